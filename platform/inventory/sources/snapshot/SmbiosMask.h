#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOT_SMBIOSMASK_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SNAPSHOT_SMBIOSMASK_H

#include <string>
#include <string_view>
#include <vector>

namespace Tarn::Inventory {

/// Masks in the firmware's table what tells this machine from others of its kind. Of the structures that
/// the inventory is read from (types 1, 4 and 7), and of the firmware's own (0), everything stays but
/// serial numbers, asset tags, part and SKU numbers, the UUID, and what no field refers to. Of all others
/// only the headers stay. Texts are replaced by X, fields by zeros, both at equal length, so that every
/// structure keeps its place and what was wrong with the table stays wrong. Texts that firmware vendors
/// leave in a field that they did not fill in stay as well, as they identify nothing.
///
/// Returns what was masked, one line for each structure or group of structures.
std::vector<std::string> maskTable(std::string_view entryPoint, std::string& table);

}  // namespace Tarn::Inventory

#endif
