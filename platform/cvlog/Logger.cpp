#include <cvlog/CVLogger.h>
#include <pthread.h>
#include <unistd.h>

#include <cerrno>
#include <ctime>
#include <exception>
#include <limits>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/base/ConfigurationFile.h"
#include "platform/base/Environment.h"
#include "platform/cvlog/Settings.h"
#include "platform/cvlog/Sink.h"

namespace CVLog {
namespace {

using Tarn::Common::ConfigurationFile;
using Tarn::Common::ConfigurationProblem;
using Tarn::Common::environmentOverride;

constexpr std::string_view thisFile = "Logger.cpp";

/// Leaves errno as it is, and delays the cancellation of the thread until the logger is done.
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

/// Admits one thread of the process at a time. A process that is forked while a thread is inside has a copy of
/// half-changed data and nobody who completes it: there nobody is admitted any more, and nobody waits.
class Admission {
 public:
  Admission(std::atomic<pid_t>& inside, bool waits) : inside_(inside) {
    const pid_t self = getpid();
    pid_t other = 0;
    while (!(isGranted_ = inside_.compare_exchange_strong(other, self, std::memory_order_acquire))) {
      if (other != self || !waits) {
        return;
      }
      inside_.wait(other, std::memory_order_relaxed);
      other = 0;
    }
  }
  Admission(const Admission&) = delete;
  Admission& operator=(const Admission&) = delete;
  ~Admission() {
    if (isGranted_) {
      inside_.store(0, std::memory_order_release);
      inside_.notify_one();
    }
  }

  explicit operator bool() const { return isGranted_; }

 private:
  std::atomic<pid_t>& inside_;
  bool isGranted_ = false;
};

}  // namespace

/// The settings of a sink that are in force, and the sink.
struct Route {
  SinkSettings wanted{};
  bool isFallback = true;  ///< the default, because the settings wanted cannot be had
  int level = 0;           ///< the lowest that is accepted
  std::unique_ptr<Sink> sink{};

  [[nodiscard]] int threshold() const { return sink ? level : std::numeric_limits<int>::max(); }

  void write(const Message& message) const {
    if (sink && message.level >= level) {
      sink->write(message);
    }
  }

  /// A sink whose settings stay the same stays as it is, with its open file and the count of its limit.
  void change(const SinkSettings& next, const SinkSettings& fallback, std::vector<ConfigurationProblem>& problems) {
    wanted.level = next.level;  // a change of the level alone needs no other sink
    if (!isFallback && wanted == next) {
      level = next.level;
      return;
    }
    try {
      *this = {.wanted = next, .isFallback = false, .level = next.level, .sink = openSink(next)};
    } catch (const std::runtime_error& error) {
      problems.push_back({error.what(), "the default destination is used"});
      *this = {.wanted = next, .isFallback = true, .level = fallback.level, .sink = openSink(fallback)};
    }
  }
};

/// The two sinks of this process and the thresholds in front of them.
class Logger {
 public:
  static Logger& instance() {
    static Logger logger;
    return logger;
  }

  Logger() { readConfiguration(); }
  Logger(const Logger&) = delete;
  Logger& operator=(const Logger&) = delete;
  /// A thread may still log while the library is unloaded.
  ~Logger() {
    CVLogger::isClosed_.store(true, std::memory_order_relaxed);
    setThresholds({}, {});
  }

  void deliver(bool isTrace, const Message& message) {
    if (const Admission admission(inside_, true); admission) {
      (isTrace ? trace_ : log_).write(message);
    }
  }

  /// Costs one system call if the configuration file has not changed, and nothing while another thread logs.
  void followConfiguration() {
    const Admission admission(inside_, false);
    if (admission && file_.hasChanged()) {
      readConfiguration();
      noteThatFileWasRead();
    }
  }

 private:
  static void setThresholds(const Route& log, const Route& trace) {
    CVLogger::logThreshold_.store(log.threshold(), std::memory_order_relaxed);
    CVLogger::traceThreshold_.store(trace.threshold(), std::memory_order_relaxed);
  }

  void readConfiguration() {
    const Settings settings = makeSettings(file_.read(), logOverride_, traceOverride_);
    std::vector<ConfigurationProblem> problems = settings.problems;
    log_.change(settings.log, defaultLog(), problems);
    trace_.change(settings.trace, {}, problems);
    setThresholds(log_, trace_);
    report(problems);
  }

  static void report(const std::vector<ConfigurationProblem>& problems) {
    if (problems.empty()) {
      return;
    }
    // Not to the configured sink: that may be what is wrong.
    const std::unique_ptr<Sink> sink = openSink(defaultLog());
    for (const ConfigurationProblem& problem : problems) {
      const std::string text = "Configuration: " + problem.where + ": " + problem.why;
      sink->write(ownMessage(levelError, thisFile, text));
    }
  }

  void noteThatFileWasRead() const {
    const std::string text = "Configuration: " + file_.path() + " was read again";
    const Message message = ownMessage(levelInfo, thisFile, text);
    log_.write(message);
    trace_.write(message);
  }

  std::atomic<pid_t> inside_{0};  // the process whose thread is inside; 0 if there is none
  ConfigurationFile file_ = ConfigurationFile::ofThisProcess();
  const std::optional<std::string> logOverride_ = environmentOverride("CORVANE_LOG");
  const std::optional<std::string> traceOverride_ = environmentOverride("CORVANE_TRACE");
  Route log_;
  Route trace_;
};

void CVLogger::followConfiguration() {
  constexpr unsigned never = -1;
  static std::atomic<unsigned> lastLook{never};
  timespec time{};
  clock_gettime(CLOCK_MONOTONIC_COARSE, &time);  // without a system call
  const auto now = static_cast<unsigned>(time.tv_sec);
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

void CVLogger::deliver(bool isTrace, const char* function, const char* file, int line, const std::string& component,
                       int level, const std::string& text) {
  if (isClosed_.load(std::memory_order_relaxed)) {
    return;
  }
  const auto textOrNothing = [](const char* name) { return name == nullptr ? std::string_view() : name; };
  const Undisturbed undisturbed;
  try {
    const Message message = {.time = std::chrono::system_clock::now(),
                             .level = level,
                             .component = component,
                             .function = textOrNothing(function),
                             .file = textOrNothing(file),
                             .line = line,
                             .text = text};
    Logger::instance().deliver(isTrace, message);
  } catch (const std::exception&) {
    // Out of memory: the message is lost.
  }
}

}  // namespace CVLog
