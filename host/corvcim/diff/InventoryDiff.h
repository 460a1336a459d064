#ifndef HOST_CORVCIM_DIFF_INVENTORYDIFF_H
#define HOST_CORVCIM_DIFF_INVENTORYDIFF_H

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "host/corvcim/text/NodeFields.h"
#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// A field that differs, by its name (NodeFields.h). Absent on the side where the node, or its value, is
/// not there.
struct FieldChange {
  std::string_view name;
  std::optional<FieldValue> before;
  std::optional<FieldValue> after;
};

/// A node that differs, with every field that does. noNode where the node is not in that tree.
struct NodeChange {
  std::string path;
  Tarn::Inventory::NodeIndex before = Tarn::Inventory::noNode;
  Tarn::Inventory::NodeIndex after = Tarn::Inventory::noNode;
  std::vector<FieldChange> fields;

  bool isRemoved() const { return after == Tarn::Inventory::noNode; }
  bool isAdded() const { return before == Tarn::Inventory::noNode; }
  const FieldChange* field(std::string_view name) const;
};

/// What differs between two inventories. Nodes are matched by their paths: first what is in `before`, in
/// its order, then what only `after` has. The fields that `ignored` names are left out. What a source could
/// not read is no part of the machine, and not compared.
std::vector<NodeChange> compareInventories(const Tarn::Inventory::Tree& before, const Tarn::Inventory::Tree& after,
                                           std::span<const std::string> ignored = {});

}  // namespace Corvcim

#endif
