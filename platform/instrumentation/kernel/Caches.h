#ifndef CORVANE_PLATFORM_INSTRUMENTATION_KERNEL_CACHES_H
#define CORVANE_PLATFORM_INSTRUMENTATION_KERNEL_CACHES_H

#include <optional>
#include <vector>

#include "platform/instrumentation/kernel/Machine.h"
#include "platform/instrumentation/tree/CpuSet.h"

namespace Tarn::Inventory {

/// What a cache holds; the numbers are the inventory's codes.
enum class CacheContents : unsigned int { Instructions = 1, Data = 2, Unified = 3 };

/// One cache of the machine. Numbers are absent where the kernel does not tell them.
struct Cache {
  unsigned int level = 0;
  std::optional<CacheContents> contents;
  std::optional<unsigned int> id;        ///< unique for its level and contents
  CpuSet cpus;                           ///< the CPUs that share it
  unsigned int sourceCpu = 0;            ///< the CPU in whose directory it was read,
  unsigned int index = 0;                ///< and its number there
  std::optional<unsigned int> size;      ///< KiB
  std::optional<unsigned int> lineSize;  ///< bytes
  std::optional<unsigned int> sets;
  std::optional<unsigned int> ways;         ///< 0 stands for fully associative
  std::optional<unsigned int> writePolicy;  ///< the inventory's code
};

/// Every cache once, however many CPUs share it; by level, contents and lowest CPU. No two caches of one
/// level and contents have a CPU in common.
std::vector<Cache> readCaches(Machine& machine, const CpuSet& present, const CpuSet& online);

}  // namespace Tarn::Inventory

#endif
