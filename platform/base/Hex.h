#ifndef CORVANE_PLATFORM_BASE_HEX_H
#define CORVANE_PLATFORM_BASE_HEX_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace Tarn::Common {

/// The digits of hexadecimal numbers, in their two forms.
inline constexpr std::string_view hexDigits = "0123456789abcdef";
inline constexpr std::string_view hexCapitals = "0123456789ABCDEF";

/// Appends the two digits of a byte.
constexpr void appendHex(std::string& text, unsigned char byte, std::string_view digits = hexDigits) {
  text += digits[byte >> 4U];
  text += digits[byte & 0xFU];
}

/// A number with `width` digits at least: hexText(0x43, 4) is "0043".
constexpr std::string hexText(std::uint32_t number, std::size_t width = 1, std::string_view digits = hexDigits) {
  std::string text;
  for (; number != 0 || text.size() < width; number >>= 4U) {
    text.insert(text.begin(), digits[number & 0xFU]);
  }
  return text;
}

}  // namespace Tarn::Common

#endif
