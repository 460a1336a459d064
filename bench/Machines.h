#ifndef CORVANE_BENCH_MACHINES_H
#define CORVANE_BENCH_MACHINES_H

#include <cstddef>
#include <string>

#include "platform/inventory/tree/Tree.h"

namespace Corvane::Bench {

/// A kind of cache, in the codes of the inventory tree.
struct CacheKind {
  const char* name;
  const char* description;
  unsigned int level;
  unsigned int type;
  unsigned int blocks;
  unsigned int associativity;
};

inline constexpr unsigned int cacheBlockSize = 64;
inline constexpr unsigned int cacheWritePolicy = 1;
inline constexpr CacheKind sharedCache = {"L3", "L3 unified cache", 5, 3, 524288, 6};
inline constexpr CacheKind coreCaches[] = {
    {"L1d", "L1 data cache", 3, 2, 512, 5},
    {"L1i", "L1 instruction cache", 3, 1, 512, 5},
    {"L2", "L2 unified cache", 4, 3, 16384, 6},
};

/// What a machine has of each kind: `processors` packages, and in each `coresEach` cores, a private L2
/// and two L1 caches for every core, and one L3 for all of them.
struct MachineSize {
  std::size_t processors;
  std::size_t coresEach;

  constexpr std::size_t cores() const { return processors * coresEach; }
  constexpr std::size_t cachesEach() const { return 1 + 3 * coresEach; }
  constexpr std::size_t caches() const { return processors * cachesEach(); }
};

/// The inventory of such a machine, with every property that a real one has.
Tarn::Inventory::Tree makeMachine(const MachineSize& size);

/// The paths of a part, by its numbers.
std::string processorPath(std::size_t processor);
std::string corePath(std::size_t processor, std::size_t core);
std::string cachePath(std::size_t processor, const CacheKind& kind, std::size_t core);

}  // namespace Corvane::Bench

#endif
