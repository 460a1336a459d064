#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_RECONCILIATION_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_RECONCILIATION_H

#include <string>
#include <vector>

#include "platform/inventory/tree/Facts.h"
#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// What two sources together know of a part: all that the kernel says, so that the part looks the same to
/// those who may not read the firmware's tables, and of the firmware's what the kernel does not know.
/// Where both say something and mean different things, a disagreement is added. Values that change by
/// nature are not compared.
Facts reconcile(const Facts& kernel, const Facts& firmware, const std::string& path,
                std::vector<Disagreement>& disagreements);

}  // namespace Tarn::Inventory

#endif
