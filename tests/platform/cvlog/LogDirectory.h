#ifndef CORVANE_TESTS_PLATFORM_CVLOG_LOGDIRECTORY_H
#define CORVANE_TESTS_PLATFORM_CVLOG_LOGDIRECTORY_H

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>
#include <string>

#include "platform/cvlog/Message.h"

/// A test with a directory for its log files, and a message to write there.
class LogDirectory : public testing::Test {
 public:
  LogDirectory(const LogDirectory&) = delete;
  LogDirectory& operator=(const LogDirectory&) = delete;
  ~LogDirectory() override { std::filesystem::remove_all(directory_); }

 protected:
  LogDirectory() { std::filesystem::create_directories(directory_); }

  [[nodiscard]] std::string path(const std::string& name) const { return directory_ + "/" + name; }

  static std::string contentOf(const std::string& path) {
    std::ifstream file(path);
    return {std::istreambuf_iterator<char>(file), {}};
  }
  [[nodiscard]] std::string content(const std::string& name) const { return contentOf(path(name)); }

  [[nodiscard]] std::set<std::string> names() const {
    std::set<std::string> all;
    for (const auto& entry : std::filesystem::directory_iterator(directory_)) {
      all.insert(entry.path().filename());
    }
    return all;
  }

  static CVLog::Message message(std::string_view text) {
    return {.time = {},
            .level = 6000,
            .component = "Corvane.Test",
            .function = "function",
            .file = "file.cpp",
            .line = 1,
            .text = text};
  }
  static std::string line(std::string_view text) { return CVLog::formatLine(message(text)) + '\n'; }

  const std::string directory_ = testing::TempDir() + "log_directory_" + std::to_string(getpid());
};

#endif
