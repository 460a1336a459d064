#include <algorithm>
#include <array>
#include <stdexcept>

#include "host/corvcim/explain/Explanation.h"
#include "platform/inventory/tree/PathForms.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::noNode;
using Tarn::Inventory::Tree;
using namespace Tarn::NodeLexicon;

/// Which parts are instances of which class, and which key holds the part's path.
struct PartClass {
  std::string_view className;
  NodeType type;
  std::string_view key;
  std::string_view keyPrefix;
};
constexpr std::array partClasses = {
    PartClass{"HALDA_ComputerSystem", NodeSystem, "", ""},
    PartClass{"HALDA_CPUProcessor", NodeProcessor, "DeviceID", ""},
    PartClass{"HALDA_CPUProcessorCapabilities", NodeProcessor, "InstanceID", "NERITH:"},
    PartClass{"HALDA_CPUProcessorCore", NodeProcessorCore, "InstanceID", ""},
    PartClass{"HALDA_CPUMemory", NodeCacheMemory, "DeviceID", ""},
    PartClass{"HALDA_CPUAssociatedCacheMemory", NodeCacheMemory, "DeviceID", ""},
};

[[noreturn]] void fail(const std::string& text, const std::string& why) {
  throw std::runtime_error("explain " + text + ": " + why);
}

const PartClass& classNamed(const std::string& text, std::string_view name) {
  const auto* const found =
      std::ranges::find_if(partClasses, [&](const PartClass& each) { return sameName(each.className, name); });
  if (found != partClasses.end()) {
    return *found;
  }
  std::string known;
  for (const PartClass& each : partClasses) {
    known.append(known.empty() ? "" : ", ").append(each.className);
  }
  fail(text, "instances of " + std::string(name) + " are not explained; there are " + known);
}

ExplanationTarget targetOf(const Tree& tree, const std::string& text, const PartClass& part, std::string_view key) {
  if (part.type == NodeSystem && !tree.ofType(NodeSystem).empty()) {
    return {part.className, tree.ofType(NodeSystem).front()};
  }
  std::string_view path = key;
  if (path.starts_with(part.keyPrefix)) {
    path.remove_prefix(part.keyPrefix.size());
  }
  const NodeIndex node = tree.find(Tarn::Inventory::toInternalPath(path));
  if (node == noNode || tree.node(node).type != part.type) {
    fail(text, "the inventory has no such part; 'corvcim inventory' lists them all");
  }
  return {part.className, node};
}

ExplanationTarget targetOfPath(const Tree& tree, const std::string& text) {
  const ObjectPath path = ObjectPath::parse(text);
  const PartClass& part = classNamed(text, path.className);
  const ObjectPath* holder = &path;
  if (const Value* cache = path.key("Antecedent"); cache != nullptr && cache->type() == CMPI_ref && !cache->isNull()) {
    holder = &cache->asReference();
  }
  const Value* key = part.key.empty() ? nullptr : holder->key(part.key);
  if (!part.key.empty() && (key == nullptr || key->isNull() || key->type() != CMPI_string)) {
    fail(text, "the path has no key " + std::string(part.key));
  }
  return targetOf(tree, text, part, key == nullptr ? std::string_view() : std::string_view(key->asString()));
}

std::vector<ExplanationTarget> targetsOfType(const Tree& tree, NodeType type, std::string_view className) {
  std::vector<ExplanationTarget> targets;
  for (const NodeIndex node : tree.ofType(type)) {
    for (const PartClass& each : partClasses) {
      if (each.type == type && (className.empty() || sameName(each.className, className))) {
        targets.push_back({each.className, node});
      }
    }
  }
  return targets;
}

}  // namespace

std::vector<ExplanationTarget> explanationTargets(const Tree& tree, const std::string& text) {
  if (text.empty()) {
    return targetsOfType(tree, NodeProcessor, {});
  }
  if (const NodeIndex node = tree.find(Tarn::Inventory::toInternalPath(text)); node != noNode) {
    std::vector<ExplanationTarget> targets;
    for (const PartClass& each : partClasses) {
      if (each.type == tree.node(node).type) {
        targets.push_back({each.className, node});
      }
    }
    return targets;
  }
  if (text.find('=') != std::string::npos) {
    return {targetOfPath(tree, text)};
  }
  // A class, with or without a namespace before it and a key after it.
  const std::size_t colon = text.find(':');
  const std::size_t dot = text.find('.');
  const std::size_t begin = colon == std::string::npos || colon > dot ? 0 : colon + 1;
  const std::string name = text.substr(begin, dot == std::string::npos ? dot : dot - begin);
  if (findClass(name) == nullptr) {
    fail(text, "neither a part of this inventory nor a class; 'corvcim inventory' and 'corvcim classes' list them");
  }
  const PartClass& part = classNamed(text, name);
  if (dot != std::string::npos) {
    return {targetOf(tree, text, part, std::string_view(text).substr(dot + 1))};
  }
  return targetsOfType(tree, part.type, part.className);
}

}  // namespace Corvcim
