#ifndef CORVCIM_VALUE_H
#define CORVCIM_VALUE_H

#include <cmpidt.h>

#include <cstdint>
#include <iosfwd>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

namespace Corvcim {

struct ObjectPath;
struct Instance;

/// One CIM value with its exact CMPI type, free of any broker object: it may be copied, compared,
/// kept and sent anywhere.
///
/// Texts are always CMPI_string (a provider's CMPI_chars included), date-times are their 25-character
/// text, arrays have the element's type plus CMPI_ARRAY. A value of any type may be NULL. The as…
/// accessors throw std::bad_variant_access when the value is NULL or of another kind.
class Value {
 public:
  Value() = default;  ///< NULL without a type

  static Value null(CMPIType type);
  static Value boolean(bool value);
  static Value char16(CMPIChar16 value);
  static Value uint8(std::uint8_t value);
  static Value uint16(std::uint16_t value);
  static Value uint32(std::uint32_t value);
  static Value uint64(std::uint64_t value);
  static Value sint8(std::int8_t value);
  static Value sint16(std::int16_t value);
  static Value sint32(std::int32_t value);
  static Value sint64(std::int64_t value);
  static Value real32(float value);
  static Value real64(double value);
  static Value string(std::string_view value);
  static Value dateTime(std::string_view value);
  static Value reference(ObjectPath path);
  static Value instance(Instance instance);
  /// Elements must be of `elementType` (a code without CMPI_ARRAY) or NULL.
  static Value array(CMPIType elementType, std::vector<Value> elements);
  static Value uint16Array(const std::vector<std::uint16_t>& elements);
  static Value stringArray(const std::vector<std::string>& elements);

  /// An integer of any integer type by its number, for codecs; the number must fit the type.
  static Value ofUnsigned(CMPIType type, std::uint64_t value);
  static Value ofSigned(CMPIType type, std::int64_t value);

  [[nodiscard]] CMPIType type() const { return type_; }
  [[nodiscard]] bool isNull() const { return std::holds_alternative<std::monostate>(data_); }
  [[nodiscard]] bool isArray() const { return (type_ & CMPI_ARRAY) != 0; }

  [[nodiscard]] bool asBoolean() const { return std::get<bool>(data_); }
  [[nodiscard]] std::uint64_t asUnsigned() const { return std::get<std::uint64_t>(data_); }  ///< uint…, char16
  [[nodiscard]] std::int64_t asSigned() const { return std::get<std::int64_t>(data_); }      ///< sint…
  [[nodiscard]] double asReal() const { return std::get<double>(data_); }
  [[nodiscard]] const std::string& asString() const { return std::get<std::string>(data_); }  ///< string, dateTime
  [[nodiscard]] const ObjectPath& asReference() const { return *std::get<PathPointer>(data_); }
  [[nodiscard]] const Instance& asInstance() const { return *std::get<InstancePointer>(data_); }
  [[nodiscard]] const std::vector<Value>& elements() const { return std::get<std::vector<Value>>(data_); }

  /// As MOF writes it: "text", 42, TRUE, {1, 2}, NULL; a reference is its quoted path.
  [[nodiscard]] std::string text() const;

  /// Same type and same content, texts byte for byte.
  friend bool operator==(const Value& left, const Value& right);
  friend std::ostream& operator<<(std::ostream& stream, const Value& value);

 private:
  using PathPointer = std::shared_ptr<const ObjectPath>;
  using InstancePointer = std::shared_ptr<const Instance>;
  using Data = std::variant<std::monostate, bool, std::uint64_t, std::int64_t, double, std::string, std::vector<Value>,
                            PathPointer, InstancePointer>;

  /// Data is made in place: moving a variant would be a step that changes nothing.
  template <class Content>
  Value(CMPIType type, Content content) : type_(type), data_(std::move(content)) {}

  CMPIType type_ = CMPI_null;
  Data data_;
};

struct NamedValue {
  std::string name;
  Value value;

  friend bool operator==(const NamedValue&, const NamedValue&) = default;
};

/// The value of that name, without regard to case; nullptr if there is none.
[[nodiscard]] const Value* findValue(const std::vector<NamedValue>& values, std::string_view name);

/// Replaces the value of that name (keeping its first spelling and place) or appends it.
void assignValue(std::vector<NamedValue>& values, std::string_view name, Value value);

/// "uint16", "string", "uint16[]", "ref", ...; the number in hexadecimal for a code that is no type.
[[nodiscard]] std::string typeName(CMPIType type);

/// `text` in double quotes, with backslash, quote and control characters escaped as MOF does.
[[nodiscard]] std::string quotedText(std::string_view text);

}  // namespace Corvcim

#endif
