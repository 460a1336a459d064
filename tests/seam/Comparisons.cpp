#include "tests/seam/Comparisons.h"

#include <cmpift.h>
#include <cmpimacs.h>
#include <tarn/Common.h>

#include <algorithm>
#include <string>
#include <string_view>
#include <utility>

namespace {

std::vector<Scripted::Comparison>& comparisons() {
  static std::vector<Scripted::Comparison> calls;
  return calls;
}

std::string_view textOf(const CMPIString* string) {
  const char* text = string != nullptr && string->hdl != nullptr ? CMGetCharPtr(string) : nullptr;
  return text != nullptr ? text : "";
}

char lower(char letter) {
  return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
}

bool sameName(std::string_view left, std::string_view right) {
  return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                    [](char l, char r) { return lower(l) == lower(r); });
}

bool samePath(const CMPIObjectPath* left, const CMPIObjectPath* right, bool withNameSpace);

std::string_view textOf(const CMPIData& data) {
  if (data.type == CMPI_chars) {
    return data.value.chars != nullptr ? data.value.chars : "";
  }
  return textOf(data.value.string);
}

bool isText(const CMPIData& data) {
  return data.type == CMPI_string || data.type == CMPI_chars;
}

bool sameValue(const CMPIData& left, const CMPIData& right, bool withNameSpace) {
  if (isText(left) && isText(right)) {
    return textOf(left) == textOf(right);
  }
  if (left.type != right.type) {
    return false;
  }
  switch (left.type) {
    case CMPI_ref:
      return samePath(left.value.ref, right.value.ref, withNameSpace);
    case CMPI_boolean:
    case CMPI_uint8:
    case CMPI_sint8:
      return left.value.uint8 == right.value.uint8;
    case CMPI_uint16:
    case CMPI_sint16:
    case CMPI_char16:
      return left.value.uint16 == right.value.uint16;
    case CMPI_uint32:
    case CMPI_sint32:
      return left.value.uint32 == right.value.uint32;
    default:
      return left.value.uint64 == right.value.uint64;
  }
}

bool samePath(const CMPIObjectPath* left, const CMPIObjectPath* right, bool withNameSpace) {
  if (left == nullptr || right == nullptr) {
    return false;
  }
  if (!sameName(textOf(CMGetClassName(left, nullptr)), textOf(CMGetClassName(right, nullptr)))) {
    return false;
  }
  const std::string leftSpace(textOf(CMGetNameSpace(left, nullptr)));
  const std::string rightSpace(textOf(CMGetNameSpace(right, nullptr)));
  if (withNameSpace && !leftSpace.empty() && !rightSpace.empty() && leftSpace != rightSpace) {
    return false;
  }
  const CMPICount count = CMGetKeyCount(left, nullptr);
  if (count != CMGetKeyCount(right, nullptr)) {
    return false;
  }
  for (CMPICount i = 0; i < count; ++i) {
    CMPIString* name = nullptr;
    const CMPIData leftKey = CMGetKeyAt(left, i, &name, nullptr);
    CMPIStatus status{CMPI_RC_OK, nullptr};
    const CMPIData rightKey = CMGetKey(right, std::string(textOf(name)).c_str(), &status);
    if (status.rc != CMPI_RC_OK || !sameValue(leftKey, rightKey, withNameSpace)) {
      return false;
    }
  }
  return true;
}

}  // namespace

namespace Scripted {

std::vector<Comparison> takeComparisons() {
  return std::exchange(comparisons(), {});
}

}  // namespace Scripted

namespace Tarn {

bool isObjPathsEqual(const CMPIObjectPath* left, const CMPIObjectPath* right, bool flag) {
  const bool equal = samePath(left, right, flag);
  comparisons().push_back({false, nullptr, left, right, flag, equal});
  return equal;
}

bool isObjPathsEqualWithLog(const CMPIBroker* broker, const CMPIObjectPath* left, const CMPIObjectPath* right,
                            bool flag) {
  const bool equal = samePath(left, right, flag);
  comparisons().push_back({true, broker, left, right, flag, equal});
  return equal;
}

}  // namespace Tarn
