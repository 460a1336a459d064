#ifndef TARN_CMPIOBJECTS_H
#define TARN_CMPIOBJECTS_H

#include <cmpidt.h>
#include <cmpift.h>
#include <cmpimacs.h>

#include <tarn/Common.h>

#include <algorithm>
#include <cstring>
#include <iterator>
#include <string>
#include <string_view>
#include <type_traits>

/// Small helpers over CMPI objects and values. A broker may answer NULL wherever it answers an object;
/// nothing here dereferences it.
namespace Tarn::CPUProvider {

/// Brokers also say "no object" with one that has no handle.
template <class Object>
bool isNull(const Object* object) {
  return object == nullptr || object->hdl == nullptr;
}

/// Whether a key was found. It has a value if its pointer is not NULL: some brokers deliver values in the state of a
/// null value.
inline bool isFound(const CMPIData& key) {
  return (key.state & (CMPI_notFound | CMPI_badValue)) == 0;
}

/// The text, or NULL when there is none. It lives as long as the string.
inline const char* charsOrNull(const CMPIString* string, CMPIStatus* rc = nullptr) {
  return isNull(string) ? nullptr : CMGetCharsPtr(string, rc);
}

/// The same with "" for NULL.
inline const char* charsOf(const CMPIString* string, CMPIStatus* rc = nullptr) {
  const char* chars = charsOrNull(string, rc);
  return chars != nullptr ? chars : "";
}

inline const char* namespaceOf(const CMPIObjectPath* path, CMPIStatus* rc = nullptr) {
  return charsOf(CMGetNameSpace(path, rc));
}

inline const char* classNameOf(const CMPIObjectPath* path, CMPIStatus* rc = nullptr) {
  return charsOf(CMGetClassName(path, rc));
}

/// A value for a broker to read. Brokers may copy the whole union whatever the value's type is, so all of it is
/// initialized.
template <class Content>
CMPIValue wholeValue(Content CMPIValue::*member, std::type_identity_t<Content> content) {
  CMPIValue value;
  std::memset(&value, 0, sizeof(value));
  value.*member = content;
  return value;
}

/// A type of values: its code, and the member of the union that holds it.
template <class Content>
struct ValueType {
  CMPIType code;
  Content CMPIValue::*member;
};
template <class Content>
ValueType(CMPIType, Content CMPIValue::*) -> ValueType<Content>;  // clang before 17 needs this for an aggregate

inline constexpr ValueType booleanValue{CMPI_boolean, &CMPIValue::boolean};
inline constexpr ValueType uint16Value{CMPI_uint16, &CMPIValue::uint16};
inline constexpr ValueType uint32Value{CMPI_uint32, &CMPIValue::uint32};
inline constexpr ValueType uint64Value{CMPI_uint64, &CMPIValue::uint64};
inline constexpr ValueType uint16ArrayValue{CMPI_uint16A, &CMPIValue::array};

template <class Content>
void setProperty(CMPIInstance* instance, const char* name, const ValueType<Content>& type,
                 std::type_identity_t<Content> content) {
  const CMPIValue value = wholeValue(type.member, content);
  CMSetProperty(instance, name, &value, type.code);
}

// A text is no value: CMPI takes the address of its characters.

inline void setProperty(CMPIInstance* instance, const char* name, const char* text) {
  CMSetProperty(instance, name, reinterpret_cast<const CMPIValue*>(text), CMPI_chars);
}

inline void addKey(CMPIObjectPath* path, const char* name, const char* text) {
  CMAddKey(path, name, reinterpret_cast<const CMPIValue*>(text), CMPI_chars);
}

/// The broker copies the path; only the union's member is mutable.
inline CMPIValue referenceTo(const CMPIObjectPath* path) {
  return wholeValue(&CMPIValue::ref, const_cast<CMPIObjectPath*>(path));
}

inline void setProperty(CMPIInstance* instance, const char* name, const CMPIObjectPath* path) {
  const CMPIValue value = referenceTo(path);
  CMSetProperty(instance, name, &value, CMPI_ref);
}

inline void addKey(CMPIObjectPath* key, const char* name, const CMPIObjectPath* path) {
  const CMPIValue value = referenceTo(path);
  CMAddKey(key, name, &value, CMPI_ref);
}

/// An array of numbers; what the broker answers when it cannot make one.
template <class Numbers>
CMPIArray* newUint16Array(const CMPIBroker* broker, const Numbers& numbers, CMPIStatus* rc) {
  const auto count = static_cast<unsigned short>(std::size(numbers));
  CMPIArray* array = CMNewArray(broker, count, CMPI_uint16, rc);
  for (unsigned short i = 0; !isNull(array) && i < count; ++i) {
    const CMPIValue value = wholeValue(&CMPIValue::uint16, numbers[i]);
    CMSetArrayElementAt(array, i, &value, CMPI_uint16);
  }
  return array;
}

/// Class names compare without regard to case (ASCII).
inline bool equalIgnoringCase(std::string_view left, std::string_view right) {
  const auto lower = [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; };
  return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                    [&](char l, char r) { return lower(l) == lower(r); });
}

/// Gives a path the namespace of another and this system's host name.
inline void stampPath(CMPIObjectPath* path, const CMPIObjectPath* ref, const std::string& systemName = getSystemName(),
                      CMPIStatus* readStatus = nullptr) {
  CMSetNameSpace(path, namespaceOf(ref, readStatus));
  CMSetHostname(path, systemName.c_str());
}

/// A path of a class without keys, in the namespace of another and with this system's host name; what the broker
/// answers when it has none. The two statuses are of reading the namespace and of making the path.
inline CMPIObjectPath* newPath(const CMPIBroker* broker, const CMPIObjectPath* ref, const char* className,
                               const std::string& systemName, CMPIStatus* readStatus, CMPIStatus* makeStatus) {
  CMPIObjectPath* path = CMNewObjectPath(broker, namespaceOf(ref, readStatus), className, makeStatus);
  if (!isNull(path)) {
    stampPath(path, ref, systemName, readStatus);
  }
  return path;
}

/// Sets a failure with a message of the broker's making; without a broker there is no message.
inline void setFailure(const CMPIBroker* broker, CMPIStatus* rc, const char* message) {
  if (rc != nullptr) {
    rc->rc = CMPI_RC_ERR_FAILED;
    rc->msg = broker != nullptr ? CMNewString(broker, message, nullptr) : nullptr;
  }
}

}  // namespace Tarn::CPUProvider

#endif
