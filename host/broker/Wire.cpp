#include "host/broker/Wire.h"

#include <bit>
#include <utility>

namespace Corvcim {
namespace {

constexpr unsigned bitsPerGroup = 7;
constexpr std::uint64_t groupMask = 0x7F;
constexpr std::uint64_t moreGroups = 0x80;

// What a value's bytes after its type hold.
enum class Content : std::uint64_t { Null, Boolean, Unsigned, Signed, Real, Text, Array, Path, Instance };

bool isUnsigned(CMPIType type) {
  return type == CMPI_char16 || (type & CMPI_SINT) == CMPI_UINT;
}
bool isReal(CMPIType type) {
  return type == CMPI_real32 || type == CMPI_real64;
}

Content contentOf(const Value& value) {
  if (value.isNull()) {
    return Content::Null;
  }
  if (value.isArray()) {
    return Content::Array;
  }
  switch (value.type()) {
    case CMPI_boolean:
      return Content::Boolean;
    case CMPI_string:
    case CMPI_dateTime:
      return Content::Text;
    case CMPI_ref:
      return Content::Path;
    case CMPI_instance:
      return Content::Instance;
    default:
      break;
  }
  if (isReal(value.type())) {
    return Content::Real;
  }
  return isUnsigned(value.type()) ? Content::Unsigned : Content::Signed;
}

class Writer {
 public:
  void number(std::uint64_t value) {
    while (value > groupMask) {
      bytes_ += static_cast<char>((value & groupMask) | moreGroups);
      value >>= bitsPerGroup;
    }
    bytes_ += static_cast<char>(value);
  }

  void text(std::string_view value) {
    number(value.size());
    bytes_ += value;
  }

  void optionalText(const std::optional<std::string>& value) {
    number(value ? 1 : 0);
    if (value) {
      text(*value);
    }
  }

  template <class T, class Write>
  void list(const std::vector<T>& values, Write write) {
    number(values.size());
    for (const T& each : values) {
      write(each);
    }
  }

  void value(const Value& value);

  void namedValues(const std::vector<NamedValue>& values) {
    list(values, [this](const NamedValue& each) {
      text(each.name);
      value(each.value);
    });
  }

  void path(const ObjectPath& path) {
    text(path.host);
    text(path.nameSpace);
    text(path.className);
    namedValues(path.keys);
  }

  void instance(const Instance& instance) {
    path(instance.path);
    namedValues(instance.properties);
  }

  std::string take() { return std::move(bytes_); }

 private:
  std::string bytes_;
};

void Writer::value(const Value& value) {
  const Content content = contentOf(value);
  number(value.type());
  number(static_cast<std::uint64_t>(content));
  switch (content) {
    case Content::Null:
      return;
    case Content::Boolean:
      return number(value.asBoolean() ? 1 : 0);
    case Content::Unsigned:
      return number(value.asUnsigned());
    case Content::Signed:
      return number(static_cast<std::uint64_t>(value.asSigned()));
    case Content::Real:
      return number(std::bit_cast<std::uint64_t>(value.asReal()));
    case Content::Text:
      return text(value.asString());
    case Content::Array:
      return list(value.elements(), [this](const Value& each) { this->value(each); });
    case Content::Path:
      return path(value.asReference());
    case Content::Instance:
      return instance(value.asInstance());
  }
}

class Reader {
 public:
  explicit Reader(std::string_view bytes) : bytes_(bytes) {}

  std::uint64_t number() {
    std::uint64_t result = 0;
    for (unsigned shift = 0; shift < 64; shift += bitsPerGroup) {
      const auto group = static_cast<unsigned char>(take(1).front());
      result |= (group & groupMask) << shift;
      if ((group & moreGroups) == 0) {
        return result;
      }
    }
    fail("a number is too long");
  }

  std::string text() { return std::string(take(number())); }

  std::optional<std::string> optionalText() {
    return number() != 0 ? std::optional<std::string>(text()) : std::nullopt;
  }

  template <class Read>
  auto list(Read read) {
    const std::uint64_t count = number();
    std::vector<decltype(read())> result;
    for (std::uint64_t i = 0; i < count; ++i) {
      result.push_back(read());
    }
    return result;
  }

  Value value();

  std::vector<NamedValue> namedValues() {
    return list([this] {
      std::string name = text();
      return NamedValue{std::move(name), value()};
    });
  }

  ObjectPath path() {
    ObjectPath result;
    result.host = text();
    result.nameSpace = text();
    result.className = text();
    result.keys = namedValues();
    return result;
  }

  Instance instance() {
    Instance result;
    result.path = path();
    result.properties = namedValues();
    return result;
  }

  void expectEnd() const {
    if (position_ != bytes_.size()) {
      fail("there are bytes after the end");
    }
  }

  [[noreturn]] void fail(const std::string& reason) const {
    throw WireError("message between host and provider process, byte " + std::to_string(position_) + ": " + reason);
  }

 private:
  std::string_view take(std::uint64_t count) {
    if (count > bytes_.size() - position_) {
      fail("the message ends too early");
    }
    const std::string_view result = bytes_.substr(position_, static_cast<std::size_t>(count));
    position_ += static_cast<std::size_t>(count);
    return result;
  }

  std::string_view bytes_;
  std::size_t position_ = 0;
};

Value Reader::value() {
  const auto type = static_cast<CMPIType>(number());
  switch (static_cast<Content>(number())) {
    case Content::Null:
      return Value::null(type);
    case Content::Boolean:
      return Value::boolean(number() != 0);
    case Content::Unsigned:
      return Value::ofUnsigned(type, number());
    case Content::Signed:
      return Value::ofSigned(type, static_cast<std::int64_t>(number()));
    case Content::Real: {
      const auto real = std::bit_cast<double>(number());
      return type == CMPI_real32 ? Value::real32(static_cast<float>(real)) : Value::real64(real);
    }
    case Content::Text:
      return type == CMPI_dateTime ? Value::dateTime(text()) : Value::string(text());
    case Content::Array:
      return Value::array(static_cast<CMPIType>(type & ~CMPI_ARRAY), list([this] { return value(); }));
    case Content::Path:
      return Value::reference(path());
    case Content::Instance:
      return Value::instance(instance());
  }
  fail("a value is of no known kind");
}

}  // namespace

std::string encode(const WireRequest& request) {
  const Operation& operation = request.operation;
  Writer writer;
  writer.text(request.className);
  writer.number(static_cast<std::uint64_t>(operation.kind));
  writer.path(operation.path);
  writer.number(operation.properties ? 1 : 0);
  if (operation.properties) {
    writer.list(*operation.properties, [&](const std::string& each) { writer.text(each); });
  }
  writer.optionalText(operation.filter.assocClass);
  writer.optionalText(operation.filter.resultClass);
  writer.optionalText(operation.filter.role);
  writer.optionalText(operation.filter.resultRole);
  return writer.take();
}

WireRequest decodeRequest(std::string_view bytes) {
  Reader reader(bytes);
  WireRequest result;
  result.className = reader.text();
  const std::uint64_t kind = reader.number();
  if (kind > static_cast<std::uint64_t>(OperationKind::ReferenceNames)) {
    reader.fail("there is no operation number " + std::to_string(kind));
  }
  Operation& operation = result.operation;
  operation.kind = static_cast<OperationKind>(kind);
  operation.path = reader.path();
  if (reader.number() != 0) {
    operation.properties = reader.list([&] { return reader.text(); });
  }
  operation.filter.assocClass = reader.optionalText();
  operation.filter.resultClass = reader.optionalText();
  operation.filter.role = reader.optionalText();
  operation.filter.resultRole = reader.optionalText();
  reader.expectEnd();
  return result;
}

std::string encode(const Response& response) {
  Writer writer;
  writer.number(static_cast<std::uint64_t>(response.rc));
  writer.optionalText(response.message);
  writer.list(response.instances, [&](const Instance& each) { writer.instance(each); });
  writer.list(response.paths, [&](const ObjectPath& each) { writer.path(each); });
  writer.number(response.doneCalls);
  return writer.take();
}

Response decodeResponse(std::string_view bytes) {
  Reader reader(bytes);
  Response result;
  result.rc = static_cast<CMPIrc>(reader.number());
  result.message = reader.optionalText();
  result.instances = reader.list([&] { return reader.instance(); });
  result.paths = reader.list([&] { return reader.path(); });
  result.doneCalls = static_cast<unsigned>(reader.number());
  reader.expectEnd();
  return result;
}

}  // namespace Corvcim
