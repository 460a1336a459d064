#ifndef CORVANE_PLATFORM_INSTRUMENTATION_ARCHIVE_H
#define CORVANE_PLATFORM_INSTRUMENTATION_ARCHIVE_H

#include <string>
#include <string_view>

#include "platform/instrumentation/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// Many small files in one text file: a machine's captured sysfs and procfs.
///
///     # Where this comes from.
///     [sys/devices/system/cpu]
///     online: 0-3
///     offline:
///     [proc]
///     cpuinfo:
///     	processor	: 0
///     	vendor_id	: GenuineIntel
///     [sys/class/dmi/id]
///     product_name! EACCES
///
/// A directory in brackets begins its files. Behind a colon stands a file's one line; a file of more
/// lines, or of none, has them below, each behind a tab. An exclamation mark instead of the colon says
/// that reading the file fails, and how. Lines that begin with # and empty lines do not count.
///
/// Throws InventoryError with the line number where a text is no such archive.
MemoryFileSystem::Files readArchive(std::string_view text, const std::string& name);

/// The files as such a text, sorted by path.
std::string writeArchive(const MemoryFileSystem::Files& files);

}  // namespace Tarn::Inventory

#endif
