#include "platform/instrumentation/Tree.h"

#include <algorithm>

namespace Tarn::Inventory {

std::optional<unsigned int> Tree::slot(NodeLexicon::NodeType type) {
  switch (type) {
    case NodeLexicon::NodeSystem:
      return 0;
    case NodeLexicon::NodeProcessor:
      return 1;
    case NodeLexicon::NodeProcessorCore:
      return 2;
    case NodeLexicon::NodeCacheMemory:
      return 3;
  }
  return std::nullopt;
}

std::span<const NodeIndex> Tree::ofType(NodeLexicon::NodeType type) const {
  const std::optional<unsigned int> place = slot(type);
  return place ? std::span<const NodeIndex>(byType_[*place]) : std::span<const NodeIndex>();
}

NodeIndex Tree::find(std::string_view internalPath) const {
  const auto pathOf = [this](NodeIndex index) { return std::string_view(nodes_[index].internalPath); };
  const auto found = std::ranges::lower_bound(byPath_, internalPath, {}, pathOf);
  return found == byPath_.end() || pathOf(*found) != internalPath ? noNode : *found;
}

}  // namespace Tarn::Inventory
