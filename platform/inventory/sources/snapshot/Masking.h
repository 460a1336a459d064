#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOT_MASKING_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOT_MASKING_H

#include <string>
#include <vector>

#include "platform/inventory/sources/files/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// Masks in captured files what tells one machine from others of its kind, and keeps what tells its kind:
/// serial numbers, asset tags, UUIDs go; makers, models, versions, processor signatures stay. In place and
/// at equal length, so that the files are read as before. docs/inventory.md lists what is masked.
///
/// Returns what was masked, one line each: "proc/cpuinfo: Serial".
std::vector<std::string> maskIdentifiers(MemoryFileSystem::Files& files);

}  // namespace Tarn::Inventory

#endif
