#ifndef HOST_CLI_CLASSLIST_H
#define HOST_CLI_CLASSLIST_H

#include <string>

#include "host/cli/Verbs.h"

namespace Corvcim {

/// The classes that the host knows: as text each with its kind, its parent and its keys, as JSON with
/// all properties and their types as well.
std::string writeClassList(Format format);

}  // namespace Corvcim

#endif
