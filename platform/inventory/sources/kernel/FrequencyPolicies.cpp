#include "platform/inventory/sources/kernel/FrequencyPolicies.h"

#include <algorithm>
#include <optional>
#include <utility>

namespace Tarn::Inventory {

namespace {

// The lowest CPU of the policy that has a processor. "0 1 2" is how related_cpus looks.
std::optional<unsigned int> relatedCpu(Attributes& files, const std::string& directory, const CpuSet& placed) {
  std::string list(files.text(directory, "/related_cpus").value_or(std::string_view()));
  std::ranges::replace(list, ' ', ',');
  CpuSet related = CpuSet::fromList(list).value_or(CpuSet());
  related.keepOnly(placed);
  return related.empty() ? std::nullopt : std::optional(related.first());
}

}  // namespace

std::vector<FrequencyPolicy> readFrequencyPolicies(Machine& machine, const Topology& topology) {
  const CpuSet placed = topology.placed();
  std::vector<std::string> names;
  machine.cpus().files().list("cpufreq", names);
  std::vector<FrequencyPolicy> policies;
  for (const std::string& name : names) {
    // A policy has the number of one of its CPUs.
    const std::optional<unsigned int> number = Attributes::numberAfter("policy", name);
    if (!number) {
      continue;
    }
    std::string directory = "cpufreq/" + name;
    const std::optional<unsigned int> cpu =
        placed.contains(*number) ? number : relatedCpu(machine.cpus(), directory, placed);
    if (cpu) {
      policies.push_back({*cpu, std::move(directory)});
    }
  }
  return policies;
}

}  // namespace Tarn::Inventory
