#include "tests/platform/cvlog/LogTest.h"

#include <cvlog/CVLogger.h>
#include <syslog.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <mutex>
#include <sstream>
#include <thread>

namespace {

std::mutex mutex;
std::vector<SystemLogRecord> records;

}  // namespace

std::vector<SystemLogRecord> recordedSystemLog() {
  const std::lock_guard lock(mutex);
  return records;
}

extern "C" void syslog(int priority, const char* format, ...) {
  std::array<char, 4096> text;
  va_list arguments;
  va_start(arguments, format);
  std::vsnprintf(text.data(), text.size(), format, arguments);
  va_end(arguments);
  const std::lock_guard lock(mutex);
  records.push_back({priority, text.data()});
}

std::string contentOf(const std::string& path) {
  std::ifstream file(path);
  return {std::istreambuf_iterator<char>(file), {}};
}

std::ptrdiff_t countOpenDescriptors() {
  const std::filesystem::directory_iterator descriptors("/proc/self/fd");
  return std::distance(begin(descriptors), end(descriptors));
}

LogTest::LogTest() : directory_(testing::TempDir() + "log_test_" + std::to_string(getpid())) {
  std::filesystem::create_directories(directory_);
  const std::lock_guard lock(mutex);
  records.clear();
}

LogTest::~LogTest() {
  std::filesystem::remove_all(directory_);
}

std::set<std::string> LogTest::names() const {
  std::set<std::string> all;
  for (const auto& entry : std::filesystem::directory_iterator(directory_)) {
    all.insert(entry.path().filename());
  }
  return all;
}

std::unique_ptr<CVLog::Sink> LogTest::openFile(const std::string& name, CVLog::Rotation rotation) const {
  const std::string file = name.starts_with('/') ? name : path(name);
  return CVLog::openSink({.destination = {CVLog::DestinationKind::File, file}, .rotation = rotation});
}

CVLog::Message LogTest::message(std::string_view text, int second) {
  return {.time = std::chrono::system_clock::time_point(std::chrono::seconds(1'000'000 + second)),
          .level = 6000,
          .component = "Corvane.Test",
          .function = "function",
          .file = "file.cpp",
          .line = 1,
          .text = text};
}

void LogTest::writeAll(CVLog::Sink& sink, std::string_view letters, int second) {
  for (std::size_t i = 0; i < letters.size(); ++i) {
    sink.write(message(letters.substr(i, 1), second));
  }
}

LoggerTest::LoggerTest() {
  unsetenv("CORVANE_LOG");
  unsetenv("CORVANE_TRACE");
  configure("");
}

void LoggerTest::configure(const std::string& text) const {
  std::ofstream(path("corvane.conf")) << text;
  setenv("CORVANE_CONFIG", path("corvane.conf").c_str(), 1);
}

void LoggerTest::reconfigure(const std::string& text) const {
  // As an editor does it: another file in the place of the first.
  std::ofstream(path("next.conf")) << text;
  std::filesystem::rename(path("next.conf"), path("corvane.conf"));
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  CVLog::CVLogger::logLevelMessage("", "", 0, "", 4000, nullptr, 0, 0, "looks after the configuration");
}

std::string LoggerTest::lines(const std::string& name) const {
  std::istringstream file(content(name));
  std::string text;
  for (std::string line; std::getline(file, line);) {
    text += "TIME" + line.substr(std::min(line.find(' '), line.size())) + '\n';
  }
  return text;
}

void LoggerTest::log(int level, const std::string& text) {
  CVLog::CVLogger::logLevelMessage("function", "file.cpp", 12, "Corvane.Test", level, nullptr, 0, 0, text);
}

void LoggerTest::trace(int level, const std::string& text) {
  CVLog::CVLogger::traceLevelMessage("function", "file.cpp", 12, "Corvane.Test", level, nullptr, 0, 0, text);
}
