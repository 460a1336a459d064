// Load, ask everything, unload: nothing stays behind, however often.

#include <dlfcn.h>
#include <gtest/gtest.h>
#include <malloc.h>

#include <filesystem>
#include <fstream>
#include <string>

#include "tests/library/LoadedLibrary.h"

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr bool sanitized = true;
#else
constexpr bool sanitized = false;
#endif

namespace {

using Corvcim::LoadScope;
using Library::Environment;
using Library::LoadedLibrary;

constexpr int rounds = sanitized ? 20 : 1000;
constexpr int warmUp = rounds / 10;

std::size_t allocatedBytes() {
  return mallinfo2().uordblks;
}

/// Resident memory in KiB.
long residentMemory() {
  std::ifstream status("/proc/self/status");
  for (std::string line; std::getline(status, line);) {
    if (line.starts_with("VmRSS:")) {
      return std::stol(line.substr(6));
    }
  }
  return 0;
}

class Unload : public ::testing::TestWithParam<LoadScope> {};

std::string scopeName(const ::testing::TestParamInfo<LoadScope>& tested) {
  return tested.param == LoadScope::Global ? "Global" : "Local";
}

INSTANTIATE_TEST_SUITE_P(OfEachScope, Unload, ::testing::Values(LoadScope::Global, LoadScope::Local), scopeName);

TEST_P(Unload, AThousandTimesLeavesNothingBehind) {
  const Environment environment(Library::quietly(Library::fixture("virtual-machine")));
  std::size_t bytes = 0;
  long resident = 0;
  for (int round = 0; round < rounds; ++round) {
    {
      LoadedLibrary library(GetParam());
      ASSERT_GT(Library::mappings(), 0U);
      ASSERT_GT(library.askEverything(), 100U);
    }
    ASSERT_EQ(Library::mappings(), 0U) << "after round " << round;
    ASSERT_EQ(dlopen(Library::file.c_str(), RTLD_NOW | RTLD_NOLOAD), nullptr);
    if (round == warmUp) {
      bytes = allocatedBytes();
      resident = residentMemory();
    }
  }
  if (!sanitized) {
    EXPECT_LT(allocatedBytes(), bytes + 16 * 1024);
    EXPECT_LT(residentMemory(), resident + 2 * 1024);
  }
}

TEST_P(Unload, OfTheLiveInventoryLeavesNothingBehind) {
  const Environment environment(Library::quietly("live"));
  std::size_t bytes = 0;
  for (int round = 0; round < 10; ++round) {
    {
      LoadedLibrary library(GetParam());
      ASSERT_GT(library.askEverything(), 0U);
    }
    ASSERT_EQ(Library::mappings(), 0U);
    if (round == 4) {
      bytes = allocatedBytes();
    }
  }
  if (!sanitized) {
    EXPECT_LT(allocatedBytes(), bytes + 16 * 1024);
  }
}

// Loading does no work: no inventory, no configuration, no message.
TEST_P(Unload, WithoutARequestNothingIsRead) {
  const Environment environment(Library::quietly("json:/no/such/file"));
  const LoadedLibrary library(GetParam());
  for (const std::string& name : Library::servedClasses()) {
    EXPECT_GT(Library::mappings(), 0U) << name;
  }
}

TEST(Reload, SeesTheMachineAnew) {
  std::size_t processors = 0;
  {
    const Environment environment(Library::quietly(Library::fixture("dual-socket-server")));
    LoadedLibrary library;
    processors = library.enumerateInstances("HALDA_CPUProcessor").instances.size();
  }
  EXPECT_EQ(processors, 2U);
  const Environment environment(Library::quietly(Library::fixture("kvm-two-cpus")));
  LoadedLibrary library;
  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessor").instances.size(), 1U);
}

TEST(Reload, KeepsTheInventoryUntilThen) {
  const Environment environment(Library::quietly(Library::fixture("dual-socket-server")));
  LoadedLibrary library;
  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessor").instances.size(), 2U);
  const Environment other(Library::quietly(Library::fixture("kvm-two-cpus")));
  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessor").instances.size(), 2U);
}

// An agent may bring a version of its own beside the one that is installed.
TEST(TwoCopies, ShareNothing) {
  const std::filesystem::path directory = std::filesystem::path(::testing::TempDir()) / "two-copies";
  std::filesystem::create_directories(directory);
  const auto load = [&](const char* name) {
    const std::filesystem::path copy = directory / name;
    std::filesystem::copy_file(Library::file, copy, std::filesystem::copy_options::overwrite_existing);
    return dlopen(copy.c_str(), RTLD_NOW | RTLD_GLOBAL);
  };
  void* first = load("first.so");
  void* second = load("second.so");
  ASSERT_NE(first, nullptr) << dlerror();
  ASSERT_NE(second, nullptr) << dlerror();

  // A copy that something of the other is bound to would stay.
  dlclose(first);
  EXPECT_EQ(dlopen((directory / "first.so").c_str(), RTLD_NOW | RTLD_NOLOAD), nullptr);
  dlclose(second);
  EXPECT_EQ(dlopen((directory / "second.so").c_str(), RTLD_NOW | RTLD_NOLOAD), nullptr);
  std::filesystem::remove_all(directory);
}

}  // namespace
