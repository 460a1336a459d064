#ifndef CORVANE_PLATFORM_INSTRUMENTATION_SNAPSHOT_SNAPSHOT_H
#define CORVANE_PLATFORM_INSTRUMENTATION_SNAPSHOT_SNAPSHOT_H

#include <string>
#include <string_view>

#include "platform/instrumentation/files/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// A snapshot is an archive (Archive.h) of the files that the live source read, whole, with what listing
/// directories gave and with the errors, so that another machine can read the same inventory from it.
/// Its first line says that it is one.
inline constexpr std::string_view snapshotFirstLine = "# corvane-snapshot 1";

/// Whether a snapshot holds what tells one machine from others of its kind (Masking.h).
enum class Identifiers { Masked, Kept };

struct Snapshot {
  std::string text;
  std::string error;  ///< why no inventory could be read; empty where it could. The snapshot is good all the same
};

/// Reads the inventory from a source and keeps what was read. `program` names who does it, for the file's
/// head. Throws InventoryError where the text names no source, or one that is none of files.
Snapshot takeSnapshot(std::string_view specification, Identifiers identifiers, const std::string& program);

/// The files of a snapshot; `name` is the file's name for messages. Throws InventoryError where it is none.
MemoryFileSystem::Files readSnapshot(std::string_view text, const std::string& name);

}  // namespace Tarn::Inventory

#endif
