#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_FIRMWARETABLES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_FIRMWARETABLES_H

#include <memory>
#include <string>
#include <utility>

#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/sources/smbios/Tables.h"
#include "platform/inventory/tree/Facts.h"

namespace Tarn::Inventory {

/// The two files in which the kernel shows the firmware's SMBIOS tables. Only root may read them.
inline constexpr const char* entryPointFile = "sys/firmware/dmi/tables/smbios_entry_point";
inline constexpr const char* tableFile = "sys/firmware/dmi/tables/DMI";

/// The firmware's SMBIOS tables: the files' bytes, and what they say. It stays where it is, as what was
/// decoded looks into the bytes.
struct FirmwareTables {
  FirmwareTables() = default;
  FirmwareTables(const FirmwareTables&) = delete;
  FirmwareTables(FirmwareTables&&) = delete;
  FirmwareTables& operator=(const FirmwareTables&) = delete;
  FirmwareTables& operator=(FirmwareTables&&) = delete;
  ~FirmwareTables() = default;

  std::string entryPoint;
  std::string table;
  Smbios::Tables tables;
};

/// Reads the tables; nullptr, and a note, where they are not there or may not be read. What is broken in
/// them is noted, and the rest is used.
std::unique_ptr<const FirmwareTables> readFirmwareTables(Machine& machine);

/// What the tables tell of the computer itself.
Facts systemFacts(const Smbios::Tables& tables);

/// The origin of a value that stands in a field of a structure. A text's raw datum is the text itself.
Origin originInTables(const Smbios::Structure& structure, std::size_t offset, Smbios::Bytes raw, std::string rule);
Origin originInTables(const Smbios::Structure& structure, const Smbios::Field<std::string>& field, std::string rule);

template <class Value>
Origin originInTables(const Smbios::Structure& structure, const Smbios::Field<Value>& field, std::string rule) {
  return originInTables(structure, field.offset, field.raw, std::move(rule));
}

/// The bytes as they stand, each with two digits: "57 06 05 00".
std::string byteText(Smbios::Bytes bytes);

/// The structure's handle with its four digits: "0043".
std::string handleText(const Smbios::Structure& structure);

/// A text that the firmware gives, as plainText has it; empty where nobody filled it in.
std::string firmwareText(const Smbios::Field<std::string>& field);

}  // namespace Tarn::Inventory

#endif
