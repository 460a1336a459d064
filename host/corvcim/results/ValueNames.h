#ifndef HOST_CORVCIM_RESULTS_VALUENAMES_H
#define HOST_CORVCIM_RESULTS_VALUENAMES_H

#include <cstdint>
#include <span>
#include <string_view>

namespace Corvcim {

/// A code and what it means, in the words of the CIM schema.
struct CodeName {
  std::uint16_t code;
  std::string_view name;
};

/// The codes of a property, ascending; empty for one that is no enumeration. Property names compare without regard to
/// case.
std::span<const CodeName> codesOf(std::string_view property);

/// What a property's code means, in the words of the CIM schema: EnabledState 2 is "Enabled". Empty
/// for a property that is no enumeration and for a code without a meaning. Property names compare
/// without regard to case.
std::string_view valueName(std::string_view property, std::uint64_t code);

/// The unit that a property counts in: MaxClockSpeed is in "MHz". Empty for a property without one.
std::string_view unitName(std::string_view property);

/// The codes of the processor families.
std::span<const CodeName> processorFamilies();

}  // namespace Corvcim

#endif
