#include "platform/inventory/sources/kernel/NumaNodes.h"

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace Tarn::Inventory {

std::vector<NumaNode> readNumaNodes(Machine& machine) {
  constexpr const char* directory = "sys/devices/system/node";
  constexpr std::string_view prefix = "node";
  std::vector<std::string> names;
  machine.root().files().list(directory, names);
  std::vector<NumaNode> nodes;
  for (const std::string& name : names) {
    if (!name.starts_with(prefix)) {
      continue;
    }
    const std::optional<unsigned int> number = Attributes::toNumber(std::string_view(name).substr(prefix.size()));
    if (!number || name != "node" + std::to_string(*number)) {
      continue;
    }
    std::optional<CpuSet> cpus = machine.root().list(directory, "/node", *number, "/cpulist");
    if (cpus && !cpus->empty()) {
      nodes.push_back({*number, *std::move(cpus)});
    }
  }
  std::ranges::sort(nodes, {}, &NumaNode::number);
  return nodes;
}

}  // namespace Tarn::Inventory
