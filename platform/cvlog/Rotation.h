#ifndef CORVANE_PLATFORM_CVLOG_ROTATION_H
#define CORVANE_PLATFORM_CVLOG_ROTATION_H

#include <cstdint>
#include <string>

namespace CVLog {

/// How large a log file becomes before it makes way for a new one, and how many old ones are kept.
struct Rotation {
  std::uint64_t size = 0;  ///< bytes; 0 is no limit
  unsigned keep = 1;       ///< old files, at least 1

  friend bool operator==(const Rotation&, const Rotation&) = default;
};

/// The name of an old log file: "FILE.1" is the youngest.
std::string oldFile(const std::string& path, unsigned number);

/// Renames FILE to FILE.1, and FILE.1 to FILE.2 before, as far as that name is taken, up to FILE.keep, which is
/// dropped where all names are taken. The caller makes sure that nobody else does so at the same time.
/// Throws std::system_error at the first name that cannot be changed; the files that come before it keep theirs.
void makeOld(const std::string& path, unsigned keep);

}  // namespace CVLog

#endif
