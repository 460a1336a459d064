#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_DUMPFILE_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_DUMPFILE_H

#include <string>

#include "platform/inventory/sources/files/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// The two files in which the kernel would show the SMBIOS tables of a dump, as `dmidecode --dump-bin`
/// writes it: the entry point at the beginning, and the table where the entry point says. `name` is the
/// dump's name for messages. Throws InventoryError where it is no such dump.
MemoryFileSystem::Files filesOfDump(const std::string& dump, const std::string& name);

}  // namespace Tarn::Inventory

#endif
