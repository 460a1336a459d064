#ifndef CORVANE_PLATFORM_INVENTORY_TREE_UNREADLOG_H
#define CORVANE_PLATFORM_INVENTORY_TREE_UNREADLOG_H

#include <string>
#include <vector>

#include "platform/inventory/tree/CpuSet.h"
#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// Collects what a source could not read. What failed in the same way for many CPUs is one entry.
class UnreadLog {
 public:
  void add(std::string file, std::string reason, std::string remedy);

  /// As add, for the file `prefix`N`suffix` of CPU N.
  void addForCpu(const std::string& prefix, unsigned int cpu, const std::string& suffix, std::string reason,
                 std::string remedy);

  /// The entries in the order in which they came first; "cpu{2,4-7}" stands for several CPUs.
  std::vector<Unread> entries() const;

 private:
  struct Item {
    Unread entry;  // the file's name without the CPU number
    std::string suffix;
    CpuSet cpus;
  };
  std::vector<Item> items_;
};

}  // namespace Tarn::Inventory

#endif
