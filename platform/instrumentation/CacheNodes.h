#ifndef CORVANE_PLATFORM_INSTRUMENTATION_CACHENODES_H
#define CORVANE_PLATFORM_INSTRUMENTATION_CACHENODES_H

#include <string>

#include "platform/instrumentation/KernelView.h"
#include "platform/instrumentation/TreeBuilder.h"

namespace Tarn::Inventory {

/// The inventory's code for a cache level that the kernel or the firmware counts from 1.
unsigned int levelCode(unsigned int level);

/// Puts the package's caches below the processor that was added last, whose path is given.
void addCaches(TreeBuilder& tree, const KernelView& kernel, const Package& package, const std::string& processor);

}  // namespace Tarn::Inventory

#endif
