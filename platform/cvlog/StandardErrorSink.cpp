#include "platform/cvlog/StandardErrorSink.h"

#include <pthread.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <ctime>

#include "platform/cvlog/WriteLine.h"

namespace CVLog {
namespace {

/// Keeps a write to a closed pipe from killing the process: SIGPIPE is held back in this thread, and
/// taken back if the write raised it. The process's own signal handling stays as it is.
class HeldBackPipeSignal {
 public:
  HeldBackPipeSignal() {
    sigemptyset(&pipe_);
    sigaddset(&pipe_, SIGPIPE);
    sigset_t pending;
    sigemptyset(&pending);
    sigpending(&pending);
    wasPending_ = sigismember(&pending, SIGPIPE) == 1;
    pthread_sigmask(SIG_BLOCK, &pipe_, &before_);
  }
  HeldBackPipeSignal(const HeldBackPipeSignal&) = delete;
  HeldBackPipeSignal& operator=(const HeldBackPipeSignal&) = delete;
  ~HeldBackPipeSignal() {
    if (!wasPending_) {
      const timespec atOnce{};
      while (sigtimedwait(&pipe_, nullptr, &atOnce) < 0 && errno == EINTR) {
      }
    }
    pthread_sigmask(SIG_SETMASK, &before_, nullptr);
  }

 private:
  sigset_t pipe_{};
  sigset_t before_{};
  bool wasPending_ = false;
};

}  // namespace

void StandardErrorSink::write(const Message& message) {
  const HeldBackPipeSignal held;
  writeLine(STDERR_FILENO, formatLine(message) + '\n');
}

}  // namespace CVLog
