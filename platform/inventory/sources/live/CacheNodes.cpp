#include "platform/inventory/sources/live/CacheNodes.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <optional>
#include <string_view>

#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/live/NodePaths.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

struct WaysCode {
  unsigned int ways;
  unsigned int code;
};
constexpr std::array waysCodes = {WaysCode{1, 1}, WaysCode{2, 3}, WaysCode{4, 4}, WaysCode{8, 5}, WaysCode{16, 6}};

bool hasOneSet(const Cache& cache) {
  return cache.sets == 1U && cache.ways != 1U;
}

/// One cache's node, each value with the attribute that it comes from.
class CacheNode {
 public:
  CacheNode(TreeBuilder& tree, const KernelView& kernel, const Cache& cache, const FirmwareCache* twin)
      : tree_(tree), kernel_(kernel), cache_(cache), twin_(twin) {}

  void add(const std::string& path) {
    tree_.cache(path).cpus(cache_.cpus);
    tree_.status(kernel_.statusOf(cache_.cpus)).from([&] { return kernel_.statusOrigin(cache_.cpus); });
    const bool numbered = path.find('@') == std::string::npos;
    tree_.description(describeCache(cache_, path)).from([&] {
      return attribute(numbered ? "id" : cache_.cpusFile, numbered
                                                              ? "level, contents and the kernel's number of the cache"
                                                              : "level, contents and the lowest CPU of the cache");
    });
    tree_.text(PropCacheName, cacheName(cache_)).from([&] {
      return attribute("level", "L and the level, after it d for data, i for instructions");
    });
    number(PropCacheLevel, levelCode(cache_.level), "level", "L1 is 3, L2 4, L3 5, any other 1");
    if (cache_.contents) {
      number(PropCacheType, static_cast<unsigned int>(*cache_.contents), "type", "Instruction is 1, Data 2, Unified 3");
    }
    number(PropCacheAssociativity, associativityCode(cache_),
           hasOneSet(cache_) ? "number_of_sets" : "ways_of_associativity",
           hasOneSet(cache_) ? "one set: fully associative, 2" : "ways: 1 is 1, 2 is 3, 4 is 4, 8 is 5, 16 is 6");
    number(PropCacheWritePolicy, cache_.writePolicy, "write_policy", "WriteBack is 1, WriteThrough 2");
    addSize();
    addFromTwin();
  }

 private:
  void addSize() {
    number(PropCacheBlockSize, cache_.lineSize, "coherency_line_size", "bytes, as it stands");
    if (!cache_.size) {
      return;
    }
    const auto blocks = cacheBlocks(std::uint64_t{*cache_.size} * 1024, cache_.lineSize);
    if (!blocks) {
      return;
    }
    const char* rule = "the size by coherency_line_size";
    if (!cache_.lineSize) {
      number(PropCacheBlockSize, blocks->size, "size",
             "the kernel reports no line size: the unit of the number of blocks");
      rule = blocks->size == 1 ? "the size in bytes" : "the size in KiB";
    }
    number(PropCacheNumberOfBlocks, blocks->count, "size", rule);
    number(PropCacheConsumableBlocks, blocks->count, "size", rule);
  }

  // What only the firmware tells.
  void addFromTwin() {
    if (twin_ == nullptr) {
      return;
    }
    const Smbios::Cache& structure = *twin_->structure;
    if (!cache_.writePolicy) {
      twinNumber(PropCacheWritePolicy, writePolicyCode(structure), structure.mode, writePolicyRule);
    }
    if (!cache_.ways && !cache_.sets) {
      twinNumber(PropCacheAssociativity, associativityCode(structure), structure.associativity, associativityRule);
    }
  }

  template <class Value>
  void twinNumber(Properties id, std::optional<unsigned int> value, const Smbios::Field<Value>& field,
                  const char* rule) {
    if (value) {
      tree_.number(id, *value).from([&] { return originInTables(twin_->structure->structure, field, rule); });
    }
  }

  void number(Properties id, std::optional<unsigned int> value, std::string_view file, const char* rule) {
    if (value) {
      tree_.number(id, *value).from([&] { return attribute(file, rule); });
    }
  }

  Origin attribute(std::string_view file, const char* rule) const {
    return kernel_.machine.originOfCpu(cache_.sourceCpu,
                                       "cache/index" + std::to_string(cache_.index) + '/' + std::string(file), rule);
  }

  TreeBuilder& tree_;
  const KernelView& kernel_;
  const Cache& cache_;
  const FirmwareCache* twin_;
};

}  // namespace

std::string describeCache(const Cache& cache, const std::string& path) {
  const std::string_view contents = cache.contents == CacheContents::Data           ? " data"
                                    : cache.contents == CacheContents::Instructions ? " instruction"
                                                                                    : "";
  return describeByPath("L" + std::to_string(cache.level) + std::string(contents) + " cache", path);
}

std::optional<unsigned int> associativityCode(const Cache& cache) {
  return hasOneSet(cache) ? std::optional(fullyAssociative) : associativityCode(cache.ways.value_or(0));
}

unsigned int levelCode(unsigned int level) {
  return level >= 1 && level <= 3 ? level + 2 : 1;
}

std::optional<unsigned int> associativityCode(unsigned int ways) {
  const auto* const row = std::ranges::find(waysCodes, ways, &WaysCode::ways);
  return row == waysCodes.end() ? std::nullopt : std::optional(row->code);
}

void addCaches(TreeBuilder& tree, const KernelView& kernel, const Package& package, const std::string& processor,
               const std::vector<FirmwareCache>& firmware) {
  const std::vector<const Cache*> own = kernel.cachesOf(package);
  const std::vector<std::string> paths = cachePaths(processor, own);
  for (std::size_t i = 0; i < own.size(); ++i) {
    CacheNode(tree, kernel, *own[i], findTwin(firmware, *own[i])).add(paths[i]);
  }
}

}  // namespace Tarn::Inventory
