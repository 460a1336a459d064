#include "host/corvcim/diff/InventoryDiff.h"

#include <algorithm>

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::noNode;
using Tarn::Inventory::Tree;

using Field = std::optional<FieldValue>;

class Comparison {
 public:
  Comparison(const Tree& before, const Tree& after, std::span<const std::string> ignored)
      : before_(before), after_(after), ignored_(ignored) {}

  std::vector<NodeChange> run() {
    for (NodeIndex index = 0; index < before_.nodes().size(); ++index) {
      compare(index, after_.find(before_.node(index).internalPath));
    }
    for (NodeIndex index = 0; index < after_.nodes().size(); ++index) {
      if (before_.find(after_.node(index).internalPath) == noNode) {
        compare(noNode, index);
      }
    }
    return std::move(changes_);
  }

 private:
  void compare(NodeIndex before, NodeIndex after) {
    const Node* const old = before == noNode ? nullptr : &before_.node(before);
    const Node* const now = after == noNode ? nullptr : &after_.node(after);
    NodeChange change{std::string((old != nullptr ? old : now)->path()), before, after, {}};
    for (const std::string_view name : names_) {
      note(change, name, old == nullptr ? std::nullopt : readField(before_, *old, name),
           now == nullptr ? std::nullopt : readField(after_, *now, name));
    }
    if (!change.fields.empty() || change.isAdded() || change.isRemoved()) {
      changes_.push_back(std::move(change));
    }
  }

  void note(NodeChange& change, std::string_view name, Field before, Field after) const {
    if (before != after && std::ranges::find(ignored_, name) == ignored_.end()) {
      change.fields.push_back({name, std::move(before), std::move(after)});
    }
  }

  const Tree& before_;
  const Tree& after_;
  std::span<const std::string> ignored_;
  const std::vector<std::string_view> names_ = fieldNames();
  std::vector<NodeChange> changes_;
};

}  // namespace

const FieldChange* NodeChange::field(std::string_view name) const {
  const auto found = std::ranges::find(fields, name, &FieldChange::name);
  return found == fields.end() ? nullptr : &*found;
}

std::vector<NodeChange> compareInventories(const Tree& before, const Tree& after,
                                           std::span<const std::string> ignored) {
  return Comparison(before, after, ignored).run();
}

}  // namespace Corvcim
