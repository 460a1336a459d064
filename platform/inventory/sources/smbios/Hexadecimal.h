#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_HEXADECIMAL_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_HEXADECIMAL_H

#include <array>
#include <charconv>
#include <cstdint>
#include <string>
#include <string_view>

namespace Tarn::Smbios::detail {

/// A number for a message, with at least `digits` digits: "0x0043". Independent of the process's locale.
inline std::string hexadecimal(std::uint64_t number, std::size_t digits = 1) {
  std::array<char, 16> buffer;
  const char* const end = std::to_chars(buffer.data(), buffer.data() + buffer.size(), number, 16).ptr;
  const std::string_view text(buffer.data(), static_cast<std::size_t>(end - buffer.data()));
  std::string result = "0x";
  result.append(digits > text.size() ? digits - text.size() : 0, '0');
  return result.append(text);
}

}  // namespace Tarn::Smbios::detail

#endif
