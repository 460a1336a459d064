#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_ARCHIVE_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_ARCHIVE_H

#include <string>
#include <string_view>

#include "platform/inventory/sources/files/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// Many small files in one text file: a machine's captured sysfs and procfs.
///
///     # Where this comes from.
///     [sys/devices/system/cpu]
///     online: 0-3
///     offline:
///     [sys/devices/system/cpu/cpu0]
///     ./:
///     	cache
///     	topology
///     [proc]
///     cpuinfo:
///     	processor	: 0
///     	vendor_id	: GenuineIntel
///     [sys/class/dmi/id]
///     product_name! EACCES
///     [sys/firmware/dmi/tables]
///     DMI#
///     	011b010001020304f1bd7a1c3c2c11ec8f6c0242ac120002060506000045786d
///     	706c650000
///
/// A directory in brackets begins its files. After a colon stands a file's one line; a file of more
/// lines, or of none, has them below, each after a tab. After # stands a file that is no text, its
/// bytes in hexadecimal, on this line or below. An exclamation mark says that reading the file fails,
/// and how: by the error's name or its number. The name ./ is the directory itself: below it stands
/// what listing it gives, one name on each line, where that is more or less than the files here. Lines
/// that begin with # and empty lines are skipped.
///
/// Throws InventoryError with the line number where a text is no such archive.
MemoryFileSystem::Files readArchive(std::string_view text, const std::string& name);

/// The files as such a text, sorted by path.
std::string writeArchive(const MemoryFileSystem::Files& files);

}  // namespace Tarn::Inventory

#endif
