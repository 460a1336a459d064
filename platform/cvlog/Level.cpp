#include "platform/cvlog/Level.h"

#include <syslog.h>

#include <algorithm>
#include <array>
#include <charconv>

#include "platform/common/Ascii.h"

namespace CVLog {
namespace {

struct NamedLevel {
  int level;
  std::string_view name;
  int priority;
};

constexpr std::array<NamedLevel, 4> levels = {{
    {levelError, "error", LOG_ERR},
    {levelWarning, "warning", LOG_WARNING},
    {levelInfo, "info", LOG_INFO},
    {levelDebug, "debug", LOG_DEBUG},
}};

const NamedLevel& named(int level) {
  const auto* found =
      std::find_if(levels.begin(), levels.end(), [level](const NamedLevel& row) { return level >= row.level; });
  return found == levels.end() ? levels.back() : *found;
}

}  // namespace

std::string_view levelName(int level) {
  return named(level).name;
}

int syslogPriority(int level) {
  return named(level).priority;
}

std::optional<int> parseLevel(std::string_view text) {
  for (const NamedLevel& row : levels) {
    if (Tarn::Common::equalIgnoringCase(text, row.name)) {
      return row.level;
    }
  }
  int level = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), level);
  if (error != std::errc() || end != text.data() + text.size() || level < 0) {
    return std::nullopt;
  }
  return level;
}

}  // namespace CVLog
