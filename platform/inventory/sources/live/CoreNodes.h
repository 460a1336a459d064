#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_CORENODES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_CORENODES_H

#include <string>

#include "platform/inventory/sources/kernel/KernelView.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn::Inventory {

/// "Performance core 4 of die 1": what the core of that kind is called, at its place and path.
std::string describeCore(const std::string& kind, const CorePlace& place, const std::string& path);

/// Puts the package's cores below the processor that was added last, whose path is given.
void addCores(TreeBuilder& tree, const KernelView& kernel, const Package& package, const std::string& processor);

}  // namespace Tarn::Inventory

#endif
