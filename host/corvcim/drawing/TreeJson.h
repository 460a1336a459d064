#ifndef HOST_CORVCIM_DRAWING_TREEJSON_H
#define HOST_CORVCIM_DRAWING_TREEJSON_H

#include <string>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

/// The machine as JSON, nested like the drawings: "processors", in each "parts", which are cores with their caches, or
/// caches with the "parts" that share them. Sizes are in bytes, clocks in MHz, states as the inventory's numbers; what
/// is not known is null.
std::string drawTreeJson(const Machine& machine);

}  // namespace Corvcim

#endif
