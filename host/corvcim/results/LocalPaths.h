#ifndef HOST_CORVCIM_RESULTS_LOCALPATHS_H
#define HOST_CORVCIM_RESULTS_LOCALPATHS_H

#include "host/broker/Instance.h"
#include "host/broker/ObjectPath.h"

namespace Corvcim {

/// The path without its host, and without those of the paths in its keys: whatever this program shows
/// lies on this host, and saying so in every line helps nobody.
ObjectPath withoutHosts(ObjectPath path);

/// The value, with references treated so, those in arrays too.
Value withoutHosts(const Value& value);

/// The instance, with its path and all its values treated so.
Instance withoutHosts(Instance instance);

}  // namespace Corvcim

#endif
