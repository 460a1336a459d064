#ifndef CORVANE_TESTS_PLATFORM_CVLOG_LOGTEST_H
#define CORVANE_TESTS_PLATFORM_CVLOG_LOGTEST_H

#include <gtest/gtest.h>

#include <chrono>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "platform/cvlog/Sink.h"

struct SystemLogRecord {
  int priority;
  std::string text;

  friend bool operator==(const SystemLogRecord&, const SystemLogRecord&) = default;
};

/// The messages that this process has sent to the system log: the executable's own syslog(3) keeps them.
std::vector<SystemLogRecord> recordedSystemLog();

std::string contentOf(const std::string& path);
std::ptrdiff_t countOpenDescriptors();

/// A directory for log files, and messages to write there.
class LogTest : public testing::Test {
 public:
  LogTest(const LogTest&) = delete;
  LogTest& operator=(const LogTest&) = delete;
  ~LogTest() override;

 protected:
  LogTest();

  [[nodiscard]] std::string path(const std::string& name) const { return directory_ + "/" + name; }
  [[nodiscard]] std::string content(const std::string& name) const { return contentOf(path(name)); }
  [[nodiscard]] std::set<std::string> names() const;

  [[nodiscard]] std::unique_ptr<CVLog::Sink> openFile(const std::string& name, CVLog::Rotation rotation = {}) const;

  static CVLog::Message message(std::string_view text, int second = 0);
  static std::string line(std::string_view text) { return CVLog::formatLine(message(text)) + '\n'; }
  /// Writes a message for each letter, all in the same second.
  static void writeAll(CVLog::Sink& sink, std::string_view letters, int second = 0);
  /// The size of a file with two of these.
  static std::uint64_t twoLines() { return 2 * line("a").size(); }

  const std::string directory_;
};

/// A process whose logger is not configured yet, and its configuration file.
class LoggerTest : public LogTest {
 protected:
  LoggerTest();

  void configure(const std::string& text) const;
  /// Changes the configuration, and logs until the logger has looked at the file.
  void reconfigure(const std::string& text) const;

  [[nodiscard]] std::string to(const std::string& name) const { return "log.destination = file:" + path(name) + "\n"; }
  /// The file's lines with TIME in place of the time.
  [[nodiscard]] std::string lines(const std::string& name) const;

  static void log(int level, const std::string& text);
  static void trace(int level, const std::string& text);
};

#endif
