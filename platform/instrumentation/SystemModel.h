#ifndef CORVANE_PLATFORM_INSTRUMENTATION_SYSTEMMODEL_H
#define CORVANE_PLATFORM_INSTRUMENTATION_SYSTEMMODEL_H

#include <string>

#include "platform/instrumentation/Machine.h"

namespace Tarn::Inventory {

/// The computer's model: the firmware's product name, else the device tree's model, else "Virtual Machine"
/// where the kernel says that it runs under a hypervisor. Empty where none of them is known.
std::string readSystemModel(Machine& machine);

/// The computer's maker, as the firmware names it; empty where it does not.
std::string readSystemManufacturer(Machine& machine);

}  // namespace Tarn::Inventory

#endif
