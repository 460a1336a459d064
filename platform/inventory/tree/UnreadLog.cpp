#include "platform/inventory/tree/UnreadLog.h"

#include <algorithm>
#include <utility>

namespace Tarn::Inventory {

void UnreadLog::add(std::string file, std::string reason, std::string remedy) {
  items_.push_back({{std::move(file), std::move(reason), std::move(remedy)}, {}, {}});
}

void UnreadLog::addForCpu(const std::string& prefix, unsigned int cpu, const std::string& suffix, std::string reason,
                          std::string remedy) {
  Unread entry{prefix, std::move(reason), std::move(remedy)};
  const auto same = std::ranges::find_if(
      items_, [&](const Item& item) { return !item.cpus.empty() && item.suffix == suffix && item.entry == entry; });
  if (same != items_.end()) {
    same->cpus.add(cpu);
  } else {
    items_.push_back({std::move(entry), suffix, {cpu}});
  }
}

std::vector<Unread> UnreadLog::entries() const {
  std::vector<Unread> entries;
  for (const Item& item : items_) {
    entries.push_back(item.entry);
    if (!item.cpus.empty()) {
      const std::string list = item.cpus.toList();
      entries.back().file += (item.cpus.count() == 1 ? list : '{' + list + '}') + item.suffix;
    }
  }
  return entries;
}

}  // namespace Tarn::Inventory
