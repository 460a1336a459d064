#include <gtest/gtest.h>
#include <tarn/Locale.h>
#include <unistd.h>

#include <clocale>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

namespace {

using Tarn::Locale::getLanguageId;

/// A process that nobody has asked for its language yet.
class Language : public testing::Test {
 protected:
  Language() {
    std::filesystem::create_directories(directory_);
    unsetenv("CORVANE_LANGUAGE");
    setenv("CORVANE_LOG", ("error:file:" + directory_ + "/log").c_str(), 1);
    configure("");
  }
  ~Language() override { std::filesystem::remove_all(directory_); }

  void configure(const std::string& text) const {
    std::ofstream(directory_ + "/corvane.conf") << text;
    setenv("CORVANE_CONFIG", (directory_ + "/corvane.conf").c_str(), 1);
  }

  [[nodiscard]] std::string log() const {
    std::ifstream file(directory_ + "/log");
    return {std::istreambuf_iterator<char>(file), {}};
  }

  std::string directory_ = testing::TempDir() + "language_" + std::to_string(getpid());
};

TEST_F(Language, IsEnglishByDefault) {
  EXPECT_EQ(getLanguageId(), "en");
  EXPECT_EQ(log(), "");
}

TEST_F(Language, ComesFromTheConfigurationFile) {
  configure("language = DE-at\n");
  EXPECT_EQ(getLanguageId(), "de_AT");
}

TEST_F(Language, ComesFromTheEnvironmentBeforeTheFile) {
  configure("language = fr\n");
  setenv("CORVANE_LANGUAGE", "de_CH.UTF-8", 1);
  EXPECT_EQ(getLanguageId(), "de_CH");
}

TEST_F(Language, IsReadOnce) {
  setenv("CORVANE_LANGUAGE", "de", 1);
  EXPECT_EQ(getLanguageId(), "de");
  setenv("CORVANE_LANGUAGE", "en", 1);
  EXPECT_EQ(getLanguageId(), "de");
}

TEST_F(Language, HasNothingToDoWithTheLocaleOfTheProcess) {
  setenv("LANGUAGE", "de", 1);
  setenv("LANG", "de_DE.UTF-8", 1);
  setenv("LC_ALL", "de_DE.UTF-8", 1);
  const std::string before = std::setlocale(LC_ALL, nullptr);
  EXPECT_EQ(getLanguageId(), "en");
  EXPECT_EQ(std::setlocale(LC_ALL, nullptr), before);
}

TEST_F(Language, ThatIsNoneIsReportedAndReadsAsEnglish) {
  configure("\nlanguage = German, please\n");
  EXPECT_EQ(getLanguageId(), "en");
  const std::string expected = " Configuration: " + directory_ +
                               "/corvane.conf:2: \"German, please\" is not valid: expected a language id such as de "
                               "or de_AT\n";
  EXPECT_TRUE(log().ends_with(expected)) << log();
}

}  // namespace
