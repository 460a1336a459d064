#include "platform/base/NearestName.h"

#include <algorithm>
#include <numeric>
#include <vector>

#include "platform/base/Ascii.h"

namespace Tarn::Common {
namespace {

bool isSame(char left, char right) {
  return lower(left) == lower(right);
}

/// The number of edits between two names, row by row of the usual table of their beginnings.
std::size_t editsBetween(std::string_view from, std::string_view to) {
  std::vector<std::size_t> beforePrevious(to.size() + 1);
  std::vector<std::size_t> previous(to.size() + 1);
  std::vector<std::size_t> current(to.size() + 1);
  std::iota(previous.begin(), previous.end(), std::size_t{0});
  for (std::size_t i = 1; i <= from.size(); ++i) {
    current[0] = i;
    for (std::size_t j = 1; j <= to.size(); ++j) {
      const std::size_t replaced = previous[j - 1] + (isSame(from[i - 1], to[j - 1]) ? 0 : 1);
      current[j] = std::min({replaced, previous[j] + 1, current[j - 1] + 1});
      const bool isSwapped = i > 1 && j > 1 && isSame(from[i - 1], to[j - 2]) && isSame(from[i - 2], to[j - 1]);
      if (isSwapped) {
        current[j] = std::min(current[j], beforePrevious[j - 2] + 1);
      }
    }
    beforePrevious.swap(previous);
    previous.swap(current);
  }
  return previous.back();
}

}  // namespace

std::string_view nearestName(std::string_view name, std::span<const std::string_view> valid) {
  constexpr std::size_t lettersPerEdit = 3;
  std::size_t fewest = name.size() / lettersPerEdit + 1;
  std::string_view nearest;
  for (const std::string_view each : valid) {
    if (const std::size_t edits = editsBetween(name, each); edits < fewest) {
      fewest = edits;
      nearest = each;
    }
  }
  return nearest;
}

std::string suggestNames(std::string_view name, std::span<const std::string_view> valid, std::string_view there) {
  if (const std::string_view nearest = nearestName(name, valid); !nearest.empty()) {
    return "did you mean " + std::string(nearest) + "?";
  }
  std::string text(there);
  for (const std::string_view& each : valid) {
    text.append(&each == valid.data() ? "" : ", ").append(each);
  }
  return text;
}

}  // namespace Tarn::Common
