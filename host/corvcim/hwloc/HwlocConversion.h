#ifndef HOST_CORVCIM_HWLOC_HWLOCCONVERSION_H
#define HOST_CORVCIM_HWLOC_HWLOCCONVERSION_H

#include <string>

#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

// Where hwloc begins. `name` is the source's name for messages. Both throw InventoryError.

Tarn::Inventory::Tree treeOfXml(const std::string& text, const std::string& name);
Tarn::Inventory::Tree treeOfSynthetic(const std::string& description, const std::string& name);

}  // namespace Corvcim

#endif
