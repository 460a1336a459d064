#ifndef TARN_CMPIOBJECTS_H
#define TARN_CMPIOBJECTS_H

#include <cmpidt.h>
#include <cmpift.h>
#include <cmpimacs.h>

#include <tarn/Common.h>

#include <algorithm>
#include <string>
#include <string_view>

/// The few things that are said again and again about CMPI objects. A broker may answer NULL
/// wherever it answers an object; nothing here dereferences it.
namespace Tarn::CPUProvider {

/// Brokers also say "no object" with one that has no handle.
template <class Object>
bool isNull(const Object* object) {
  return object == nullptr || object->hdl == nullptr;
}

/// Whether there is a value at all. What the value holds where there is none is anybody's guess.
inline bool hasValue(const CMPIData& data) {
  constexpr CMPIValueState noValue = CMPI_nullValue | CMPI_notFound | CMPI_badValue;
  return (data.state & noValue) == 0;
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
