#ifndef CORVANE_PLATFORM_INVENTORY_TREE_PROPERTYTABLE_H
#define CORVANE_PLATFORM_INVENTORY_TREE_PROPERTYTABLE_H

#include <tarn/NodeLexicon.h>

#include <span>
#include <string_view>

namespace Tarn::Inventory {

enum class PropertyKind { Number, Text, List };

/// The system's maker, a text. The processor classes have no use for it, so the lexicon that the
/// inventory shares with them does not list it; the provider of the computer system does.
inline constexpr auto PropSystemManufacturer = static_cast<NodeLexicon::Properties>(400);

/// The name of the machine, a text.
inline constexpr auto PropSystemName = static_cast<NodeLexicon::Properties>(405);

/// What only the firmware knows of a processor's socket and of what is in it, texts. The processor classes
/// have no use for them either.
inline constexpr auto PropSocket = static_cast<NodeLexicon::Properties>(401);  ///< the label on the board
inline constexpr auto PropSerialNumber = static_cast<NodeLexicon::Properties>(402);
inline constexpr auto PropAssetTag = static_cast<NodeLexicon::Properties>(403);
inline constexpr auto PropPartNumber = static_cast<NodeLexicon::Properties>(404);

/// What is known about a property: its name in JSON, its kind, and the one type of node that has it.
struct PropertyEntry {
  NodeLexicon::Properties id;
  NodeLexicon::NodeType nodeType;
  PropertyKind kind;
  std::string_view name;
};

/// All properties, sorted by number.
std::span<const PropertyEntry> propertyTable();

/// nullptr where there is no such property.
const PropertyEntry* findProperty(NodeLexicon::Properties id);
const PropertyEntry* findProperty(std::string_view name);

/// "number", "text" or "list of numbers".
std::string_view kindName(PropertyKind kind);

struct NodeTypeEntry {
  NodeLexicon::NodeType type;
  std::string_view name;  ///< "system", "processor", "core" or "cache"
};

/// All node types.
std::span<const NodeTypeEntry> nodeTypeTable();

/// "node" for a type that there is not.
std::string_view nodeTypeName(NodeLexicon::NodeType type);

}  // namespace Tarn::Inventory

#endif
