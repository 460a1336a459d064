#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_CACHE_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_CACHE_H

#include <cstdint>
#include <string>

#include "platform/inventory/sources/smbios/Field.h"
#include "platform/inventory/sources/smbios/Problem.h"
#include "platform/inventory/sources/smbios/Structure.h"

namespace Tarn::Smbios {

enum class CacheMode : std::uint8_t { WriteThrough = 0, WriteBack = 1, VariesWithAddress = 2 };
enum class CacheType : std::uint8_t { Other = 1, Instruction = 3, Data = 4, Unified = 5 };

/// A cache (type 7). One structure can stand for the caches of all cores of a processor, with their sizes added up.
struct Cache {
  /// Codes of `associativity` that name no number of ways.
  static constexpr std::uint8_t otherAssociativity = 1;
  static constexpr std::uint8_t fullyAssociative = 6;

  Structure structure;
  Field<std::string> socket;           ///< 0x04, the label, often just "L1 Cache"
  Field<unsigned int> level;           ///< 0x05, bits 0 to 2: 1 for L1, up to 8
  Field<bool> enabled;                 ///< 0x05, bit 7: on at boot
  Field<CacheMode> mode;               ///< 0x05, bits 8 and 9; absent if unknown
  Field<std::uint64_t> installedSize;  ///< 0x09, or 0x17 where 0x09 is 0xffff; KiB. 0: no cache is there
  Field<CacheType> type;               ///< 0x11; absent if unknown or no listed code
  Field<std::uint8_t> associativity;   ///< 0x12, the table's code; absent if 0 or 2 (unknown)
  Field<unsigned int> ways;            ///< 0x12, the number of ways that the code stands for, 1 for direct-mapped;
                                       ///< absent for other, unknown, fully associative and unlisted codes
};

/// Decodes a structure of type 7. Fields that the structure is too short for are absent.
Cache readCache(const Structure& structure, Problems& problems);

}  // namespace Tarn::Smbios

#endif
