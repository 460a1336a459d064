#ifndef CORVANE_PLATFORM_CVLOG_RATELIMITEDSINK_H
#define CORVANE_PLATFORM_CVLOG_RATELIMITEDSINK_H

#include <memory>
#include <mutex>

#include "platform/cvlog/Sink.h"

namespace CVLog {

/// Passes on so many messages a minute and drops the rest. The first message of a later minute is
/// preceded by a note that says how many were dropped; where none comes, the note ends the output.
class RateLimitedSink final : public Sink {
 public:
  RateLimitedSink(std::unique_ptr<Sink> target, unsigned perMinute);

  RateLimitedSink(const RateLimitedSink&) = delete;
  RateLimitedSink& operator=(const RateLimitedSink&) = delete;
  ~RateLimitedSink() override;

  void write(const Message& message) override;

 private:
  /// What becomes of one message.
  struct Verdict {
    bool passes;
    unsigned droppedBefore;
  };
  Verdict judge(std::chrono::system_clock::time_point time);
  void noteDropped(std::chrono::system_clock::time_point time, unsigned count);

  const std::unique_ptr<Sink> target_;
  const unsigned perMinute_;

  // Guards what follows, never held while writing. A process that was forked while another thread had it, and logs,
  // waits for ever, as it would for the lock in syslog(3).
  std::mutex mutex_;
  std::chrono::system_clock::time_point minuteStart_;
  unsigned passed_ = 0;
  unsigned dropped_ = 0;
};

}  // namespace CVLog

#endif
