#ifndef CORVANE_PLATFORM_INVENTORY_TREE_JSONTREE_H
#define CORVANE_PLATFORM_INVENTORY_TREE_JSONTREE_H

#include <string>
#include <string_view>

#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// The tree as JSON, one node on each line; docs/inventory.md describes the format. Ends with a newline.
/// What is written reads back as the same tree.
std::string writeJson(const Tree& tree);

/// The tree that the JSON text states. Strict: what it does not know it refuses. `name` is the file's
/// name for messages. Throws InventoryError that says where (line and column, or the JSON pointer of the
/// offending value), why, and what is expected there. The origin of a value is its place in the file.
Tree readJson(std::string_view text, const std::string& name, Detail detail = Detail::Values);

}  // namespace Tarn::Inventory

#endif
