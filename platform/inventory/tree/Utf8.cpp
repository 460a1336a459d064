#include "platform/inventory/tree/Utf8.h"

#include <algorithm>
#include <cstdint>

namespace Tarn::Inventory {

namespace {

constexpr std::string_view replacement = "\xEF\xBF\xBD";

std::uint8_t byteAt(std::string_view text, std::size_t i) {
  return static_cast<std::uint8_t>(text[i]);
}

bool isBetween(std::uint8_t byte, std::uint8_t low, std::uint8_t high) {
  return byte >= low && byte <= high;
}

// The length of the character at the start of `text`, or 0. The second byte's range shuts out overlong
// forms, surrogates and what lies beyond U+10FFFF.
std::size_t characterLength(std::string_view text) {
  const std::uint8_t lead = byteAt(text, 0);
  if (lead < 0x80) {
    return 1;
  }
  const std::size_t length = isBetween(lead, 0xC2, 0xDF)   ? 2
                             : isBetween(lead, 0xE0, 0xEF) ? 3
                             : isBetween(lead, 0xF0, 0xF4) ? 4
                                                           : 0;
  if (length == 0 || text.size() < length) {
    return 0;
  }
  const std::uint8_t low = lead == 0xE0 ? 0xA0 : lead == 0xF0 ? 0x90 : 0x80;
  const std::uint8_t high = lead == 0xED ? 0x9F : lead == 0xF4 ? 0x8F : 0xBF;
  if (!isBetween(byteAt(text, 1), low, high)) {
    return 0;
  }
  for (std::size_t i = 2; i < length; ++i) {
    if (!isBetween(byteAt(text, i), 0x80, 0xBF)) {
      return 0;
    }
  }
  return length;
}

}  // namespace

std::string validUtf8(std::string_view text) {
  if (std::ranges::all_of(text, [](char c) { return static_cast<std::uint8_t>(c) < 0x80; })) {
    return std::string(text);
  }
  std::string valid;
  while (!text.empty()) {
    const std::size_t length = characterLength(text);
    valid += length == 0 ? replacement : text.substr(0, length);
    text.remove_prefix(std::max<std::size_t>(length, 1));
  }
  return valid;
}

}  // namespace Tarn::Inventory
