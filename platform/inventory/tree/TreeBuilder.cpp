#include "platform/inventory/tree/TreeBuilder.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

#include "platform/inventory/tree/PathForms.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "platform/inventory/tree/Utf8.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

[[noreturn]] void refuse(NodeType type, std::string_view path, const std::string& why) {
  throw std::invalid_argument(std::string(nodeTypeName(type)) + " \"" + validUtf8(path) + "\": " + why);
}

void checkProperty(const Node& node, Properties id, PropertyKind kind) {
  const PropertyEntry* entry = findProperty(id);
  if (entry == nullptr) {
    refuse(node.type, node.path(), "there is no property " + std::to_string(id));
  }
  const std::string name(entry->name);
  if (entry->nodeType != node.type) {
    refuse(node.type, node.path(),
           "property " + name + " belongs to a " + std::string(nodeTypeName(entry->nodeType)) + " node");
  }
  if (entry->kind != kind) {
    refuse(
        node.type, node.path(),
        "property " + name + " is a " + std::string(kindName(entry->kind)) + ", not a " + std::string(kindName(kind)));
  }
}

// Keeps the node's stretch at the end of the table sorted.
template <class Value>
void insert(std::vector<Property<Value>>& table, PropertyRange& range, const Node& node, Properties id, Value value) {
  const auto begin = table.begin() + static_cast<std::ptrdiff_t>(range.begin);
  const auto place = std::ranges::lower_bound(begin, table.end(), id, {}, &Property<Value>::id);
  if (place != table.end() && place->id == id) {
    refuse(node.type, node.path(), "property " + std::string(findProperty(id)->name) + " is given twice");
  }
  table.insert(place, {id, std::move(value)});
  ++range.end;
}

template <class Value>
PropertyRange endOf(const std::vector<Property<Value>>& table) {
  const auto end = static_cast<unsigned int>(table.size());
  return {end, end};
}

}  // namespace

TreeBuilder& TreeBuilder::system(std::string_view path) {
  return node(NodeSystem, path);
}

TreeBuilder& TreeBuilder::processor(std::string_view path) {
  return node(NodeProcessor, path);
}

TreeBuilder& TreeBuilder::core(std::string_view path) {
  return node(NodeProcessorCore, path);
}

TreeBuilder& TreeBuilder::cache(std::string_view path) {
  return node(NodeCacheMemory, path);
}

TreeBuilder& TreeBuilder::node(NodeType type, std::string_view path) {
  const std::optional<unsigned int> slot = Tree::slot(type);
  if (!slot) {
    refuse(type, path, "there is no node type " + std::to_string(type));
  }
  if (!isPrintablePath(path)) {
    refuse(type, path, "a path consists of visible ASCII characters without blanks, at least one");
  }
  const auto index = static_cast<NodeIndex>(tree_.nodes_.size());
  if (type == NodeSystem) {
    if (index != 0) {
      refuse(type, path, "the system is the first node, and the only one of its type");
    }
    system_ = index;
  } else if (type == NodeProcessor) {
    processor_ = index;
  } else if (processor_ == noNode) {
    refuse(type, path, "cores and caches belong below a processor, and there is none yet");
  }

  Node added;
  added.type = type;
  added.internalPath = toInternalPath(path);
  added.parent = type == NodeSystem ? noNode : type == NodeProcessor ? system_ : processor_;
  added.numbers = endOf(tree_.numbers_);
  added.texts = endOf(tree_.texts_);
  added.lists = endOf(tree_.lists_);
  lastValue_.reset();
  tree_.nodes_.push_back(std::move(added));
  tree_.byType_[*slot].push_back(index);
  for (NodeIndex up = index; up != noNode; up = tree_.nodes_[up].parent) {
    tree_.nodes_[up].end = index + 1;
  }
  return *this;
}

TreeBuilder& TreeBuilder::status(unsigned int status) {
  last().status = status;
  lastValue_ = Tree::statusKey;
  return *this;
}

TreeBuilder& TreeBuilder::description(std::string_view text) {
  last().description = validUtf8(text);
  lastValue_ = Tree::descriptionKey;
  return *this;
}

TreeBuilder& TreeBuilder::cpus(CpuSet cpus) {
  last().cpus = std::move(cpus);
  lastValue_.reset();
  return *this;
}

TreeBuilder& TreeBuilder::number(Properties id, unsigned int value) {
  Node& node = last();
  checkProperty(node, id, PropertyKind::Number);
  insert(tree_.numbers_, node.numbers, node, id, value);
  lastValue_ = id;
  return *this;
}

TreeBuilder& TreeBuilder::text(Properties id, std::string_view value) {
  Node& node = last();
  checkProperty(node, id, PropertyKind::Text);
  insert(tree_.texts_, node.texts, node, id, validUtf8(value));
  lastValue_ = id;
  return *this;
}

TreeBuilder& TreeBuilder::list(Properties id, std::vector<unsigned int> value) {
  Node& node = last();
  checkProperty(node, id, PropertyKind::List);
  insert(tree_.lists_, node.lists, node, id, std::move(value));
  lastValue_ = id;
  return *this;
}

TreeBuilder& TreeBuilder::numaNode(NumaNode node) {
  const std::string name = "NUMA node " + std::to_string(node.number);
  if (!tree_.numaNodes_.empty() && tree_.numaNodes_.back().number >= node.number) {
    throw std::invalid_argument(name + " is not above those before it");
  }
  if (node.cpus.empty()) {
    throw std::invalid_argument(name + " has no CPUs");
  }
  tree_.numaNodes_.push_back(std::move(node));
  return *this;
}

TreeBuilder& TreeBuilder::unread(const Unread& entry) {
  tree_.unread_.push_back({validUtf8(entry.file), validUtf8(entry.reason), validUtf8(entry.remedy)});
  return *this;
}

TreeBuilder& TreeBuilder::disagreement(const Disagreement& entry) {
  tree_.disagreements_.push_back({validUtf8(entry.path), validUtf8(entry.property), validUtf8(entry.chosen),
                                  validUtf8(entry.chosenSource), validUtf8(entry.other), validUtf8(entry.otherSource)});
  return *this;
}

void TreeBuilder::addOrigin(const Origin& origin) {
  const Node& node = last();
  if (!lastValue_) {
    refuse(node.type, node.path(), "an origin follows the value that it explains");
  }
  const auto index = static_cast<NodeIndex>(tree_.nodes_.size() - 1);
  tree_.origins_.push_back(
      {index, *lastValue_, {validUtf8(origin.source), validUtf8(origin.raw), validUtf8(origin.rule)}});
  lastValue_.reset();
}

Tree TreeBuilder::build() {
  Tree tree = std::exchange(*this, TreeBuilder(detail_)).tree_;
  std::ranges::sort(tree.origins_, {}, [](const auto& entry) { return std::pair(entry.node, entry.id); });
  tree.byPath_.resize(tree.nodes_.size());
  for (NodeIndex index = 0; index < tree.byPath_.size(); ++index) {
    tree.byPath_[index] = index;
  }
  const auto pathOf = [&tree](NodeIndex index) { return std::string_view(tree.nodes_[index].internalPath); };
  std::ranges::stable_sort(tree.byPath_, {}, pathOf);
  const auto twice = std::ranges::adjacent_find(tree.byPath_, {}, pathOf);
  if (twice != tree.byPath_.end()) {
    const Node& node = tree.nodes_[*std::next(twice)];
    refuse(node.type, node.path(), "another node has the same path");
  }
  return tree;
}

Node& TreeBuilder::last() {
  if (tree_.nodes_.empty()) {
    throw std::invalid_argument("inventory: there is no node yet to describe");
  }
  return tree_.nodes_.back();
}

}  // namespace Tarn::Inventory
