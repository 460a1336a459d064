#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_ERRORNAMES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_ERRORNAMES_H

#include <optional>
#include <string>
#include <string_view>

#include "platform/inventory/sources/files/FileSystem.h"

namespace Tarn::Inventory {

/// The error's name, such as "EACCES", which is the same on every architecture; of an error without a name here, its
/// number.
std::string nameOfError(FileError error);

/// The error of that name or number; nothing where the text is neither.
std::optional<FileError> errorOfName(std::string_view name);

}  // namespace Tarn::Inventory

#endif
