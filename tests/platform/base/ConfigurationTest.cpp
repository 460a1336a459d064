#include "platform/base/Configuration.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string>

namespace {

using Tarn::Common::Configuration;
using Tarn::Common::ConfigurationProblem;
using Tarn::Common::Setting;
using testing::ElementsAre;
using testing::IsEmpty;

void expectSetting(const Configuration& configuration, std::string_view key, std::string_view value,
                   std::string_view where) {
  const Setting* setting = configuration.find(key);
  ASSERT_NE(setting, nullptr) << key;
  EXPECT_EQ(setting->value, value);
  EXPECT_EQ(setting->where, where);
}

constexpr const char* knownKeys =
    "(known keys: inventory, language, log.destination, log.keep, log.level, log.rate, log.size, trace.destination, "
    "trace.keep, trace.level, trace.rate, trace.size)";

TEST(Configuration, HoldsTheValuesOfItsLines) {
  const Configuration configuration = Configuration::parse(
      "# Corvane\n"
      "\n"
      "language = de_AT\r\n"
      "\t log.level=debug \n"
      "   # log.level = error\n"
      "log.destination = file:/var/log/a = #b.log",
      "corvane.conf");
  expectSetting(configuration, "language", "de_AT", "corvane.conf:3");
  expectSetting(configuration, "log.level", "debug", "corvane.conf:4");
  expectSetting(configuration, "log.destination", "file:/var/log/a = #b.log", "corvane.conf:6");
  EXPECT_EQ(configuration.find("trace.level"), nullptr);
  EXPECT_THAT(configuration.problems(), IsEmpty());
}

TEST(Configuration, CountsTheLaterOfTwoLines) {
  const Configuration configuration = Configuration::parse("language = en\nlanguage = de\n", "corvane.conf");
  expectSetting(configuration, "language", "de", "corvane.conf:2");
}

TEST(Configuration, NamesEveryLineThatDoesNotCount) {
  const Configuration configuration =
      Configuration::parse("debug\nlog.levle = 1\n = 2\nlanguage =\ncolour = 3\n", "corvane.conf");
  EXPECT_THAT(
      configuration.problems(),
      ElementsAre(
          ConfigurationProblem{"corvane.conf:1", "expected \"key = value\" but there is no \"=\"; the line is ignored"},
          ConfigurationProblem{"corvane.conf:2",
                               "unknown key \"log.levle\"; the line is ignored (did you mean log.level?)"},
          ConfigurationProblem{"corvane.conf:3", std::string("unknown key \"\"; the line is ignored ") + knownKeys},
          ConfigurationProblem{"corvane.conf:5",
                               std::string("unknown key \"colour\"; the line is ignored ") + knownKeys}));
  expectSetting(configuration, "language", "", "corvane.conf:4");
}

class ConfigurationFileOfTheProcess : public testing::Test {
 protected:
  ConfigurationFileOfTheProcess() { std::filesystem::create_directories(directory_); }
  ~ConfigurationFileOfTheProcess() override { std::filesystem::remove_all(directory_); }

  [[nodiscard]] std::string path(const std::string& name) const { return directory_ + "/" + name; }

  void expectOnlyProblem(const std::string& file, const std::string& why) const {
    const Configuration configuration = Configuration::read(file);
    EXPECT_THAT(configuration.problems(),
                ElementsAre(ConfigurationProblem{file, "the configuration file " + why + "; the defaults are used"}));
  }

  std::string directory_ = testing::TempDir() + "configuration_" + std::to_string(getpid());
};

TEST_F(ConfigurationFileOfTheProcess, IsReadAsAWhole) {
  std::string text;
  while (text.size() < 20'000) {
    text += "# a comment that makes the file longer than one block\n";
  }
  std::ofstream(path("corvane.conf")) << text << "language = de\n";
  const Configuration configuration = Configuration::read(path("corvane.conf"));
  ASSERT_NE(configuration.find("language"), nullptr);
  EXPECT_EQ(configuration.find("language")->value, "de");
  EXPECT_THAT(configuration.problems(), IsEmpty());
}

TEST_F(ConfigurationFileOfTheProcess, ThatIsMissingIsAProblem) {
  expectOnlyProblem(path("missing.conf"), "cannot be opened: No such file or directory");
}

TEST_F(ConfigurationFileOfTheProcess, MustBeARegularFile) {
  ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
  expectOnlyProblem(path("pipe"), "is not a regular file");
  expectOnlyProblem(directory_, "is not a regular file");
  expectOnlyProblem("/dev/zero", "is not a regular file");
}

TEST_F(ConfigurationFileOfTheProcess, MustNotBeHuge) {
  std::ofstream(path("huge.conf")) << std::string((1 << 20) + 1, '\n');
  expectOnlyProblem(path("huge.conf"), "is larger than a configuration file can be (1 MiB)");
}

}  // namespace
