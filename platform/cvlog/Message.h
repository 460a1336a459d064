#ifndef CORVANE_PLATFORM_CVLOG_MESSAGE_H
#define CORVANE_PLATFORM_CVLOG_MESSAGE_H

#include <chrono>
#include <string>
#include <string_view>

namespace CVLog {

/// One message on its way to a sink. The views live as long as the call that delivers it.
struct Message {
  std::chrono::system_clock::time_point time{};
  int level = 0;
  std::string_view component{};
  std::string_view function{};
  std::string_view file{};
  int line = 0;
  std::string_view text{};
};

/// A message of the logger itself, from the calling function and line. `file` is the base name of its source.
Message ownMessage(int level, std::string_view file, std::string_view text,
                   std::chrono::system_clock::time_point time = std::chrono::system_clock::now(),
                   std::string_view function = __builtin_FUNCTION(), int line = __builtin_LINE());

/// The message as one line without its end:
/// `2026-03-01T09:30:00.125Z error Corvane.CPUProvider getProcessorCapRefByProcHandle CPUObjFactory.cpp:2044 the text`.
/// The time is UTC. Only the text has blanks of its own. A byte that would break the line or act on a terminal is
/// written as in C (`\n`, `\t`, `\x1b`), a backslash as two; every other byte stands for itself.
std::string formatLine(const Message& message);

/// The same without time and level, which the system log adds by itself.
std::string formatForSystemLog(const Message& message);

}  // namespace CVLog

#endif
