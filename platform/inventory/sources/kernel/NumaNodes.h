#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_NUMANODES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_NUMANODES_H

#include <vector>

#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// The NUMA nodes that have CPUs, by number. Empty where the kernel reports none; nothing is missing then.
std::vector<NumaNode> readNumaNodes(Machine& machine);

}  // namespace Tarn::Inventory

#endif
