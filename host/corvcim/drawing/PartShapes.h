#ifndef HOST_CORVCIM_DRAWING_PARTSHAPES_H
#define HOST_CORVCIM_DRAWING_PARTSHAPES_H

#include <span>
#include <vector>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

/// Whether the states of cores are compared with their shapes.
enum class States { Compared, Ignored };

/// Whether two parts look the same: the same caches, the same number of CPUs and the same states all
/// the way down. Names and numbers of cores and CPUs may differ.
bool hasSameShape(const MachinePart& left, const MachinePart& right, States states = States::Compared);

/// Neighbours of one shape.
using PartRun = std::span<const MachinePart>;

/// The parts, cut into runs of the same shape.
std::vector<PartRun> runsOfShape(std::span<const MachinePart> parts, States states = States::Compared);

/// All cores among and below the parts, in order.
std::vector<const MachinePart*> coresOf(std::span<const MachinePart> parts);

}  // namespace Corvcim

#endif
