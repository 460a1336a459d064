#ifndef HOST_CLI_RESULTS_VALUENAMES_H
#define HOST_CLI_RESULTS_VALUENAMES_H

#include <cstdint>
#include <string_view>

namespace Corvcim {

/// What a property's code means, in the words of the CIM schema: EnabledState 2 is "Enabled". Empty
/// for a property that is no enumeration and for a code without a meaning. Property names compare
/// without regard to case.
std::string_view valueName(std::string_view property, std::uint64_t code);

/// The unit that a property counts in: MaxClockSpeed is in "MHz". Empty for a property without one.
std::string_view unitName(std::string_view property);

/// The processor family with that CIM code; empty where there is none.
std::string_view processorFamilyName(std::uint64_t code);

}  // namespace Corvcim

#endif
