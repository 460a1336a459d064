#ifndef HOST_CORVCIM_DIFF_DIFFCAUSES_H
#define HOST_CORVCIM_DIFF_DIFFCAUSES_H

#include <map>
#include <set>
#include <span>
#include <string>

#include "host/corvcim/diff/InventoryDiff.h"

namespace Corvcim {

/// What happened to a part, beyond the fields that differ.
enum class Event {
  Changed,  ///< no more than its fields say
  Removed,
  Added,
  SocketEmptied,
  SocketFilled,
  WentOffline,  ///< a core that is not in the inventory any more, while its CPUs are still there: the kernel hides it
  CameOnline
};

/// The events that a list of changes comes of, and which changes come of others: cores and caches come and go
/// with their processor, caches with a core that the kernel hides.
class DiffCauses {
 public:
  /// All must outlive this object.
  DiffCauses(const Tarn::Inventory::Tree& before, const Tarn::Inventory::Tree& after,
             std::span<const NodeChange> changes);

  Event eventOf(const NodeChange& change) const { return events_.at(&change); }

  /// Whether another change explains this one.
  bool isExplained(const NodeChange& change) const { return explained_.contains(&change); }

  /// What the change explains: "2 cores and 7 caches"; empty for nothing.
  std::string partsOf(const NodeChange& change) const;

 private:
  struct Parts {
    std::size_t cores = 0;
    std::size_t caches = 0;
  };

  Event findEvent(const NodeChange& change) const;
  bool isHidden(const NodeChange& change) const;
  const NodeChange* causeOf(const NodeChange& change) const;
  const NodeChange* hiddenCoreOf(const NodeChange& cache) const;
  const Tarn::Inventory::Tree& treeWith(const NodeChange& change) const;
  const Tarn::Inventory::Node& nodeOf(const NodeChange& change) const;

  const Tarn::Inventory::Tree& before_;
  const Tarn::Inventory::Tree& after_;
  std::span<const NodeChange> changes_;
  std::map<const NodeChange*, Event> events_;
  std::set<const NodeChange*> explained_;
  std::map<const NodeChange*, Parts> parts_;
};

}  // namespace Corvcim

#endif
