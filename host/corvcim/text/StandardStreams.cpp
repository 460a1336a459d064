#include "host/corvcim/text/StandardStreams.h"

#include <fcntl.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cerrno>
#include <stdexcept>
#include <system_error>
#include <utility>

#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

/// The caller's standard error.
int standardError = STDERR_FILENO;

/// 0, or the number of the error.
int writeAll(int descriptor, std::string_view text) {
  while (!text.empty()) {
    const ssize_t written = ::write(descriptor, text.data(), text.size());
    if (written < 0 && errno != EINTR) {
      return errno;
    }
    text.remove_prefix(written < 0 ? 0 : static_cast<std::size_t>(written));
  }
  return 0;
}

}  // namespace

void occupyStandardStreams() {
  for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
    if (fcntl(descriptor, F_GETFD) == -1 && errno == EBADF) {
      // The lowest free number is this one. Opened the wrong way round, so that its use still fails.
      open("/dev/null", descriptor == STDIN_FILENO ? O_WRONLY : O_RDONLY);
    }
  }
}

std::size_t terminalWidth() {
  winsize size = {};
  return ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) == 0 ? size.ws_col : 0;
}

void writeOutput(std::string_view text) {
  constexpr int statusOfSigpipe = 141;
  const int error = writeAll(STDOUT_FILENO, text);
  if (error == EPIPE) {
    _exit(statusOfSigpipe);
  }
  if (error != 0) {
    throw std::runtime_error("standard output: " + std::generic_category().message(error));
  }
}

void writeError(std::string_view text) {
  writeToStandardError("corvcim: " + toPrintable(text) + '\n');
}

void writeToStandardError(std::string_view text) {
  writeAll(standardError, text);
}

bool replaceStandardError(int descriptor) {
  const int callers = fcntl(STDERR_FILENO, F_DUPFD_CLOEXEC, 0);
  if (callers == -1 || dup2(descriptor, STDERR_FILENO) == -1) {
    if (callers != -1) {
      close(callers);
    }
    return false;
  }
  standardError = callers;
  return true;
}

void restoreStandardError() {
  dup2(standardError, STDERR_FILENO);
  close(std::exchange(standardError, STDERR_FILENO));
}

}  // namespace Corvcim
