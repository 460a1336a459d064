#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SOURCE_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SOURCE_H

#include <memory>
#include <string_view>
#include <vector>

#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// What names a source, for messages.
inline constexpr std::string_view sourceForms = "live, root:DIRECTORY, snapshot:FILE, json:FILE or smbios:FILE";

/// Whether the text names a source, be its file there or not.
bool namesSource(std::string_view specification);

/// The names of files and directories in the text of a source, in order, as parts of it: both of
/// smbios:FILE+root:DIR, none of live.
std::vector<std::string_view> locationsOf(std::string_view specification);

/// Reads the inventory that the text names:
///
///     live          this machine
///     root:DIR      a captured root directory that holds sys/ and proc/
///     root:FILE     the same in one file (Archive.h)
///     snapshot:FILE what another machine's live source read (Snapshot.h)
///     json:FILE     a tree written as JSON (JsonTree.h)
///     smbios:FILE   the firmware's tables alone, as `dmidecode --dump-bin` writes them to a file
///     smbios:FILE+live, smbios:FILE+root:DIR, smbios:FILE+root:FILE
///                   the same in the place of those tables that the machine shows
///
/// With Detail::WithOrigins the tree also tells of each value where it comes from.
/// Throws InventoryError where the text names no source, or its source cannot be read.
Tree loadInventory(std::string_view specification, Detail detail = Detail::Values);

/// The root of the files that the live source's readers read for this source; nullptr where they read none (json:,
/// and a dump of the firmware's tables alone). Throws InventoryError as above.
std::unique_ptr<FileSystem> openSource(std::string_view specification);

}  // namespace Tarn::Inventory

#endif
