#include "platform/cvlog/Sink.h"

#include <pthread.h>
#include <syslog.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <ctime>
#include <exception>
#include <optional>
#include <string>
#include <utility>

#include "platform/cvlog/Level.h"

namespace CVLog {
namespace {

using std::chrono::minutes;
using std::chrono::system_clock;

/// Blocks a signal in this thread. A signal that arrives meanwhile is removed; one that was pending before stays.
class SuppressedSignal {
 public:
  explicit SuppressedSignal(int signal) {
    sigemptyset(&signal_);
    sigaddset(&signal_, signal);
    sigset_t pending;
    sigemptyset(&pending);
    sigpending(&pending);
    wasPending_ = sigismember(&pending, signal) == 1;
    pthread_sigmask(SIG_BLOCK, &signal_, &before_);
  }
  SuppressedSignal(const SuppressedSignal&) = delete;
  SuppressedSignal& operator=(const SuppressedSignal&) = delete;
  ~SuppressedSignal() {
    const timespec noWait{};
    while (!wasPending_ && sigtimedwait(&signal_, nullptr, &noWait) < 0 && errno == EINTR) {
    }
    pthread_sigmask(SIG_SETMASK, &before_, nullptr);
  }

 private:
  sigset_t signal_{};
  sigset_t before_{};
  bool wasPending_ = false;
};

class StandardErrorSink final : public Sink {
 public:
  void write(const Message& message) override { writeLine(STDERR_FILENO, formatLine(message) + '\n', SIGPIPE); }
};

class SystemLogSink final : public Sink {
 public:
  void write(const Message& message) override { writeToSystemLog(message); }
};

class RateLimitedSink final : public Sink {
 public:
  RateLimitedSink(std::unique_ptr<Sink> target, unsigned perMinute)
      : target_(std::move(target)), perMinute_(perMinute) {}
  RateLimitedSink(const RateLimitedSink&) = delete;
  RateLimitedSink& operator=(const RateLimitedSink&) = delete;
  ~RateLimitedSink() override {
    try {
      noteDropped(system_clock::now());
    } catch (const std::exception&) {
      // Out of memory: the note is lost.
    }
  }

  void write(const Message& message) override {
    // A clock that was set back starts a new minute, too.
    if (message.time >= minuteStart_ + minutes(1) || message.time < minuteStart_) {
      minuteStart_ = message.time;
      passed_ = 0;
    }
    if (passed_ >= perMinute_) {
      ++dropped_;
      return;
    }
    ++passed_;
    noteDropped(message.time);
    target_->write(message);
  }

 private:
  void noteDropped(system_clock::time_point time) {
    const unsigned count = std::exchange(dropped_, 0U);
    if (count == 0) {
      return;
    }
    const std::string text = std::to_string(count) + (count == 1 ? " message was" : " messages were") +
                             " dropped; the limit is " + std::to_string(perMinute_) + " a minute";
    target_->write(ownMessage(levelWarning, "Sink.cpp", text, time));
  }

  const std::unique_ptr<Sink> target_;
  const unsigned perMinute_;
  system_clock::time_point minuteStart_;
  unsigned passed_ = 0;
  unsigned dropped_ = 0;
};

std::unique_ptr<Sink> openDestination(const SinkSettings& settings) {
  switch (settings.destination.kind) {
    case DestinationKind::StandardError:
      return std::make_unique<StandardErrorSink>();
    case DestinationKind::SystemLog:
      return std::make_unique<SystemLogSink>();
    case DestinationKind::File:
      return openFile(settings.destination.path, settings.rotation);
    case DestinationKind::None:
      break;
  }
  return nullptr;
}

}  // namespace

std::unique_ptr<Sink> openSink(const SinkSettings& settings) {
  std::unique_ptr<Sink> sink = openDestination(settings);
  return sink && settings.perMinute != 0 ? std::make_unique<RateLimitedSink>(std::move(sink), settings.perMinute)
                                         : std::move(sink);
}

void writeToSystemLog(const Message& message) {
  syslog(namedLevel(message.level).severity, "%s", formatForSystemLog(message).c_str());
}

void writeLine(int descriptor, std::string_view line, int signal) {
  std::optional<SuppressedSignal> suppressed;
  if (signal != 0) {
    suppressed.emplace(signal);
  }
  while (write(descriptor, line.data(), line.size()) < 0 && errno == EINTR) {
  }
}

}  // namespace CVLog
