#include "platform/inventory/sources/kernel/CoreKinds.h"

#include <algorithm>
#include <utility>

#include "platform/inventory/sources/kernel/CpuIdentity.h"
#include "platform/inventory/tree/PlainText.h"

namespace Tarn::Inventory {

namespace {

// Hybrid x86 processors have a performance counter unit for each kind of core.
std::vector<CoreKind> x86Kinds(Machine& machine) {
  const std::optional<CpuSet> performance = machine.root().list("sys/devices/cpu_core/cpus");
  const std::optional<CpuSet> efficient = performance ? machine.root().list("sys/devices/cpu_atom/cpus") : std::nullopt;
  if (!performance || !efficient) {
    return {};
  }
  return {{"Performance core", *performance}, {"Efficient core", *efficient}};
}

std::vector<CoreKind> armKinds(const CpuInfo& info, const Topology& topology) {
  std::vector<std::pair<std::string, CpuSet>> byPart;
  for (const Package& package : topology.packages) {
    for (const Core& core : package.cores) {
      const unsigned int cpu = core.cpus.first();
      if (!info.cpus().contains(cpu)) {
        continue;
      }
      std::string part =
          std::string(info.field(cpu, "CPU implementer")) + ' ' + std::string(info.field(cpu, "CPU part"));
      const auto same = std::ranges::find(byPart, part, &std::pair<std::string, CpuSet>::first);
      (same != byPart.end() ? *same : byPart.emplace_back(std::move(part), CpuSet())).second.add(core.cpus);
    }
  }
  std::vector<CoreKind> kinds;
  for (auto& [part, cpus] : byPart) {
    const std::string name = identifyCpu(info, cpus.first()).name;
    kinds.push_back({(name.empty() ? plainText(part) : name) + " core", std::move(cpus)});
  }
  return kinds;
}

}  // namespace

std::vector<CoreKind> readCoreKinds(Machine& machine, const Topology& topology) {
  const CpuInfo& info = machine.cpuInfo();
  std::vector<CoreKind> kinds;
  if (!info.cpus().empty()) {
    const CpuIdentity first = identifyCpu(info, info.cpus().first());
    if (first.vendor == "GenuineIntel") {
      kinds = x86Kinds(machine);
    } else if (first.architecture == Architecture::Arm) {
      kinds = armKinds(info, topology);
    }
  }
  if (kinds.size() < 2) {
    return {{"Core", topology.present}};
  }
  return kinds;
}

}  // namespace Tarn::Inventory
