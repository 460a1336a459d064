#ifndef CORVANE_PLATFORM_CVLOG_LEVEL_H
#define CORVANE_PLATFORM_CVLOG_LEVEL_H

#include <optional>
#include <string_view>

namespace CVLog {

/// The levels with a name. Any number is a level; it has the name of the nearest named level below it,
/// and "debug" where there is none.
inline constexpr int levelDebug = 3000;
inline constexpr int levelInfo = 4000;
inline constexpr int levelWarning = 5000;
inline constexpr int levelError = 6000;

/// "error", "warning", "info" or "debug".
std::string_view levelName(int level);

/// The priority that syslog(3) gives messages of this level: LOG_ERR, LOG_WARNING, LOG_INFO or LOG_DEBUG.
int syslogPriority(int level);

/// A level as the configuration writes it: one of the names in any case, or a number from 0 on.
std::optional<int> parseLevel(std::string_view text);

}  // namespace CVLog

#endif
