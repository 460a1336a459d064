#include "host/cli/StandardStreams.h"

#include <fcntl.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cerrno>
#include <stdexcept>
#include <string>
#include <system_error>

#include "host/cli/Text.h"

namespace Corvcim {
namespace {

/// 0, or the number of the error.
int writeAll(int descriptor, std::string_view text) {
  while (!text.empty()) {
    const ssize_t written = write(descriptor, text.data(), text.size());
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
  writeAll(STDERR_FILENO, "corvcim: " + toPrintable(text) + '\n');
}

}  // namespace Corvcim
