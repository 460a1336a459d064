#include "platform/cvlog/HeldBackSignal.h"

#include <pthread.h>

#include <cerrno>
#include <ctime>

namespace CVLog {

HeldBackSignal::HeldBackSignal(int signal) {
  sigemptyset(&signal_);
  sigaddset(&signal_, signal);
  sigset_t pending;
  sigemptyset(&pending);
  sigpending(&pending);
  wasPending_ = sigismember(&pending, signal) == 1;
  pthread_sigmask(SIG_BLOCK, &signal_, &before_);
}

HeldBackSignal::~HeldBackSignal() {
  if (!wasPending_) {
    const timespec atOnce{};
    while (sigtimedwait(&signal_, nullptr, &atOnce) < 0 && errno == EINTR) {
    }
  }
  pthread_sigmask(SIG_SETMASK, &before_, nullptr);
}

}  // namespace CVLog
