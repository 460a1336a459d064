#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_BYTES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_BYTES_H

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace Tarn::Smbios {

/// Bytes as they stand in a table. Whoever holds them does not own them.
using Bytes = std::span<const std::byte>;

/// What a file held, as bytes. They are the text's own and live as long as it does.
inline Bytes bytesOf(std::string_view text) {
  return std::as_bytes(std::span(text));
}

/// The number whose lowest byte stands at `offset`. All of its bytes must be there.
template <std::unsigned_integral Number>
Number littleEndian(Bytes bytes, std::size_t offset) {
  Number number = 0;
  for (std::size_t i = sizeof(Number); i-- > 0;) {
    number = static_cast<Number>(std::uint64_t{number} << 8U | std::to_integer<Number>(bytes[offset + i]));
  }
  return number;
}

/// The bytes in hexadecimal, two digits each, without anything between: "a9060300".
std::string hexOf(Bytes bytes);

}  // namespace Tarn::Smbios

#endif
