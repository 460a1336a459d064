#ifndef CORVANE_PLATFORM_INSTRUMENTATION_KERNEL_CPUINFO_H
#define CORVANE_PLATFORM_INSTRUMENTATION_KERNEL_CPUINFO_H

#include <string>
#include <string_view>
#include <vector>

#include "platform/instrumentation/tree/CpuSet.h"

namespace Tarn::Inventory {

/// The text of /proc/cpuinfo: lines of a name, a colon and a value, in a block for each logical CPU that
/// is online. Some architectures state what holds for all CPUs once, outside of the blocks.
class CpuInfo {
 public:
  CpuInfo() = default;
  explicit CpuInfo(std::string text);

  /// The CPUs that have a block.
  const CpuSet& cpus() const { return cpus_; }

  /// A field of that CPU; where its block does not have it, the first one of that name in the text; empty
  /// where there is none. Good while this object lives.
  std::string_view field(unsigned int cpu, std::string_view name) const;

 private:
  struct Block {
    unsigned int cpu;
    std::size_t begin;
    std::size_t end;
  };

  std::string text_;
  std::vector<Block> blocks_;  // sorted by CPU
  CpuSet cpus_;
};

}  // namespace Tarn::Inventory

#endif
