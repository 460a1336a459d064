#include "host/corvcim/diff/DiffCommand.h"

#include <algorithm>

#include "host/corvcim/diff/DiffText.h"
#include "host/corvcim/diff/InventoryDiff.h"
#include "host/corvcim/options/SourceArgument.h"
#include "host/corvcim/text/InventoryText.h"
#include "host/corvcim/text/Json.h"
#include "platform/base/NearestName.h"
#include "platform/inventory/sources/Source.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Tree;
using Tarn::Inventory::Unread;

void checkIgnored(const std::vector<std::string>& ignored) {
  const std::vector<std::string_view> known = fieldNames();
  for (const std::string& name : ignored) {
    if (std::ranges::find(known, name) != known.end()) {
      continue;
    }
    throw UsageError("diff: '--ignore' names no field of an inventory: '" + name + "'; " +
                     Tarn::Common::suggestNames(name, known));
  }
}

/// A file's name on its machine: that of a captured one has the capture's directory before it.
std::string_view onItsMachine(std::string_view file) {
  for (const std::string_view top : {"/sys/", "/proc/"}) {
    if (const std::size_t at = file.rfind(top); at != std::string_view::npos) {
      return file.substr(at);
    }
  }
  return file;
}

bool isSame(const Unread& a, const Unread& b) {
  return onItsMachine(a.file) == onItsMachine(b.file) && a.reason == b.reason;
}

std::vector<Unread> unreadInOne(const Tree& one, const Tree& other) {
  std::vector<Unread> entries;
  std::ranges::copy_if(one.unread(), std::back_inserter(entries), [&](const Unread& entry) {
    return std::ranges::none_of(other.unread(), [&](const Unread& each) { return isSame(entry, each); });
  });
  return entries;
}

struct Difference {
  const Options& options;
  const Tree& before;
  const Tree& after;
  std::vector<NodeChange> changes;
};

std::string asText(const Difference& difference) {
  if (difference.changes.empty()) {
    return "No differences.\n";
  }
  std::string text = writeDiffText(difference.before, difference.after, difference.changes);
  // A value may differ for the sole reason that one of them was not allowed to read it.
  for (const std::string& section :
       {writeUnread(unreadInOne(difference.before, difference.after), "Not read in A alone"),
        writeUnread(unreadInOne(difference.after, difference.before), "Not read in B alone")}) {
    text += section.empty() ? "" : '\n' + section;
  }
  return text;
}

OrderedJson changeAsJson(const Difference& difference, const NodeChange& change) {
  const auto& node = change.isRemoved() ? difference.before.node(change.before) : difference.after.node(change.after);
  OrderedJson fields = OrderedJson::object();
  for (const FieldChange& field : change.fields) {
    fields[std::string(field.name)] = {{"a", fieldAsJson(field.before)}, {"b", fieldAsJson(field.after)}};
  }
  return {{"path", change.path},
          {"type", Tarn::Inventory::nodeTypeName(node.type)},
          {"change", change.isRemoved() ? "removed"
                     : change.isAdded() ? "added"
                                        : "changed"},
          {"fields", std::move(fields)}};
}

std::string asJson(const Difference& difference) {
  OrderedJson changes = OrderedJson::array();
  for (const NodeChange& change : difference.changes) {
    changes.push_back(changeAsJson(difference, change));
  }
  return jsonDocument({{"format", "corvane-inventory-diff"},
                       {"version", 1},
                       {"a", difference.options.operand(0)},
                       {"b", difference.options.operand(1)},
                       {"equal", difference.changes.empty()},
                       {"changes", std::move(changes)},
                       {"unreadInA", unreadAsJson(unreadInOne(difference.before, difference.after))},
                       {"unreadInB", unreadAsJson(unreadInOne(difference.after, difference.before))}});
}

}  // namespace

Outcome diffInventories(const Options& options) {
  checkIgnored(options.ignoredFields);
  const Tree before = Tarn::Inventory::loadInventory(settleSource(options.operand(0)));
  const Tree after = Tarn::Inventory::loadInventory(settleSource(options.operand(1)));
  const Difference difference{options, before, after, compareInventories(before, after, options.ignoredFields)};
  const std::string output = options.format == Format::Json ? asJson(difference) : asText(difference);
  return {output, {}, !difference.changes.empty()};
}

}  // namespace Corvcim
