// What --as-is sends, and how it shows what the providers answer.

#include <gtest/gtest.h>

#include <string>

#include "tests/host/corvcim/Expected.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

TEST(AsIs, ClassAndPropertiesGoInTheSpellingOfTheUser) {
  // The plain library compares names of properties letter by letter, and answers with its own class.
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"--as-is", "ei", "halda_cpuprocessorcore", "elementname,HealthState"}),
            success(corePath("P0.C0") + "\n  InstanceID   P0.C0\n  HealthState  5 (OK)\n\n" + corePath("P0.C1") +
                    "\n  InstanceID   P0.C1\n  HealthState  5 (OK)\n"));
}

TEST(AsIs, NamespacesAndHostsGoAsTheyAre) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"--as-is", "-n", "root/x", "ein", "HALDA_CPUProcessorCore"}),
            success("root/x:HALDA_CPUProcessorCore.InstanceID=\"P0.C0\"\n"
                    "root/x:HALDA_CPUProcessorCore.InstanceID=\"P0.C1\"\n"));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"--as-is", "gi", "//elsewhere/" + corePath("P0.C1"), "Caption"}).status, 0);
}

TEST(AsIs, FiltersAreLeftToTheProviders) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"--as-is", "ain", "-ac", "HALDA_CPUConcreteComponent", "-arc", "X_None", "-ar",
                                         "X_None", "-arr", "X_None", corePath("P0.C1")}),
            success(processorPath("P0") + '\n'));
}

TEST(AsIs, EveryAssociationIsAskedThatABrokerWouldAsk) {
  const Finished run = shell("\"$corvcim\" -l " TEST_PROVIDER " --companion " TEST_PROVIDER
                             " --as-is ai -ar role 'X_Fan.Name=\"f\"' | grep -v '^$'");

  std::string expected;
  for (const std::string name :
       {"HALDA_CPUSystemDevice", "HALDA_CPUConcreteComponent", "HALDA_CPUAssociatedCacheMemory",
        "HALDA_CPUCoreAssociatedCacheMemory", "HALDA_CPUElementCapabilities"}) {
    expected += "root/cimv2:" + name + "\n  DeviceID  associators NULL NULL role NULL\n";
  }
  EXPECT_EQ(run, success(expected));
}

TEST(AsIs, AProvidersErrorIsShownAsItIs) {
  EXPECT_EQ(
      corvcimOn(twoCoreMachine(), {"--as-is", "rin", "-ac", "HALDA_CPUAssociatedCacheMemory", "X_Fan.Name=\"f\""}),
      failed("rin X_Fan.Name=\"f\": HALDA_CPUAssociatedCacheMemory: CIM_ERR_FAILED: Object Path is NULL in "
             "ReferenceNames."));
}

TEST(AsIs, AClassWithoutAProviderIsRefused) {
  EXPECT_EQ(corvcim({"--as-is", "ei", "HALDA_CPUMemry"}),
            failed("ei HALDA_CPUMemry: CIM_ERR_INVALID_CLASS: no class \"HALDA_CPUMemry\" is served here; did you mean "
                   "HALDA_CPUMemory?"));
}

}  // namespace
}  // namespace Corvcim::Testing
