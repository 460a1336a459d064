#include "host/broker/Value.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <ostream>

#include "host/broker/Instance.h"
#include "host/broker/ObjectPath.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

struct TypeName {
  CMPIType type;
  std::string_view name;
};

constexpr TypeName typeNames[] = {
    {CMPI_boolean, "boolean"},   {CMPI_char16, "char16"},     {CMPI_real32, "real32"}, {CMPI_real64, "real64"},
    {CMPI_uint8, "uint8"},       {CMPI_uint16, "uint16"},     {CMPI_uint32, "uint32"}, {CMPI_uint64, "uint64"},
    {CMPI_sint8, "sint8"},       {CMPI_sint16, "sint16"},     {CMPI_sint32, "sint32"}, {CMPI_sint64, "sint64"},
    {CMPI_instance, "instance"}, {CMPI_ref, "ref"},           {CMPI_args, "args"},     {CMPI_class, "class"},
    {CMPI_filter, "filter"},     {CMPI_enumeration, "enum"},  {CMPI_string, "string"}, {CMPI_chars, "chars"},
    {CMPI_dateTime, "datetime"}, {CMPI_charsptr, "charsptr"}, {CMPI_ptr, "ptr"},
};

template <class... Ts>
struct Overloaded : Ts... {
  using Ts::operator()...;
};
template <class... Functions>
Overloaded(Functions...) -> Overloaded<Functions...>;  // clang before 17 needs this for an aggregate

std::string realText(double value) {
  std::array<char, 32> buffer{};
  const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
  return {buffer.data(), result.ptr};
}

std::string listText(const std::vector<Value>& elements) {
  std::string result = "{";
  for (const Value& element : elements) {
    if (result.size() > 1) {
      result += ", ";
    }
    result += element.text();
  }
  return result + "}";
}

}  // namespace

Value Value::null(CMPIType type) {
  return {type, std::monostate{}};
}
Value Value::boolean(bool value) {
  return {CMPI_boolean, value};
}
Value Value::char16(CMPIChar16 value) {
  return ofUnsigned(CMPI_char16, value);
}
Value Value::uint8(std::uint8_t value) {
  return ofUnsigned(CMPI_uint8, value);
}
Value Value::uint16(std::uint16_t value) {
  return ofUnsigned(CMPI_uint16, value);
}
Value Value::uint32(std::uint32_t value) {
  return ofUnsigned(CMPI_uint32, value);
}
Value Value::uint64(std::uint64_t value) {
  return ofUnsigned(CMPI_uint64, value);
}
Value Value::sint8(std::int8_t value) {
  return ofSigned(CMPI_sint8, value);
}
Value Value::sint16(std::int16_t value) {
  return ofSigned(CMPI_sint16, value);
}
Value Value::sint32(std::int32_t value) {
  return ofSigned(CMPI_sint32, value);
}
Value Value::sint64(std::int64_t value) {
  return ofSigned(CMPI_sint64, value);
}
Value Value::real32(float value) {
  return {CMPI_real32, static_cast<double>(value)};
}
Value Value::real64(double value) {
  return {CMPI_real64, value};
}
Value Value::string(std::string_view value) {
  return {CMPI_string, std::string(value)};
}
Value Value::dateTime(std::string_view value) {
  return {CMPI_dateTime, std::string(value)};
}

Value Value::reference(ObjectPath path) {
  return {CMPI_ref, std::make_shared<const ObjectPath>(std::move(path))};
}

Value Value::instance(Instance instance) {
  return {CMPI_instance, std::make_shared<const Instance>(std::move(instance))};
}

Value Value::array(CMPIType elementType, std::vector<Value> elements) {
  return {static_cast<CMPIType>(elementType | CMPI_ARRAY), std::move(elements)};
}

Value Value::uint16Array(const std::vector<std::uint16_t>& elements) {
  std::vector<Value> values(elements.size());
  std::ranges::transform(elements, values.begin(), uint16);
  return array(CMPI_uint16, std::move(values));
}

Value Value::stringArray(const std::vector<std::string>& elements) {
  std::vector<Value> values(elements.size());
  std::ranges::transform(elements, values.begin(), string);
  return array(CMPI_string, std::move(values));
}

Value Value::ofUnsigned(CMPIType type, std::uint64_t value) {
  return {type, value};
}
Value Value::ofSigned(CMPIType type, std::int64_t value) {
  return {type, value};
}

std::string Value::text() const {
  return std::visit(Overloaded{
                        [](std::monostate) { return std::string("NULL"); },
                        [](bool value) { return std::string(value ? "TRUE" : "FALSE"); },
                        [](std::uint64_t value) { return std::to_string(value); },
                        [](std::int64_t value) { return std::to_string(value); },
                        [](double value) { return realText(value); },
                        [](const std::string& value) { return quotedText(value); },
                        [](const std::vector<Value>& values) { return listText(values); },
                        [](const PathPointer& path) { return quotedText(path->text()); },
                        [](const InstancePointer& instance) { return quotedText(instance->text()); },
                    },
                    data_);
}

bool operator==(const Value& left, const Value& right) {
  if (left.type_ != right.type_ || left.data_.index() != right.data_.index()) {
    return false;
  }
  if (std::holds_alternative<Value::PathPointer>(left.data_)) {
    return left.asReference() == right.asReference();
  }
  if (std::holds_alternative<Value::InstancePointer>(left.data_)) {
    return left.asInstance() == right.asInstance();
  }
  return left.data_ == right.data_;
}

std::ostream& operator<<(std::ostream& stream, const Value& value) {
  return stream << typeName(value.type()) << ' ' << value.text();
}

const Value* findValue(const std::vector<NamedValue>& values, std::string_view name) {
  const auto found = std::ranges::find_if(values, [&](const NamedValue& each) { return sameName(each.name, name); });
  return found == values.end() ? nullptr : &found->value;
}

void assignValue(std::vector<NamedValue>& values, std::string_view name, Value value) {
  const auto found = std::ranges::find_if(values, [&](const NamedValue& each) { return sameName(each.name, name); });
  if (found != values.end()) {
    found->value = std::move(value);
    return;
  }
  values.push_back({std::string(name), std::move(value)});
}

std::string typeName(CMPIType type) {
  const auto element = static_cast<CMPIType>(type & ~CMPI_ARRAY);
  const std::string suffix = (type & CMPI_ARRAY) != 0 ? "[]" : "";
  const auto* found = std::ranges::find(typeNames, element, &TypeName::type);
  if (found != std::end(typeNames)) {
    return std::string(found->name) + suffix;
  }
  if (type == CMPI_null) {
    return "null";
  }
  std::array<char, 8> digits{};
  const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), type, 16);
  return "0x" + std::string(digits.data(), result.ptr);
}

std::string quotedText(std::string_view text) {
  constexpr std::string_view hexDigits = "0123456789abcdef";
  constexpr unsigned char firstPrintable = 0x20;
  std::string result = "\"";
  for (const char letter : text) {
    const auto code = static_cast<unsigned char>(letter);
    if (letter == '"' || letter == '\\') {
      result += {'\\', letter};
    } else if (letter == '\n') {
      result += "\\n";
    } else if (letter == '\t') {
      result += "\\t";
    } else if (code < firstPrintable) {
      result += {'\\', 'x', '0', '0', hexDigits[code >> 4U], hexDigits[code & 0xFU]};
    } else {
      result += letter;
    }
  }
  return result + '"';
}

}  // namespace Corvcim
