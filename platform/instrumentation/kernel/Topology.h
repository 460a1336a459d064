#ifndef CORVANE_PLATFORM_INSTRUMENTATION_KERNEL_TOPOLOGY_H
#define CORVANE_PLATFORM_INSTRUMENTATION_KERNEL_TOPOLOGY_H

#include <optional>
#include <vector>

#include "platform/instrumentation/kernel/Machine.h"
#include "platform/instrumentation/tree/CpuSet.h"

namespace Tarn::Inventory {

/// Where a core is, in the kernel's numbers; absent where the kernel does not know.
struct CorePlace {
  std::optional<unsigned int> die;
  std::optional<unsigned int> cluster;  ///< only where core numbers begin again in each cluster
  std::optional<unsigned int> core;
  bool operator==(const CorePlace&) const = default;
};

struct Core {
  CorePlace place;
  CpuSet cpus;
};

/// A processor package. Its CPUs include those of which the kernel does not tell the core.
struct Package {
  std::optional<unsigned int> id;
  unsigned int lowestCpu = 0;  ///< stands for the id where there is none
  CpuSet cpus;
  std::vector<Core> cores;  ///< by die, cluster, number
};

struct Topology {
  CpuSet present;
  CpuSet online;
  std::vector<Package> packages;  ///< by id, then by lowest CPU
};

/// Packages, cores and threads as the kernel groups them.
Topology readTopology(Machine& machine);

}  // namespace Tarn::Inventory

#endif
