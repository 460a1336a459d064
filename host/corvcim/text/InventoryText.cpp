#include "host/corvcim/text/InventoryText.h"

#include <algorithm>
#include <utility>
#include <vector>

#include "host/corvcim/text/StateNote.h"
#include "host/corvcim/text/Text.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::Tree;

std::string propertyName(Tarn::NodeLexicon::Properties id) {
  const Tarn::Inventory::PropertyEntry* entry = Tarn::Inventory::findProperty(id);
  return entry == nullptr ? "property " + std::to_string(id) : std::string(entry->name);
}

using Rows = std::vector<std::pair<std::string, std::string>>;

Rows rowsOf(const Tree& tree, const Node& node) {
  Rows rows;
  if (!node.description.empty()) {
    rows.emplace_back("description", toPrintable(node.description));
  }
  if (!node.cpus.empty()) {
    rows.emplace_back("cpus", node.cpus.toList());
  }
  for (const auto& property : tree.texts(node)) {
    rows.emplace_back(propertyName(property.id), toPrintable(property.value));
  }
  for (const auto& property : tree.numbers(node)) {
    rows.emplace_back(propertyName(property.id), std::to_string(property.value));
  }
  for (const auto& property : tree.lists(node)) {
    rows.emplace_back(propertyName(property.id), numberListText(property.value));
  }
  return rows;
}

std::size_t depthOf(const Tree& tree, const Node& node) {
  return node.parent == Tarn::Inventory::noNode ? 0 : 1 + depthOf(tree, tree.node(node.parent));
}

std::string nodeText(const Tree& tree, const Node& node) {
  const std::string indent(2 * depthOf(tree, node), ' ');
  const std::string state = stateNote(node.status);
  std::string text = indent + std::string(Tarn::Inventory::nodeTypeName(node.type)) + ' ' + std::string(node.path()) +
                     (state.empty() ? "" : " (" + state + ')') + '\n';
  const Rows rows = rowsOf(tree, node);
  std::size_t width = 0;
  for (const auto& [name, value] : rows) {
    width = std::max(width, columns(name));
  }
  for (const auto& [name, value] : rows) {
    text.append(indent).append("    ").append(padRight(name, width)).append("  ").append(value).append("\n");
  }
  return text;
}

}  // namespace

std::string writeInventoryText(const Tree& tree) {
  std::string text;
  for (const Node& node : tree.nodes()) {
    text += nodeText(tree, node);
  }
  for (const std::string& section : {writeUnread(tree.unread()), writeDisagreements(tree.disagreements())}) {
    text += section.empty() ? "" : '\n' + section;
  }
  return text;
}

std::string writeUnread(std::span<const Tarn::Inventory::Unread> unread, std::string_view heading) {
  if (unread.empty()) {
    return "";
  }
  std::string text = std::string(heading) + ":\n";
  for (const Tarn::Inventory::Unread& entry : unread) {
    text += "  " + toPrintable(entry.file) + ": " + toPrintable(entry.reason) + '\n';
    if (!entry.remedy.empty()) {
      text += "    " + toPrintable(entry.remedy) + '\n';
    }
  }
  return text;
}

std::string writeDisagreements(std::span<const Tarn::Inventory::Disagreement> disagreements) {
  if (disagreements.empty()) {
    return "";
  }
  std::string text = "Sources disagree:\n";
  for (const Tarn::Inventory::Disagreement& entry : disagreements) {
    text += "  " + toPrintable(entry.path) + ' ' + toPrintable(entry.property) + '\n';
    text += "    " + toPrintable(entry.chosen) + "  taken from " + toPrintable(entry.chosenSource) + '\n';
    text += "    " + toPrintable(entry.other) + "  said by " + toPrintable(entry.otherSource) + '\n';
  }
  return text;
}

}  // namespace Corvcim
