#ifndef CORVANE_PLATFORM_INVENTORY_TREE_PATHFORMS_H
#define CORVANE_PLATFORM_INVENTORY_TREE_PATHFORMS_H

#include <string>
#include <string_view>

namespace Tarn::Inventory {

/// A node's internal path is its printable path after a slash: the two cannot be mistaken for each
/// other, need no look-up, and are short enough to be kept without memory of their own.
inline constexpr char internalMark = '/';

/// Whether a text can be a printable path: not empty, and of visible ASCII characters only.
inline bool isPrintablePath(std::string_view text) {
  for (const char c : text) {
    if (c <= ' ' || c > '~') {
      return false;
    }
  }
  return !text.empty();
}

/// The internal form of a printable path. Empty stays empty: it is no path in either form.
inline std::string toInternalPath(std::string_view printable) {
  std::string internal;
  if (!printable.empty()) {
    internal.reserve(printable.size() + 1);
    internal += internalMark;
    internal += printable;
  }
  return internal;
}

/// The printable form of an internal path; empty for a text that is none.
inline std::string toPrintablePath(std::string_view internal) {
  return internal.empty() || internal.front() != internalMark ? std::string() : std::string(internal.substr(1));
}

}  // namespace Tarn::Inventory

#endif
