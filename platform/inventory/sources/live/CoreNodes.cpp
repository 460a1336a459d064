#include "platform/inventory/sources/live/CoreNodes.h"

#include <algorithm>
#include <array>
#include <optional>
#include <string_view>

#include "platform/inventory/sources/live/NodePaths.h"

namespace Tarn::Inventory {

namespace {

const CoreKind* kindOf(const KernelView& kernel, const Core& core) {
  const auto kind = std::ranges::find_if(kernel.kinds, [&](const CoreKind& k) { return k.cpus.intersects(core.cpus); });
  return kind == kernel.kinds.end() ? nullptr : &*kind;
}

std::string partOf(const char* group, std::optional<unsigned int> number) {
  return number.value_or(0) == 0 ? std::string() : std::string(" of ") + group + ' ' + std::to_string(*number);
}

Origin descriptionOrigin(const KernelView& kernel, const Core& core, const std::string& path) {
  static constexpr std::array<std::string_view, 1> byNumber = {"topology/core_id"};
  const bool numbered = path.find('@') == std::string::npos;
  const std::string rule = std::string(kernel.kinds.size() > 1 ? "the kind of the core and " : "") +
                           (numbered ? "the kernel's number of the core" : "the lowest CPU of the core");
  return kernel.machine.originOfCpus(
      core.cpus, numbered ? std::span<const std::string_view>(byNumber) : std::span<const std::string_view>(coreFiles),
      numbered ? "core id" : "", rule);
}

}  // namespace

std::string describeCore(const std::string& kind, const CorePlace& place, const std::string& path) {
  std::string text = describeByPath(kind, path);
  if (path.find('@') == std::string::npos) {
    text += partOf("cluster", place.cluster) + partOf("die", place.die);
  }
  return text;
}

void addCores(TreeBuilder& tree, const KernelView& kernel, const Package& package, const std::string& processor) {
  const std::vector<std::string> paths = corePaths(processor, package.cores);
  for (std::size_t i = 0; i < paths.size(); ++i) {
    const Core& core = package.cores[i];
    const CoreKind* kind = kindOf(kernel, core);
    tree.core(paths[i]).cpus(core.cpus);
    tree.status(kernel.statusOf(core.cpus)).from([&] { return kernel.statusOrigin(core.cpus); });
    tree.description(describeCore(kind == nullptr ? "Core" : kind->name, core.place, paths[i])).from([&] {
      return descriptionOrigin(kernel, core, paths[i]);
    });
  }
}

}  // namespace Tarn::Inventory
