// Reads the WBEM form of object paths:
//   [http:|https:] [//host/ | /] [namespace:] Class [.key=value[,key=value...]]
// A value is a text in double quotes with backslash escapes, TRUE, FALSE or an integer.

#include <algorithm>
#include <charconv>
#include <limits>
#include <optional>

#include "host/broker/ObjectPath.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

// References hold paths that hold references; real ones are one deep.
constexpr unsigned deepestNesting = 8;

bool isNameLetter(char letter) {
  return (letter >= 'a' && letter <= 'z') || (letter >= 'A' && letter <= 'Z') || (letter >= '0' && letter <= '9') ||
         letter == '_' || static_cast<unsigned char>(letter) >= 0x80;
}

unsigned bitsOf(CMPIType type) {
  constexpr unsigned widthMask = 0x30;
  constexpr unsigned smallest = 8;
  return smallest << ((type & widthMask) >> 4U);
}

class Parser {
 public:
  Parser(std::string_view text, unsigned nesting) : text_(text), nesting_(nesting) {}

  ObjectPath path() {
    ObjectPath result;
    readHost(result);
    readNameSpace(result);
    result.className = readName("a class name");
    definition_ = findClass(result.className);
    if (atEnd()) {
      return result;
    }
    expect('.', "'.' and the keys, or the end, after the class name");
    do {
      readKey(result);
    } while (accept(','));
    if (!atEnd()) {
      fail("expected ',' or the end after a key's value");
    }
    return result;
  }

 private:
  void readHost(ObjectPath& result) {
    for (const std::string_view scheme : {"http://", "https://"}) {
      if (text_.starts_with(scheme)) {
        position_ = scheme.size() - 2;
      }
    }
    if (!text_.substr(position_).starts_with("//")) {
      accept('/');
      return;
    }
    position_ += 2;
    const std::size_t end = text_.find('/', position_);
    if (end == std::string_view::npos) {
      fail("expected '/' and a namespace after the host");
    }
    result.host = text_.substr(position_, end - position_);
    if (result.host.empty()) {
      fail("the host is empty");
    }
    position_ = end + 1;
  }

  void readNameSpace(ObjectPath& result) {
    const std::size_t end = text_.find_first_of(":.=\"", position_);
    if (end == std::string_view::npos || text_[end] != ':') {
      if (!result.host.empty()) {
        fail("expected a namespace and ':' after the host");
      }
      return;
    }
    result.nameSpace = text_.substr(position_, end - position_);
    if (result.nameSpace.empty() && result.host.empty()) {
      fail("the namespace before ':' is empty");
    }
    position_ = end + 1;
  }

  void readKey(ObjectPath& result) {
    const std::size_t start = position_;
    std::string name = readName("a key name");
    if (result.key(name) != nullptr) {
      failAt(start, "key " + name + " is given twice");
    }
    expect('=', "'=' after the key name " + name);
    const PropertyDefinition* known = definition_ != nullptr ? findProperty(*definition_, name) : nullptr;
    Value value = readValue(known != nullptr ? std::optional(known->type) : std::nullopt);
    result.keys.push_back({std::move(name), std::move(value)});
  }

  Value readValue(std::optional<CMPIType> type) {
    const std::size_t start = position_;
    if (atEnd()) {
      fail("expected a value: a text in double quotes, TRUE, FALSE or a number");
    }
    if (text_[position_] == '"') {
      return quotedValue(start, type);
    }
    const std::size_t end = std::min(text_.find(',', position_), text_.size());
    const std::string_view word = text_.substr(position_, end - position_);
    position_ = end;
    if (const CMPIType known = type.value_or(CMPI_null); known == CMPI_string || known == CMPI_ref) {
      failAt(start, "this key's value is a text and must stand in double quotes");
    }
    if (type.value_or(CMPI_boolean) == CMPI_boolean && (sameName(word, "TRUE") || sameName(word, "FALSE"))) {
      return Value::boolean(sameName(word, "TRUE"));
    }
    return number(start, word, type);
  }

  Value quotedValue(std::size_t start, std::optional<CMPIType> type) {
    const std::string content = readQuoted();
    if (type.value_or(CMPI_string) == CMPI_string) {
      return Value::string(content);
    }
    if (type == CMPI_dateTime) {
      return Value::dateTime(content);
    }
    if (type != CMPI_ref) {
      failAt(start, "this key's value is of type " + typeName(*type) + " and must stand without quotes");
    }
    if (nesting_ == deepestNesting) {
      failAt(start, "references are nested too deeply");
    }
    try {
      return Value::reference(Parser(content, nesting_ + 1).path());
    } catch (const PathSyntaxError& error) {
      failAt(start, std::string("the reference is no object path: ") + error.what());
    }
  }

  Value number(std::size_t start, std::string_view word, std::optional<CMPIType> type) {
    const char* const first = word.data();
    const char* const last = word.data() + word.size();
    const bool isNegative = word.starts_with('-');
    const bool wantsSigned = type.has_value() ? (*type & CMPI_SINT) == CMPI_SINT : true;
    if (isNegative || wantsSigned) {
      std::int64_t value = 0;
      const auto result = std::from_chars(first, last, value);
      if (result.ec == std::errc{} && result.ptr == last && fits(value, type)) {
        return Value::ofSigned(type.value_or(CMPI_sint64), value);
      }
    }
    std::uint64_t value = 0;
    const auto result = std::from_chars(first, last, value);
    if (result.ec == std::errc{} && result.ptr == last && fits(value, type)) {
      return Value::ofUnsigned(type.value_or(CMPI_uint64), value);
    }
    failAt(start, "expected a value: a text in double quotes, TRUE, FALSE or a number" +
                      (type.has_value() ? " of type " + typeName(*type) : std::string()));
  }

  static bool fits(std::int64_t value, std::optional<CMPIType> type) {
    if (type.has_value() && (*type & CMPI_SINT) != CMPI_SINT) {
      return false;
    }
    const unsigned bits = bitsOf(type.value_or(CMPI_sint64));
    const std::int64_t limit = std::numeric_limits<std::int64_t>::max() >> (64U - bits);
    return value <= limit && value >= -limit - 1;
  }

  static bool fits(std::uint64_t value, std::optional<CMPIType> type) {
    if (type.has_value() && (*type & CMPI_SINT) != CMPI_UINT) {
      return false;
    }
    return value <= std::numeric_limits<std::uint64_t>::max() >> (64U - bitsOf(type.value_or(CMPI_uint64)));
  }

  std::string readName(std::string_view what) {
    const std::size_t start = position_;
    while (!atEnd() && isNameLetter(text_[position_])) {
      ++position_;
    }
    if (position_ == start) {
      fail("expected " + std::string(what));
    }
    return std::string(text_.substr(start, position_ - start));
  }

  std::string readQuoted() {
    const std::size_t start = position_;
    std::string result;
    for (++position_; !atEnd(); ++position_) {
      const char letter = text_[position_];
      if (letter == '"') {
        ++position_;
        return result;
      }
      result += letter == '\\' ? readEscape(start) : letter;
    }
    failAt(start, "the text has no closing double quote");
  }

  char readEscape(std::size_t start) {
    ++position_;
    if (atEnd()) {
      failAt(start, "the text has no closing double quote");
    }
    switch (text_[position_]) {
      case 'n':
        return '\n';
      case 't':
        return '\t';
      case 'x':
        return readCode();
      default:
        return text_[position_];
    }
  }

  // \xHHHH, for control characters only: that is what printing writes.
  char readCode() {
    constexpr std::size_t digits = 4;
    constexpr unsigned largest = 0x7F;
    const std::string_view word = text_.substr(position_ + 1, digits);
    unsigned code = 0;
    const auto result = std::from_chars(word.data(), word.data() + word.size(), code, 16);
    if (word.size() != digits || result.ptr != word.data() + digits || code > largest) {
      fail("expected four hexadecimal digits up to 007f after \\x");
    }
    position_ += digits;
    return static_cast<char>(code);
  }

  [[nodiscard]] bool atEnd() const { return position_ == text_.size(); }

  bool accept(char letter) {
    if (atEnd() || text_[position_] != letter) {
      return false;
    }
    ++position_;
    return true;
  }

  void expect(char letter, const std::string& what) {
    if (!accept(letter)) {
      fail("expected " + what);
    }
  }

  [[noreturn]] void fail(const std::string& reason) const { failAt(position_, reason); }
  [[noreturn]] void failAt(std::size_t offset, const std::string& reason) const {
    throw PathSyntaxError(text_, offset, reason);
  }

  std::string_view text_;
  std::size_t position_ = 0;
  unsigned nesting_;
  const ClassDefinition* definition_ = nullptr;
};

}  // namespace

PathSyntaxError::PathSyntaxError(std::string_view text, std::size_t offset, std::string_view reason)
    : std::runtime_error("object path " + quotedText(text) + ", column " + std::to_string(offset + 1) + ": " +
                         std::string(reason)),
      offset_(offset) {}

ObjectPath ObjectPath::parse(std::string_view text) {
  return Parser(text, 0).path();
}

}  // namespace Corvcim
