#ifndef CORVANE_PLATFORM_INSTRUMENTATION_CORENODES_H
#define CORVANE_PLATFORM_INSTRUMENTATION_CORENODES_H

#include <string>

#include "platform/instrumentation/KernelView.h"
#include "platform/instrumentation/TreeBuilder.h"

namespace Tarn::Inventory {

/// Puts the package's cores below the processor that was added last, whose path is given.
void addCores(TreeBuilder& tree, const KernelView& kernel, const Package& package, const std::string& processor);

}  // namespace Tarn::Inventory

#endif
