#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_PROCESSOR_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_PROCESSOR_H

#include <array>
#include <cstdint>
#include <string>

#include "platform/inventory/sources/smbios/Field.h"
#include "platform/inventory/sources/smbios/Problem.h"
#include "platform/inventory/sources/smbios/Structure.h"

namespace Tarn::Smbios {

/// The state of the processor in a socket; the codes are the table's.
enum class ProcessorStatus : std::uint8_t {
  Unknown = 0,
  Enabled = 1,
  DisabledByUser = 2,
  DisabledByFirmware = 3,  ///< it failed the power-on self-test
  Idle = 4,                ///< waiting to be enabled
  Other = 7,
};

/// Bits of Processor::characteristics.
namespace ProcessorCharacteristic {
inline constexpr std::uint16_t unknown = 1U << 1;
inline constexpr std::uint16_t wide64 = 1U << 2;
inline constexpr std::uint16_t multiCore = 1U << 3;
inline constexpr std::uint16_t multiThread = 1U << 4;
inline constexpr std::uint16_t executeProtection = 1U << 5;
inline constexpr std::uint16_t virtualization = 1U << 6;
inline constexpr std::uint16_t powerControl = 1U << 7;
inline constexpr std::uint16_t wide128 = 1U << 8;
inline constexpr std::uint16_t armSocId = 1U << 9;
}  // namespace ProcessorCharacteristic

/// A processor socket and what is in it (type 4). Texts are as the firmware wrote them, blanks included. Where a
/// value did not fit into its first field and stands in a second one, the Field is the second one.
struct Processor {
  Structure structure;
  Field<std::string> socket;                   ///< 0x04, the label on the board
  Field<std::uint8_t> type;                    ///< 0x05: 1 other, 3 central, 4 math, 5 signal, 6 video; absent if 2
  Field<std::uint16_t> family;                 ///< 0x06, or 0x28 where 0x06 is 0xfe; absent if 0 or 2 (unknown)
  Field<std::string> manufacturer;             ///< 0x07
  Field<std::uint64_t> id;                     ///< 0x08, the identification register, on x86 then the feature
                                               ///< bits; the raw bytes are its printed form; absent if 0
  Field<std::string> version;                  ///< 0x10, usually the brand name
  Field<std::uint16_t> externalClock;          ///< 0x12, MHz; absent if 0
  Field<std::uint16_t> maxSpeed;               ///< 0x14, MHz: the most that the socket takes; absent if 0
  Field<std::uint16_t> currentSpeed;           ///< 0x16, MHz, at boot; absent if 0
  Field<bool> populated;                       ///< 0x18, bit 6
  Field<ProcessorStatus> status;               ///< 0x18, bits 0 to 2; absent for the reserved codes 5 and 6
  Field<std::uint8_t> upgrade;                 ///< 0x19, the kind of socket; absent if 0 or 2 (unknown)
  std::array<Field<std::uint16_t>, 3> caches;  ///< 0x1a, 0x1c, 0x1e: handles of its L1, L2 and L3 cache; absent
                                               ///< if 0xffff (not provided)
  Field<std::string> serialNumber;             ///< 0x20
  Field<std::string> assetTag;                 ///< 0x21
  Field<std::string> partNumber;               ///< 0x22
  Field<std::uint16_t> cores;                  ///< 0x23, or 0x2a where 0x23 is 0xff; absent if 0
  Field<std::uint16_t> coresEnabled;           ///< 0x24, or 0x2c; absent if 0
  Field<std::uint16_t> threads;                ///< 0x25, or 0x2e; absent if 0
  Field<std::uint16_t> characteristics;        ///< 0x26, bits of ProcessorCharacteristic; absent if bit 1 says so
};

/// Decodes a structure of type 4. Fields that the structure is too short for are absent.
Processor readProcessor(const Structure& structure, Problems& problems);

}  // namespace Tarn::Smbios

#endif
