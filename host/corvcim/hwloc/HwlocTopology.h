#ifndef HOST_CORVCIM_HWLOC_HWLOCTOPOLOGY_H
#define HOST_CORVCIM_HWLOC_HWLOCTOPOLOGY_H

#include <memory>
#include <string>

#include "host/corvcim/hwloc/HwlocLibrary.h"
#include "platform/inventory/tree/CpuSet.h"

namespace Corvcim {

struct HwlocRelease {
  void operator()(hwloc_topology* topology) const { hwloc().topologyDestroy(topology); }
};
/// A topology that was loaded.
using HwlocTopology = std::unique_ptr<hwloc_topology, HwlocRelease>;

/// The topology that the XML text describes, with what its maker was not allowed to use. `name` is for
/// messages. Throws InventoryError.
HwlocTopology loadXml(const std::string& text, const std::string& name);

/// The topology of a synthetic description. Throws InventoryError, also for one of more CPUs than an
/// inventory can have.
HwlocTopology loadSynthetic(const std::string& description, const std::string& name);

/// The set as the inventory has it; empty for none. Throws std::invalid_argument where it holds a CPU that
/// an inventory cannot have, or all CPUs there could be.
Tarn::Inventory::CpuSet cpuSetOf(hwloc_const_bitmap_t set);

}  // namespace Corvcim

#endif
