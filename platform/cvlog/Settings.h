#ifndef CORVANE_PLATFORM_CVLOG_SETTINGS_H
#define CORVANE_PLATFORM_CVLOG_SETTINGS_H

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/common/Configuration.h"
#include "platform/cvlog/Level.h"
#include "platform/cvlog/Rotation.h"

namespace CVLog {

enum class DestinationKind { None, StandardError, SystemLog, File };

struct Destination {
  DestinationKind kind = DestinationKind::None;
  std::string path;  ///< of a file

  friend bool operator==(const Destination&, const Destination&) = default;
};

// A forgotten trace must not fill a disk: 80 MiB at most, with the defaults.
inline constexpr Rotation defaultRotation = {.size = std::uint64_t{16} << 20U, .keep = 4};

/// What one sink takes and where it goes.
struct SinkSettings {
  int level = levelDebug;  ///< the lowest level that is taken
  Destination destination;
  unsigned perMinute = 0;               ///< messages; 0 is no limit
  Rotation rotation = defaultRotation;  ///< of a file

  /// The level stands in front of the sink: another one needs no other sink.
  bool differsOnlyInLevel(SinkSettings other) const {
    other.level = level;
    return other == *this;
  }

  friend bool operator==(const SinkSettings&, const SinkSettings&) = default;
};

// The system log belongs to the whole machine; a provider that fails all the time must not fill it.
inline constexpr unsigned systemLogPerMinute = 60;

/// Errors go to the system log.
inline SinkSettings defaultLog() {
  return {.level = levelError, .destination = {DestinationKind::SystemLog, {}}, .perMinute = systemLogPerMinute};
}
/// Nothing is traced; a trace that only has a destination takes everything.
inline SinkSettings defaultTrace() {
  return {};
}

struct Settings {
  SinkSettings log = defaultLog();
  SinkSettings trace = defaultTrace();
  std::vector<Tarn::Common::ConfigurationProblem> problems;
};

/// The settings that the configuration file and the two overrides (the values of CORVANE_LOG and
/// CORVANE_TRACE) make. A value that cannot be understood is noted and the one it would have replaced stays.
Settings makeSettings(const Tarn::Common::Configuration& file, const std::optional<std::string>& logOverride,
                      const std::optional<std::string>& traceOverride);

/// "none", "stderr", "syslog" or "file:PATH" with a path that is not empty.
std::optional<Destination> parseDestination(std::string_view text);

}  // namespace CVLog

#endif
