#include "host/corvcim/diff/DiffText.h"

#include <utility>

#include "host/corvcim/diff/DiffCauses.h"
#include "host/corvcim/diff/FieldWordings.h"
#include "host/corvcim/diff/Sentences.h"
#include "host/corvcim/text/Quantities.h"
#include "host/corvcim/text/Text.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::Tree;
using namespace Tarn::NodeLexicon;

class Teller {
 public:
  Teller(const Tree& before, const Tree& after, std::span<const NodeChange> changes)
      : before_(before), after_(after), changes_(changes), causes_(before, after, changes) {}

  std::string tell() {
    for (const NodeChange& change : changes_) {
      if (!causes_.isExplained(change)) {
        tellOf(change);
      }
    }
    return sentences_.text();
  }

 private:
  const Node& nodeOf(const NodeChange& change) const {
    return change.isAdded() ? after_.node(change.after) : before_.node(change.before);
  }

  void tellOf(const NodeChange& change) {
    const std::string parts = causes_.partsOf(change);
    const std::string withParts = parts.empty() ? "" : ", with " + parts;
    const std::string each = parts.empty() ? "" : " each";
    switch (causes_.eventOf(change)) {
      case Event::Changed:
        tellFields(change, [](const FieldChange&) { return true; });
        return;
      case Event::Removed:
        say(change, {Verbal::Is, "gone" + withParts, each});
        return;
      case Event::Added:
        say(change, {Verbal::Is, "new" + nameOf(after_, change.after) + withParts, each});
        return;
      case Event::WentOffline:
        say(change, {Verbal::None, " went offline" + withParts, each});
        return;
      case Event::CameOnline:
        say(change, {Verbal::None, " came online" + withParts, each});
        return;
      case Event::SocketEmptied:
        say(change, {Verbal::None, ": the socket is empty now" + (parts.empty() ? "" : withParts + " gone"), each});
        // That the processor's properties went with it says no more.
        tellFields(change, [](const FieldChange& field) { return field.name != "status" && field.after; });
        return;
      case Event::SocketFilled:
        say(change,
            {Verbal::None, ": the socket has a processor now" + nameOf(after_, change.after) + withParts, each});
        tellFields(change, [](const FieldChange& field) { return field.name != "status" && field.before; });
        return;
    }
  }

  static std::string nameOf(const Tree& tree, NodeIndex index) {
    const Node& node = tree.node(index);
    if (node.status == Tarn::Inventory::Status::emptySocket) {
      return ": an empty socket";
    }
    const std::string* name = tree.text(node, PropProcessorName);
    return name == nullptr ? "" : ": " + toPrintable(*name);
  }

  template <class Filter>
  void tellFields(const NodeChange& change, Filter filter) {
    const bool toldSize = tellSize(change);
    for (const FieldChange& field : change.fields) {
      if (!filter(field) || (toldSize && isPartOfSize(change, field))) {
        continue;
      }
      say(change, field.name == "status" ? describeStatusChange(field, after_.node(change.after).type)
                                         : describeFieldChange(field));
    }
  }

  static std::optional<std::uint64_t> sizeOf(const Tree& tree, NodeIndex index) {
    const unsigned int* blocks = tree.number(tree.node(index), PropCacheNumberOfBlocks);
    const unsigned int* size = tree.number(tree.node(index), PropCacheBlockSize);
    return blocks == nullptr || size == nullptr ? std::nullopt : std::optional(std::uint64_t{*blocks} * *size);
  }

  bool tellSize(const NodeChange& change) {
    const auto before = sizeOf(before_, change.before);
    const auto after = sizeOf(after_, change.after);
    if (!before || !after || *before == *after || change.field("CacheNumberOfBlocks") == nullptr) {
      return false;
    }
    const std::string comparative = *after < *before ? "smaller" : "larger";
    say(change, {Verbal::Is, comparative + ": " + formatBytes(*after) + ", was " + formatBytes(*before)});
    return true;
  }

  static bool isPartOfSize(const NodeChange& change, const FieldChange& field) {
    if (field.name == "CacheConsumableBlocks") {
      const FieldChange* blocks = change.field("CacheNumberOfBlocks");
      return blocks->before == field.before && blocks->after == field.after;
    }
    return field.name == "CacheNumberOfBlocks";
  }

  void say(const NodeChange& change, Predicate predicate) {
    sentences_.add(Tarn::Inventory::nodeTypeName(nodeOf(change).type), change.path, std::move(predicate));
  }

  const Tree& before_;
  const Tree& after_;
  std::span<const NodeChange> changes_;
  const DiffCauses causes_;
  Sentences sentences_;
};

}  // namespace

std::string writeDiffText(const Tree& before, const Tree& after, std::span<const NodeChange> changes) {
  return Teller(before, after, changes).tell();
}

}  // namespace Corvcim
