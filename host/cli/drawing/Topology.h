#ifndef HOST_CLI_DRAWING_TOPOLOGY_H
#define HOST_CLI_DRAWING_TOPOLOGY_H

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "platform/instrumentation/tree/Tree.h"

namespace Corvcim {

/// A cache as drawings label it.
struct CacheUnit {
  std::string name;        ///< "L3", "L1d", "L1i"; "cache" where the level is unknown
  std::uint64_t size = 0;  ///< bytes; 0 where unknown
  unsigned int status = 0;
  bool operator==(const CacheUnit&) const = default;

  /// "L2 2 MiB".
  std::string label() const;
};

/// A part of a processor: a core with the caches that it has for itself, or caches that several parts
/// share, with these parts.
struct TopologyPart {
  std::vector<CacheUnit> caches;    ///< outermost first; of a shared level: those of the same cores
  std::vector<TopologyPart> parts;  ///< what shares the caches; empty for a core
  std::string corePath;             ///< of a core
  unsigned int status = 0;          ///< of a core, as the inventory tells it
  Tarn::Inventory::CpuSet cpus;     ///< logical CPUs; empty where unknown
  std::size_t coreCount = 1;        ///< cores in this part
  std::size_t level = 0;            ///< of shared caches: levels below, 1 for those that only cores share

  bool isCore() const { return parts.empty(); }
};

struct TopologyProcessor {
  std::string path;
  std::string name;  ///< the model; empty where unknown
  unsigned int status = 0;
  unsigned int maxClock = 0;  ///< MHz; 0 where unknown
  std::size_t coreCount = 0;
  std::size_t threadCount = 0;         ///< 0 where unknown
  std::vector<TopologyPart> parts;     ///< empty for an empty socket
  std::vector<CacheUnit> otherCaches;  ///< those of which the inventory does not say who shares them
};

/// System, processors, shared caches and cores, nested as the inventory tells who shares what. The
/// texts are printable: control characters stand as escapes.
struct Topology {
  std::string systemName;
  std::string model;  ///< empty where unknown
  std::vector<TopologyProcessor> processors;

  std::size_t coreCount() const;
};

Topology readTopology(const Tarn::Inventory::Tree& tree, std::string_view systemName);

/// What a node's status means in a drawing: "offline", "disabled"; empty for a part in use.
std::string stateNote(unsigned int status);

/// "CPU 3", "CPUs 0-3,8"; empty for no CPU.
std::string cpuListText(const Tarn::Inventory::CpuSet& cpus);

/// "L2 2 MiB, L1d 48 KiB, L1i 32 KiB", with the states of those that are not in use; equal neighbours
/// are counted: "4 × L2 1 MiB".
std::string labelsOf(std::span<const CacheUnit> caches);

/// What a drawing says about a processor beside its name: "2 cores", "4 threads", "up to 3.6 GHz", "offline".
std::vector<std::string> factsOf(const TopologyProcessor& processor);

/// "PowerBox 300 · 2 processors · 128 cores · 256 threads".
std::string summaryOf(const Topology& topology);

/// Whether the states of cores count when shapes are compared.
enum class States { Count, Ignored };

/// Whether two parts look the same: the same caches, the same number of CPUs and the same states all
/// the way down. Names and numbers of cores and CPUs do not count.
bool hasSameShape(const TopologyPart& left, const TopologyPart& right, States states = States::Count);

/// Neighbours of one shape.
using PartRun = std::span<const TopologyPart>;

/// The parts, cut into runs of the same shape.
std::vector<PartRun> runsOfShape(std::span<const TopologyPart> parts, States states = States::Count);

/// All cores among and below the parts, in order.
std::vector<const TopologyPart*> coresOf(std::span<const TopologyPart> parts);

}  // namespace Corvcim

#endif
