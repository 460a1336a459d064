#ifndef CORVANE_BENCH_MACHINES_H
#define CORVANE_BENCH_MACHINES_H

#include "platform/instrumentation/Tree.h"

namespace Corvane::Bench {

/// What a machine has of each kind: `processors` packages, and in each `coresEach` cores, a private L2
/// and two L1 caches for every core, and one L3 for all of them.
struct MachineSize {
  unsigned int processors;
  unsigned int coresEach;

  constexpr unsigned int cores() const { return processors * coresEach; }
  constexpr unsigned int cachesEach() const { return 1 + 3 * coresEach; }
  constexpr unsigned int caches() const { return processors * cachesEach(); }
};

/// The inventory of such a machine, with every property that a real one has.
Tarn::Inventory::Tree makeMachine(const MachineSize& size);

/// The paths of a part, by its numbers.
std::string processorPath(unsigned int processor);
std::string corePath(unsigned int processor, unsigned int core);
std::string cachePath(unsigned int processor, const char* level, unsigned int core);

}  // namespace Corvane::Bench

#endif
