#ifndef HOST_CORVCIM_OPERATIONS_LIBRARIES_H
#define HOST_CORVCIM_OPERATIONS_LIBRARIES_H

#include <functional>
#include <map>
#include <string>
#include <string_view>

#include "host/corvcim/options/Options.h"

namespace Corvcim {

/// Files by the base name of the library, as the dispatcher takes them.
using LibraryFiles = std::map<std::string, std::string, std::less<>>;

inline constexpr std::string_view providerLibraryName = "corvcpuprofileprovider";
inline constexpr std::string_view companionLibraryName = "corvcomputersystemprovider";

/// The file of the library with that base name which belongs to this program, in the build tree or
/// where the package installs it. Empty where there is none.
std::string findLibrary(std::string_view baseName);

/// The files of both libraries: what the options name, else what findLibrary finds. A companion that
/// is not there is left out. Throws std::runtime_error, which says where it looked, if there is no
/// provider library.
LibraryFiles libraryFiles(const Options& options);

}  // namespace Corvcim

#endif
