#include "host/corvcim/diff/DiffCauses.h"

#include <algorithm>

#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::CpuSet;
using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::noNode;
using Tarn::Inventory::Tree;
using namespace Tarn::NodeLexicon;
namespace Status = Tarn::Inventory::Status;

bool isPart(const Node& node) {
  return node.type == NodeProcessorCore || node.type == NodeCacheMemory;
}

}  // namespace

DiffCauses::DiffCauses(const Tree& before, const Tree& after, std::span<const NodeChange> changes)
    : before_(before), after_(after), changes_(changes) {
  for (const NodeChange& change : changes_) {
    events_[&change] = findEvent(change);
  }
  for (const NodeChange& change : changes_) {
    if (const NodeChange* cause = causeOf(change)) {
      explained_.insert(&change);
      Parts& parts = parts_[cause];
      ++(nodeOf(change).type == NodeProcessorCore ? parts.cores : parts.caches);
    }
  }
}

std::string DiffCauses::partsOf(const NodeChange& change) const {
  const auto found = parts_.find(&change);
  if (found == parts_.end()) {
    return "";
  }
  const auto [cores, caches] = found->second;
  return (cores == 0 ? "" : counted(cores, "core")) + (cores != 0 && caches != 0 ? " and " : "") +
         (caches == 0 ? "" : counted(caches, "cache"));
}

Event DiffCauses::findEvent(const NodeChange& change) const {
  if (change.isRemoved() || change.isAdded()) {
    const bool hidden = isHidden(change);
    return change.isRemoved() ? (hidden ? Event::WentOffline : Event::Removed)
                              : (hidden ? Event::CameOnline : Event::Added);
  }
  const FieldChange* status = change.field("status");
  if (status == nullptr || after_.node(change.after).type != NodeProcessor) {
    return Event::Changed;
  }
  if (status->after == FieldValue(Status::emptySocket)) {
    return Event::SocketEmptied;
  }
  const bool isFilled = status->before == FieldValue(Status::emptySocket) && status->after == FieldValue(Status::inUse);
  return isFilled ? Event::SocketFilled : Event::Changed;
}

/// Where a machine shows its cores, but not this one while its CPUs are there, they must be offline.
bool DiffCauses::isHidden(const NodeChange& change) const {
  const Tree& with = treeWith(change);
  const Tree& without = &with == &before_ ? after_ : before_;
  const Node& core = nodeOf(change);
  if (core.type != NodeProcessorCore || core.cpus.empty()) {
    return false;
  }
  const NodeIndex processor = without.find(with.node(core.parent).internalPath);
  if (processor == noNode || !core.cpus.isSubsetOf(without.node(processor).cpus)) {
    return false;
  }
  bool hasCores = false;
  for (NodeIndex part = processor + 1; part < without.node(processor).end; ++part) {
    const Node& other = without.node(part);
    if (other.type == NodeProcessorCore && other.cpus.intersects(core.cpus)) {
      return false;
    }
    hasCores = hasCores || other.type == NodeProcessorCore;
  }
  return hasCores;
}

const NodeChange* DiffCauses::causeOf(const NodeChange& change) const {
  const Node& node = nodeOf(change);
  if (!isPart(node) || (!change.isAdded() && !change.isRemoved())) {
    return nullptr;
  }
  const Tree& tree = treeWith(change);
  const auto above = std::ranges::find(changes_, tree.node(node.parent).path(),
                                       [](const NodeChange& c) { return std::string_view(c.path); });
  if (above != changes_.end()) {
    const Event event = eventOf(*above);
    const bool came = change.isAdded() && (event == Event::Added || event == Event::SocketFilled);
    const bool went = change.isRemoved() && (event == Event::Removed || event == Event::SocketEmptied);
    if (came || went) {
      return &*above;
    }
  }
  return node.type == NodeCacheMemory ? hiddenCoreOf(change) : nullptr;
}

/// The hidden core that had or has the cache, with others or alone; nullptr where some of the cache's CPUs
/// belong to none.
const NodeChange* DiffCauses::hiddenCoreOf(const NodeChange& cache) const {
  const Event wanted = cache.isRemoved() ? Event::WentOffline : Event::CameOnline;
  CpuSet rest = nodeOf(cache).cpus;
  const NodeChange* first = nullptr;
  for (const NodeChange& change : changes_) {
    if (eventOf(change) == wanted && nodeOf(change).cpus.intersects(rest)) {
      first = first == nullptr ? &change : first;
      rest.remove(nodeOf(change).cpus);
    }
  }
  return rest.empty() ? first : nullptr;
}

const Tree& DiffCauses::treeWith(const NodeChange& change) const {
  return change.isAdded() ? after_ : before_;
}

const Node& DiffCauses::nodeOf(const NodeChange& change) const {
  return change.isAdded() ? after_.node(change.after) : before_.node(change.before);
}

}  // namespace Corvcim
