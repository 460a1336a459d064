#ifndef CORVANE_PLATFORM_BASE_NEARESTNAME_H
#define CORVANE_PLATFORM_BASE_NEARESTNAME_H

#include <span>
#include <string>
#include <string_view>

namespace Tarn::Common {

/// The valid name that a mistyped one most likely means: the one with the fewest letters added, left out, replaced or
/// swapped with their neighbour, at most one for every three letters. ASCII case does not count. Empty if no name is
/// that near; the first of several that are equally near.
std::string_view nearestName(std::string_view name, std::span<const std::string_view> valid);

/// What a message about an invalid name ends with: "did you mean language?", or "there are A, B, C" if no valid name is
/// near. `there` replaces the words in front of the list.
std::string suggestNames(std::string_view name, std::span<const std::string_view> valid,
                         std::string_view there = "there are ");

}  // namespace Tarn::Common

#endif
