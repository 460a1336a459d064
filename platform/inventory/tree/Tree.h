#ifndef CORVANE_PLATFORM_INVENTORY_TREE_TREE_H
#define CORVANE_PLATFORM_INVENTORY_TREE_TREE_H

#include <tarn/NodeLexicon.h>

#include <array>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "platform/inventory/tree/CpuSet.h"

namespace Tarn::Inventory {

/// A node's place in the tree. Nodes stand in depth-first order: a node's descendants follow it.
using NodeIndex = unsigned int;
inline constexpr NodeIndex noNode = ~0U;

/// Node states that the sources deliver. 0 is never delivered for something that exists.
namespace Status {
inline constexpr unsigned int inUse = 1;
inline constexpr unsigned int offline = 12;
inline constexpr unsigned int emptySocket = 15;
inline constexpr unsigned int disabled = 16;
inline constexpr unsigned int failed = 24;
}  // namespace Status

template <class Value>
struct Property {
  NodeLexicon::Properties id;
  Value value;
  bool operator==(const Property&) const = default;
};
using NumberProperty = Property<unsigned int>;
using TextProperty = Property<std::string>;
using ListProperty = Property<std::vector<unsigned int>>;

/// A stretch of one of the tree's property tables.
struct PropertyRange {
  unsigned int begin = 0;
  unsigned int end = 0;
  bool operator==(const PropertyRange&) const = default;
};

struct Node {
  NodeLexicon::NodeType type = NodeLexicon::NodeSystem;
  unsigned int status = Status::inUse;
  NodeIndex parent = noNode;
  NodeIndex end = 0;  ///< one past the last node below this one
  std::string internalPath;
  std::string description;
  CpuSet cpus;  ///< the logical CPUs of the part, or that share the cache; empty where unknown
  PropertyRange numbers;
  PropertyRange texts;
  PropertyRange lists;

  /// The path as people see it.
  std::string_view path() const { return std::string_view(internalPath).substr(1); }

  bool operator==(const Node&) const = default;
};

/// Something that a source wanted to read and could not, for people.
struct Unread {
  std::string file;    ///< what could not be read
  std::string reason;  ///< why
  std::string remedy;  ///< what would make it readable
  bool operator==(const Unread&) const = default;
};

/// How much a source tells: the values alone, or with each of them where it comes from.
enum class Detail { Values, WithOrigins };

/// Where a value comes from, for people.
struct Origin {
  std::string source;  ///< file and place in it: "/proc/cpuinfo, processor 0",
                       ///< "SMBIOS type 4, handle 0x0043, offset 0x12"
  std::string raw;     ///< the datum as it stands there: "model name: Some CPU", "64 00"; empty where
                       ///< the value says that something is not there
  std::string rule;    ///< how the datum became the value: the table row or the computation
  bool operator==(const Origin&) const = default;
};

/// Two sources that contradict each other, for people.
struct Disagreement {
  std::string path;      ///< of the node, as people see it
  std::string property;  ///< its name as in propertyTable(), "status", or words where it is no one value
  std::string chosen;    ///< the value that stands in the tree; "(none)" where there is none
  std::string chosenSource;
  std::string other;  ///< the value that does not
  std::string otherSource;
  bool operator==(const Disagreement&) const = default;
};

/// Logical CPUs that share their memory, under the kernel's number for them.
struct NumaNode {
  unsigned int number = 0;
  CpuSet cpus;
  bool operator==(const NumaNode&) const = default;
};

/// The inventory: system, processors, and below each processor its cores and caches. Immutable once
/// built (by TreeBuilder), so any number of threads may read it.
class Tree {
 public:
  std::span<const Node> nodes() const { return nodes_; }
  const Node& node(NodeIndex index) const { return nodes_[index]; }

  /// The nodes of one type in tree order, ascending. Empty for a type that the tree does not know.
  std::span<const NodeIndex> ofType(NodeLexicon::NodeType type) const;

  /// The node with this internal path, or noNode.
  NodeIndex find(std::string_view internalPath) const;

  /// The node's properties of each kind, sorted by number.
  std::span<const NumberProperty> numbers(const Node& node) const { return stretch(numbers_, node.numbers); }
  std::span<const TextProperty> texts(const Node& node) const { return stretch(texts_, node.texts); }
  std::span<const ListProperty> lists(const Node& node) const { return stretch(lists_, node.lists); }

  /// One property; nullptr where the node has none of that number and kind.
  const unsigned int* number(const Node& node, NodeLexicon::Properties id) const { return lookUp(numbers(node), id); }
  const std::string* text(const Node& node, NodeLexicon::Properties id) const { return lookUp(texts(node), id); }
  const std::vector<unsigned int>* list(const Node& node, NodeLexicon::Properties id) const {
    return lookUp(lists(node), id);
  }

  /// By number; empty where the kernel reports none. Nodes without CPUs are left out.
  std::span<const NumaNode> numaNodes() const { return numaNodes_; }

  std::span<const Unread> unread() const { return unread_; }
  std::span<const Disagreement> disagreements() const { return disagreements_; }

  /// Where a value of the node comes from; nullptr where the node has no such value, or the tree was read
  /// with Detail::Values.
  const Origin* origin(NodeIndex node, NodeLexicon::Properties id) const;
  const Origin* statusOrigin(NodeIndex node) const { return origin(node, statusKey); }
  const Origin* descriptionOrigin(NodeIndex node) const { return origin(node, descriptionKey); }

  /// Whether both say the same; where it comes from makes no difference.
  bool operator==(const Tree& other) const;

 private:
  friend class TreeBuilder;

  // What is not a property and has an origin all the same. No property has these numbers.
  static constexpr auto statusKey = static_cast<NodeLexicon::Properties>(0);
  static constexpr auto descriptionKey = static_cast<NodeLexicon::Properties>(1);

  struct OriginEntry {
    NodeIndex node;
    NodeLexicon::Properties id;
    Origin origin;
  };

  static constexpr unsigned int nodeTypes = 4;
  static std::optional<unsigned int> slot(NodeLexicon::NodeType type);

  template <class Value>
  static std::span<const Value> stretch(const std::vector<Value>& table, PropertyRange range) {
    return std::span(table).subspan(range.begin, range.end - range.begin);
  }

  // A node has a dozen properties at most, side by side: walking them beats searching.
  template <class Value>
  static const Value* lookUp(std::span<const Property<Value>> properties, NodeLexicon::Properties id) {
    for (const Property<Value>& property : properties) {
      if (property.id == id) {
        return &property.value;
      }
    }
    return nullptr;
  }

  std::vector<Node> nodes_;
  std::vector<NumberProperty> numbers_;
  std::vector<TextProperty> texts_;
  std::vector<ListProperty> lists_;
  std::array<std::vector<NodeIndex>, nodeTypes> byType_;
  std::vector<NodeIndex> byPath_;  // sorted by path
  std::vector<NumaNode> numaNodes_;
  std::vector<Unread> unread_;
  std::vector<Disagreement> disagreements_;
  std::vector<OriginEntry> origins_;  // sorted by node and number
};

}  // namespace Tarn::Inventory

#endif
