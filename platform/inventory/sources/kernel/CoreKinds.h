#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_COREKINDS_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_COREKINDS_H

#include <string>
#include <vector>

#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/sources/kernel/Topology.h"
#include "platform/inventory/tree/CpuSet.h"

namespace Tarn::Inventory {

/// Cores of one design, on machines that have several.
struct CoreKind {
  std::string name;  ///< such as "Performance core"
  CpuSet cpus;
};

/// The machine's kinds of core. One kind named "Core" with all CPUs where they are all alike, or where
/// the kernel does not tell them apart.
std::vector<CoreKind> readCoreKinds(Machine& machine, const Topology& topology);

}  // namespace Tarn::Inventory

#endif
