#ifndef CORVANE_PLATFORM_CVLOG_WRITELINE_H
#define CORVANE_PLATFORM_CVLOG_WRITELINE_H

#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <string_view>

namespace CVLog {

/// Writes the line, its end included, by one write(2), so that the lines of several writers do not mix.
/// One that the descriptor does not take is lost. Returns how much of it was written.
inline std::size_t writeLine(int descriptor, std::string_view line) {
  ssize_t written = 0;
  do {
    written = ::write(descriptor, line.data(), line.size());
  } while (written < 0 && errno == EINTR);
  return written < 0 ? 0 : static_cast<std::size_t>(written);
}

}  // namespace CVLog

#endif
