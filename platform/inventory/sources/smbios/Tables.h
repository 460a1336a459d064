#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_TABLES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_TABLES_H

#include <cstddef>
#include <cstdint>
#include <map>
#include <variant>
#include <vector>

#include "platform/inventory/sources/smbios/Bytes.h"
#include "platform/inventory/sources/smbios/Cache.h"
#include "platform/inventory/sources/smbios/EntryPoint.h"
#include "platform/inventory/sources/smbios/Problem.h"
#include "platform/inventory/sources/smbios/Processor.h"
#include "platform/inventory/sources/smbios/Structure.h"
#include "platform/inventory/sources/smbios/System.h"

namespace Tarn::Smbios {

/// What the firmware's tables tell of a machine. Structures and raw bytes look into the bytes that were decoded,
/// which must outlive this; texts and numbers are its own.
///
///     const Decoded decoded = decode(bytesOf(entryPointFile), bytesOf(tableFile));
///     if (const auto* tables = std::get_if<Tables>(&decoded)) {
///       for (const Processor& processor : tables->processors) {
///         if (processor.externalClock) {
///           use(*processor.externalClock,                                 // 100
///               placeOf(processor.structure, processor.externalClock),    // SMBIOS type 4, handle 0x0043, offset 0x12
///               hexOf(processor.externalClock.raw));                      // 6400
///         }
///       }
///     } else {
///       tell(describe(std::get<Problem>(decoded)));
///     }
struct Tables {
  EntryPoint entryPoint;
  std::vector<Structure> structures;  ///< all of them, in the table's order
  std::vector<System> systems;        ///< one on every machine, but who knows
  std::vector<Processor> processors;  ///< sockets, in the table's order; empty ones included
  std::vector<Cache> caches;          ///< in the table's order
  std::vector<Problem> problems;      ///< what was wrong; everything that was right is delivered all the same

  /// Where in `caches` the one with a handle is, the first if there are several.
  std::map<std::uint16_t, std::size_t> cacheByHandle;

  /// The structure with this handle, the first if there are several; nullptr where there is none.
  const Structure* structure(std::uint16_t handle) const;
  const Cache* cache(std::uint16_t handle) const;
};

/// The tables, or why there are none: no entry point, or no table where the entry point says.
using Decoded = std::variant<Tables, Problem>;

/// Decodes a table and the entry point that leads to it, as the kernel shows them in sys/firmware/dmi/tables. The
/// table's bytes count from their beginning, whatever address the entry point gives.
Decoded decode(Bytes entryPoint, Bytes table);

/// Decodes a dump file: the entry point at its beginning, and the table at the offset in the file that stands as the
/// table's address.
Decoded decodeDump(Bytes file);

/// Where the table is within a dump file whose entry point this is; empty where it is not in the file.
Bytes tableInDump(const EntryPoint& entryPoint, Bytes file);

}  // namespace Tarn::Smbios

#endif
