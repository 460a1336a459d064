#include "host/cli/DiffText.h"

#include <algorithm>
#include <map>
#include <set>
#include <utility>

#include "host/cli/FieldWordings.h"
#include "host/cli/Quantities.h"
#include "host/cli/Sentences.h"
#include "host/cli/Text.h"
#include "platform/instrumentation/PropertyTable.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::noNode;
using Tarn::Inventory::Tree;
using namespace Tarn::NodeLexicon;
namespace Status = Tarn::Inventory::Status;

class Teller {
 public:
  Teller(const Tree& before, const Tree& after, std::span<const NodeChange> changes)
      : before_(before), after_(after), changes_(changes) {}

  std::string tell() {
    for (const NodeChange& change : changes_) {
      countBelow(change);
    }
    for (const NodeChange& change : changes_) {
      if (!isToldAbove(change)) {
        tellOf(change);
      }
    }
    return sentences_.text();
  }

 private:
  struct Parts {
    std::size_t cores = 0;
    std::size_t caches = 0;
  };

  const Node& nodeOf(const NodeChange& change) const {
    return change.isAdded() ? after_.node(change.after) : before_.node(change.before);
  }

  static bool hasStatus(const std::optional<FieldValue>& value, unsigned int status) {
    return value && *value == FieldValue(status);
  }
  static bool wasEmptied(const NodeChange& change) {
    const FieldChange* status = change.field("status");
    return !change.isRemoved() && !change.isAdded() && status != nullptr &&
           hasStatus(status->after, Status::emptySocket);
  }
  static bool wasFilled(const NodeChange& change) {
    const FieldChange* status = change.field("status");
    return !change.isRemoved() && !change.isAdded() && status != nullptr &&
           hasStatus(status->before, Status::emptySocket) && hasStatus(status->after, Status::inUse);
  }

  /// The processor whose coming or going explains that of the part; nullptr where there is none.
  const NodeChange* causeOf(const NodeChange& change) const {
    const Node& node = nodeOf(change);
    if (node.type != NodeProcessorCore && node.type != NodeCacheMemory) {
      return nullptr;
    }
    const Tree& tree = change.isAdded() ? after_ : before_;
    const std::string_view path = tree.node(node.parent).path();
    const auto above = std::ranges::find(changes_, path, [](const NodeChange& c) { return std::string_view(c.path); });
    if (above == changes_.end()) {
      return nullptr;
    }
    const bool came = change.isAdded() && (above->isAdded() || wasFilled(*above));
    const bool went = change.isRemoved() && (above->isRemoved() || wasEmptied(*above));
    return came || went ? &*above : nullptr;
  }

  void countBelow(const NodeChange& change) {
    if (!change.isAdded() && !change.isRemoved()) {
      return;
    }
    if (const NodeChange* cause = causeOf(change)) {
      toldAbove_.insert(&change);
      Parts& parts = below_[cause];
      ++(nodeOf(change).type == NodeProcessorCore ? parts.cores : parts.caches);
    }
  }

  bool isToldAbove(const NodeChange& change) const { return toldAbove_.contains(&change); }

  /// "2 cores and 7 caches"; empty for nothing.
  std::string partsOf(const NodeChange& change) const {
    const auto found = below_.find(&change);
    if (found == below_.end()) {
      return "";
    }
    const auto [cores, caches] = found->second;
    return (cores == 0 ? "" : counted(cores, "core")) + (cores != 0 && caches != 0 ? " and " : "") +
           (caches == 0 ? "" : counted(caches, "cache"));
  }

  void tellOf(const NodeChange& change) {
    const std::string parts = partsOf(change);
    if (change.isRemoved()) {
      say(change, {Verbal::Is, "gone" + (parts.empty() ? "" : ", and " + parts + " with it")});
    } else if (change.isAdded()) {
      say(change, {Verbal::Is, "new" + nameOf(after_, change.after) + (parts.empty() ? "" : ", with " + parts)});
    } else if (wasEmptied(change)) {
      say(change, {Verbal::None,
                   ": the socket is empty now" + (parts.empty() ? "" : "; " + parts + " went with the processor")});
      // That the processor's properties went with it says no more.
      tellFields(change, [](const FieldChange& field) { return field.name != "status" && field.after; });
    } else if (wasFilled(change)) {
      say(change, {Verbal::None, ": the socket has a processor now" + nameOf(after_, change.after) +
                                     (parts.empty() ? "" : ", with " + parts)});
      tellFields(change, [](const FieldChange& field) { return field.name != "status" && field.before; });
    } else {
      tellFields(change, [](const FieldChange&) { return true; });
    }
  }

  static std::string nameOf(const Tree& tree, NodeIndex index) {
    const std::string* name = tree.text(tree.node(index), PropProcessorName);
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
  std::map<const NodeChange*, Parts> below_;
  std::set<const NodeChange*> toldAbove_;
  Sentences sentences_;
};

}  // namespace

std::string writeDiffText(const Tree& before, const Tree& after, std::span<const NodeChange> changes) {
  return Teller(before, after, changes).tell();
}

}  // namespace Corvcim
