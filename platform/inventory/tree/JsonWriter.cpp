#include <nlohmann/json.hpp>

#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {

namespace {

std::string jsonText(std::string_view text) {
  return nlohmann::json(text).dump(-1, ' ', false, nlohmann::json::error_handler_t::replace);
}

std::string jsonList(const std::vector<unsigned int>& numbers) {
  std::string text = "[";
  for (const unsigned int number : numbers) {
    text += (text.size() > 1 ? ", " : "") + std::to_string(number);
  }
  return text + ']';
}

class Writer {
 public:
  explicit Writer(const Tree& tree) : tree_(tree) {}

  std::string write() {
    text_ = "{\n  \"format\": \"corvane-inventory\",\n  \"version\": 1,\n  \"unread\": [";
    writeEntries(tree_.unread(), [](const Unread& entry) {
      return members({{"file", entry.file}, {"reason", entry.reason}, {"remedy", entry.remedy}});
    });
    if (!tree_.disagreements().empty()) {
      text_ += ",\n  \"disagreements\": [";
      writeEntries(tree_.disagreements(), [](const Disagreement& entry) {
        return members({{"path", entry.path},
                        {"property", entry.property},
                        {"chosen", entry.chosen},
                        {"chosenSource", entry.chosenSource},
                        {"other", entry.other},
                        {"otherSource", entry.otherSource}});
      });
    }
    if (!tree_.numaNodes().empty()) {
      text_ += ",\n  \"numaNodes\": [";
      writeEntries(tree_.numaNodes(), [](const NumaNode& node) {
        return "{\"number\": " + std::to_string(node.number) + ", \"cpus\": " + jsonText(node.cpus.toList()) + '}';
      });
    }
    text_ += ",\n  \"nodes\": [";
    const auto size = static_cast<NodeIndex>(tree_.nodes().size());
    writeNodes(0, size, 1);
    text_ += "]\n}\n";
    return std::move(text_);
  }

 private:
  using Members = std::initializer_list<std::pair<const char*, std::string_view>>;

  static std::string members(Members members) {
    std::string text;
    for (const auto& [name, value] : members) {
      text += (text.empty() ? "{" : ", ") + jsonText(name) + ": " + jsonText(value);
    }
    return text + '}';
  }

  // One on each line, and the bracket after them.
  template <class Entries, class Describe>
  void writeEntries(const Entries& entries, Describe describe) {
    const char* separator = "\n    ";
    for (const auto& entry : entries) {
      text_ += separator + describe(entry);
      separator = ",\n    ";
    }
    text_ += entries.empty() ? "]" : "\n  ]";
  }

  // The nodes of a stretch, each with what is below it; the list's brackets are the caller's.
  void writeNodes(NodeIndex begin, NodeIndex end, std::size_t depth) {
    if (begin == end) {
      return;
    }
    const char* separator = "\n";
    for (NodeIndex index = begin; index != end; index = tree_.node(index).end) {
      text_ += separator + std::string(2 * depth + 2, ' ') + '{';
      writeNode(tree_.node(index));
      if (index + 1 != tree_.node(index).end) {
        text_ += ",\n" + std::string(2 * depth + 3, ' ') + "\"children\": [";
        writeNodes(index + 1, tree_.node(index).end, depth + 1);
        text_ += ']';
      }
      text_ += '}';
      separator = ",\n";
    }
    text_ += '\n' + std::string(2 * depth, ' ');
  }

  void writeNode(const Node& node) {
    text_ += "\"type\": " + jsonText(nodeTypeName(node.type)) + ", \"path\": " + jsonText(node.path()) +
             ", \"status\": " + std::to_string(node.status) + ", \"description\": " + jsonText(node.description);
    if (!node.cpus.empty()) {
      text_ += ", \"cpus\": " + jsonText(node.cpus.toList());
    }
    text_ += ", \"properties\": {";
    const char* separator = "";
    for (const PropertyEntry& entry : propertyTable()) {
      const std::string value = valueOf(node, entry);
      if (!value.empty()) {
        text_ += separator + jsonText(entry.name) + ": " + value;
        separator = ", ";
      }
    }
    text_ += '}';
  }

  std::string valueOf(const Node& node, const PropertyEntry& entry) const {
    if (const unsigned int* number = tree_.number(node, entry.id)) {
      return std::to_string(*number);
    }
    if (const std::string* text = tree_.text(node, entry.id)) {
      return jsonText(*text);
    }
    if (const std::vector<unsigned int>* list = tree_.list(node, entry.id)) {
      return jsonList(*list);
    }
    return {};
  }

  const Tree& tree_;
  std::string text_;
};

}  // namespace

std::string writeJson(const Tree& tree) {
  return Writer(tree).write();
}

}  // namespace Tarn::Inventory
