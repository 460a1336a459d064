#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_KERNELVIEW_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_KERNELVIEW_H

#include <string>
#include <string_view>
#include <vector>

#include "platform/inventory/sources/kernel/Caches.h"
#include "platform/inventory/sources/kernel/CoreKinds.h"
#include "platform/inventory/sources/kernel/FrequencyPolicies.h"
#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/sources/kernel/Topology.h"

namespace Tarn::Inventory {

/// What the kernel tells of the machine's parts, read once.
struct KernelView {
  explicit KernelView(Machine& whole);

  /// The caches that stand below the package: a cache belongs to the processor of its owner, also where
  /// several processors share it.
  std::vector<const Cache*> cachesOf(const Package& package) const;

  bool isOnline(const CpuSet& cpus) const { return cpus.intersects(topology.online); }

  /// The state of a part with these CPUs, and where that comes from.
  unsigned int statusOf(const CpuSet& cpus) const;
  Origin statusOrigin(const CpuSet& cpus) const;

  /// Where it comes from which of these CPUs are online.
  Origin onlineOrigin(const CpuSet& cpus, std::string rule) const;

  Machine& machine;
  const Topology topology;
  const std::vector<CoreKind> kinds;
  const std::vector<Cache> caches;
  const std::vector<FrequencyPolicy> policies;
};

/// The kind of part and its number, which its path ends with: "L2 cache 3", "Core at CPU 8".
std::string describeByPath(const std::string& label, std::string_view path);

}  // namespace Tarn::Inventory

#endif
