#ifndef HOST_CORVCIM_DRAWING_MACHINE_H
#define HOST_CORVCIM_DRAWING_MACHINE_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// A cache as drawings label it.
struct CacheUnit {
  std::string name;        ///< "L3", "L1d", "L1i"; "cache" where the level is unknown
  std::uint64_t size = 0;  ///< bytes; 0 where unknown
  unsigned int status = 0;
  bool operator==(const CacheUnit&) const = default;
};

/// A part of a processor: a core with the caches that it has for itself, or caches that several parts
/// share, with these parts.
struct MachinePart {
  std::vector<CacheUnit> caches;   ///< outermost first; of a shared level: those of the same cores
  std::vector<MachinePart> parts;  ///< what shares the caches; empty for a core
  std::string corePath;            ///< of a core
  std::string coreKind;            ///< of a core, where the processor has several kinds: "P-core", "Cortex-A72 core"
  std::vector<unsigned int> numaNodes;  ///< of the CPUs; empty where the machine has fewer than two
  std::string numa;                     ///< "NUMA node 1"; empty if the part around this one lies in the same
  unsigned int status = 0;              ///< of a core, as the inventory tells it
  Tarn::Inventory::CpuSet cpus;         ///< logical CPUs; empty where unknown
  std::size_t coreCount = 1;            ///< cores in this part
  std::size_t level = 0;                ///< of shared caches: levels below, 1 for those that only cores share

  bool isCore() const { return parts.empty(); }
};

struct MachineProcessor {
  std::string path;
  std::string name;  ///< the model; empty where unknown
  unsigned int status = 0;
  unsigned int maxClock = 0;  ///< MHz; 0 where unknown
  std::size_t coreCount = 0;
  std::size_t enabledCount = 0;         ///< cores in use
  std::size_t threadCount = 0;          ///< 0 where unknown
  std::vector<unsigned int> numaNodes;  ///< of the CPUs; empty where the machine has fewer than two
  std::vector<MachinePart> parts;       ///< empty for an empty socket
  std::vector<CacheUnit> otherCaches;   ///< those of which the inventory does not say who shares them
};

/// System, processors, shared caches and cores, nested as the inventory tells who shares what. The
/// texts are printable: control characters stand as escapes.
struct Machine {
  std::string systemName;
  std::string model;  ///< empty where unknown
  std::vector<MachineProcessor> processors;

  std::size_t coreCount() const;
  std::size_t enabledCount() const;
};

/// "NUMA node 1", "NUMA nodes 0, 1"; empty for none.
std::string numaText(const std::vector<unsigned int>& nodes);

/// The machine of the tree, under that name.
Machine readMachine(const Tarn::Inventory::Tree& tree, std::string_view systemName);

}  // namespace Corvcim

#endif
