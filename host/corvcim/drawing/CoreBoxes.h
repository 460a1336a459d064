#ifndef HOST_CORVCIM_DRAWING_COREBOXES_H
#define HOST_CORVCIM_DRAWING_COREBOXES_H

#include <span>
#include <string>

#include "host/corvcim/drawing/Machine.h"
#include "host/corvcim/drawing/SvgLayout.h"

namespace Corvcim {

/// How much of each core is drawn.
enum class Detail {
  Full,     ///< each core with its caches
  Cells,    ///< small cells, and what they have in common
  Summary,  ///< one group of each shape
};

/// What all cores of a drawing have in common.
struct CorePlan {
  Detail detail = Detail::Full;
  int cellWidth = 0;
};

inline constexpr int barHeight = 22;

CorePlan planCores(const Machine& machine);

/// A bar in the colour of its cache level; without text.
Box cacheBar(std::span<const CacheUnit> caches, int width);

/// A core with its caches above it.
Box fullCore(const MachinePart& core, const CorePlan& plan);

/// Cores as small cells, or as one cell for all of them, with a line below that says what they have
/// in common.
Box coreGroup(std::span<const MachinePart> cores, const CorePlan& plan, int maxWidth, const std::string& traits);

/// What all the cores have: "2 threads · L2 512 KiB, L1d 32 KiB"; empty where they differ.
std::string commonTraits(std::span<const MachinePart* const> cores);

void addLine(Box& box, TextStyle style, int x, int y, std::string text);

}  // namespace Corvcim

#endif
