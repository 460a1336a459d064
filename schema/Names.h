#ifndef CORVCIM_NAMES_H
#define CORVCIM_NAMES_H

#include <string_view>

#include "platform/base/Ascii.h"

namespace Corvcim {

/// CIM names compare without regard to case; only ASCII letters have one here, whatever the locale.

constexpr char toLowerAscii(char letter) {
  return Tarn::Common::lower(letter);
}

constexpr bool sameName(std::string_view left, std::string_view right) {
  return Tarn::Common::equalIgnoringCase(left, right);
}

/// Orders names so that spellings of one name are equal; for maps.
struct NameLess {
  using is_transparent = void;
  bool operator()(std::string_view left, std::string_view right) const {
    return Tarn::Common::lessIgnoringCase(left, right);
  }
};

}  // namespace Corvcim

#endif
