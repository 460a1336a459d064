#include <cvlog/CVLogger.h>
#include <pthread.h>

#include <atomic>
#include <cerrno>
#include <ctime>
#include <exception>
#include <limits>

#include "platform/cvlog/Logger.h"

namespace CVLog {
namespace {

/// What the logger does is nothing to the thread that logs: it may look at errno after it has logged, and where it is
/// cancelled it ends before or after, not in a destructor that closes a file.
class Undisturbed {
 public:
  Undisturbed() { pthread_setcancelstate(PTHREAD_CANCEL_DISABLE, &cancelState_); }
  Undisturbed(const Undisturbed&) = delete;
  Undisturbed& operator=(const Undisturbed&) = delete;
  ~Undisturbed() {
    pthread_setcancelstate(cancelState_, nullptr);
    errno = errno_;
  }

 private:
  int errno_ = errno;
  int cancelState_ = PTHREAD_CANCEL_ENABLE;
};

std::string_view textOrNothing(const char* text) {
  return text == nullptr ? std::string_view() : text;
}

constexpr unsigned neverLooked = std::numeric_limits<unsigned>::max();

/// Seconds of a clock that nobody sets, read without a system call.
unsigned secondsNow() {
  timespec now{};
  clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
  return static_cast<unsigned>(now.tv_sec);
}

using Deliver = void (Logger::*)(const Message&);

void deliver(Deliver operation, const char* function, const char* file, int line, const std::string& component,
             int level, const std::string& text) {
  const Undisturbed undisturbed;
  try {
    (Logger::instance().*operation)({.time = std::chrono::system_clock::now(),
                                     .level = level,
                                     .component = component,
                                     .function = textOrNothing(function),
                                     .file = textOrNothing(file),
                                     .line = line,
                                     .text = text});
  } catch (const std::exception&) {
    // Out of memory: the message is lost, its caller goes on.
  }
}

}  // namespace

void CVLogger::followConfiguration() {
  static std::atomic<unsigned> lastLook{neverLooked};
  const unsigned now = secondsNow();
  if (lastLook.load(std::memory_order_relaxed) == now) [[likely]] {
    return;
  }
  if (isClosed_.load(std::memory_order_relaxed) || lastLook.exchange(now, std::memory_order_relaxed) == now) {
    return;
  }
  const Undisturbed undisturbed;
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
