#ifndef HOST_CORVCIM_RESULTS_TEXTWRITER_H
#define HOST_CORVCIM_RESULTS_TEXTWRITER_H

#include <span>
#include <string>
#include <string_view>

#include "host/broker/Instance.h"

namespace Corvcim {

/// For people: each instance under its path, one property on each line, values aligned, codes with
/// their meaning and numbers with their unit. Control characters stand as escapes.
std::string instancesAsText(std::span<const Instance> instances);

/// One path on each line.
std::string pathsAsText(std::span<const ObjectPath> paths);

/// One value as instancesAsText shows it: `2 (Enabled)`, `2300 MHz`, `-` for null.
std::string valueAsText(std::string_view property, const Value& value);

/// Whether the value is a number of one of the unsigned types, and not null.
bool isUnsignedNumber(const Value& value);

}  // namespace Corvcim

#endif
