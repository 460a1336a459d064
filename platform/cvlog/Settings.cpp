#include "platform/cvlog/Settings.h"

#include <charconv>
#include <limits>
#include <utility>

#include "platform/base/Ascii.h"

namespace CVLog {
namespace {

using Tarn::Common::Configuration;
using Tarn::Common::ConfigurationProblem;
using Tarn::Common::equalIgnoringCase;
using Tarn::Common::Setting;

constexpr const char* validLevels = "error, warning, info, debug or a number";
constexpr const char* validDestinations = "none, stderr, syslog or file:PATH";

template <class Number>
std::optional<Number> parseNumber(std::string_view text) {
  Number number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  return error == std::errc() && end == text.data() + text.size() ? std::optional(number) : std::nullopt;
}

std::optional<int> parseLevel(std::string_view text) {
  for (const NamedLevel& row : namedLevels) {
    if (equalIgnoringCase(text, row.name)) {
      return row.level;
    }
  }
  const std::optional<int> level = parseNumber<int>(text);
  return level >= 0 ? level : std::nullopt;
}

std::optional<unsigned> parseKeep(std::string_view text) {
  const std::optional<unsigned> keep = parseNumber<unsigned>(text);
  return keep >= 1U && keep <= 999U ? keep : std::nullopt;
}

/// Bytes, or K, M or G of 1024.
std::optional<std::uint64_t> parseSize(std::string_view text) {
  // A file for every few messages is a mistake: the unit is missing.
  constexpr std::uint64_t smallest = 4096;
  constexpr std::uint64_t largest = std::numeric_limits<std::int64_t>::max();
  const std::size_t unit = text.empty() ? 0 : std::string_view("?kmg").find(Tarn::Common::lower(text.back()));
  const bool hasUnit = unit != 0 && unit != std::string_view::npos;
  const unsigned shift = hasUnit ? 10U * static_cast<unsigned>(unit) : 0U;
  const auto count = parseNumber<std::uint64_t>(text.substr(0, text.size() - (hasUnit ? 1 : 0)));
  if (!count || *count > largest >> shift || (*count != 0 && *count << shift < smallest)) {
    return std::nullopt;
  }
  return *count << shift;
}

/// Changes the settings of one sink as the file says, and then as the override says.
void read(SinkSettings& sink, const Configuration& file, const std::string& section,
          const std::optional<Setting>& override, std::vector<ConfigurationProblem>& problems) {
  const auto note = [&](const Setting& setting, const std::string& valid) {
    problems.push_back({setting.where, '"' + setting.value + "\" is not valid: expected " + valid});
  };
  const auto take = [&](const char* key, const char* valid, auto parse, auto& target) {
    const Setting* setting = file.find(section + key);
    if (setting == nullptr) {
      return;
    }
    if (const auto value = parse(setting->value)) {
      target = *value;
    } else {
      note(*setting, valid);
    }
  };
  std::optional<unsigned> rate;
  take(".level", validLevels, parseLevel, sink.level);
  take(".destination", validDestinations, parseDestination, sink.destination);
  take(".rate", "a number of messages a minute, 0 for no limit", parseNumber<unsigned>, rate);
  take(".size", "a size from 4K on, such as 500K, 16M or 1G, or 0 for no limit", parseSize, sink.rotation.size);
  take(".keep", "how many old files are kept, 1 to 999", parseKeep, sink.rotation.keep);
  if (override) {
    const std::string_view text = override->value;
    const std::string_view levelText = text.substr(0, text.find(':'));
    const std::optional<int> level = parseLevel(levelText);
    const std::optional<Destination> destination =
        levelText == text ? std::nullopt : parseDestination(text.substr(levelText.size() + 1));
    if (level && destination) {
      sink.level = *level;
      sink.destination = *destination;
    } else {
      note(*override, std::string("LEVEL:DESTINATION, where LEVEL is ") + validLevels + " and DESTINATION is " +
                          validDestinations);
    }
  }
  const bool isSystemLog = sink.destination.kind == DestinationKind::SystemLog;
  sink.perMinute = rate.value_or(isSystemLog ? systemLogPerMinute : 0);
}

}  // namespace

std::optional<Destination> parseDestination(std::string_view text) {
  static constexpr std::pair<std::string_view, DestinationKind> names[] = {
      {"none", DestinationKind::None},
      {"stderr", DestinationKind::StandardError},
      {"syslog", DestinationKind::SystemLog},
  };
  for (const auto& [name, kind] : names) {
    if (text == name) {
      return Destination{kind};
    }
  }
  constexpr std::string_view file = "file:";
  return text.starts_with(file) && text != file
             ? std::optional(Destination{DestinationKind::File, std::string(text.substr(file.size()))})
             : std::nullopt;
}

Settings makeSettings(const Configuration& file, const std::optional<std::string>& logOverride,
                      const std::optional<std::string>& traceOverride) {
  Settings settings;
  settings.problems = file.problems();
  const auto setting = [](const std::optional<std::string>& value, const char* where) {
    return value ? std::optional(Setting{*value, where}) : std::nullopt;
  };
  read(settings.log, file, "log", setting(logOverride, "CORVANE_LOG"), settings.problems);
  read(settings.trace, file, "trace", setting(traceOverride, "CORVANE_TRACE"), settings.problems);
  return settings;
}

}  // namespace CVLog
