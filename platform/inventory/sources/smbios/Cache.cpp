#include "platform/inventory/sources/smbios/Cache.h"

#include <algorithm>
#include <array>

#include "platform/inventory/sources/smbios/FieldReader.h"

namespace Tarn::Smbios {

namespace {

using detail::FieldReader;
using detail::unlessZeroOrTwo;

/// `count` bits of a word, the lowest of them at `bit`.
constexpr unsigned int bits(std::uint16_t word, unsigned int bit, unsigned int count) {
  return (word >> bit) & ((1U << count) - 1U);
}

std::optional<unsigned int> levelOf(std::uint16_t configuration) {
  return bits(configuration, 0, 3) + 1;
}

std::optional<bool> isEnabled(std::uint16_t configuration) {
  return bits(configuration, 7, 1) != 0;
}

std::optional<CacheMode> modeOf(std::uint16_t configuration) {
  const unsigned int code = bits(configuration, 8, 2);
  return code == 3 ? std::nullopt : std::optional(static_cast<CacheMode>(code));
}

// The highest bit of a size says what it counts: KiB, or 64 KiB.
template <std::unsigned_integral Raw>
std::optional<std::uint64_t> kibibytes(Raw raw) {
  constexpr Raw highest = static_cast<Raw>(Raw{1} << (sizeof(Raw) * 8 - 1));
  const std::uint64_t count = raw & static_cast<Raw>(highest - 1);
  return (raw & highest) != 0 ? count * 64 : count;
}

// A size is a word, which later did not suffice: all ones mean "see the second field" where there is one.
Field<std::uint64_t> readSize(const FieldReader& fields, std::size_t first, std::size_t second) {
  constexpr std::uint16_t inSecondField = 0xFFFF;
  return fields.twoFields<std::uint16_t, std::uint32_t>(first, inSecondField, kibibytes<std::uint16_t>, second,
                                                        kibibytes<std::uint32_t>);
}

std::optional<CacheType> typeOf(std::uint8_t raw) {
  constexpr std::array listed = {CacheType::Other, CacheType::Instruction, CacheType::Data, CacheType::Unified};
  const auto* const found = std::ranges::find(listed, static_cast<CacheType>(raw));
  return found == listed.end() ? std::nullopt : std::optional(*found);
}

struct Ways {
  std::uint8_t code;
  unsigned int ways;
};
constexpr std::array waysByCode = {
    Ways{3, 1},   Ways{4, 2},   Ways{5, 4},   Ways{7, 8},   Ways{8, 16},  Ways{9, 12},
    Ways{10, 24}, Ways{11, 32}, Ways{12, 48}, Ways{13, 64}, Ways{14, 20},
};

std::optional<unsigned int> waysOf(std::uint8_t raw) {
  const auto* const found = std::ranges::find(waysByCode, raw, &Ways::code);
  return found == waysByCode.end() ? std::nullopt : std::optional(found->ways);
}

}  // namespace

Cache readCache(const Structure& structure, Problems& problems) {
  constexpr std::size_t lengthIn20 = 0x0F;
  const FieldReader fields(structure, lengthIn20, problems);
  return {
      .structure = structure,
      .socket = fields.text(0x04),
      .level = fields.number<std::uint16_t>(0x05, levelOf),
      .enabled = fields.number<std::uint16_t>(0x05, isEnabled),
      .mode = fields.number<std::uint16_t>(0x05, modeOf),
      .installedSize = readSize(fields, 0x09, 0x17),
      .type = fields.number<std::uint8_t>(0x11, typeOf),
      .associativity = fields.number<std::uint8_t>(0x12, unlessZeroOrTwo<std::uint8_t>),
      .ways = fields.number<std::uint8_t>(0x12, waysOf),
  };
}

}  // namespace Tarn::Smbios
