#include <gtest/gtest.h>
#include <tarn/Common.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include "tests/cmpi/PathBroker.h"

namespace {

/// A process that keeps its log in a file.
class LoggedComparison : public testing::Test {
 protected:
  LoggedComparison() {
    setenv("CORVANE_CONFIG", "/dev/null", 1);
    setenv("CORVANE_LOG", ("info:file:" + file_).c_str(), 1);
    setenv("CORVANE_TRACE", ("info:file:" + file_ + ".trace").c_str(), 1);
  }
  ~LoggedComparison() override {
    std::filesystem::remove(file_);
    std::filesystem::remove(file_ + ".trace");
  }

  /// The one line of the file, from its level on.
  static std::string lineOf(const std::string& file) {
    std::ifstream stream(file);
    std::string line;
    std::getline(stream, line);
    const std::size_t level = line.find(' ');
    EXPECT_EQ(stream.peek(), std::ifstream::traits_type::eof());
    return level == std::string::npos ? line : line.substr(level + 1);
  }

  void expectLogged(const PathBroker::Path& left, const PathBroker::Path& right, const std::string& difference) {
    EXPECT_FALSE(Tarn::isObjPathsEqualWithLog(nullptr, left, right, true));
    const std::string logged = lineOf(file_);
    EXPECT_TRUE(logged.starts_with("info Corvane.Common isObjPathsEqualWithLog ObjectPaths.cpp:")) << logged;
    EXPECT_TRUE(logged.ends_with(" Object paths differ: " + difference)) << logged;
    EXPECT_TRUE(lineOf(file_ + ".trace").ends_with(" Object paths differ: " + difference));
  }

  PathBroker broker_;
  std::string file_ = testing::TempDir() + "logged_comparison_" + std::to_string(getpid());
};

TEST_F(LoggedComparison, NamesTheClasses) {
  expectLogged(broker_.path("A"), broker_.path("B"), R"(class names differ: "A" and "B")");
}

TEST_F(LoggedComparison, NamesTheNamespaces) {
  expectLogged(broker_.path("A").in("root/a"), broker_.path("A").in("root/b"),
               R"(namespaces differ: "root/a" and "root/b")");
}

TEST_F(LoggedComparison, CountsTheKeys) {
  expectLogged(broker_.path("A").key("k", "1"), broker_.path("A"), R"(numbers of keys differ: "1" and "0")");
}

TEST_F(LoggedComparison, NamesTheKeys) {
  expectLogged(broker_.path("A").key("k", "1"), broker_.path("A").key("l", "1"),
               R"(names of keys differ: "k" and "l")");
}

TEST_F(LoggedComparison, ShowsTheValues) {
  expectLogged(broker_.path("A").key("k", "1"), broker_.path("A").key("k", CMPI_sint32, {.sint32 = -5}),
               R"(values of key "k" differ: "1" and -5)");
}

TEST_F(LoggedComparison, LeadsToTheValueInsideAReference) {
  PathBroker::Path& same = broker_.path("S");
  expectLogged(broker_.path("A").key("a", same).key("r", broker_.path("C").key("k", CMPI_boolean, {.boolean = 1})),
               broker_.path("A").key("a", same).key("r", broker_.path("C").key("k", CMPI_boolean, {.boolean = 0})),
               R"(in key "r": values of key "k" differ: true and false)");
}

TEST_F(LoggedComparison, SaysThatAPathIsMissing) {
  EXPECT_FALSE(Tarn::isObjPathsEqualWithLog(nullptr, nullptr, broker_.path("A"), true));
  EXPECT_TRUE(lineOf(file_).ends_with(" Object paths differ: a path is missing"));
}

TEST_F(LoggedComparison, LogsNothingForEqualPaths) {
  EXPECT_TRUE(Tarn::isObjPathsEqualWithLog(nullptr, broker_.path("A"), broker_.path("a"), true));
  EXPECT_FALSE(std::filesystem::exists(file_));
}

}  // namespace
