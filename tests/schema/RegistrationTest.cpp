// The rendered registration files, compared whole.

#include "schema/Registration.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <regex>
#include <set>
#include <string>

#include "schema/ClassTable.h"

namespace {

std::string contents(const std::string& name) {
  std::ifstream stream(CORVANE_SOURCE_DIR "/tests/schema/expected/" + name);
  EXPECT_TRUE(stream) << name;
  return {std::istreambuf_iterator<char>(stream), {}};
}

// The text after "<name>: " or "<name> = " in each line that has it.
std::multiset<std::string> valuesOf(const std::string& text, const std::string& name) {
  std::multiset<std::string> values;
  const std::regex pattern("\\b" + name + "(?:: | = )\"?([^\";\n]*)");
  for (std::sregex_iterator each(text.begin(), text.end(), pattern), end; each != end; ++each) {
    values.insert((*each)[1]);
  }
  return values;
}

}  // namespace

TEST(Registration, SfcbBlocksOfTheProviderLibrary) {
  EXPECT_EQ(Registration::forSfcb("corvcpuprofileprovider"), contents("corvane-cpu.reg"));
}

TEST(Registration, SfcbBlockOfTheCompanion) {
  EXPECT_EQ(Registration::forSfcb("corvcomputersystemprovider"), contents("corvane-computersystem.reg"));
}

TEST(Registration, PegasusInstancesOfTheProviderLibrary) {
  EXPECT_EQ(Registration::forPegasus("corvcpuprofileprovider", "1.2.3"), contents("corvane-cpu.mof"));
}

TEST(Registration, PegasusInstancesOfTheCompanion) {
  EXPECT_EQ(Registration::forPegasus("corvcomputersystemprovider", "1.2.3"), contents("corvane-computersystem.mof"));
}

TEST(Registration, CapabilitiesProviderHasItsShortName) {
  for (const std::string& text :
       {Registration::forSfcb("corvcpuprofileprovider"), Registration::forPegasus("corvcpuprofileprovider", "1")}) {
    EXPECT_NE(text.find("CPUProcessorCapProvider"), std::string::npos);
    EXPECT_EQ(text.find("CPUProcessorCapabilitiesProvider"), std::string::npos);
  }
}

TEST(Registration, CacheAssociationHasAProcessOfItsOwn) {
  const std::string sfcb = Registration::forSfcb("corvcpuprofileprovider");
  const std::string pegasus = Registration::forPegasus("corvcpuprofileprovider", "1");

  EXPECT_EQ(valuesOf(sfcb, "group").count("corvane-cpu-cache"), 1U);
  EXPECT_EQ(valuesOf(sfcb, "group").count("corvane-cpu"), 8U);
  // The module is named once for its provider and once for the capabilities.
  EXPECT_EQ(valuesOf(pegasus, "ProviderModuleName").count("CorvaneCPUCacheModule"), 2U);
  EXPECT_EQ(valuesOf(pegasus, "ProviderModuleName").count("CorvaneCPUModule"), 16U);
}

TEST(Registration, BothFormatsNameEveryClassAndProviderOfTheTable) {
  std::multiset<std::string> classes;
  std::multiset<std::string> providers;
  for (const Corvcim::ClassDefinition& each : Corvcim::classDefinitions()) {
    if (each.library == "corvcpuprofileprovider") {
      classes.emplace(each.name);
      providers.emplace(each.provider);
    }
  }

  const std::string pegasus = Registration::forPegasus("corvcpuprofileprovider", "1");

  EXPECT_EQ(valuesOf(Registration::forSfcb("corvcpuprofileprovider"), "provider"), providers);
  EXPECT_EQ(valuesOf(pegasus, "ProviderName"), providers);
  EXPECT_EQ(valuesOf(pegasus, "ClassName"), classes);
}
