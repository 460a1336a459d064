#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CPUINFO_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CPUINFO_H

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/inventory/tree/CpuSet.h"

namespace Tarn::Inventory {

/// The text of /proc/cpuinfo: lines of a name, a colon and a value, in a block for each logical CPU that
/// is online, which ends with an empty line. Some architectures state what holds for all CPUs once, outside of
/// the blocks.
class CpuInfo {
 public:
  /// A number that is larger than its field can be.
  struct Misfit {
    std::size_t line;  ///< counted from 1
    std::string name;
    std::string value;
  };

  CpuInfo() = default;
  explicit CpuInfo(std::string text);

  /// The CPUs that have a block.
  const CpuSet& cpus() const { return cpus_; }

  /// A field of that CPU: from its block, else from what is outside of all blocks; empty where there is none.
  /// In the name * stands for the CPU's number. Good while this object lives.
  std::string_view field(unsigned int cpu, std::string_view name) const;

  /// The name of a field with the CPU's number in the place of the *.
  static std::string fieldName(unsigned int cpu, std::string_view name);

  /// The first number that does not fit, if there is one. A block that begins with such a number counts for no
  /// CPU; as the value of a field it is none.
  const std::optional<Misfit>& misfit() const { return misfit_; }

 private:
  struct Block {
    unsigned int cpu;
    std::size_t begin;
    std::size_t end;
  };

  bool split(std::string_view blockStart);
  void checkNumbers(std::size_t lineNumber, std::string_view line);
  void noteMisfit(std::size_t lineNumber, std::string_view name, std::string_view value);

  std::string text_;
  std::string common_;         // the lines outside of the blocks
  std::vector<Block> blocks_;  // sorted by CPU
  CpuSet cpus_;
  std::optional<Misfit> misfit_;
};

}  // namespace Tarn::Inventory

#endif
