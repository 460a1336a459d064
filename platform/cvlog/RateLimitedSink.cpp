#include "platform/cvlog/RateLimitedSink.h"

#include <exception>
#include <string>
#include <utility>

#include "platform/cvlog/Level.h"

namespace CVLog {

using std::chrono::minutes;
using std::chrono::system_clock;

RateLimitedSink::RateLimitedSink(std::unique_ptr<Sink> target, unsigned perMinute)
    : target_(std::move(target)), perMinute_(perMinute) {}

RateLimitedSink::~RateLimitedSink() {
  if (dropped_ == 0) {
    return;
  }
  try {
    noteDropped(system_clock::now(), dropped_);
  } catch (const std::exception&) {
    // Out of memory, and nobody left to tell.
  }
}

void RateLimitedSink::write(const Message& message) {
  const Verdict verdict = judge(message.time);
  if (verdict.droppedBefore != 0) {
    noteDropped(message.time, verdict.droppedBefore);
  }
  if (verdict.passes) {
    target_->write(message);
  }
}

void RateLimitedSink::noteDropped(system_clock::time_point time, unsigned count) {
  const std::string text = std::to_string(count) + (count == 1 ? " message was" : " messages were") +
                           " dropped; the limit is " + std::to_string(perMinute_) + " a minute";
  target_->write(ownMessage(levelWarning, "RateLimitedSink.cpp", text, time));
}

RateLimitedSink::Verdict RateLimitedSink::judge(system_clock::time_point time) {
  const std::lock_guard lock(mutex_);
  // A clock that was set back starts a new minute, too.
  if (time >= minuteStart_ + minutes(1) || time < minuteStart_) {
    minuteStart_ = time;
    passed_ = 0;
  }
  if (passed_ >= perMinute_) {
    ++dropped_;
    return {.passes = false, .droppedBefore = 0};
  }
  ++passed_;
  return {.passes = true, .droppedBefore = std::exchange(dropped_, 0U)};
}

}  // namespace CVLog
