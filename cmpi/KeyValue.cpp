#include "cmpi/KeyValue.h"

#include <cmpift.h>

namespace Tarn::Common {
namespace {

template <class Number>
Integer integer(Number number) {
  return {number < 0, static_cast<std::uint64_t>(number)};
}

/// A string without characters is a null.
KeyValue text(std::string_view characters) {
  if (characters.data() == nullptr) {
    return NullValue{};
  }
  return characters;
}

std::string_view charactersAt(const CMPIValuePtr& place) {
  const auto* characters = static_cast<const char*>(place.ptr);
  return characters == nullptr ? std::string_view() : std::string_view(characters, place.length);
}

std::string_view charactersAt(const char* characters) {
  return characters == nullptr ? std::string_view() : std::string_view(characters);
}

KeyValue moment(const CMPIDateTime* dateTime) {
  if (dateTime == nullptr) {
    return NullValue{};
  }
  if (dateTime->ft == nullptr) {
    return NoKey{};
  }
  CMPIStatus status{CMPI_RC_OK, nullptr};
  const CMPIBoolean isInterval = dateTime->ft->isInterval(dateTime, &status);
  if (status.rc != CMPI_RC_OK) {
    return NoKey{};
  }
  const CMPIUint64 microseconds = dateTime->ft->getBinaryFormat(dateTime, &status);
  if (status.rc != CMPI_RC_OK) {
    return NoKey{};
  }
  return Moment{isInterval != 0, microseconds};
}

KeyValue reference(const CMPIObjectPath* path) {
  if (path == nullptr) {
    return NullValue{};
  }
  return path;
}

/// Types whose values show by themselves whether they are null. Some brokers deliver them in the state of a null value.
bool isPointer(CMPIType type) {
  return type == CMPI_string || type == CMPI_chars || type == CMPI_charsptr || type == CMPI_dateTime ||
         type == CMPI_ref;
}

std::string quoted(std::string_view characters) {
  return '"' + std::string(characters) + '"';
}

struct Description {
  std::string operator()(NullValue) const { return "null"; }
  std::string operator()(bool value) const { return value ? "true" : "false"; }
  std::string operator()(const Integer& value) const {
    return value.isNegative ? std::to_string(static_cast<std::int64_t>(value.bits)) : std::to_string(value.bits);
  }
  std::string operator()(const Character& value) const { return "character " + std::to_string(value.unit); }
  std::string operator()(double value) const { return std::to_string(value); }
  std::string operator()(std::string_view value) const { return quoted(value); }
  std::string operator()(const Moment& value) const {
    return (value.isInterval ? "interval " : "time ") + std::to_string(value.microseconds);
  }
  std::string operator()(const CMPIObjectPath*) const { return "a reference"; }
  std::string operator()(NoKey) const { return "a value that no key can have"; }
};

}  // namespace

KeyValue keyValue(const CMPIData& data) {
  if ((data.state & (CMPI_badValue | CMPI_notFound)) != 0) {
    return NoKey{};
  }
  if ((data.state & CMPI_nullValue) != 0 && !isPointer(data.type)) {
    return NullValue{};
  }
  const CMPIValue& value = data.value;
  switch (data.type) {
    case CMPI_boolean:
      return value.boolean != 0;
    case CMPI_char16:
      return Character{value.char16};
    case CMPI_uint8:
      return integer(value.uint8);
    case CMPI_uint16:
      return integer(value.uint16);
    case CMPI_uint32:
      return integer(value.uint32);
    case CMPI_uint64:
      return integer(value.uint64);
    case CMPI_sint8:
      return integer(value.sint8);
    case CMPI_sint16:
      return integer(value.sint16);
    case CMPI_sint32:
      return integer(value.sint32);
    case CMPI_sint64:
      return integer(value.sint64);
    case CMPI_real32:
      return static_cast<double>(value.real32);
    case CMPI_real64:
      return value.real64;
    case CMPI_string:
      return text(textOf(value.string));
    case CMPI_chars:
      return text(charactersAt(value.chars));
    case CMPI_charsptr:
      return text(charactersAt(value.dataPtr));
    case CMPI_dateTime:
      return moment(value.dateTime);
    case CMPI_ref:
      return reference(value.ref);
    default:
      return NoKey{};
  }
}

std::string describe(const KeyValue& value) {
  return std::visit(Description{}, value);
}

std::string_view textOf(const CMPIString* string) {
  if (string == nullptr || string->ft == nullptr) {
    return {};
  }
  return charactersAt(string->ft->getCharPtr(string, nullptr));
}

}  // namespace Tarn::Common
