#ifndef HOST_CLI_DRAWING_TREESVG_H
#define HOST_CLI_DRAWING_TREESVG_H

#include <string>

#include "host/cli/drawing/Topology.h"

namespace Corvcim {

/// The topology as a picture: SVG that needs nothing beside itself, on a light ground, with a title
/// and a description for people who cannot see it.
std::string drawTreeSvg(const Topology& topology);

}  // namespace Corvcim

#endif
