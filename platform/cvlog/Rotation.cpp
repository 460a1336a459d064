#include "platform/cvlog/Rotation.h"

#include <sys/stat.h>

#include <cerrno>
#include <cstdio>
#include <system_error>

namespace CVLog {
namespace {

bool isTaken(const std::string& path) {
  struct stat status {};
  return lstat(path.c_str(), &status) == 0 || errno != ENOENT;
}

}  // namespace

std::string oldFile(const std::string& path, unsigned number) {
  return path + '.' + std::to_string(number);
}

void makeOld(const std::string& path, unsigned keep) {
  // Only up to the first gap: a failed attempt leaves one, and the next must not push the others out for it.
  unsigned last = 1;
  while (last < keep && isTaken(oldFile(path, last))) {
    ++last;
  }
  for (unsigned number = last; number != 0; --number) {
    const std::string from = number == 1 ? path : oldFile(path, number - 1);
    if (std::rename(from.c_str(), oldFile(path, number).c_str()) != 0) {
      throw std::system_error(errno, std::generic_category(),
                              "cannot be rotated: " + from + " cannot be renamed to " + oldFile(path, number));
    }
  }
}

}  // namespace CVLog
