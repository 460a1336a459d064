#ifndef CORVANE_PLATFORM_CVLOG_SETTINGS_H
#define CORVANE_PLATFORM_CVLOG_SETTINGS_H

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/base/Configuration.h"
#include "platform/cvlog/Level.h"

namespace CVLog {

enum class DestinationKind { None, StandardError, SystemLog, File };

struct Destination {
  DestinationKind kind = DestinationKind::None;
  std::string path{};  ///< of a file

  friend bool operator==(const Destination&, const Destination&) = default;
};

struct Rotation {
  std::uint64_t size = 0;  ///< of the largest file in bytes; 0 is no limit
  unsigned keep = 1;       ///< old files, at least 1

  friend bool operator==(const Rotation&, const Rotation&) = default;
};

/// The default trace has no destination: with one, it accepts everything.
struct SinkSettings {
  int level = levelDebug;  ///< the lowest level that is accepted
  Destination destination{};
  unsigned perMinute = 0;                                             ///< messages; 0 is no limit
  Rotation rotation = {.size = std::uint64_t{16} << 20U, .keep = 4};  ///< at most 80 MiB for a forgotten trace

  friend bool operator==(const SinkSettings&, const SinkSettings&) = default;
};

// The system log belongs to the whole machine; a provider that fails all the time must not fill it.
inline constexpr unsigned systemLogPerMinute = 60;

inline SinkSettings defaultLog() {
  return {.level = levelError, .destination = {DestinationKind::SystemLog}, .perMinute = systemLogPerMinute};
}

struct Settings {
  SinkSettings log = defaultLog();
  SinkSettings trace{};
  std::vector<Tarn::Common::ConfigurationProblem> problems{};
};

/// The settings from the configuration file and the two overrides, the values of CORVANE_LOG and CORVANE_TRACE. A value
/// that is not valid is noted as a problem and has no effect.
Settings makeSettings(const Tarn::Common::Configuration& file, const std::optional<std::string>& logOverride,
                      const std::optional<std::string>& traceOverride);

/// "none", "stderr", "syslog" or "file:PATH" with a path that is not empty.
std::optional<Destination> parseDestination(std::string_view text);

}  // namespace CVLog

#endif
