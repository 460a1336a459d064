#ifndef CORVANE_PLATFORM_INVENTORY_PROCESSTREE_H
#define CORVANE_PLATFORM_INVENTORY_PROCESSTREE_H

#include <memory>
#include <string>

#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// The tree that this process's cursors walk. The first call loads it, from the source that the
/// override CORVANE_INVENTORY or else the configuration key "inventory" names, by default "live"; later
/// calls share it. Throws std::exception's children if it cannot be loaded; the next call tries again.
/// Safe from several threads.
std::shared_ptr<const Tree> processTree();

/// For the host and for tests: cursors made from now on walk this tree; cursors that are there keep
/// theirs. nullptr: the next cursor loads the tree anew.
void setProcessTree(std::shared_ptr<const Tree> tree);

/// The text that names this process's source of the inventory: the override of the environment, else the
/// configuration's, else "live".
std::string chosenSource();

/// What getSystemName returns for a tree of another machine that has no name.
inline constexpr const char* unnamedSystem = "unnamed";

}  // namespace Tarn::Inventory

#endif
