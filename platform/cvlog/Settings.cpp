#include "platform/cvlog/Settings.h"

#include <array>
#include <charconv>
#include <functional>

#include "platform/common/Ascii.h"

namespace CVLog {
namespace {

using Tarn::Common::Configuration;
using Tarn::Common::ConfigurationProblem;
using Tarn::Common::Setting;

constexpr std::string_view kLevelsWanted = "error, warning, info, debug or a number";
constexpr std::string_view kDestinationsWanted = "none, stderr, syslog or file:PATH";
constexpr std::string_view kFilePrefix = "file:";

std::string expected(const Setting& setting, std::string_view wanted) {
  return "\"" + setting.value + "\" does not count: expected " + std::string(wanted);
}

std::optional<unsigned> parseRate(std::string_view text) {
  unsigned rate = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), rate);
  if (error != std::errc() || end != text.data() + text.size()) {
    return std::nullopt;
  }
  return rate;
}

/// Collects the settings of one sink, the file's first, then the override's.
class SinkReader {
 public:
  SinkReader(SinkSettings& sink, std::vector<ConfigurationProblem>& problems) : sink_(sink), problems_(problems) {}

  void readFile(const Configuration& file, const std::string& section) {
    take(file.find(section + ".level"), kLevelsWanted, parseLevel, sink_.level);
    take(file.find(section + ".destination"), kDestinationsWanted, parseDestination, sink_.destination);
    take(file.find(section + ".rate"), "a number of messages a minute, 0 for no limit", parseRate, rate_);
  }

  void readOverride(const Setting& setting) {
    const std::string_view value = setting.value;
    const std::size_t colon = value.find(':');
    const std::optional<int> level = parseLevel(value.substr(0, colon));
    const std::optional<Destination> destination =
        colon == std::string_view::npos ? std::nullopt : parseDestination(value.substr(colon + 1));
    if (!level || !destination) {
      problems_.push_back(
          {setting.where, expected(setting, "LEVEL:DESTINATION, where LEVEL is " + std::string(kLevelsWanted) +
                                                " and DESTINATION is " + std::string(kDestinationsWanted))});
      return;
    }
    sink_.level = *level;
    sink_.destination = *destination;
  }

  /// The rate's default depends on the destination, so it is settled last.
  void finish() {
    const bool isSystemLog = sink_.destination.kind == DestinationKind::kSystemLog;
    sink_.perMinute = rate_.value_or(isSystemLog ? kSystemLogPerMinute : 0);
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
  static constexpr std::array<Name, 3> kNames = {{
      {"none", DestinationKind::kNone},
      {"stderr", DestinationKind::kStandardError},
      {"syslog", DestinationKind::kSystemLog},
  }};
  for (const Name& row : kNames) {
    if (text == row.name) {
      return Destination{row.kind, {}};
    }
  }
  if (!text.starts_with(kFilePrefix) || text.size() == kFilePrefix.size()) {
    return std::nullopt;
  }
  return Destination{DestinationKind::kFile, std::string(text.substr(kFilePrefix.size()))};
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
