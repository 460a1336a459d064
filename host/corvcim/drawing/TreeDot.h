#ifndef HOST_CORVCIM_DRAWING_TREEDOT_H
#define HOST_CORVCIM_DRAWING_TREEDOT_H

#include <string>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

/// The machine as a graph in the DOT language, for Graphviz.
std::string drawTreeDot(const Machine& machine);

}  // namespace Corvcim

#endif
