#include "platform/inventory/sources/snapshot/Snapshot.h"
#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/tree/Error.h"

namespace Tarn::Inventory {

MemoryFileSystem::Files readSnapshot(std::string_view text, const std::string& name) {
  if (text.substr(0, text.find('\n')) != snapshotFirstLine) {
    throw InventoryError("cannot read the snapshot", name + ", line 1",
                         "it does not begin with \"" + std::string(snapshotFirstLine) + '"',
                         "take it with corvcim snapshot; captured files without this line are a source root:FILE");
  }
  return readArchive(text, name);
}

}  // namespace Tarn::Inventory
