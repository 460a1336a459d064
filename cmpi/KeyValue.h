#ifndef CORVANE_CMPI_KEYVALUE_H
#define CORVANE_CMPI_KEYVALUE_H

#include <cmpidt.h>

#include <cstdint>
#include <string>
#include <string_view>
#include <variant>

namespace Tarn::Common {

/// The values of object path keys in a form in which equal means equal, however the broker that made
/// the path stored them: every integer type becomes one, every string type becomes a view.
struct NullValue {
  friend bool operator==(NullValue, NullValue) = default;
};

struct Integer {
  bool isNegative = false;
  std::uint64_t bits = 0;  ///< two's complement

  friend bool operator==(const Integer&, const Integer&) = default;
};

struct Character {
  CMPIChar16 unit = 0;

  friend bool operator==(const Character&, const Character&) = default;
};

struct Moment {
  bool isInterval = false;
  std::uint64_t microseconds = 0;

  friend bool operator==(const Moment&, const Moment&) = default;
};

/// What no key can be (arrays, instances, a value the broker marks as bad): equal to nothing.
struct NoKey {
  friend bool operator==(NoKey, NoKey) { return false; }
};

using KeyValue =
    std::variant<NullValue, bool, Integer, Character, double, std::string_view, Moment, const CMPIObjectPath*, NoKey>;

/// The value of a key as getKey and getKeyAt return it. Views and pointers are those of the data.
KeyValue keyValue(const CMPIData& data);

/// The value for people to read; a reference only by its kind.
std::string describe(const KeyValue& value);

/// The characters of a broker's string; no data where it, its table or its characters are missing.
std::string_view textOf(const CMPIString* string);

}  // namespace Tarn::Common

#endif
