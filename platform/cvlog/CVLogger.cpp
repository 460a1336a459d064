#include <cvlog/CVLogger.h>

#include <atomic>
#include <cerrno>
#include <ctime>
#include <exception>
#include <limits>

#include "platform/cvlog/Logger.h"

namespace CVLog {
namespace {

/// The logged code may look at errno after it has logged.
class KeptErrno {
 public:
  KeptErrno() = default;
  KeptErrno(const KeptErrno&) = delete;
  KeptErrno& operator=(const KeptErrno&) = delete;
  ~KeptErrno() { errno = value_; }

 private:
  int value_ = errno;
};

std::string_view textOrNothing(const char* text) {
  return text == nullptr ? std::string_view() : text;
}

constexpr unsigned kNever = std::numeric_limits<unsigned>::max();

/// Seconds of a clock that nobody sets, read without a system call.
unsigned secondsNow() {
  timespec now{};
  clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
  return static_cast<unsigned>(now.tv_sec);
}

using Deliver = void (Logger::*)(const Message&);

void deliver(Deliver operation, const char* function, const char* file, int line, const std::string& component,
             int level, const std::string& text) {
  const KeptErrno kept;
  try {
    (Logger::instance().*operation)({.time = std::chrono::system_clock::now(),
                                     .level = level,
                                     .component = component,
                                     .function = textOrNothing(function),
                                     .file = textOrNothing(file),
                                     .line = line,
                                     .text = text});
  } catch (const std::exception&) {
    // Out of memory: the message is lost, its caller goes on. (Not every exception, or a cancelled
    // thread could not end here.)
  }
}

}  // namespace

void CVLogger::followConfiguration() {
  static std::atomic<unsigned> lastLook{kNever};
  const unsigned now = secondsNow();
  if (lastLook.load(std::memory_order_relaxed) == now) [[likely]] {
    return;
  }
  if (lastLook.exchange(now, std::memory_order_relaxed) == now) {
    return;
  }
  const KeptErrno kept;
  try {
    Logger::instance().followConfiguration();
  } catch (const std::exception&) {
    // Out of memory: the configuration in force stays until the file changes again.
  }
}

void CVLogger::deliverToLog(const char* function, const char* file, int line, const std::string& component, int level,
                            const std::string& text) {
  deliver(&Logger::log, function, file, line, component, level, text);
}

void CVLogger::deliverToTrace(const char* function, const char* file, int line, const std::string& component, int level,
                              const std::string& text) {
  deliver(&Logger::trace, function, file, line, component, level, text);
}

}  // namespace CVLog
