#include "platform/cvlog/LineSink.h"

#include <fcntl.h>
#include <pthread.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <ctime>
#include <stdexcept>
#include <system_error>

namespace CVLog {
namespace {

using Tarn::Common::FileDescriptor;

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

void writeLine(int descriptor, const Message& message) {
  const std::string line = formatLine(message) + '\n';
  ssize_t written = 0;
  do {
    written = ::write(descriptor, line.data(), line.size());
  } while (written < 0 && errno == EINTR);
}

FileDescriptor openLog(const std::string& path) {
  // Non-blocking, or a pipe without a reader would hold the broker.
  constexpr int kFlags = O_WRONLY | O_APPEND | O_CREAT | O_CLOEXEC | O_NOCTTY | O_NONBLOCK;
  FileDescriptor file(open(path.c_str(), kFlags, S_IRUSR | S_IWUSR | S_IRGRP));
  if (!file) {
    throw std::system_error(errno, std::generic_category(), "log file " + path + " cannot be opened");
  }
  struct stat status {};
  if (fstat(file.number(), &status) != 0 || !(S_ISREG(status.st_mode) || S_ISCHR(status.st_mode))) {
    throw std::runtime_error("log file " + path + " is not a regular file");
  }
  return file;
}

}  // namespace

void StandardErrorSink::write(const Message& message) {
  const HeldBackPipeSignal held;
  writeLine(STDERR_FILENO, message);
}

FileSink::FileSink(const std::string& path) : file_(openLog(path)) {}

void FileSink::write(const Message& message) {
  writeLine(file_.number(), message);
}

}  // namespace CVLog
