#ifndef HOST_CORVCIM_DRAWING_PARTLABELS_H
#define HOST_CORVCIM_DRAWING_PARTLABELS_H

#include <span>
#include <string>
#include <vector>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

/// "L2 2 MiB".
std::string labelOf(const CacheUnit& cache);

/// "core P0.C1", "P-core P0.C1".
std::string coreLabel(const MachinePart& core);

/// "8 cores", "8 P-cores".
std::string coreCountLabel(std::size_t count, const MachinePart& first);

/// "CPU 3", "CPUs 0-3,8"; empty for no CPU.
std::string cpuListText(const Tarn::Inventory::CpuSet& cpus);

/// "L2 2 MiB, L1d 48 KiB, L1i 32 KiB", with the states of those that are not in use; equal neighbours
/// are counted: "4 × L2 1 MiB".
std::string labelsOf(std::span<const CacheUnit> caches);

/// What a drawing says about a processor beside its name: "2 cores", "4 threads", "up to 3.6 GHz", "offline".
std::vector<std::string> factsOf(const MachineProcessor& processor);

/// "PowerBox 300 · 2 processors · 128 cores · 256 threads".
std::string summaryOf(const Machine& machine);

}  // namespace Corvcim

#endif
