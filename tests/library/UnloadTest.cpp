// Load, ask everything, unload: nothing stays behind, however often.

#include <dlfcn.h>
#include <gtest/gtest.h>
#include <malloc.h>
#include <sys/inotify.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <set>
#include <string>
#include <vector>

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

/// A directory with all that the library may open: an inventory, a configuration, and the place for its
/// trace. Tells what was opened, read or made there.
class WatchedDirectory {
 public:
  WatchedDirectory() : path_(::testing::TempDir() + "watched-" + std::to_string(getpid())), watch_(inotify_init1(0)) {
    std::filesystem::create_directories(path_);
    std::filesystem::copy_file(Library::fixture("virtual-machine").substr(std::string("json:").size()),
                               path_ + "/tree.json");
    std::ofstream(path_ + "/corvane.conf") << "log.level = debug\n";
    EXPECT_GE(inotify_add_watch(watch_, path_.c_str(), IN_ALL_EVENTS), 0) << std::strerror(errno);
  }
  ~WatchedDirectory() {
    close(watch_);
    std::filesystem::remove_all(path_);
  }
  WatchedDirectory(const WatchedDirectory&) = delete;
  WatchedDirectory& operator=(const WatchedDirectory&) = delete;

  /// Everything that the library says goes to standard error and into the trace.
  [[nodiscard]] Environment::Variables variables() const {
    Environment::Variables variables = Library::quietly("json:" + path_ + "/tree.json");
    variables["CORVANE_CONFIG"] = path_ + "/corvane.conf";
    variables["CORVANE_LOG"] = "0:stderr";
    variables["CORVANE_TRACE"] = "0:file:" + path_ + "/trace";
    return variables;
  }

  /// The names of the files that something happened to since this was last asked.
  std::set<std::string> takeTouched() {
    std::set<std::string> names;
    int waiting = 0;
    while (ioctl(watch_, FIONREAD, &waiting) == 0 && waiting > 0) {
      std::vector<char> events(static_cast<std::size_t>(waiting));
      const ssize_t length = read(watch_, events.data(), events.size());
      for (std::size_t at = 0; length > 0 && at < static_cast<std::size_t>(length);) {
        inotify_event event{};
        std::memcpy(&event, &events[at], sizeof event);
        names.insert(event.len > 0 ? &events[at + sizeof event] : "");
        at += sizeof event + event.len;
      }
    }
    return names;
  }

 private:
  std::string path_;
  int watch_;
};

using Names = std::set<std::string>;

// Loading and registering do no work: no inventory, no configuration, no message.
TEST_P(Unload, WithoutARequestNothingIsRead) {
  WatchedDirectory directory;
  const Environment environment(directory.variables());
  ::testing::internal::CaptureStderr();
  LoadedLibrary library(GetParam());
  library.createInterfaces();
  EXPECT_EQ(directory.takeTouched(), Names());
  EXPECT_EQ(::testing::internal::GetCapturedStderr(), "");

  // All of this would have been seen.
  ::testing::internal::CaptureStderr();
  library.enumerateInstances("HALDA_CPUProcessor");
  EXPECT_EQ(directory.takeTouched(), (Names{"tree.json", "corvane.conf", "trace"}));
  EXPECT_NE(::testing::internal::GetCapturedStderr(), "");
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
