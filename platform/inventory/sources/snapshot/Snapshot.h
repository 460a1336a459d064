#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOT_SNAPSHOT_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOT_SNAPSHOT_H

#include <string>
#include <string_view>

#include "platform/inventory/sources/files/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// A snapshot is an archive (Archive.h) of the files that the live source read, whole, with what listing
/// directories gave and with the errors, so that another machine can read the same inventory from it.
/// Its first line says that it is one.
inline constexpr std::string_view snapshotFirstLine = "# corvane-snapshot 1";

/// The files of a snapshot; `name` is the file's name for messages. Throws InventoryError where it is none.
MemoryFileSystem::Files readSnapshot(std::string_view text, const std::string& name);

}  // namespace Tarn::Inventory

#endif
