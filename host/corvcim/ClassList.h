#ifndef HOST_CORVCIM_CLASSLIST_H
#define HOST_CORVCIM_CLASSLIST_H

#include <string>
#include <string_view>

#include "host/corvcim/options/Verbs.h"

namespace Corvcim {

/// The classes that the host knows: as text each with its parent and its keys, as JSON and MOF with all properties as
/// well. The MOF declares what the providers set; what the classes of the schema say besides is in the files that are
/// registered with a broker.
std::string writeClassList(Format format);

/// One class: its properties with their types, keys, units and value names. A class of the schema stands for the served
/// classes derived from it. Throws std::runtime_error for a name that no class has.
std::string writeClass(Format format, std::string_view name);

}  // namespace Corvcim

#endif
