#ifndef CORVANE_TESTS_PLATFORM_CVLOG_LOGGERFIXTURE_H
#define CORVANE_TESTS_PLATFORM_CVLOG_LOGGERFIXTURE_H

#include <cvlog/CVLogger.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

/// A process whose logger nobody has configured yet, and whose configuration file is the test's.
class LoggerProcess : public testing::Test {
 public:
  LoggerProcess(const LoggerProcess&) = delete;
  LoggerProcess& operator=(const LoggerProcess&) = delete;
  ~LoggerProcess() override { std::filesystem::remove_all(directory_); }

 protected:
  LoggerProcess() {
    std::filesystem::create_directories(directory_);
    unsetenv("CORVANE_LOG");
    unsetenv("CORVANE_TRACE");
    configure("");
  }

  [[nodiscard]] std::string path(const std::string& name) const { return directory_ + "/" + name; }

  void configure(const std::string& text) const {
    std::ofstream(path("corvane.conf")) << text;
    setenv("CORVANE_CONFIG", path("corvane.conf").c_str(), 1);
  }

  static void log(int level, const std::string& text) {
    CVLog::CVLogger::logLevelMessage("function", "file.cpp", 12, "Corvane.Test", level, nullptr, 0, 0, text);
  }
  static void trace(int level, const std::string& text) {
    CVLog::CVLogger::traceLevelMessage("function", "file.cpp", 12, "Corvane.Test", level, nullptr, 0, 0, text);
  }

  /// The file's lines with TIME in place of what stands before each first blank, the time.
  [[nodiscard]] std::string content(const std::string& name) const {
    std::ifstream file(path(name));
    std::string text;
    for (std::string line; std::getline(file, line);) {
      text += "TIME" + line.substr(std::min(line.find(' '), line.size())) + '\n';
    }
    return text;
  }

  /// What the configuration changes into, as an editor does it: another file in the place of the first.
  void reconfigure(const std::string& text) const {
    std::ofstream(path("next.conf")) << text;
    std::filesystem::rename(path("next.conf"), path("corvane.conf"));
  }

  std::string directory_ = testing::TempDir() + "logger_" + std::to_string(getpid());
};

#endif
