// What the shared object shows to the process that loads it.

#include <dlfcn.h>
#include <elf.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <regex>
#include <set>

#include "tests/library/ElfFile.h"
#include "tests/library/LoadedLibrary.h"

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr bool sanitized = true;
#else
constexpr bool sanitized = false;
#endif

namespace {

using Library::ElfFile;

std::set<std::string> exportedNames() {
  std::set<std::string> names;
  for (const Library::DynamicSymbol& symbol : ElfFile(Library::file).symbols) {
    if (symbol.defined && symbol.binding != STB_LOCAL && !symbol.name.empty()) {
      names.insert(symbol.name);
    }
  }
  return names;
}

TEST(Exports, AreTheFactoryFunctionsAndTheFamilyNames) {
  std::set<std::string> names = exportedNames();
  const auto familyNames = std::find_if(names.begin(), names.end(), [](const std::string& name) {
    return std::regex_match(name, std::regex("_ZN4Tarn11CPUProvider9cpufamily.*E"));
  });
  ASSERT_NE(familyNames, names.end());
  names.erase(familyNames);
  EXPECT_EQ(
      names,
      (std::set<std::string>{
          "CPUMemoryProvider_Create_InstanceMI", "CPUProcessorProvider_Create_InstanceMI",
          "CPUProcessorCoreProvider_Create_InstanceMI", "CPUProcessorCapProvider_Create_InstanceMI",
          "CPUAssociatedCacheMemoryProvider_Create_InstanceMI", "CPUAssociatedCacheMemoryProvider_Create_AssociationMI",
          "CPUCoreAssociatedCacheMemoryProvider_Create_InstanceMI",
          "CPUCoreAssociatedCacheMemoryProvider_Create_AssociationMI", "CPUSystemDeviceProvider_Create_InstanceMI",
          "CPUSystemDeviceProvider_Create_AssociationMI", "CPUElementCapabilitiesProvider_Create_InstanceMI",
          "CPUElementCapabilitiesProvider_Create_AssociationMI", "CPUConcreteComponentProvider_Create_InstanceMI",
          "CPUConcreteComponentProvider_Create_AssociationMI"}));
}

TEST(Exports, HoldTheFortyFamilyNames) {
  const Corvcim::ProviderLibrary library(Library::file);
  unsigned int found = 0;
  for (const std::string& name : exportedNames()) {
    if (name.find("cpufamily") == std::string::npos) {
      continue;
    }
    const auto* families = static_cast<const std::string*>(library.find(name));
    ASSERT_NE(families, nullptr);
    ++found;
    EXPECT_EQ(std::vector<std::string>(families, families + 40),
              (std::vector<std::string>{
                  "Unknown",      "Intel8086",  "Intel286",   "Intel386",    "Intel486",   "Intel8087",    "Intel287",
                  "Intel387",     "Intel487",   "Pentium",    "PentiumPro",  "Pentium2",   "Pentium2Xeon", "Pentium3",
                  "Pentium3Xeon", "Pentium4",   "Xeon",       "Celeron",     "Itanium",    "Itanium2",     "AMDDuron",
                  "AMDK5",        "AMDK6",      "Athlon",     "Athlon64",    "AthlonXP",   "AthlonMP",     "Opteron",
                  "PowerPC",      "PowerPC601", "PowerPC603", "PowerPC603p", "PowerPC604", "PowerPC620",   "PowerPC704",
                  "PowerPC750",   "AS400",      "Cell",       "S390",        "Invalid"}));
  }
  EXPECT_EQ(found, 1U);
}

// A name of unique linkage keeps the library in memory for ever.
TEST(Exports, HaveNoUniqueLinkage) {
  for (const Library::DynamicSymbol& symbol : ElfFile(Library::file).symbols) {
    EXPECT_NE(symbol.binding, STB_GNU_UNIQUE) << symbol.name;
  }
}

TEST(SharedObject, NeedsTheStandardLibrariesOnly) {
  if (sanitized) {
    GTEST_SKIP() << "the sanitizers bring libraries of their own";
  }
  const std::set<std::string> allowed = {"libstdc++.so.6",       "libm.so.6",    "libgcc_s.so.1", "libc.so.6",
                                         "ld-linux-x86-64.so.2", "ld-linux.so.2"};
  for (const std::string& library : ElfFile(Library::file).needed) {
    EXPECT_TRUE(allowed.contains(library)) << library;
  }
}

TEST(SharedObject, IsAnOrdinaryOne) {
  const ElfFile elf(Library::file);
  EXPECT_EQ(elf.soname, "libcorvcpuprofileprovider.so.1");
  EXPECT_FALSE(elf.hasTextRelocations);
  EXPECT_FALSE(elf.staysLoaded);
  EXPECT_FALSE(elf.hasExecutableStack);
}

// Brokers look for the unversioned name; the loader for the one with the major version.
TEST(SharedObject, HasItsLinks) {
  namespace fs = std::filesystem;
  const fs::path unversioned = Library::file;
  EXPECT_TRUE(fs::is_symlink(unversioned));
  EXPECT_EQ(fs::read_symlink(unversioned), "libcorvcpuprofileprovider.so.1");
  const fs::path versioned = unversioned.parent_path() / "libcorvcpuprofileprovider.so.1";
  EXPECT_TRUE(fs::is_symlink(versioned));
  EXPECT_TRUE(std::regex_match(fs::read_symlink(versioned).string(),
                               std::regex(R"(libcorvcpuprofileprovider\.so\.1\.[0-9]+\.[0-9]+)")));
}

TEST(SharedObject, ProviderOfCapabilitiesHasItsShortNameOnly) {
  const Corvcim::ProviderLibrary library(Library::file);
  EXPECT_NE(library.find("CPUProcessorCapProvider_Create_InstanceMI"), nullptr);
  EXPECT_EQ(library.find("CPUProcessorCapabilitiesProvider_Create_InstanceMI"), nullptr);
}

}  // namespace
