#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_SYSTEM_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_SYSTEM_H

#include <array>
#include <cstddef>
#include <string>

#include "platform/inventory/sources/smbios/Field.h"
#include "platform/inventory/sources/smbios/Problem.h"
#include "platform/inventory/sources/smbios/Structure.h"

namespace Tarn::Smbios {

/// The computer as its maker describes it (type 1). Texts are as the firmware wrote them, blanks included.
struct System {
  using Uuid = std::array<std::byte, 16>;

  Structure structure;
  Field<std::string> manufacturer;  ///< 0x04
  Field<std::string> product;       ///< 0x05
  Field<std::string> version;       ///< 0x06
  Field<std::string> serialNumber;  ///< 0x07
  Field<Uuid> uuid;                 ///< 0x08, in the table's order; absent where all bytes are 0x00 or 0xff
  Field<std::string> sku;           ///< 0x19
  Field<std::string> family;        ///< 0x1a
};

/// Decodes a structure of type 1. Fields that the structure is too short for are absent.
System readSystem(const Structure& structure, Problems& problems);

}  // namespace Tarn::Smbios

#endif
