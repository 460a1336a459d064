#ifndef CORVANE_PLATFORM_INSTRUMENTATION_SOURCE_H
#define CORVANE_PLATFORM_INSTRUMENTATION_SOURCE_H

#include <string_view>

#include "platform/instrumentation/Tree.h"

namespace Tarn::Inventory {

/// Reads the inventory that the text names:
///
///     live          this machine
///     root:DIR      a captured root directory that holds sys/ and proc/
///     root:FILE     the same in one file (Archive.h)
///     json:FILE     a tree written as JSON (JsonTree.h)
///
/// With Detail::WithOrigins the tree also tells of each value where it comes from.
/// Throws InventoryError where the text names no source, or its source can not be read.
Tree loadInventory(std::string_view specification, Detail detail = Detail::Values);

}  // namespace Tarn::Inventory

#endif
