#include "tests/platform/inventory/sources/live/Origins.h"

#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {

namespace {

// What stands in a value's place where the library itself knows it.
constexpr const char* fixedSource = "(fixed)";

}  // namespace

std::vector<ExplainedValue> explainedValues(const Tree& tree) {
  std::vector<ExplainedValue> values;
  for (NodeIndex index = 0; index < tree.nodes().size(); ++index) {
    const Node& node = tree.node(index);
    const std::string path(node.path());
    values.push_back({path + " status", tree.statusOrigin(index)});
    if (!node.description.empty()) {
      values.push_back({path + " description", tree.descriptionOrigin(index)});
    }
    const auto add = [&](const auto& properties) {
      for (const auto& property : properties) {
        values.push_back({path + ' ' + std::string(findProperty(property.id)->name), tree.origin(index, property.id)});
      }
    };
    add(tree.numbers(node));
    add(tree.texts(node));
    add(tree.lists(node));
  }
  return values;
}

std::vector<std::string> unexplainedValues(const Tree& tree) {
  std::vector<std::string> names;
  for (const auto& [name, origin] : explainedValues(tree)) {
    if (origin == nullptr || origin->source.empty() || origin->rule.empty() ||
        (origin->raw.empty() && origin->source != fixedSource)) {
      names.push_back(name);
    }
  }
  return names;
}

std::string originsOf(const Tree& tree) {
  std::string text;
  for (const auto& [name, origin] : explainedValues(tree)) {
    text += name + ": ";
    text += origin == nullptr ? "(none)" : origin->source + ": " + origin->raw + ": " + origin->rule;
    text += '\n';
  }
  return text;
}

}  // namespace Tarn::Inventory
