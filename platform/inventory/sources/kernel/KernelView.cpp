#include "platform/inventory/sources/kernel/KernelView.h"

#include <array>
#include <string_view>
#include <utility>

#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

KernelView::KernelView(Machine& whole)
    : machine(whole),
      topology(readTopology(whole)),
      kinds(readCoreKinds(whole, topology)),
      caches(readCaches(whole, topology)),
      policies(readFrequencyPolicies(whole, topology)) {}

std::vector<const Cache*> KernelView::cachesOf(const Package& package) const {
  std::vector<const Cache*> own;
  for (const Cache& cache : caches) {
    if (package.cpus.contains(cache.owner)) {
      own.push_back(&cache);
    }
  }
  return own;
}

unsigned int KernelView::statusOf(const CpuSet& cpus) const {
  return isOnline(cpus) ? Status::inUse : Status::offline;
}

Origin KernelView::statusOrigin(const CpuSet& cpus) const {
  return onlineOrigin(
      cpus, "CPUs " + cpus.toList() + " make up the part: " +
                (isOnline(cpus) ? "one at least is online, so it is in use" : "none is online, so it is offline"));
}

Origin KernelView::onlineOrigin(const CpuSet& cpus, std::string rule) const {
  static constexpr std::array<std::string_view, 1> ownFile = {"online"};
  Origin origin = machine.originInCpuDirectory("online", rule);
  if (origin.raw.empty()) {
    // Some kernels have the file of each CPU alone.
    Origin own = machine.originOfCpus(cpus, ownFile, {}, std::move(rule));
    origin = own.raw.empty() ? origin : own;
  }
  return origin;
}

std::string describeByPath(const std::string& label, std::string_view path) {
  const std::size_t mark = path.find_last_of("@.CP");
  return label + (path[mark] == '@' ? " at CPU " : " ") + std::string(path.substr(mark + 1));
}

}  // namespace Tarn::Inventory
