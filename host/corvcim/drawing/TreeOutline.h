#ifndef HOST_CORVCIM_DRAWING_TREEOUTLINE_H
#define HOST_CORVCIM_DRAWING_TREEOUTLINE_H

#include <string>
#include <vector>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

/// One item of the machine in words.
struct OutlineItem {
  enum class Kind { System, Processor, Cache, Core, Note };

  Kind kind;
  std::string label;                 ///< "processor P0", "L3 32 MiB", "8 cores P0.C0 to P0.C7"
  std::vector<std::string> details;  ///< "CPUs 0-7", "shared by 8 cores", "offline"
  bool isInUse = true;
  std::vector<OutlineItem> below;
};

/// The machine in words. On machines with many cores, neighbours of the same shape share one item,
/// and what is below the first of them stands for all.
OutlineItem outlineOf(const Machine& machine);

}  // namespace Corvcim

#endif
