#include "platform/inventory/sources/smbios/Bytes.h"

namespace Tarn::Smbios {

std::string hexOf(Bytes bytes) {
  constexpr std::string_view digits = "0123456789abcdef";
  std::string text;
  text.reserve(bytes.size() * 2);
  for (const std::byte byte : bytes) {
    const auto number = std::to_integer<unsigned int>(byte);
    text += digits[number >> 4U];
    text += digits[number & 0xFU];
  }
  return text;
}

}  // namespace Tarn::Smbios
