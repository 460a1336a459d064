#ifndef HOST_CLI_CLASSLIST_H
#define HOST_CLI_CLASSLIST_H

#include <string>

#include "host/cli/Verbs.h"

namespace Corvcim {

/// The classes that the host knows: as text each with its parent and its keys, as JSON and MOF with all
/// properties and their types as well. The MOF declares what the providers set; what the classes of the
/// schema say besides is in the files that are registered with a broker.
std::string writeClassList(Format format);

}  // namespace Corvcim

#endif
