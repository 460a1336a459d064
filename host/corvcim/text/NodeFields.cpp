#include "host/corvcim/text/NodeFields.h"

#include <algorithm>
#include <array>

#include "platform/inventory/tree/PropertyTable.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::noNode;
using Tarn::Inventory::PropertyEntry;
using Tarn::Inventory::PropertyKind;
using Tarn::Inventory::Tree;

using Field = std::optional<FieldValue>;

Field fieldUnlessEmpty(std::string text) {
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
    NodeField{"description", [](const Tree&, const Node& node) { return fieldUnlessEmpty(node.description); }},
    NodeField{"cpus", [](const Tree&, const Node& node) { return fieldUnlessEmpty(node.cpus.toList()); }},
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

}  // namespace

std::vector<std::string_view> fieldNames() {
  std::vector<std::string_view> names;
  names.reserve(nodeFields.size() + Tarn::Inventory::propertyTable().size());
  for (const NodeField& field : nodeFields) {
    names.push_back(field.name);
  }
  for (const PropertyEntry& entry : Tarn::Inventory::propertyTable()) {
    names.push_back(entry.name);
  }
  return names;
}

std::optional<FieldValue> readField(const Tree& tree, const Node& node, std::string_view name) {
  const auto* const field = std::ranges::find(nodeFields, name, &NodeField::name);
  if (field != nodeFields.end()) {
    return field->read(tree, node);
  }
  const PropertyEntry* entry = Tarn::Inventory::findProperty(name);
  return entry == nullptr ? std::nullopt : readProperty(tree, node, *entry);
}

OrderedJson fieldAsJson(const std::optional<FieldValue>& value) {
  return value ? std::visit([](const auto& content) { return OrderedJson(content); }, *value) : OrderedJson();
}

OrderedJson unreadAsJson(std::span<const Tarn::Inventory::Unread> entries) {
  OrderedJson list = OrderedJson::array();
  for (const Tarn::Inventory::Unread& entry : entries) {
    list.push_back({{"file", entry.file}, {"reason", entry.reason}, {"remedy", entry.remedy}});
  }
  return list;
}

}  // namespace Corvcim
