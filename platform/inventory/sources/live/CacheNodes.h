#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_CACHENODES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_CACHENODES_H

#include <optional>
#include <string>
#include <vector>

#include "platform/inventory/sources/kernel/KernelView.h"
#include "platform/inventory/sources/live/FirmwareCaches.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn::Inventory {

/// The inventory's code for a cache level that the kernel or the firmware counts from 1.
unsigned int levelCode(unsigned int level);

/// The inventory's code for a number of ways; nothing where there is none.
std::optional<unsigned int> associativityCode(unsigned int ways);
inline constexpr unsigned int fullyAssociative = 2;

/// The code for the cache's ways, or for its only set.
std::optional<unsigned int> associativityCode(const Cache& cache);

/// "L1 data cache 3": what the cache at this path is called.
std::string describeCache(const Cache& cache, const std::string& path);

/// Puts the package's caches below the processor that was added last, whose path is given. What the kernel
/// does not tell of a cache comes from the firmware's twin of it, where there is one.
void addCaches(TreeBuilder& tree, const KernelView& kernel, const Package& package, const std::string& processor,
               const std::vector<FirmwareCache>& firmware);

}  // namespace Tarn::Inventory

#endif
