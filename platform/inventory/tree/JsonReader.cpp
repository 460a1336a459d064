#include <limits>
#include <map>
#include <nlohmann/json.hpp>
#include <set>
#include <stdexcept>

#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn::Inventory {

namespace {

using Json = nlohmann::json;
using namespace NodeLexicon;

constexpr const char* whatFailed = "cannot read the inventory";
constexpr const char* whatToDo = "correct the file; the format is described in docs/inventory.md";

// The parser's messages begin with a tag for programmers, in brackets.
std::string withoutTag(const std::string& message) {
  const std::size_t end = message.find("] ");
  return end == std::string::npos ? message : message.substr(end + 2);
}

// The parser keeps the last of two members with one name; here that is a mistake to be told.
class DuplicateCheck {
 public:
  bool operator()(int /*depth*/, Json::parse_event_t event, Json& parsed) {
    if (event == Json::parse_event_t::object_start) {
      open_.emplace_back();
    } else if (event == Json::parse_event_t::object_end) {
      open_.pop_back();
    } else if (event == Json::parse_event_t::key && !open_.back().insert(parsed.get<std::string>()).second) {
      throw std::invalid_argument("the member \"" + parsed.get<std::string>() + "\" is there twice in one object");
    }
    return true;
  }

 private:
  std::vector<std::set<std::string>> open_;
};

class Reader {
 public:
  Reader(const std::string& file, Detail detail) : file_(file), builder_(detail) {}

  Tree read(const Json& document) {
    const Json::json_pointer top;
    checkMembers(document, top, {"format", "version", "unread", "disagreements", "numaNodes", "nodes"});
    if (text(document, top, "format") != "corvane-inventory") {
      refuse(top / "format", "is not \"corvane-inventory\"");
    }
    if (number(document, top, "version") != 1) {
      refuse(top / "version", "is a version of the format that this program does not know; it knows 1");
    }
    if (document.contains("unread")) {
      readUnread(array(document, top, "unread"), top / "unread");
    }
    if (document.contains("disagreements")) {
      readDisagreements(array(document, top, "disagreements"), top / "disagreements");
    }
    if (document.contains("numaNodes")) {
      readNumaNodes(array(document, top, "numaNodes"), top / "numaNodes");
    }
    readNodes(array(document, top, "nodes"), top / "nodes", std::nullopt);
    return builder_.build();
  }

 private:
  using Pointer = Json::json_pointer;
  using Names = std::initializer_list<std::string_view>;

  [[noreturn]] void refuse(const Pointer& where, const std::string& why) const {
    const std::string pointer = where.to_string();
    throw InventoryError(whatFailed, file_ + ", " + (pointer.empty() ? "the whole document" : pointer), why, whatToDo);
  }

  void checkMembers(const Json& object, const Pointer& where, Names known) const {
    if (!object.is_object()) {
      refuse(where, "is not an object");
    }
    for (const auto& [name, value] : object.items()) {
      if (std::ranges::find(known, std::string_view(name)) == known.end()) {
        refuse(where / name, "is not a member that is known here");
      }
    }
  }

  const Json& member(const Json& object, const Pointer& where, const char* name) const {
    const auto found = object.find(name);
    if (found == object.end()) {
      refuse(where / name, "is missing");
    }
    return *found;
  }

  const std::string& text(const Json& object, const Pointer& where, const char* name) const {
    return textOf(member(object, where, name), where / name);
  }
  unsigned int number(const Json& object, const Pointer& where, const char* name) const {
    return numberOf(member(object, where, name), where / name);
  }
  const Json& array(const Json& object, const Pointer& where, const char* name) const {
    return arrayOf(member(object, where, name), where / name);
  }

  const std::string& textOf(const Json& value, const Pointer& where) const {
    if (!value.is_string()) {
      refuse(where, "is not a text");
    }
    return value.get_ref<const std::string&>();
  }

  unsigned int numberOf(const Json& value, const Pointer& where) const {
    constexpr auto largest = std::numeric_limits<std::uint32_t>::max();
    if (!value.is_number_unsigned() || value.get<std::uint64_t>() > largest) {
      refuse(where, "is not a whole number from 0 to " + std::to_string(largest));
    }
    return value.get<unsigned int>();
  }

  const Json& arrayOf(const Json& value, const Pointer& where) const {
    if (!value.is_array()) {
      refuse(where, "is not a list");
    }
    return value;
  }

  void readUnread(const Json& entries, const Pointer& where) {
    for (std::size_t i = 0; i < entries.size(); ++i) {
      const Pointer at = where / i;
      checkMembers(entries[i], at, {"file", "reason", "remedy"});
      builder_.unread({text(entries[i], at, "file"), text(entries[i], at, "reason"), text(entries[i], at, "remedy")});
    }
  }

  void readDisagreements(const Json& entries, const Pointer& where) {
    for (std::size_t i = 0; i < entries.size(); ++i) {
      const Json& entry = entries[i];
      const Pointer at = where / i;
      checkMembers(entry, at, {"path", "property", "chosen", "chosenSource", "other", "otherSource"});
      builder_.disagreement({text(entry, at, "path"), text(entry, at, "property"), text(entry, at, "chosen"),
                             text(entry, at, "chosenSource"), text(entry, at, "other"),
                             text(entry, at, "otherSource")});
    }
  }

  void readNumaNodes(const Json& nodes, const Pointer& where) {
    for (std::size_t i = 0; i < nodes.size(); ++i) {
      const Pointer at = where / i;
      checkMembers(nodes[i], at, {"number", "cpus"});
      explained(at, [&] { builder_.numaNode({number(nodes[i], at, "number"), cpus(nodes[i], at)}); });
    }
  }

  // Nodes below one of the type `parent`, or at the top.
  void readNodes(const Json& nodes, const Pointer& where, std::optional<NodeType> parent) {
    for (std::size_t i = 0; i < nodes.size(); ++i) {
      readNode(nodes[i], where / i, parent);
    }
  }

  void readNode(const Json& node, const Pointer& where, std::optional<NodeType> parent) {
    checkMembers(node, where, {"type", "path", "status", "description", "cpus", "properties", "children"});
    const NodeType type = typeOf(text(node, where, "type"), where / "type", parent);
    const std::string& path = text(node, where, "path");
    const auto [earlier, added] = paths_.try_emplace(path, where.to_string());
    if (!added) {
      refuse(where / "path", "is the path of " + earlier->second + ", too");
    }
    explained(where / "path", [&] { builder_.node(type, path); });
    builder_.status(number(node, where, "status")).from([&] { return stated(node["status"], where / "status"); });
    if (node.contains("description")) {
      builder_.description(text(node, where, "description")).from([&] {
        return stated(node["description"], where / "description");
      });
    }
    if (node.contains("cpus")) {
      builder_.cpus(cpus(node, where));
    }
    if (node.contains("properties")) {
      readProperties(node["properties"], where / "properties");
    }
    if (node.contains("children")) {
      readNodes(array(node, where, "children"), where / "children", type);
    }
  }

  NodeType typeOf(const std::string& name, const Pointer& where, std::optional<NodeType> parent) const {
    const auto entry = std::ranges::find(nodeTypeTable(), name, &NodeTypeEntry::name);
    if (entry == nodeTypeTable().end()) {
      refuse(where, "is \"" + name + "\", not system, processor, core or cache");
    }
    const bool isPart = entry->type == NodeProcessorCore || entry->type == NodeCacheMemory;
    const bool fits = isPart                         ? parent == NodeProcessor
                      : entry->type == NodeProcessor ? !parent || parent == NodeSystem
                                                     : !parent;
    if (!fits) {
      refuse(where, "is \"" + name + "\", which cannot stand " +
                        (parent ? "below a " + std::string(nodeTypeName(*parent)) : "at the top"));
    }
    return entry->type;
  }

  CpuSet cpus(const Json& object, const Pointer& where) const {
    std::optional<CpuSet> cpus = CpuSet::fromList(text(object, where, "cpus"));
    if (!cpus) {
      refuse(where / "cpus", "is no list of CPU numbers such as \"0-3,8\"");
    }
    return *std::move(cpus);
  }

  void readProperties(const Json& properties, const Pointer& where) {
    if (!properties.is_object()) {
      refuse(where, "is not an object");
    }
    for (const auto& [name, value] : properties.items()) {
      const PropertyEntry* entry = findProperty(std::string_view(name));
      if (entry == nullptr) {
        refuse(where / name, "is not the name of a property");
      }
      explained(where / name, [&, &given = value, &at = name] { readProperty(*entry, given, where / at); });
      builder_.from([&, &given = value, &at = name] { return stated(given, where / at); });
    }
  }

  void readProperty(const PropertyEntry& entry, const Json& value, const Pointer& where) {
    switch (entry.kind) {
      case PropertyKind::Number:
        builder_.number(entry.id, numberOf(value, where));
        return;
      case PropertyKind::Text:
        builder_.text(entry.id, textOf(value, where));
        return;
      case PropertyKind::List:
        builder_.list(entry.id, listOf(value, where));
        return;
    }
  }

  std::vector<unsigned int> listOf(const Json& value, const Pointer& where) const {
    std::vector<unsigned int> numbers;
    for (const Json& element : arrayOf(value, where)) {
      numbers.push_back(numberOf(element, where / numbers.size()));
    }
    return numbers;
  }

  Origin stated(const Json& value, const Pointer& where) const {
    return {file_ + ", " + where.to_string(), value.dump(), "as the file states it"};
  }

  // What the builder refuses, with the place in the file.
  template <class Action>
  void explained(const Pointer& where, Action action) const {
    try {
      action();
    } catch (const std::invalid_argument& refused) {
      refuse(where, refused.what());
    }
  }

  const std::string& file_;
  TreeBuilder builder_;
  std::map<std::string, std::string> paths_;  // and where each was given
};

}  // namespace

Tree readJson(std::string_view text, const std::string& name, Detail detail) {
  try {
    const Json document = Json::parse(text, DuplicateCheck());
    return Reader(name, detail).read(document);
  } catch (const Json::exception& error) {
    throw InventoryError(whatFailed, name, "it is not JSON: " + withoutTag(error.what()), whatToDo);
  } catch (const std::invalid_argument& refused) {
    throw InventoryError(whatFailed, name, refused.what(), whatToDo);
  }
}

}  // namespace Tarn::Inventory
