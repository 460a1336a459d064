#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_SYSTEMMODEL_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_SYSTEMMODEL_H

#include <string_view>

#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/tree/Facts.h"

namespace Tarn::Inventory {

/// What the kernel says of the computer: its name, its model (the firmware's product name, else the device tree's
/// model) and its maker. Where there is no model, and `firmware`, which the tables told, has none either:
/// "Virtual Machine", if the kernel says that it runs under a hypervisor. `firmware` is nullptr where
/// there are no tables. The origins look into the machine, which must outlive them.
Facts readSystemFacts(Machine& machine, const Facts* firmware);

/// Whether a text is what firmware vendors leave in a field that they did not fill in.
bool isPlaceholder(std::string_view text);

}  // namespace Tarn::Inventory

#endif
