#ifndef CORVANE_PLATFORM_CVLOG_HELDBACKSIGNAL_H
#define CORVANE_PLATFORM_CVLOG_HELDBACKSIGNAL_H

#include <csignal>

namespace CVLog {

/// Keeps a write that fails from killing the process: the signal that it would raise (SIGPIPE for a closed pipe,
/// SIGXFSZ for a file beyond the size that the process may write) is held back in this thread, and taken back if it was
/// raised. The process's own signal handling stays as it is.
class HeldBackSignal {
 public:
  explicit HeldBackSignal(int signal);
  HeldBackSignal(const HeldBackSignal&) = delete;
  HeldBackSignal& operator=(const HeldBackSignal&) = delete;
  ~HeldBackSignal();

 private:
  sigset_t signal_{};
  sigset_t before_{};
  bool wasPending_ = false;
};

}  // namespace CVLog

#endif
