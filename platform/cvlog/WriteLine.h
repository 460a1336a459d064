#ifndef CORVANE_PLATFORM_CVLOG_WRITELINE_H
#define CORVANE_PLATFORM_CVLOG_WRITELINE_H

#include <unistd.h>

#include <cerrno>
#include <string_view>

namespace CVLog {

/// Writes the line, its end included, by one write(2), so that the lines of several writers do not mix.
/// One that the descriptor does not take is lost.
inline void writeLine(int descriptor, std::string_view line) {
  ssize_t written = 0;
  do {
    written = ::write(descriptor, line.data(), line.size());
  } while (written < 0 && errno == EINTR);
}

}  // namespace CVLog

#endif
