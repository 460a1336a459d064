#include "platform/inventory/tree/Tree.h"

#include <algorithm>
#include <tuple>

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

const Origin* Tree::origin(NodeIndex node, NodeLexicon::Properties id) const {
  const auto keyOf = [](const OriginEntry& entry) { return std::tuple(entry.node, entry.id); };
  const auto found = std::ranges::lower_bound(origins_, std::tuple(node, id), {}, keyOf);
  return found == origins_.end() || keyOf(*found) != std::tuple(node, id) ? nullptr : &found->origin;
}

bool Tree::operator==(const Tree& other) const {
  const auto contents = [](const Tree& tree) {
    return std::tie(tree.nodes_, tree.numbers_, tree.texts_, tree.lists_, tree.numaNodes_, tree.unread_,
                    tree.disagreements_);
  };
  return contents(*this) == contents(other);
}

}  // namespace Tarn::Inventory
