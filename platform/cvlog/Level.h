#ifndef CORVANE_PLATFORM_CVLOG_LEVEL_H
#define CORVANE_PLATFORM_CVLOG_LEVEL_H

#include <iterator>
#include <string_view>

namespace CVLog {

inline constexpr int levelDebug = 3000;
inline constexpr int levelInfo = 4000;
inline constexpr int levelWarning = 5000;
inline constexpr int levelError = 6000;

struct NamedLevel {
  int level;
  std::string_view name;
  int severity;  ///< in the system log (RFC 5424), which is also the priority for syslog(3)
};

inline constexpr NamedLevel namedLevels[] = {
    {levelError, "error", 3},
    {levelWarning, "warning", 4},
    {levelInfo, "info", 6},
    {levelDebug, "debug", 7},
};

/// Any number is a level. It is treated as the nearest named level below it, and as debug if there is none.
constexpr const NamedLevel& namedLevel(int level) {
  for (const NamedLevel& row : namedLevels) {
    if (level >= row.level) {
      return row;
    }
  }
  return *(std::end(namedLevels) - 1);
}

}  // namespace CVLog

#endif
