#include "platform/instrumentation/Tree.h"

#include <algorithm>

namespace Tarn::Inventory {

namespace {

// A node has a dozen properties at most, side by side: walking them beats searching.
template <class Value>
const Value* lookUp(std::span<const Property<Value>> properties, NodeLexicon::Properties id) {
  for (const Property<Value>& property : properties) {
    if (property.id == id) {
      return &property.value;
    }
  }
  return nullptr;
}

}  // namespace

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

const unsigned int* Tree::number(const Node& node, NodeLexicon::Properties id) const {
  return lookUp(numbers(node), id);
}

const std::string* Tree::text(const Node& node, NodeLexicon::Properties id) const {
  return lookUp(texts(node), id);
}

const std::vector<unsigned int>* Tree::list(const Node& node, NodeLexicon::Properties id) const {
  return lookUp(lists(node), id);
}

}  // namespace Tarn::Inventory
