#ifndef CORVCIM_DATE_TIME_H
#define CORVCIM_DATE_TIME_H

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace Corvcim {

/// A CIM date-time: a moment in microseconds since 1970 UTC, or an interval in microseconds.
struct DateTime {
  std::uint64_t microseconds = 0;
  bool interval = false;

  /// The 25 characters: yyyymmddhhmmss.mmmmmm+000 or ddddddddhhmmss.mmmmmm:000. Moments are printed in UTC.
  [[nodiscard]] std::string text() const;

  /// Reads either form, a moment with any offset to UTC in minutes; nothing if the text is neither.
  static std::optional<DateTime> parse(std::string_view text);

  static DateTime now();
};

}  // namespace Corvcim

#endif
