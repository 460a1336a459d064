#include "platform/base/ConfigurationFile.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <string>
#include <thread>

namespace {

using Tarn::Common::ConfigurationFile;
using testing::IsEmpty;
using testing::SizeIs;

class ReadAgain : public testing::Test {
 public:
  ReadAgain() {
    std::filesystem::create_directories(directory_);
    write("language = de\n");
  }
  ReadAgain(const ReadAgain&) = delete;
  ReadAgain& operator=(const ReadAgain&) = delete;
  ~ReadAgain() override { std::filesystem::remove_all(directory_); }

 protected:
  void write(const std::string& text) const { std::ofstream(path_) << text; }
  // Longer than a tick of any file system's clock.
  static void letTheClockTick() { std::this_thread::sleep_for(std::chrono::milliseconds(50)); }

  static std::string languageIn(ConfigurationFile& file) {
    const auto configuration = file.read();
    const auto* setting = configuration.find("language");
    return setting == nullptr ? "none" : setting->value;
  }

  const std::string directory_ = testing::TempDir() + "read_again_" + std::to_string(getpid());
  const std::string path_ = directory_ + "/corvane.conf";
  ConfigurationFile file_{path_, ConfigurationFile::Absence::IsFine};
};

TEST_F(ReadAgain, HasNotChangedWhileNobodyTouchesIt) {
  EXPECT_EQ(languageIn(file_), "de");
  EXPECT_FALSE(file_.hasChanged());
  letTheClockTick();
  EXPECT_FALSE(file_.hasChanged());
}

TEST_F(ReadAgain, HasChangedWhenItWasWritten) {
  file_.read();
  letTheClockTick();
  write("language = en\n");
  EXPECT_TRUE(file_.hasChanged());
  EXPECT_TRUE(file_.hasChanged());
  EXPECT_EQ(languageIn(file_), "en");
  EXPECT_FALSE(file_.hasChanged());
}

TEST_F(ReadAgain, HasChangedWhenAnotherFileTookItsPlace) {
  file_.read();
  std::ofstream(directory_ + "/other") << "language = en\n";
  std::filesystem::last_write_time(directory_ + "/other", std::filesystem::last_write_time(path_));
  std::filesystem::rename(directory_ + "/other", path_);
  EXPECT_TRUE(file_.hasChanged());
}

TEST_F(ReadAgain, HasChangedWhenItsModeWas) {
  file_.read();
  letTheClockTick();
  chmod(path_.c_str(), 0600);
  EXPECT_TRUE(file_.hasChanged());
}

TEST_F(ReadAgain, HasChangedWhenItWasRemovedAndWhenItIsBack) {
  file_.read();
  std::filesystem::remove(path_);
  EXPECT_TRUE(file_.hasChanged());
  EXPECT_EQ(languageIn(file_), "none");
  EXPECT_FALSE(file_.hasChanged());
  write("language = fr\n");
  EXPECT_TRUE(file_.hasChanged());
  EXPECT_EQ(languageIn(file_), "fr");
}

TEST_F(ReadAgain, IsMissedOnlyWhereItMustBeThere) {
  std::filesystem::remove(path_);
  EXPECT_THAT(file_.read().problems(), IsEmpty());
  ConfigurationFile needed(path_, ConfigurationFile::Absence::IsAProblem);
  EXPECT_THAT(needed.read().problems(), SizeIs(1));
}

}  // namespace
