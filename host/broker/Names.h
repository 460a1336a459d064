#ifndef CORVCIM_NAMES_H
#define CORVCIM_NAMES_H

#include <algorithm>
#include <string_view>

namespace Corvcim {

/// CIM names compare without regard to case; only ASCII letters have one here, whatever the locale.

constexpr char toLowerAscii(char letter) {
  return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
}

constexpr bool sameName(std::string_view left, std::string_view right) {
  return std::ranges::equal(left, right, {}, toLowerAscii, toLowerAscii);
}

/// Orders names so that spellings of one name are equal; for maps.
struct NameLess {
  using is_transparent = void;
  bool operator()(std::string_view left, std::string_view right) const {
    return std::ranges::lexicographical_compare(left, right, {}, toLowerAscii, toLowerAscii);
  }
};

}  // namespace Corvcim

#endif
