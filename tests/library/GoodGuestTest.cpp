// The library in somebody else's process: it prints nothing, changes nothing and breaks nothing.

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <clocale>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

#include "tests/library/LoadedLibrary.h"

extern char** environ;

namespace {

using Library::Environment;
using Library::LoadedLibrary;

/// What a process could notice of a guest.
struct Surroundings {
  std::string locale = std::setlocale(LC_ALL, nullptr);
  std::filesystem::path directory = std::filesystem::current_path();
  std::vector<std::string> variables;
  std::vector<std::string> openFiles;
  std::size_t threads = 0;
  std::array<struct sigaction, NSIG> actions{};
  sigset_t blocked{};
  mode_t fileMode = 0;

  Surroundings() {
    for (char** each = environ; *each != nullptr; ++each) {
      variables.emplace_back(*each);
    }
    for (const auto& each : std::filesystem::directory_iterator("/proc/self/fd")) {
      std::error_code ignored;
      const auto target = std::filesystem::read_symlink(each, ignored);
      if (target.string().find("/proc/") == std::string::npos) {
        openFiles.push_back(each.path().string() + " " + target.string());
      }
    }
    std::sort(openFiles.begin(), openFiles.end());
    for ([[maybe_unused]] const auto& each : std::filesystem::directory_iterator("/proc/self/task")) {
      ++threads;
    }
    for (int number = 1; number < NSIG; ++number) {
      sigaction(number, nullptr, &actions[static_cast<std::size_t>(number)]);
    }
    sigprocmask(SIG_SETMASK, nullptr, &blocked);
    fileMode = umask(0);
    umask(fileMode);
  }

  void expectSame(const Surroundings& other) const {
    EXPECT_EQ(other.locale, locale);
    EXPECT_EQ(other.directory, directory);
    EXPECT_EQ(other.variables, variables);
    EXPECT_EQ(other.openFiles, openFiles);
    EXPECT_EQ(other.threads, threads);
    for (std::size_t i = 1; i < actions.size(); ++i) {
      EXPECT_EQ(other.actions[i].sa_handler, actions[i].sa_handler) << "signal " << i;
      EXPECT_EQ(other.actions[i].sa_flags, actions[i].sa_flags) << "signal " << i;
    }
    EXPECT_EQ(std::memcmp(&other.blocked, &blocked, sizeof blocked), 0);
    EXPECT_EQ(other.fileMode, fileMode);
  }
};

/// What is written to standard output and standard error in its lifetime.
class Printed {
 public:
  Printed() {
    ::testing::internal::CaptureStdout();
    ::testing::internal::CaptureStderr();
  }
  std::string output() { return ::testing::internal::GetCapturedStdout(); }
  std::string errors() { return ::testing::internal::GetCapturedStderr(); }
};

class GoodGuest : public ::testing::TestWithParam<std::string> {};

std::string sourceName(const ::testing::TestParamInfo<std::string>& tested) {
  return tested.param == "live" ? "Live" : "Fixture";
}

INSTANTIATE_TEST_SUITE_P(OfEachSource, GoodGuest,
                         ::testing::Values(std::string("live"), Library::fixture("hybrid-laptop")), sourceName);

TEST_P(GoodGuest, PrintsNothing) {
  const Environment environment(Library::quietly(GetParam()));
  Printed printed;
  {
    LoadedLibrary library;
    library.askEverything();
  }
  EXPECT_EQ(printed.output(), "");
  EXPECT_EQ(printed.errors(), "");
}

TEST_P(GoodGuest, ChangesNothingOfTheProcess) {
  const Environment environment(Library::quietly(GetParam()));
  const Surroundings before;
  {
    LoadedLibrary library;
    library.askEverything();
    before.expectSame(Surroundings());
  }
  before.expectSame(Surroundings());
}

TEST_P(GoodGuest, DoesNotDependOnTheProcess) {
  const Environment environment(Library::quietly(GetParam()));
  const auto answers = [] {
    LoadedLibrary library;
    std::vector<Corvcim::Response> all;
    for (const std::string& name : Library::servedClasses()) {
      all.push_back(library.enumerateInstanceNames(name));
    }
    return all;
  };
  const auto before = answers();
  const std::filesystem::path directory = std::filesystem::current_path();
  std::filesystem::current_path("/");
  std::setlocale(LC_ALL, "C.UTF-8");
  const Environment shell({{"LANG", "de_DE.UTF-8"}, {"LC_ALL", "tr_TR.UTF-8"}, {"PATH", std::nullopt}, {"HOME", "/x"}});
  const auto after = answers();
  std::setlocale(LC_ALL, "C");
  std::filesystem::current_path(directory);
  EXPECT_EQ(after, before);
}

/// A file with some content that goes when the test ends.
class ScratchFile {
 public:
  explicit ScratchFile(const std::string& content)
      : path_(::testing::TempDir() + "broken-inventory-" + std::to_string(getpid()) + ".json") {
    std::ofstream(path_, std::ios::binary) << content;
  }
  ~ScratchFile() { std::remove(path_.c_str()); }
  ScratchFile(const ScratchFile&) = delete;
  ScratchFile& operator=(const ScratchFile&) = delete;
  const std::string& path() const { return path_; }

 private:
  std::string path_;
};

std::string wholeFixture() {
  std::ifstream file(Library::fixture("kvm-two-cpus").substr(5), std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

/// Nothing can be read: the classes fail or are empty as on a machine without parts.
void expectNothingKnown(const std::string& inventory) {
  const Environment environment(Library::quietly(inventory));
  Printed printed;
  LoadedLibrary library;
  for (int attempt = 0; attempt < 2; ++attempt) {
    for (const std::string& name : Library::servedClasses()) {
      EXPECT_EQ(library.enumerateInstances(name).instances.size(), 0U) << name;
      EXPECT_EQ(library.enumerateInstanceNames(name).paths.size(), 0U) << name;
    }
    EXPECT_FALSE(library.enumerateInstances("HALDA_CPUProcessor").done());
    EXPECT_FALSE(library.enumerateInstances("HALDA_CPUProcessorCore").done());
    EXPECT_TRUE(library.enumerateInstances("HALDA_CPUMemory").done());
  }
  EXPECT_EQ(printed.output(), "");
  printed.errors();  // the collection of caches writes there why it failed
  EXPECT_EQ(library.broker().liveObjects(), 0U);
}

TEST(BrokenInventory, MissingFileIsNoCrash) {
  expectNothingKnown("json:/no/such/file");
}

TEST(BrokenInventory, FileThatIsNoJsonIsNoCrash) {
  for (const std::string& content :
       {std::string(), std::string("{"), std::string("[1, 2"), std::string("\0\xff\xfe", 3),
        std::string("{\"format\": \"something else\"}"), std::string(100000, '[')}) {
    const ScratchFile file(content);
    expectNothingKnown("json:" + file.path());
  }
}

TEST(BrokenInventory, FileThatEndsTooEarlyIsNoCrash) {
  const std::string whole = wholeFixture();
  for (std::size_t length = whole.size() / 8; length < whole.size() - 8; length += whole.size() / 8) {
    const ScratchFile file(whole.substr(0, length));
    expectNothingKnown("json:" + file.path());
  }
}

TEST(BrokenInventory, DirectoryAndUnknownSourceAreNoCrash) {
  expectNothingKnown("json:/");
  expectNothingKnown("root:/no/such/directory");
  expectNothingKnown("nonsense");
}

TEST(BrokenInventory, IsReadAgainOnceItIsWhole) {
  const ScratchFile file("{");
  const Environment environment(Library::quietly("json:" + file.path()));
  Printed printed;
  LoadedLibrary library;
  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessor").instances.size(), 0U);
  std::ofstream(file.path(), std::ios::binary) << wholeFixture();
  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessor").instances.size(), 1U);
  printed.output();
  printed.errors();
}

TEST(Language, IsTheOneAskedFor) {
  const auto captionIn = [](const std::string& language) {
    Environment::Variables variables = Library::quietly(Library::fixture("kvm-two-cpus"));
    variables["CORVANE_LANGUAGE"] = language;
    const Environment environment(variables);
    LoadedLibrary library;
    const auto response = library.enumerateInstances("HALDA_CPUProcessor");
    return response.instances.at(0).property("Caption")->asString();
  };
  EXPECT_EQ(captionIn("de_AT"), "Prozessor");
  EXPECT_EQ(captionIn("en"), "Processor");
  EXPECT_EQ(captionIn("xx"), "Processor");
}

}  // namespace
