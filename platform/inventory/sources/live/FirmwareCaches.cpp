#include "platform/inventory/sources/live/FirmwareCaches.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <iterator>
#include <string_view>

#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/live/CacheNodes.h"
#include "platform/inventory/sources/live/NodePaths.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;
using Smbios::CacheMode;
using Smbios::CacheType;

struct ContentsRow {
  CacheType type;
  CacheContents contents;
};
constexpr std::array contentsRows = {
    ContentsRow{CacheType::Instruction, CacheContents::Instructions},
    ContentsRow{CacheType::Data, CacheContents::Data},
    ContentsRow{CacheType::Unified, CacheContents::Unified},
};

struct PolicyRow {
  CacheMode mode;
  unsigned int code;
};
constexpr std::array policyRows = {
    PolicyRow{CacheMode::WriteThrough, 2},
    PolicyRow{CacheMode::WriteBack, 1},
    PolicyRow{CacheMode::VariesWithAddress, 3},
};

std::optional<CacheContents> contentsOf(const Smbios::Cache& cache) {
  const auto* const row =
      cache.type ? std::ranges::find(contentsRows, *cache.type, &ContentsRow::type) : contentsRows.end();
  return row == contentsRows.end() ? std::nullopt : std::optional(row->contents);
}

// "L1" where the kernel's name would have an x: the firmware often does not tell what a cache holds.
std::string nameOf(const FirmwareCache& cache) {
  return cacheName(cache.level, cache.contents.value_or(CacheContents::Unified));
}

bool isOff(const Smbios::Cache& cache) {
  return cache.enabled && !*cache.enabled;
}

std::string label(const FirmwareCache& cache) {
  const std::string_view contents = cache.contents == CacheContents::Data           ? " data"
                                    : cache.contents == CacheContents::Instructions ? " instruction"
                                                                                    : "";
  return "L" + std::to_string(cache.level) + std::string(contents) + " cache";
}

/// One cache's node, each value with its field.
class FirmwareCacheNode {
 public:
  FirmwareCacheNode(TreeBuilder& tree, const FirmwareCache& cache)
      : tree_(tree), cache_(cache), structure_(*cache.structure) {}

  void add(const std::string& path, const Facts::Explain& offline) {
    tree_.cache(path);
    addStatus(offline);
    tree_.description(label(cache_)).from([&] { return told(structure_.level, "level and contents"); });
    tree_.text(PropCacheName, nameOf(cache_)).from([&] {
      return told(structure_.level, "L and the level in bits 0 to 2, after it d for data, i for instructions");
    });
    tree_.number(PropCacheLevel, levelCode(cache_.level)).from([&] {
      return told(structure_.level, "the level in bits 0 to 2: L1 is 3, L2 4, L3 5, any other 1");
    });
    if (cache_.contents) {
      number(PropCacheType, static_cast<unsigned int>(*cache_.contents), structure_.type,
             "instruction, 3, is 1; data, 4, is 2; unified, 5, is 3");
    }
    number(PropCacheAssociativity, associativityCode(structure_), structure_.associativity, associativityRule);
    number(PropCacheWritePolicy, writePolicyCode(structure_), structure_.mode, writePolicyRule);
    addSize();
  }

 private:
  // What the firmware turned off stays off when the CPUs come back.
  void addStatus(const Facts::Explain& offline) {
    if (isOff(structure_)) {
      tree_.status(Status::disabled).from([&] { return told(structure_.enabled, "bit 7 is 0: the cache is off, 16"); });
    } else if (offline) {
      tree_.status(Status::offline).from(offline);
    } else {
      tree_.status(Status::inUse).from([&] {
        return told(structure_.enabled, structure_.enabled ? "bit 7 is 1: the cache is on, 1"
                                                           : "the structure ends before bit 7: taken as on, 1");
      });
    }
  }

  void addSize() {
    const auto blocks = structure_.installedSize ? cacheBlocks(*structure_.installedSize * 1024, std::nullopt)
                                                 : std::optional<CacheBlocks>();
    if (!blocks) {
      return;
    }
    const char* rule = blocks->size == 1 ? "the installed size in bytes" : "the installed size in KiB";
    number(PropCacheBlockSize, blocks->size, structure_.installedSize,
           "the firmware tells no line size: the unit of the number of blocks");
    number(PropCacheNumberOfBlocks, blocks->count, structure_.installedSize, rule);
    number(PropCacheConsumableBlocks, blocks->count, structure_.installedSize, rule);
  }

  template <class Value>
  void number(Properties id, std::optional<unsigned int> value, const Smbios::Field<Value>& field, const char* rule) {
    if (value) {
      tree_.number(id, *value).from([&] { return told(field, rule); });
    }
  }

  template <class Value>
  Origin told(const Smbios::Field<Value>& field, const char* rule) const {
    return originInTables(structure_.structure, field, rule);
  }

  TreeBuilder& tree_;
  const FirmwareCache& cache_;
  const Smbios::Cache& structure_;
};

/// Compares one structure with the kernel's caches that it can mean.
class Comparison {
 public:
  Comparison(const FirmwareCache& told, const std::vector<const Cache*>& kernel) : told_(told) {
    const bool isOneKind = told.contents && told.contents != CacheContents::Unified;
    std::ranges::copy_if(kernel, std::back_inserter(kernel_), [&](const Cache* cache) {
      return cache->level == told.level && (!isOneKind || !cache->contents || cache->contents == told.contents);
    });
  }

  bool sizeFits() const {
    const auto& told = told_.structure->installedSize;
    const bool isKnown = std::ranges::all_of(kernel_, [](const Cache* cache) { return cache->size.has_value(); });
    if (!told || !isKnown) {
      return true;
    }
    // Some firmware tells the size of one core's cache, or leaves out those for instructions.
    const bool isOne = std::ranges::any_of(kernel_, [&](const Cache* cache) { return *cache->size == *told; });
    return isOne || *told == sum(true) || *told == sum(false);
  }

  bool stateFits() const { return kernel_.empty() || !isOff(*told_.structure); }

  std::string kernelSize() const {
    return kernel_.empty() ? "(none)"
                           : std::to_string(sum(true)) + " KiB" +
                                 (kernel_.size() == 1 ? "" : " in " + std::to_string(kernel_.size()) + " caches");
  }

  std::string kernelSource(const FileSystem& cpuFiles, const Cache& usual, const char* attribute) const {
    const Cache& cache = kernel_.empty() ? usual : *kernel_.front();
    const std::string directory = "cpu" + std::to_string(cache.sourceCpu) + "/cache";
    return cpuFiles.nameOf(kernel_.empty() ? directory
                                           : directory + "/index" + std::to_string(cache.index) + '/' + attribute);
  }

 private:
  std::uint64_t sum(bool withInstructions) const {
    std::uint64_t all = 0;
    for (const Cache* cache : kernel_) {
      all += withInstructions || cache->contents != CacheContents::Instructions ? *cache->size : 0;
    }
    return all;
  }

  const FirmwareCache& told_;
  std::vector<const Cache*> kernel_;
};

}  // namespace

std::vector<FirmwareCache> cachesOf(const Socket& socket, const Smbios::Tables& tables) {
  std::vector<FirmwareCache> caches;
  unsigned int usualLevel = 0;
  for (const Smbios::Field<std::uint16_t>& handle : socket.structure->caches) {
    ++usualLevel;
    const Smbios::Cache* cache = handle ? tables.cache(*handle) : nullptr;
    const bool isThere = cache != nullptr && !(cache->installedSize && *cache->installedSize == 0);
    const bool isKnown =
        std::ranges::any_of(caches, [cache](const FirmwareCache& other) { return other.structure == cache; });
    if (isThere && !isKnown) {
      caches.push_back({cache, cache->level ? *cache->level : usualLevel, contentsOf(*cache)});
    }
  }
  return caches;
}

const FirmwareCache* findTwin(const std::vector<FirmwareCache>& caches, const Cache& cache) {
  const auto found = std::ranges::find_if(caches, [&](const FirmwareCache& other) {
    if (other.level != cache.level) {
      return false;
    }
    // What stands for both kinds speaks of data: instructions are not written.
    return other.contents == cache.contents ||
           (other.contents.value_or(CacheContents::Unified) == CacheContents::Unified &&
            cache.contents != CacheContents::Instructions);
  });
  return found == caches.end() ? nullptr : &*found;
}

std::optional<unsigned int> writePolicyCode(const Smbios::Cache& cache) {
  const auto* const row = cache.mode ? std::ranges::find(policyRows, *cache.mode, &PolicyRow::mode) : policyRows.end();
  return row == policyRows.end() ? std::nullopt : std::optional(row->code);
}

std::optional<unsigned int> associativityCode(const Smbios::Cache& cache) {
  if (cache.associativity && *cache.associativity == Smbios::Cache::fullyAssociative) {
    return fullyAssociative;
  }
  return cache.ways ? associativityCode(*cache.ways) : std::nullopt;
}

void addFirmwareCaches(TreeBuilder& tree, const std::vector<FirmwareCache>& caches, const std::string& processor,
                       const Facts::Explain& offline) {
  std::vector<std::string> taken;
  for (const FirmwareCache& cache : caches) {
    std::string path = processor + '.' + nameOf(cache);
    if (std::ranges::find(taken, path) != taken.end()) {
      path += '#' + handleText(cache.structure->structure);
    }
    FirmwareCacheNode(tree, cache).add(path, offline);
    taken.push_back(std::move(path));
  }
}

void compareCaches(const std::vector<FirmwareCache>& firmware, const std::vector<const Cache*>& kernel,
                   const FileSystem& cpuFiles, const std::string& processor, std::vector<Disagreement>& disagreements) {
  for (const FirmwareCache& cache : firmware) {
    const Comparison comparison(cache, kernel);
    const Smbios::Cache& told = *cache.structure;
    if (!comparison.sizeFits()) {
      disagreements.push_back({processor, nameOf(cache) + " size", comparison.kernelSize(),
                               comparison.kernelSource(cpuFiles, *kernel.front(), "size"),
                               std::to_string(*told.installedSize) + " KiB",
                               Smbios::placeOf(told.structure, told.installedSize)});
    }
    if (!comparison.stateFits()) {
      disagreements.push_back({processor, nameOf(cache) + " status", std::to_string(Status::inUse),
                               comparison.kernelSource(cpuFiles, *kernel.front(), "shared_cpu_list"),
                               std::to_string(Status::disabled), Smbios::placeOf(told.structure, told.enabled)});
    }
  }
}

}  // namespace Tarn::Inventory
