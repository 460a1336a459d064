#include "host/corvcim/drawing/Machine.h"

#include <algorithm>
#include <array>
#include <string_view>
#include <utility>

#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::CpuSet;
using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::Tree;
namespace Lexicon = Tarn::NodeLexicon;

unsigned int numberOf(const Tree& tree, const Node& node, Lexicon::Properties id) {
  const unsigned int* value = tree.number(node, id);
  return value == nullptr ? 0 : *value;
}

std::string textOf(const Tree& tree, const Node& node, Lexicon::Properties id) {
  const std::string* value = tree.text(node, id);
  return value == nullptr ? std::string() : toPrintable(*value);
}

/// Depth of a cache level in a drawing: L1 is nearest to the core; what has no level is outermost.
constexpr unsigned int outermostDepth = 4;

struct Level {
  unsigned int code;
  unsigned int depth;
  std::string_view name;
};

constexpr std::array<Level, 3> levels = {{{3, 1, "L1"}, {4, 2, "L2"}, {5, 3, "L3"}}};

unsigned int depthOf(unsigned int levelCode) {
  const auto* const level = std::ranges::find(levels, levelCode, &Level::code);
  return level == levels.end() ? outermostDepth : level->depth;
}

std::string cacheName(unsigned int levelCode, unsigned int typeCode, const std::string& givenName) {
  const auto* const level = std::ranges::find(levels, levelCode, &Level::code);
  if (level == levels.end()) {
    return givenName.empty() ? "cache" : givenName;
  }
  constexpr unsigned int instruction = 1;
  constexpr unsigned int data = 2;
  const std::string_view suffix = typeCode == instruction ? "i" : typeCode == data ? "d" : "";
  return std::string(level->name).append(suffix);
}

struct CacheNode {
  CacheUnit unit;
  unsigned int depth;
  CpuSet cpus;
};

CacheNode readCache(const Tree& tree, const Node& node) {
  const unsigned int level = numberOf(tree, node, Lexicon::PropCacheLevel);
  CacheNode cache;
  cache.unit.name =
      cacheName(level, numberOf(tree, node, Lexicon::PropCacheType), textOf(tree, node, Lexicon::PropCacheName));
  cache.unit.size = std::uint64_t{numberOf(tree, node, Lexicon::PropCacheBlockSize)} *
                    numberOf(tree, node, Lexicon::PropCacheNumberOfBlocks);
  cache.unit.status = node.status;
  cache.depth = depthOf(level);
  cache.cpus = node.cpus;
  return cache;
}

/// Shared caches from the outside in, those of the same cores as one row.
struct CacheRow {
  std::vector<CacheUnit> caches;
  unsigned int depth;
  CpuSet cpus;
};

void sortByCpu(std::vector<MachinePart>& parts) {
  std::ranges::stable_sort(parts, {}, [](const MachinePart& part) { return part.cpus.first(); });
}

/// "P-core" for "Performance core 4", "Cortex-A72 core" for "Cortex-A72 core 1"; empty for "Core 4".
std::string coreKindIn(std::string_view description) {
  constexpr std::string_view word = " core ";
  const std::size_t end = description.find(word);
  if (end == std::string_view::npos) {
    return "";
  }
  const std::string_view kind = description.substr(0, end);
  return kind == "Performance" ? "P-core" : kind == "Efficient" ? "E-core" : toPrintable(kind) + " core";
}

std::vector<unsigned int> numaNodesOf(const Tree& tree, const CpuSet& cpus) {
  std::vector<unsigned int> numbers;
  if (tree.numaNodes().size() > 1) {
    for (const Tarn::Inventory::NumaNode& node : tree.numaNodes()) {
      if (node.cpus.intersects(cpus)) {
        numbers.push_back(node.number);
      }
    }
  }
  return numbers;
}

/// Labels the parts that lie in other nodes than the part around them, and puts those of one node together.
void labelNuma(const Tree& tree, std::vector<MachinePart>& parts, const std::vector<unsigned int>& around) {
  for (MachinePart& part : parts) {
    part.numaNodes = numaNodesOf(tree, part.cpus);
    part.numa = part.numaNodes == around ? "" : numaText(part.numaNodes);
    labelNuma(tree, part.parts, part.numaNodes);
  }
  std::ranges::stable_sort(parts, {}, &MachinePart::numaNodes);
}

/// Nests rows and cores by who lies within whom. `rows` are sorted from the outside in.
class Nesting {
 public:
  Nesting(std::vector<CacheRow> rows, std::vector<MachinePart> cores)
      : rows_(std::move(rows)), cores_(std::move(cores)), isPlaced_(cores_.size(), false) {}

  std::vector<MachinePart> build() {
    std::vector<MachinePart> parts = partsWithin(0, nullptr);
    sortByCpu(parts);
    return parts;
  }

  /// Caches that no core was found for, after build().
  std::vector<CacheUnit> takeUnplaced() { return std::move(unplaced_); }

 private:
  std::vector<MachinePart> partsWithin(std::size_t firstRow, const CpuSet* bounds) {
    std::vector<MachinePart> parts;
    for (std::size_t i = firstRow; i < rows_.size(); ++i) {
      if (rows_[i].caches.empty() || (bounds != nullptr && !rows_[i].cpus.isSubsetOf(*bounds))) {
        continue;
      }
      addSharedCaches(parts, i);
    }
    for (std::size_t i = 0; i < cores_.size(); ++i) {
      if (!isPlaced_[i] && (bounds == nullptr || (!cores_[i].cpus.empty() && cores_[i].cpus.isSubsetOf(*bounds)))) {
        isPlaced_[i] = true;
        parts.push_back(std::move(cores_[i]));
      }
    }
    return parts;
  }

  void addSharedCaches(std::vector<MachinePart>& parts, std::size_t row) {
    MachinePart part;
    part.caches = std::exchange(rows_[row].caches, {});
    part.cpus = rows_[row].cpus;
    part.parts = partsWithin(row + 1, &part.cpus);
    if (part.parts.empty()) {
      unplaced_.insert(unplaced_.end(), part.caches.begin(), part.caches.end());
      return;
    }
    sortByCpu(part.parts);
    part.coreCount = 0;
    for (const MachinePart& inner : part.parts) {
      part.coreCount += inner.coreCount;
      part.level = std::max(part.level, inner.level + 1);
    }
    parts.push_back(std::move(part));
  }

  std::vector<CacheRow> rows_;  // a row's caches are taken out when it is placed
  std::vector<MachinePart> cores_;
  std::vector<bool> isPlaced_;
  std::vector<CacheUnit> unplaced_;
};

void sortFromOutside(std::vector<CacheNode>& caches) {
  std::ranges::stable_sort(caches, [](const CacheNode& left, const CacheNode& right) {
    return left.depth != right.depth ? left.depth > right.depth : left.unit.name < right.unit.name;
  });
}

/// Caches of the same level and the same CPUs become one row.
void addToRows(std::vector<CacheRow>& rows, const CacheNode& cache) {
  const auto row = std::ranges::find_if(
      rows, [&](const CacheRow& other) { return other.depth == cache.depth && other.cpus == cache.cpus; });
  if (row != rows.end()) {
    row->caches.push_back(cache.unit);
    return;
  }
  rows.push_back({{cache.unit}, cache.depth, cache.cpus});
}

MachinePart* onlyUser(std::vector<MachinePart>& cores, const CpuSet& cpus) {
  for (MachinePart& core : cores) {
    if (cpus.isSubsetOf(core.cpus)) {
      return &core;
    }
  }
  return nullptr;
}

void readParts(MachineProcessor& processor, std::vector<CacheNode> caches, std::vector<MachinePart> cores) {
  sortFromOutside(caches);
  std::vector<CacheRow> rows;
  for (const CacheNode& cache : caches) {
    if (cache.cpus.empty()) {
      processor.otherCaches.push_back(cache.unit);
    } else if (MachinePart* core = onlyUser(cores, cache.cpus)) {
      core->caches.push_back(cache.unit);
    } else {
      addToRows(rows, cache);
    }
  }
  Nesting nesting(std::move(rows), std::move(cores));
  processor.parts = nesting.build();
  const std::vector<CacheUnit> unplaced = nesting.takeUnplaced();
  processor.otherCaches.insert(processor.otherCaches.end(), unplaced.begin(), unplaced.end());
}

MachineProcessor readProcessor(const Tree& tree, NodeIndex index) {
  const Node& node = tree.node(index);
  MachineProcessor processor;
  processor.path = node.path();
  processor.name = textOf(tree, node, Lexicon::PropProcessorName);
  processor.status = node.status;
  processor.maxClock = numberOf(tree, node, Lexicon::PropMaxClockSpeed);
  processor.threadCount = numberOf(tree, node, Lexicon::PropHardwareThreads);
  std::vector<CacheNode> caches;
  std::vector<MachinePart> cores;
  for (NodeIndex i = index + 1; i < node.end; ++i) {
    const Node& part = tree.node(i);
    if (part.type == Lexicon::NodeCacheMemory) {
      caches.push_back(readCache(tree, part));
    } else if (part.type == Lexicon::NodeProcessorCore) {
      MachinePart core;
      core.corePath = part.path();
      core.status = part.status;
      core.cpus = part.cpus;
      core.coreKind = coreKindIn(part.description);
      cores.push_back(std::move(core));
    }
  }
  processor.coreCount = cores.size();
  processor.enabledCount =
      static_cast<std::size_t>(std::ranges::count(cores, Tarn::Inventory::Status::inUse, &MachinePart::status));
  readParts(processor, std::move(caches), std::move(cores));
  processor.numaNodes = numaNodesOf(tree, node.cpus);
  labelNuma(tree, processor.parts, processor.numaNodes);
  return processor;
}

}  // namespace

std::string numaText(const std::vector<unsigned int>& nodes) {
  return nodes.empty() ? "" : (nodes.size() == 1 ? "NUMA node " : "NUMA nodes ") + numberListText(nodes);
}

std::size_t Machine::coreCount() const {
  std::size_t count = 0;
  for (const MachineProcessor& processor : processors) {
    count += processor.coreCount;
  }
  return count;
}

std::size_t Machine::enabledCount() const {
  std::size_t count = 0;
  for (const MachineProcessor& processor : processors) {
    count += processor.enabledCount;
  }
  return count;
}

Machine readMachine(const Tree& tree, std::string_view systemName) {
  Machine machine;
  machine.systemName = toPrintable(systemName);
  for (const NodeIndex index : tree.ofType(Lexicon::NodeSystem)) {
    machine.model = textOf(tree, tree.node(index), Lexicon::PropSystemModel);
  }
  for (const NodeIndex index : tree.ofType(Lexicon::NodeProcessor)) {
    machine.processors.push_back(readProcessor(tree, index));
  }
  return machine;
}

}  // namespace Corvcim
