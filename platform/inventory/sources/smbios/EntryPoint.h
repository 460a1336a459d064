#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_ENTRYPOINT_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_ENTRYPOINT_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <variant>

#include "platform/inventory/sources/smbios/Bytes.h"
#include "platform/inventory/sources/smbios/Problem.h"

namespace Tarn::Smbios {

/// The version of the standard that the firmware says its tables follow. Only for people: which fields there are is
/// given by each structure's length.
struct Version {
  std::uint8_t majorNumber = 0;
  std::uint8_t minorNumber = 0;
  bool operator==(const Version&) const = default;
};

/// The small record that says where the table is, and how large.
struct EntryPoint {
  /// By its anchor: "_DMI_" alone (before 2.1), "_SM_" (32-bit) or "_SM3_" (64-bit).
  enum class Kind : std::uint8_t { Legacy, Smbios2, Smbios3 };

  Kind kind = Kind::Smbios2;
  Version version;
  std::uint64_t tableAddress = 0;  ///< in physical memory; in a dump file the offset from the file's beginning
  std::uint32_t tableLength = 0;   ///< bytes; for _SM3_ the most that the table may have
  std::optional<std::uint16_t> structures = {};  ///< how many structures there are; _SM3_ does not tell
  std::size_t length = 0;                        ///< bytes of the entry point itself

  bool operator==(const EntryPoint&) const = default;
};

/// Reads the entry point at the beginning of the bytes; more may follow it. A wrong checksum is a problem and does
/// not keep it from being used. A Problem instead of an entry point where there is no anchor, or where the bytes
/// end too soon.
std::variant<EntryPoint, Problem> readEntryPoint(Bytes bytes, Problems& problems);

}  // namespace Tarn::Smbios

#endif
