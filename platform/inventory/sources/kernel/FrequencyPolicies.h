#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_FREQUENCYPOLICIES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_FREQUENCYPOLICIES_H

#include <string>
#include <vector>

#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/sources/kernel/Topology.h"

namespace Tarn::Inventory {

/// CPUs that change their clock together, and so have one limit.
struct FrequencyPolicy {
  unsigned int cpu;       ///< one of them, which has a processor
  std::string directory;  ///< of its attributes, below kernelCpuDirectory
};

/// The policies of CPUs that have a processor. None where there is no frequency driver, and on kernels that have
/// the directories of the CPUs alone.
std::vector<FrequencyPolicy> readFrequencyPolicies(Machine& machine, const Topology& topology);

}  // namespace Tarn::Inventory

#endif
