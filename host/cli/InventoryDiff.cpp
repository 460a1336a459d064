#include "host/cli/InventoryDiff.h"

#include <algorithm>
#include <array>

#include "platform/instrumentation/PropertyTable.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::noNode;
using Tarn::Inventory::PropertyEntry;
using Tarn::Inventory::PropertyKind;
using Tarn::Inventory::Tree;

using Field = std::optional<FieldValue>;

Field unlessEmpty(std::string text) {
  return text.empty() ? std::nullopt : Field(std::move(text));
}

/// What every node has beside its properties.
struct NodeField {
  std::string_view name;
  Field (*read)(const Tree& tree, const Node& node);
};

constexpr std::array nodeFields = {
    NodeField{
        "type",
        [](const Tree&, const Node& node) -> Field { return std::string(Tarn::Inventory::nodeTypeName(node.type)); }},
    NodeField{"parent",
              [](const Tree& tree, const Node& node) -> Field {
                return node.parent == noNode ? std::nullopt : Field(std::string(tree.node(node.parent).path()));
              }},
    NodeField{"status", [](const Tree&, const Node& node) -> Field { return node.status; }},
    NodeField{"description", [](const Tree&, const Node& node) { return unlessEmpty(node.description); }},
    NodeField{"cpus", [](const Tree&, const Node& node) { return unlessEmpty(node.cpus.toList()); }},
};

template <class Value>
Field copied(const Value* value) {
  return value == nullptr ? std::nullopt : Field(*value);
}

Field readProperty(const Tree& tree, const Node& node, const PropertyEntry& entry) {
  switch (entry.kind) {
    case PropertyKind::Number:
      return copied(tree.number(node, entry.id));
    case PropertyKind::Text:
      return copied(tree.text(node, entry.id));
    case PropertyKind::List:
      return copied(tree.list(node, entry.id));
  }
  return std::nullopt;
}

class Comparison {
 public:
  Comparison(const Tree& before, const Tree& after, std::span<const std::string> ignored)
      : before_(before), after_(after), ignored_(ignored) {}

  std::vector<NodeChange> run() {
    for (NodeIndex index = 0; index < before_.nodes().size(); ++index) {
      compare(index, after_.find(before_.node(index).internalPath));
    }
    for (NodeIndex index = 0; index < after_.nodes().size(); ++index) {
      if (before_.find(after_.node(index).internalPath) == noNode) {
        compare(noNode, index);
      }
    }
    return std::move(changes_);
  }

 private:
  void compare(NodeIndex before, NodeIndex after) {
    const Node* const old = before == noNode ? nullptr : &before_.node(before);
    const Node* const now = after == noNode ? nullptr : &after_.node(after);
    NodeChange change{std::string((old != nullptr ? old : now)->path()), before, after, {}};
    for (const NodeField& field : nodeFields) {
      note(change, field.name, old == nullptr ? std::nullopt : field.read(before_, *old),
           now == nullptr ? std::nullopt : field.read(after_, *now));
    }
    for (const PropertyEntry& entry : Tarn::Inventory::propertyTable()) {
      note(change, entry.name, old == nullptr ? std::nullopt : readProperty(before_, *old, entry),
           now == nullptr ? std::nullopt : readProperty(after_, *now, entry));
    }
    if (!change.fields.empty() || change.isAdded() || change.isRemoved()) {
      changes_.push_back(std::move(change));
    }
  }

  void note(NodeChange& change, std::string_view name, Field before, Field after) const {
    if (before != after && std::ranges::find(ignored_, name) == ignored_.end()) {
      change.fields.push_back({name, std::move(before), std::move(after)});
    }
  }

  const Tree& before_;
  const Tree& after_;
  std::span<const std::string> ignored_;
  std::vector<NodeChange> changes_;
};

}  // namespace

const FieldChange* NodeChange::field(std::string_view name) const {
  const auto found = std::ranges::find(fields, name, &FieldChange::name);
  return found == fields.end() ? nullptr : &*found;
}

std::vector<std::string_view> comparedFields() {
  std::vector<std::string_view> names;
  for (const NodeField& field : nodeFields) {
    names.push_back(field.name);
  }
  for (const PropertyEntry& entry : Tarn::Inventory::propertyTable()) {
    names.push_back(entry.name);
  }
  return names;
}

std::vector<NodeChange> compareInventories(const Tree& before, const Tree& after,
                                           std::span<const std::string> ignored) {
  return Comparison(before, after, ignored).run();
}

}  // namespace Corvcim
