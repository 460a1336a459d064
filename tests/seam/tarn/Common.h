#ifndef TESTS_SEAM_COMMON_H
#define TESTS_SEAM_COMMON_H

#include <cmpidt.h>

#include <string>

namespace Tarn {

std::string stripSpaces(std::string text);
std::string getSystemName();
std::string make_string(const std::wstring& text);
bool isObjPathsEqual(const CMPIObjectPath* left, const CMPIObjectPath* right, bool flag);
bool isObjPathsEqualWithLog(const CMPIBroker* broker, const CMPIObjectPath* left, const CMPIObjectPath* right,
                            bool flag);

}  // namespace Tarn

#endif
