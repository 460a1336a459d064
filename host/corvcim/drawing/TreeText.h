#ifndef HOST_CORVCIM_DRAWING_TREETEXT_H
#define HOST_CORVCIM_DRAWING_TREETEXT_H

#include <cstddef>
#include <string>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

/// The machine as a tree of lines. On machines with many cores, neighbours of the same shape share
/// one line. `width` is the terminal's, where longer lines are cut; 0 for no limit.
std::string drawTreeText(const Machine& machine, std::size_t width);

}  // namespace Corvcim

#endif
