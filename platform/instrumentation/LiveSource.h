#ifndef CORVANE_PLATFORM_INSTRUMENTATION_LIVESOURCE_H
#define CORVANE_PLATFORM_INSTRUMENTATION_LIVESOURCE_H

#include "platform/instrumentation/FileSystem.h"
#include "platform/instrumentation/Tree.h"

namespace Tarn::Inventory {

/// The inventory that the kernel tells about below sys/ and proc/ of a root. docs/inventory.md says
/// where every value comes from. What could not be read is left out and noted in Tree::unread.
/// Throws InventoryError only if nothing at all tells of a processor.
Tree readLiveInventory(FileSystem& root, Detail detail = Detail::Values);

}  // namespace Tarn::Inventory

#endif
