#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOTWRITER_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOTWRITER_H

#include <string>
#include <string_view>

namespace Tarn::Inventory {

/// Whether a snapshot holds what tells one machine from others of its kind (Masking.h).
enum class Identifiers { Masked, Kept };

struct Snapshot {
  std::string text;
  std::string error;  ///< why no inventory could be read; empty where it could. The snapshot is good all the same
};

/// Reads the inventory from a source and keeps what was read. `program` names who does it, for the file's
/// head. Throws InventoryError where the text names no source, or one that is none of files.
Snapshot takeSnapshot(std::string_view specification, Identifiers identifiers, const std::string& program);

}  // namespace Tarn::Inventory

#endif
