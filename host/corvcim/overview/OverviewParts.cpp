#include "host/corvcim/overview/OverviewParts.h"

#include <algorithm>
#include <functional>
#include <utility>

#include "host/corvcim/text/Quantities.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

std::string cacheName(const Instance& association) {
  constexpr std::uint64_t firstLevelCode = 3;
  constexpr std::uint64_t lastLevelCode = 5;
  constexpr std::uint64_t instruction = 2;
  constexpr std::uint64_t data = 3;
  const std::uint64_t level = propertyNumber(association, "Level").value_or(0);
  const std::uint64_t type = propertyNumber(association, "CacheType").value_or(0);
  if (level < firstLevelCode || level > lastLevelCode) {
    return "cache";
  }
  return "L" + std::to_string(level - firstLevelCode + 1) + (type == instruction ? "i" : type == data ? "d" : "");
}

}  // namespace

std::vector<Shown> worstFirst(const OverviewData& data, const Tarn::Inventory::Tree& tree) {
  std::vector<Shown> shown;
  for (const OverviewProcessor& overview : data.processors) {
    ProcessorState state = stateOf(overview.processor, overview.capabilities, tree);
    const Tarn::Inventory::Node* node = processorNode(tree, state.path);
    shown.push_back({&overview, std::move(state), node});
  }
  std::ranges::stable_sort(shown, std::greater(), [](const Shown& each) { return each.state.severity; });
  return shown;
}

std::vector<ProcessorState> statesOf(const std::vector<Shown>& processors) {
  std::vector<ProcessorState> states;
  for (const Shown& shown : processors) {
    states.push_back(shown.state);
  }
  return states;
}

std::string kernelModel(const Shown& shown, const Tarn::Inventory::Tree& tree) {
  const std::string* model =
      shown.node == nullptr ? nullptr : tree.text(*shown.node, Tarn::NodeLexicon::PropProcessorName);
  return model == nullptr ? "" : toPrintable(*model);
}

bool isVirtual(const OverviewData& data) {
  return propertyText(data.system, "Model").find("Virtual") != std::string::npos;
}

std::string CacheKind::label() const {
  return size == 0 ? name : name + ' ' + formatBytes(size);
}

std::vector<CacheKind> cacheKinds(const std::vector<OverviewCache>& caches) {
  std::vector<CacheKind> kinds;
  for (const auto& [cache, association] : caches) {
    const CacheKind kind = {
        cacheName(association),
        propertyNumber(cache, "BlockSize").value_or(0) * propertyNumber(cache, "NumberOfBlocks").value_or(0), 1};
    const auto same = std::ranges::find(kinds, kind.label(), &CacheKind::label);
    if (same == kinds.end()) {
      kinds.push_back(kind);
    } else {
      ++same->count;
    }
  }
  std::ranges::sort(kinds, {}, &CacheKind::label);
  return kinds;
}

}  // namespace Corvcim
