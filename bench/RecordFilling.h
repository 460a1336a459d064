#ifndef CORVANE_BENCH_RECORDFILLING_H
#define CORVANE_BENCH_RECORDFILLING_H

#include "bench/Machines.h"

/// Filling records from constants: what a collection costs at the least.
namespace Corvane::Bench {

/// Collects the records of a kind, as often as asked: each time all of the machine's, into a new vector.
void fillProcessors(const MachineSize& machine, std::size_t times);
void fillCores(const MachineSize& machine, std::size_t times);
void fillCaches(const MachineSize& machine, std::size_t times);

}  // namespace Corvane::Bench

#endif
