#include "platform/instrumentation/kernel/KernelView.h"

#include "platform/instrumentation/tree/Tree.h"

namespace Tarn::Inventory {

KernelView::KernelView(Machine& whole)
    : machine(whole),
      topology(readTopology(whole)),
      kinds(readCoreKinds(whole, topology)),
      caches(readCaches(whole, topology.present, topology.online)) {}

std::vector<const Cache*> KernelView::cachesOf(const Package& package) const {
  std::vector<const Cache*> own;
  for (const Cache& cache : caches) {
    if (package.cpus.contains(cache.cpus.first())) {
      own.push_back(&cache);
    }
  }
  return own;
}

unsigned int KernelView::statusOf(const CpuSet& cpus) const {
  return isOnline(cpus) ? Status::inUse : Status::offline;
}

Origin KernelView::statusOrigin(const CpuSet& cpus) const {
  const std::string part = "CPUs " + cpus.toList() + " make up the part: ";
  return machine.originInCpuDirectory("online", part + (isOnline(cpus) ? "one at least is online, so it is in use"
                                                                       : "none is online, so it is offline"));
}

std::string describeByPath(const std::string& label, std::string_view path) {
  const std::size_t mark = path.find_last_of("@.CP");
  return label + (path[mark] == '@' ? " at CPU " : " ") + std::string(path.substr(mark + 1));
}

}  // namespace Tarn::Inventory
