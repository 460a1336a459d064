#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CACHES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CACHES_H

#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/sources/kernel/Topology.h"
#include "platform/inventory/tree/CpuSet.h"

namespace Tarn::Inventory {

/// What a cache holds; the numbers are the inventory's codes.
enum class CacheContents : unsigned int { Instructions = 1, Data = 2, Unified = 3 };

/// One cache of the machine. Numbers are absent where the kernel does not tell them.
struct Cache {
  unsigned int level = 0;
  std::optional<CacheContents> contents;
  std::optional<unsigned int> id;        ///< unique for its level and contents
  CpuSet cpus;                           ///< the CPUs that share it
  unsigned int owner = 0;                ///< the lowest of them that has a processor
  std::string_view cpusFile;             ///< the file that names them
  unsigned int sourceCpu = 0;            ///< the CPU in whose directory it was read,
  unsigned int index = 0;                ///< and its number there
  std::optional<unsigned int> size;      ///< KiB
  std::optional<unsigned int> lineSize;  ///< bytes
  std::optional<unsigned int> sets;
  std::optional<unsigned int> ways;         ///< 0 stands for fully associative
  std::optional<unsigned int> writePolicy;  ///< the inventory's code
};

/// A cache's size as a number of blocks.
struct CacheBlocks {
  unsigned int size;  ///< bytes
  unsigned int count;
};

/// Without a line size the blocks are bytes, as CIM has it for what has no blocks, or KiB where 32 bits cannot
/// count the bytes. Nothing where 32 bits cannot hold the number of blocks.
std::optional<CacheBlocks> cacheBlocks(std::uint64_t bytes, std::optional<unsigned int> lineSize);

/// Every cache of a known processor once, however many CPUs share it; by level, contents and lowest CPU. No
/// two caches of one level and contents have a CPU in common.
std::vector<Cache> readCaches(Machine& machine, const Topology& topology);

}  // namespace Tarn::Inventory

#endif
