#ifndef TARN_COMMON_H
#define TARN_COMMON_H

#include <cmpidt.h>

#include <string>

namespace Tarn {

/// The text without the blanks (the space character only) at both ends.
std::string stripSpaces(std::string text);

/// The name of the machine that the inventory describes: for this machine its host name as the kernel has it, the
/// empty text if there is none; no resolver is asked.
std::string getSystemName();

/// The text in UTF-8. A code unit that is no character becomes U+FFFD.
std::string make_string(const std::wstring& text);

/// Whether two object paths name the same instance: the same class and the same keys with equal values.
///
/// Names compare without regard to case, strings exactly, integers by their number whatever integer type
/// holds them, references by this rule again. Host names do not count; namespaces count only when `flag`
/// is set and both paths have one. A null path, or one without a handle, equals nothing; so do references
/// that are nested more than eight deep.
bool isObjPathsEqual(const CMPIObjectPath* left, const CMPIObjectPath* right, bool flag);

/// As isObjPathsEqual, and logs the first difference at level 4000. The broker is not used.
bool isObjPathsEqualWithLog(const CMPIBroker* broker, const CMPIObjectPath* left, const CMPIObjectPath* right,
                            bool flag);

}  // namespace Tarn

#endif
