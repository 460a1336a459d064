#include "platform/cvlog/Settings.h"

#include <array>
#include <charconv>
#include <cstdint>
#include <limits>

#include "platform/common/Ascii.h"

namespace CVLog {
namespace {

using Tarn::Common::Configuration;
using Tarn::Common::ConfigurationProblem;
using Tarn::Common::lower;
using Tarn::Common::Setting;

constexpr std::string_view levelsWanted = "error, warning, info, debug or a number";
constexpr std::string_view destinationsWanted = "none, stderr, syslog or file:PATH";
constexpr std::string_view sizesWanted = "a size from 4K on, such as 500K, 16M or 1G, or 0 for no limit";
constexpr std::string_view keepWanted = "how many old files are kept, 1 to 999";
constexpr std::string_view filePrefix = "file:";

constexpr unsigned mostOldFiles = 999;
// A file for every few messages is a mistake: a unit was forgotten.
constexpr std::uint64_t smallestFile = 4096;
constexpr std::uint64_t largestFile = std::numeric_limits<std::int64_t>::max();

std::string expected(const Setting& setting, std::string_view wanted) {
  return "\"" + setting.value + "\" is not valid: expected " + std::string(wanted);
}

std::optional<std::uint64_t> parseNumber(std::string_view text) {
  std::uint64_t number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  if (error != std::errc() || end != text.data() + text.size()) {
    return std::nullopt;
  }
  return number;
}

std::optional<unsigned> parseRate(std::string_view text) {
  const std::optional<std::uint64_t> rate = parseNumber(text);
  return rate && *rate <= std::numeric_limits<unsigned>::max() ? std::optional(static_cast<unsigned>(*rate))
                                                               : std::nullopt;
}

std::optional<unsigned> parseKeep(std::string_view text) {
  const std::optional<unsigned> keep = parseRate(text);
  return keep && *keep >= 1 && *keep <= mostOldFiles ? keep : std::nullopt;
}

/// Bytes, or so many K, M or G of 1024 each; below the least size only 0.
std::optional<std::uint64_t> parseSize(std::string_view text) {
  constexpr std::string_view units = "kmg";
  const std::size_t unit = text.empty() ? std::string_view::npos : units.find(lower(text.back()));
  const bool hasUnit = unit != std::string_view::npos;
  const unsigned shift = hasUnit ? 10U * (static_cast<unsigned>(unit) + 1U) : 0U;
  const std::optional<std::uint64_t> count = parseNumber(text.substr(0, text.size() - (hasUnit ? 1 : 0)));
  if (!count || *count > largestFile >> shift) {
    return std::nullopt;
  }
  const std::uint64_t size = *count << shift;
  return size == 0 || size >= smallestFile ? std::optional(size) : std::nullopt;
}

/// Collects the settings of one sink, the file's first, then the override's.
class SinkReader {
 public:
  SinkReader(SinkSettings& sink, std::vector<ConfigurationProblem>& problems) : sink_(sink), problems_(problems) {}

  void readFile(const Configuration& file, const std::string& section) {
    take(file.find(section + ".level"), levelsWanted, parseLevel, sink_.level);
    take(file.find(section + ".destination"), destinationsWanted, parseDestination, sink_.destination);
    take(file.find(section + ".rate"), "a number of messages a minute, 0 for no limit", parseRate, rate_);
    take(file.find(section + ".size"), sizesWanted, parseSize, sink_.rotation.size);
    take(file.find(section + ".keep"), keepWanted, parseKeep, sink_.rotation.keep);
  }

  void readOverride(const Setting& setting) {
    const std::string_view value = setting.value;
    const std::size_t colon = value.find(':');
    const std::optional<int> level = parseLevel(value.substr(0, colon));
    const std::optional<Destination> destination =
        colon == std::string_view::npos ? std::nullopt : parseDestination(value.substr(colon + 1));
    if (!level || !destination) {
      problems_.push_back(
          {setting.where, expected(setting, "LEVEL:DESTINATION, where LEVEL is " + std::string(levelsWanted) +
                                                " and DESTINATION is " + std::string(destinationsWanted))});
      return;
    }
    sink_.level = *level;
    sink_.destination = *destination;
  }

  /// The rate's default depends on the destination, so it is settled last.
  void finish() {
    const bool isSystemLog = sink_.destination.kind == DestinationKind::SystemLog;
    sink_.perMinute = rate_.value_or(isSystemLog ? systemLogPerMinute : 0);
  }

 private:
  template <class Parse, class Target>
  void take(const Setting* setting, std::string_view wanted, Parse parse, Target& target) {
    if (setting == nullptr) {
      return;
    }
    if (auto value = parse(setting->value)) {
      target = *value;
    } else {
      problems_.push_back({setting->where, expected(*setting, wanted)});
    }
  }

  SinkSettings& sink_;
  std::vector<ConfigurationProblem>& problems_;
  std::optional<unsigned> rate_;
};

}  // namespace

std::optional<Destination> parseDestination(std::string_view text) {
  struct Name {
    std::string_view name;
    DestinationKind kind;
  };
  static constexpr std::array<Name, 3> names = {{
      {"none", DestinationKind::None},
      {"stderr", DestinationKind::StandardError},
      {"syslog", DestinationKind::SystemLog},
  }};
  for (const Name& row : names) {
    if (text == row.name) {
      return Destination{row.kind, {}};
    }
  }
  if (!text.starts_with(filePrefix) || text.size() == filePrefix.size()) {
    return std::nullopt;
  }
  return Destination{DestinationKind::File, std::string(text.substr(filePrefix.size()))};
}

Settings makeSettings(const Configuration& file, const std::optional<std::string>& logOverride,
                      const std::optional<std::string>& traceOverride) {
  Settings settings;
  settings.problems = file.problems();
  SinkReader log(settings.log, settings.problems);
  SinkReader trace(settings.trace, settings.problems);
  log.readFile(file, "log");
  trace.readFile(file, "trace");
  if (logOverride) {
    log.readOverride({*logOverride, "CORVANE_LOG"});
  }
  if (traceOverride) {
    trace.readOverride({*traceOverride, "CORVANE_TRACE"});
  }
  log.finish();
  trace.finish();
  return settings;
}

}  // namespace CVLog
