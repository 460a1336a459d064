#ifndef SCHEMA_REGISTRATION_H
#define SCHEMA_REGISTRATION_H

#include <string>
#include <string_view>

#include "schema/ClassTable.h"

/// The registration of a library's providers, rendered from the host's class table: the one list of
/// classes, providers, libraries and process groups.
namespace Registration {

/// The namespace that the classes are served in.
inline constexpr std::string_view nameSpace = Corvcim::servedNameSpace;

/// The text format of SFCB: one block for each class that `library` ("corvcpuprofileprovider") serves.
std::string forSfcb(std::string_view library);

/// The MOF instances of OpenPegasus, to be compiled into root/PG_InterOp: a module for each process
/// group, a provider and its capabilities for each class. `version` is the modules' version.
std::string forPegasus(std::string_view library, std::string_view version);

}  // namespace Registration

#endif
