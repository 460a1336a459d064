#ifndef HOST_CORVCIM_HWLOC_HWLOCPARTS_H
#define HOST_CORVCIM_HWLOC_HWLOCPARTS_H

#include <optional>
#include <string_view>
#include <vector>

#include "host/corvcim/hwloc/HwlocTopology.h"
#include "platform/inventory/sources/kernel/Caches.h"
#include "platform/inventory/sources/kernel/Topology.h"

namespace Corvcim {

/// A cache with its size as hwloc tells it.
struct HwlocCache {
  Tarn::Inventory::Cache cache;  ///< without `size` and `sets`
  std::uint64_t bytes = 0;       ///< 0 where it is not known
};

struct HwlocPackage {
  Tarn::Inventory::Package package;
  hwloc_obj_t object = nullptr;  ///< the machine where there is no package
  std::vector<HwlocCache> caches;
};

/// A kind of core, where the description tells kinds apart.
struct HwlocCoreKind {
  Tarn::Inventory::CpuSet cpus;
  std::string_view name;                 ///< "Performance core"; empty where it is not known
  std::optional<unsigned int> maxClock;  ///< MHz
};

/// What a topology says of a machine, in the terms of the live source.
struct HwlocParts {
  std::vector<HwlocPackage> packages;  ///< by id, then by lowest CPU
  std::vector<HwlocCoreKind> kinds;
  Tarn::Inventory::CpuSet online;    ///< those with a place in the topology
  Tarn::Inventory::CpuSet homeless;  ///< those of which nothing tells the package
};

/// Throws std::invalid_argument where the topology describes what an inventory cannot hold.
HwlocParts readParts(hwloc_topology_t topology);

/// An object's own remark; empty where it has none of that name.
std::string_view infoOf(hwloc_obj_t object, const char* name);

}  // namespace Corvcim

#endif
