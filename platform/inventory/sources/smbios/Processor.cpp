#include "platform/inventory/sources/smbios/Processor.h"

#include "platform/inventory/sources/smbios/FieldReader.h"

namespace Tarn::Smbios {

namespace {

using detail::FieldReader;
using detail::unlessZero;
using detail::unlessZeroOrTwo;

// The family is a byte, which later did not suffice: this value stands for "see the second field".
constexpr std::uint8_t familyInSecondField = 0xFE;

Field<std::uint16_t> readFamily(const FieldReader& fields) {
  constexpr std::size_t first = 0x06;
  constexpr std::size_t second = 0x28;
  const auto fromFirst = [&](std::uint8_t raw) -> std::optional<std::uint16_t> {
    constexpr std::uint8_t reserved = 0xFF;
    if (raw == familyInSecondField) {
      fields.note(first, "the family is in a second field, for which the structure is too short");
    }
    return raw == familyInSecondField || raw == reserved ? std::nullopt : unlessZeroOrTwo<std::uint16_t>(raw);
  };
  const auto fromSecond = [](std::uint16_t raw) {
    constexpr std::uint16_t firstReserved = 0xFFFE;
    return raw >= firstReserved ? std::nullopt : unlessZeroOrTwo(raw);
  };
  return fields.twoFields<std::uint8_t, std::uint16_t>(first, familyInSecondField, fromFirst, second, fromSecond);
}

// A count is a byte as well. 255 in it means "see the second field" where the structure has that, else just 255.
Field<std::uint16_t> readCount(const FieldReader& fields, std::size_t first, std::size_t second) {
  constexpr std::uint8_t inSecondField = 0xFF;
  const auto fromSecond = [](std::uint16_t raw) {
    constexpr std::uint16_t reserved = 0xFFFF;
    return raw == reserved ? std::nullopt : unlessZero(raw);
  };
  return fields.twoFields<std::uint8_t, std::uint16_t>(first, inSecondField, unlessZero<std::uint16_t>, second,
                                                       fromSecond);
}

std::optional<bool> isPopulated(std::uint8_t raw) {
  return (raw & 0x40U) != 0;
}

std::optional<ProcessorStatus> statusOf(std::uint8_t raw) {
  const auto code = static_cast<std::uint8_t>(raw & 0x07U);
  return code == 5 || code == 6 ? std::nullopt : std::optional(static_cast<ProcessorStatus>(code));
}

std::optional<std::uint16_t> unlessNotProvided(std::uint16_t handle) {
  constexpr std::uint16_t notProvided = 0xFFFF;
  return handle == notProvided ? std::nullopt : std::optional(handle);
}

std::optional<std::uint16_t> characteristicsOf(std::uint16_t raw) {
  return (raw & ProcessorCharacteristic::unknown) != 0 ? std::nullopt : std::optional(raw);
}

}  // namespace

Processor readProcessor(const Structure& structure, Problems& problems) {
  constexpr std::size_t lengthIn20 = 0x1A;
  const FieldReader fields(structure, lengthIn20, problems);
  return {
      .structure = structure,
      .socket = fields.text(0x04),
      .type = fields.number<std::uint8_t>(0x05, unlessZeroOrTwo<std::uint8_t>),
      .family = readFamily(fields),
      .manufacturer = fields.text(0x07),
      .id = fields.number<std::uint64_t>(0x08, unlessZero<std::uint64_t>),
      .version = fields.text(0x10),
      .externalClock = fields.number<std::uint16_t>(0x12, unlessZero<std::uint16_t>),
      .maxSpeed = fields.number<std::uint16_t>(0x14, unlessZero<std::uint16_t>),
      .currentSpeed = fields.number<std::uint16_t>(0x16, unlessZero<std::uint16_t>),
      .populated = fields.number<std::uint8_t>(0x18, isPopulated),
      .status = fields.number<std::uint8_t>(0x18, statusOf),
      .upgrade = fields.number<std::uint8_t>(0x19, unlessZeroOrTwo<std::uint8_t>),
      .caches = {fields.number<std::uint16_t>(0x1A, unlessNotProvided),
                 fields.number<std::uint16_t>(0x1C, unlessNotProvided),
                 fields.number<std::uint16_t>(0x1E, unlessNotProvided)},
      .serialNumber = fields.text(0x20),
      .assetTag = fields.text(0x21),
      .partNumber = fields.text(0x22),
      .cores = readCount(fields, 0x23, 0x2A),
      .coresEnabled = readCount(fields, 0x24, 0x2C),
      .threads = readCount(fields, 0x25, 0x2E),
      .characteristics = fields.number<std::uint16_t>(0x26, characteristicsOf),
  };
}

}  // namespace Tarn::Smbios
