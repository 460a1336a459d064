#ifndef TARN_COMMON_H
#define TARN_COMMON_H

#include <cmpidt.h>

#include <string>

namespace Tarn {

/// The text without the blanks (the space character only) at both ends.
std::string stripSpaces(std::string text);

/// This machine's host name as the kernel has it; no resolver is asked.
std::string getSystemName();

/// The text in UTF-8. A code unit that is no character becomes U+FFFD.
std::string make_string(const std::wstring& text);

/// Whether two object paths name the same instance: the same class and the same keys with equal
/// values, names compared without regard to case. Host names do not count; namespaces count only
/// when `flag` is set and both paths have one.
bool isObjPathsEqual(const CMPIObjectPath* left, const CMPIObjectPath* right, bool flag);

/// As isObjPathsEqual, and logs what differed.
bool isObjPathsEqualWithLog(const CMPIBroker* broker, const CMPIObjectPath* left, const CMPIObjectPath* right,
                            bool flag);

}  // namespace Tarn

#endif
