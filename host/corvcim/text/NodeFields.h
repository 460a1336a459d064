#ifndef HOST_CORVCIM_TEXT_NODEFIELDS_H
#define HOST_CORVCIM_TEXT_NODEFIELDS_H

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "host/corvcim/text/Json.h"
#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// What a field of a node holds. CPUs are a text in the kernel's list form, the parent its path.
using FieldValue = std::variant<unsigned int, std::string, std::vector<unsigned int>>;

/// The names of a node's fields: "type", "parent", "status", "description", "cpus", then the properties.
std::vector<std::string_view> fieldNames();

/// One field; nothing where the node does not have it, or there is none of that name.
std::optional<FieldValue> readField(const Tarn::Inventory::Tree& tree, const Tarn::Inventory::Node& node,
                                    std::string_view name);

/// The value in JSON; null for nothing.
OrderedJson fieldAsJson(const std::optional<FieldValue>& value);

/// What could not be read, as a list of objects.
OrderedJson unreadAsJson(std::span<const Tarn::Inventory::Unread> entries);

}  // namespace Corvcim

#endif
