#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_LIVESOURCE_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_LIVESOURCE_H

#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// The inventory that the kernel and the firmware tell about below sys/ and proc/ of a root.
/// docs/inventory.md says where every value comes from. What could not be read is left out and noted in
/// Tree::unread; where kernel and firmware contradict each other, Tree::disagreements tells.
/// Throws InventoryError only if no file lists a processor.
Tree readLiveInventory(FileSystem& root, Detail detail = Detail::Values);

/// The inventory that the firmware's tables alone tell about: nothing else is expected below the root.
/// Throws InventoryError if they cannot be read, or list no processor socket.
Tree readFirmwareInventory(FileSystem& root, Detail detail = Detail::Values);

}  // namespace Tarn::Inventory

#endif
