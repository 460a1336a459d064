#ifndef HOST_CLI_DRAWING_TREEDOT_H
#define HOST_CLI_DRAWING_TREEDOT_H

#include <string>

#include "host/cli/drawing/Topology.h"

namespace Corvcim {

/// The topology as a graph in the DOT language, for Graphviz.
std::string drawTreeDot(const Topology& topology);

}  // namespace Corvcim

#endif
