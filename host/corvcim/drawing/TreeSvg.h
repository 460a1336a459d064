#ifndef HOST_CORVCIM_DRAWING_TREESVG_H
#define HOST_CORVCIM_DRAWING_TREESVG_H

#include <string>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

/// The machine as a picture: SVG that needs nothing beside itself, on a light ground, with a title
/// and a description for people who cannot see it. It has no ids and no style sheet, so that it changes nothing of a
/// page that it is put into.
std::string drawTreeSvg(const Machine& machine);

}  // namespace Corvcim

#endif
