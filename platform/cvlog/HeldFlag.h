#ifndef CORVANE_PLATFORM_CVLOG_HELDFLAG_H
#define CORVANE_PLATFORM_CVLOG_HELDFLAG_H

#include <atomic>

namespace CVLog {

/// Holds a flag that was free; whoever finds it taken goes on without it. In a process that was forked while another
/// thread held it, it stays taken.
class HeldFlag {
 public:
  explicit HeldFlag(std::atomic_flag& flag) : flag_(flag), isHeld_(!flag.test_and_set(std::memory_order_acquire)) {}
  HeldFlag(const HeldFlag&) = delete;
  HeldFlag& operator=(const HeldFlag&) = delete;
  ~HeldFlag() {
    if (isHeld_) {
      flag_.clear(std::memory_order_release);
    }
  }

  explicit operator bool() const { return isHeld_; }

 private:
  std::atomic_flag& flag_;
  bool isHeld_;
};

}  // namespace CVLog

#endif
