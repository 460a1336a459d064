// What a broker that goes on running sees of the log and the trace.

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>

#include "tests/library/LoadedLibrary.h"

namespace {

using Library::Environment;
using Library::LoadedLibrary;
using testing::AllOf;
using testing::HasSubstr;
using testing::Not;

constexpr const char* kClass = "HALDA_CPUProcessor";

class Logging : public testing::Test {
 public:
  Logging() { std::filesystem::create_directories(directory_); }
  Logging(const Logging&) = delete;
  Logging& operator=(const Logging&) = delete;
  ~Logging() override { std::filesystem::remove_all(directory_); }

 protected:
  [[nodiscard]] std::string path(const std::string& name) const { return directory_ + "/" + name; }

  void configure(const std::string& text) const {
    std::ofstream(path("next.conf")) << "log.destination = none\n" << text;
    std::filesystem::rename(path("next.conf"), path("corvane.conf"));
  }
  [[nodiscard]] Environment configuredByFile() const {
    Environment::Variables variables = Library::quietly(Library::fixture("virtual-machine"));
    variables["CORVANE_CONFIG"] = path("corvane.conf");
    variables["CORVANE_LOG"] = std::nullopt;
    variables["CORVANE_TRACE"] = std::nullopt;
    return Environment(variables);
  }
  /// The logger looks at its configuration once a second.
  static void letASecondPass() { std::this_thread::sleep_for(std::chrono::milliseconds(1100)); }

  [[nodiscard]] std::string content(const std::string& name) const {
    std::ifstream file(path(name));
    return {std::istreambuf_iterator<char>(file), {}};
  }

  const std::string directory_ = testing::TempDir() + "logging_" + std::to_string(getpid());
};

TEST_F(Logging, TracesTheFirstRequestAfterTheConfigurationWasChangedFromItsEntryOn) {
  configure("");
  const Environment environment = configuredByFile();
  LoadedLibrary library;
  library.enumerateInstanceNames(kClass);

  configure("trace.destination = file:" + path("trace") + "\n");
  letASecondPass();
  library.enumerateInstances(kClass);
  EXPECT_THAT(content("trace"), AllOf(HasSubstr(" ENTERING: CPUProcessor_EnumInstances() in "),
                                      HasSubstr(" EXITING: CPUProcessor_EnumInstances() in ")));

  configure("");
  letASecondPass();
  library.enumerateInstanceNames(kClass);
  EXPECT_THAT(content("trace"), Not(HasSubstr("CPUProcessor_EnumInstanceNames")));
}

TEST_F(Logging, RotatesATraceAndLosesNoLineOfIt) {
  configure("trace.destination = file:" + path("whole") + "\ntrace.size = 0\n");
  const Environment environment = configuredByFile();
  {
    LoadedLibrary library;
    library.askEverything();
  }
  configure("trace.destination = file:" + path("parts") + "\ntrace.size = 16K\ntrace.keep = 999\n");
  {
    LoadedLibrary library;
    library.askEverything();
  }
  std::size_t lines = 0;
  std::size_t files = 0;
  for (const auto& entry : std::filesystem::directory_iterator(directory_)) {
    if (entry.path().stem() == "parts") {
      ++files;
      EXPECT_LE(entry.file_size(), 16384U) << entry.path();
      std::ifstream file(entry.path());
      lines += static_cast<std::size_t>(
          std::count(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>(), '\n'));
    }
  }
  const std::string whole = content("whole");
  EXPECT_GT(files, 2U);
  EXPECT_EQ(lines, static_cast<std::size_t>(std::count(whole.begin(), whole.end(), '\n')));
}

}  // namespace
