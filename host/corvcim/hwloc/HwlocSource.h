#ifndef HOST_CORVCIM_HWLOC_HWLOCSOURCE_H
#define HOST_CORVCIM_HWLOC_HWLOCSOURCE_H

#include <string_view>

#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// The inventory of a machine that hwloc describes:
///
///     hwloc:FILE                   an XML file, as lstopo writes it
///     hwloc-synthetic:DESCRIPTION  hwloc's short form: "package:2 l3:1 l2:4 l1d:1 l1i:1 core:1 pu:2"
///
/// Only the file or description is read, not this machine and no HWLOC_ variable; these are removed from
/// the process's environment. Parts get the paths that the live source gives them. What the description
/// does not tell is absent. Throws Tarn::Inventory::InventoryError.
Tarn::Inventory::Tree readHwloc(std::string_view source);

}  // namespace Corvcim

#endif
