#ifndef CORVANE_TESTS_PLATFORM_CVLOG_RECORDEDSYSTEMLOG_H
#define CORVANE_TESTS_PLATFORM_CVLOG_RECORDEDSYSTEMLOG_H

#include <string>
#include <vector>

/// What this process has sent to the system log: the executable's own syslog(3) takes the place of the
/// C library's and keeps the messages.
struct SystemLogRecord {
  int priority;
  std::string text;

  friend bool operator==(const SystemLogRecord&, const SystemLogRecord&) = default;
};

std::vector<SystemLogRecord> recordedSystemLog();

#endif
