#include "tests/platform/cvlog/RecordedSystemLog.h"

#include <syslog.h>

#include <array>
#include <cstdarg>
#include <cstdio>
#include <mutex>

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
