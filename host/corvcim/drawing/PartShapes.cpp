#include "host/corvcim/drawing/PartShapes.h"

#include <algorithm>

namespace Corvcim {
namespace {

void collectCores(std::span<const MachinePart> parts, std::vector<const MachinePart*>& cores) {
  for (const MachinePart& part : parts) {
    if (part.isCore()) {
      cores.push_back(&part);
    } else {
      collectCores(part.parts, cores);
    }
  }
}

}  // namespace

bool hasSameShape(const MachinePart& left, const MachinePart& right, States states) {
  return left.caches == right.caches && left.coreKind == right.coreKind && left.numa == right.numa &&
         (states == States::Ignored || left.status == right.status) && left.cpus.count() == right.cpus.count() &&
         std::ranges::equal(left.parts, right.parts, [states](const MachinePart& one, const MachinePart& other) {
           return hasSameShape(one, other, states);
         });
}

std::vector<PartRun> runsOfShape(std::span<const MachinePart> parts, States states) {
  std::vector<PartRun> runs;
  while (!parts.empty()) {
    std::size_t length = 1;
    while (length < parts.size() && hasSameShape(parts.front(), parts[length], states)) {
      ++length;
    }
    runs.push_back(parts.first(length));
    parts = parts.subspan(length);
  }
  return runs;
}

std::vector<const MachinePart*> coresOf(std::span<const MachinePart> parts) {
  std::vector<const MachinePart*> cores;
  collectCores(parts, cores);
  return cores;
}

}  // namespace Corvcim
