#include "host/broker/DateTime.h"

#include <array>
#include <charconv>
#include <chrono>
#include <cstdio>

namespace Corvcim {
namespace {

using std::chrono::microseconds;

constexpr std::size_t length = 25;
constexpr std::size_t pointPosition = 14;
constexpr std::size_t signPosition = 21;

constexpr std::uint64_t microsecondsPerSecond = 1000000;
constexpr std::uint64_t secondsPerMinute = 60;
constexpr std::uint64_t secondsPerHour = 3600;
constexpr std::uint64_t secondsPerDay = 86400;

std::optional<std::uint64_t> digits(std::string_view text, std::size_t start, std::size_t count) {
  std::uint64_t value = 0;
  const char* const first = text.data() + start;
  const auto result = std::from_chars(first, first + count, value);
  return result.ec == std::errc{} && result.ptr == first + count ? std::optional(value) : std::nullopt;
}

// Days since 1970 of a calendar date; nothing for a date that does not exist or lies before 1970.
std::optional<std::uint64_t> daysOf(std::uint64_t year, std::uint64_t month, std::uint64_t day) {
  const std::chrono::year_month_day date(std::chrono::year(static_cast<int>(year)),
                                         std::chrono::month(static_cast<unsigned>(month)),
                                         std::chrono::day(static_cast<unsigned>(day)));
  const auto days = date.ok() ? std::chrono::sys_days(date).time_since_epoch().count() : -1;
  return days >= 0 ? std::optional(static_cast<std::uint64_t>(days)) : std::nullopt;
}

std::optional<std::uint64_t> leadingDays(std::string_view text, bool interval) {
  if (interval) {
    return digits(text, 0, 8);
  }
  const auto year = digits(text, 0, 4);
  const auto month = digits(text, 4, 2);
  const auto day = digits(text, 6, 2);
  return year && month && day ? daysOf(*year, *month, *day) : std::nullopt;
}

}  // namespace

std::string DateTime::text() const {
  const std::uint64_t seconds = microseconds / microsecondsPerSecond;
  const auto fraction = static_cast<unsigned>(microseconds % microsecondsPerSecond);
  const auto hour = static_cast<unsigned>(seconds % secondsPerDay / secondsPerHour);
  const auto minute = static_cast<unsigned>(seconds % secondsPerHour / secondsPerMinute);
  const auto second = static_cast<unsigned>(seconds % secondsPerMinute);
  const auto days = static_cast<long>(seconds / secondsPerDay);
  std::array<char, 64> buffer{};
  if (interval) {
    std::snprintf(buffer.data(), buffer.size(), "%08ld%02u%02u%02u.%06u:000", days, hour, minute, second, fraction);
  } else {
    const std::chrono::year_month_day date{std::chrono::sys_days(std::chrono::days(days))};
    std::snprintf(buffer.data(), buffer.size(), "%04d%02u%02u%02u%02u%02u.%06u+000", static_cast<int>(date.year()),
                  static_cast<unsigned>(date.month()), static_cast<unsigned>(date.day()), hour, minute, second,
                  fraction);
  }
  return buffer.data();
}

std::optional<DateTime> DateTime::parse(std::string_view text) {
  if (text.size() != length || text[pointPosition] != '.') {
    return std::nullopt;
  }
  const char sign = text[signPosition];
  const bool interval = sign == ':';
  const auto days = leadingDays(text, interval);
  const auto hour = digits(text, 8, 2);
  const auto minute = digits(text, 10, 2);
  const auto second = digits(text, 12, 2);
  const auto fraction = digits(text, 15, 6);
  const auto offset = digits(text, 22, 3);
  if (!days || !hour || !minute || !second || !fraction || !offset || *hour > 23 || *minute > 59 || *second > 59) {
    return std::nullopt;
  }
  std::uint64_t seconds = *days * secondsPerDay + *hour * secondsPerHour + *minute * secondsPerMinute + *second;
  const std::uint64_t offsetSeconds = *offset * secondsPerMinute;
  if (sign == '+' && seconds >= offsetSeconds) {
    seconds -= offsetSeconds;
  } else if (sign == '-') {
    seconds += offsetSeconds;
  } else if (!interval || *offset != 0) {
    return std::nullopt;
  }
  return DateTime{seconds * microsecondsPerSecond + *fraction, interval};
}

DateTime DateTime::now() {
  const auto sinceEpoch = std::chrono::system_clock::now().time_since_epoch();
  return {static_cast<std::uint64_t>(std::chrono::duration_cast<std::chrono::microseconds>(sinceEpoch).count()), false};
}

}  // namespace Corvcim
