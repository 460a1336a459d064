#include "host/broker/ObjectPath.h"

#include <algorithm>
#include <ostream>

#include "schema/Names.h"

namespace Corvcim {
namespace {

bool isUnsigned(const Value& value) {
  return !value.isNull() && !value.isArray() &&
         ((value.type() & CMPI_SINT) == CMPI_UINT || value.type() == CMPI_char16);
}

bool isSigned(const Value& value) {
  return !value.isNull() && !value.isArray() && value.type() <= CMPI_sint64 && (value.type() & CMPI_SINT) == CMPI_SINT;
}

// Brokers change the width and sign of integer keys on the way, so only the number is compared.
bool sameNumber(const Value& left, const Value& right) {
  if (isUnsigned(left) && isUnsigned(right)) {
    return left.asUnsigned() == right.asUnsigned();
  }
  if (isSigned(left) && isSigned(right)) {
    return left.asSigned() == right.asSigned();
  }
  if (isSigned(left) && isUnsigned(right)) {
    return left.asSigned() >= 0 && static_cast<std::uint64_t>(left.asSigned()) == right.asUnsigned();
  }
  return isUnsigned(left) && isSigned(right) && sameNumber(right, left);
}

bool sameKeyValue(const Value& left, const Value& right) {
  if (left.isNull() || right.isNull()) {
    return left.isNull() && right.isNull();
  }
  if (left.type() == CMPI_ref && right.type() == CMPI_ref) {
    return namesSameInstance(left.asReference(), right.asReference());
  }
  return left == right || sameNumber(left, right);
}

}  // namespace

std::string ObjectPath::text() const {
  std::string result;
  if (!host.empty()) {
    result += "//" + host + "/";
  }
  result += nameSpace;
  if (!nameSpace.empty() || !host.empty()) {
    result += ':';
  }
  result += className;
  char separator = '.';
  for (const NamedValue& each : keys) {
    result += separator;
    result += each.name + "=" + each.value.text();
    separator = ',';
  }
  return result;
}

std::ostream& operator<<(std::ostream& stream, const ObjectPath& path) {
  return stream << path.text();
}

bool namesSameInstance(const ObjectPath& left, const ObjectPath& right) {
  if (!sameName(left.className, right.className) || left.keys.size() != right.keys.size()) {
    return false;
  }
  if (!left.nameSpace.empty() && !right.nameSpace.empty() && !sameName(left.nameSpace, right.nameSpace)) {
    return false;
  }
  return std::ranges::all_of(left.keys, [&](const NamedValue& each) {
    const Value* other = right.key(each.name);
    return other != nullptr && sameKeyValue(each.value, *other);
  });
}

}  // namespace Corvcim
