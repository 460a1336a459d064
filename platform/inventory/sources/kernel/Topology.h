#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_TOPOLOGY_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_TOPOLOGY_H

#include <array>
#include <optional>
#include <string_view>
#include <vector>

#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/tree/CpuSet.h"

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

  /// The CPUs that have a processor.
  CpuSet placed() const;
};

/// The files below cpuN/ that name the CPUs of its core, and of its package: under two names each, and as masks
/// on kernels that have no lists. The first usable one counts.
inline constexpr std::array<std::string_view, 4> coreCpusFiles = {
    "topology/thread_siblings_list", "topology/core_cpus_list", "topology/thread_siblings", "topology/core_cpus"};
inline constexpr std::array<std::string_view, 4> packageCpusFiles = {
    "topology/core_siblings_list", "topology/package_cpus_list", "topology/core_siblings", "topology/package_cpus"};

/// The files that tell the cores apart: these, or without them the core's number.
inline constexpr std::array<std::string_view, 5> coreFiles = {coreCpusFiles[0], coreCpusFiles[1], coreCpusFiles[2],
                                                              coreCpusFiles[3], "topology/core_id"};

/// Packages, cores and threads as the kernel groups them.
Topology readTopology(Machine& machine);

}  // namespace Tarn::Inventory

#endif
