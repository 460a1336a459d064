#include "platform/inventory/sources/kernel/Caches.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <limits>
#include <string>
#include <tuple>
#include <utility>

namespace Tarn::Inventory {

namespace {

template <class Value>
struct Word {
  std::string_view text;
  Value value;
};
constexpr std::array contentsWords = {
    Word<CacheContents>{"Data", CacheContents::Data},
    Word<CacheContents>{"Instruction", CacheContents::Instructions},
    Word<CacheContents>{"Unified", CacheContents::Unified},
};
constexpr std::array policyWords = {
    Word<unsigned int>{"WriteBack", 1},
    Word<unsigned int>{"WriteThrough", 2},
};

template <class Words>
auto meaning(const Words& words, std::optional<std::string_view> text) -> std::optional<decltype(words[0].value)> {
  const auto found = std::ranges::find(words, text.value_or(std::string_view()), [](auto& word) { return word.text; });
  return found == words.end() ? std::nullopt : std::optional(found->value);
}

// A size with its unit, such as "48K", in KiB.
std::optional<unsigned int> kibibytes(std::optional<std::string_view> text) {
  if (!text || text->empty()) {
    return std::nullopt;
  }
  const std::size_t unit = std::string_view("KMG").find(text->back());
  text->remove_suffix(unit == std::string_view::npos ? 0 : 1);
  const std::optional<unsigned int> number = Attributes::toNumber(*text);
  if (!number || unit == std::string_view::npos) {
    return number ? std::optional(*number / 1024) : std::nullopt;
  }
  const unsigned int shift = 10 * static_cast<unsigned int>(unit);
  return *number << shift >> shift == *number ? std::optional(*number << shift) : std::nullopt;
}

std::optional<unsigned int> unlessZero(std::optional<unsigned int> number) {
  return number == 0U ? std::nullopt : number;
}

// How a cache is shared: old kernels have the mask alone.
constexpr std::array<std::string_view, 2> sharingFiles = {"shared_cpu_list", "shared_cpu_map"};

constexpr unsigned int bytesPerKibibyte = 1024;

class CacheReader {
 public:
  CacheReader(Machine& machine, const Topology& topology)
      : machine_(machine), cpus_(machine.cpus()), topology_(topology) {}

  std::vector<Cache> read() {
    for (const unsigned int cpu : topology_.present) {
      unsigned int index = 0;
      while (readCache(cpu, index)) {
        ++index;
      }
      // While a CPU is offline most kernels have nothing to say about its caches.
      if (index == 0 && topology_.online.contains(cpu)) {
        machine_.noteUnreadOfCpu(cpu, "cache",
                                 "mount sysfs on /sys; "
                                 "some kernels and virtual machines report no caches");
      }
    }
    dropUnplaced();
    std::ranges::sort(caches_, {},
                      [](const Cache& cache) { return std::tuple(cache.level, order(cache), cache.cpus.first()); });
    return std::move(caches_);
  }

 private:
  // How a cache is shared, in the kernel's words and parsed.
  struct Sharing {
    std::string text;
    CpuSet cpus;
  };
  struct Covered {
    unsigned int level;
    std::optional<CacheContents> contents;
    CpuSet cpus;
  };

  // False where the CPU has no cache of that index.
  bool readCache(unsigned int cpu, unsigned int index) {
    const auto sharing = readSharing(cpu, index);
    if (!sharing) {
      return false;
    }
    // Of a cache that many CPUs share all of them tell the same, at the same place: reading how it is
    // shared is enough to know it again.
    std::vector<Sharing>& told = toldAt(index);
    const bool known = std::ranges::any_of(
        told, [&](const Sharing& other) { return other.cpus.contains(cpu) && other.text == *sharing; });
    if (known) {
      return true;
    }
    CpuSet cpus = Attributes::parseCpus(sharingFile_, *sharing).value_or(CpuSet());
    cpus.keepOnly(topology_.present);
    cpus.add(cpu);
    told.push_back({std::string(*sharing), cpus});
    addCache(cpu, index, std::move(cpus));
    return true;
  }

  // A kernel that has one of the files for a cache has it for all.
  std::optional<std::string_view> readSharing(unsigned int cpu, unsigned int index) {
    for (const std::string_view file : sharingFiles) {
      if (!sharingFile_.empty() && file != sharingFile_) {
        continue;
      }
      if (const auto sharing = cpus_.text("cpu", cpu, "/cache/index", index, "/", file)) {
        sharingFile_ = file;
        return sharing;
      }
      if (cpus_.error() != ENOENT) {
        break;
      }
    }
    return std::nullopt;
  }

  void addCache(unsigned int cpu, unsigned int index, CpuSet cpus) {
    Cache cache;
    const std::optional<unsigned int> level = cpus_.number("cpu", cpu, "/cache/index", index, "/level");
    if (!level) {
      machine_.noteUnreadOfCpu(cpu, "cache/index" + std::to_string(index) + "/level",
                               "without it the cache is unknown");
      return;
    }
    cache.level = *level;
    cache.sourceCpu = cpu;
    cache.index = index;
    cache.cpusFile = sharingFile_;
    cache.contents = meaning(contentsWords, cpus_.text("cpu", cpu, "/cache/index", index, "/type"));
    // The same cache may stand at another place for another kind of core.
    CpuSet& covered = coveredBy(cache);
    cpus.remove(covered);
    if (!cpus.contains(cpu)) {
      return;
    }
    covered.add(cpus);
    cache.cpus = std::move(cpus);
    readAttributes(cpu, index, cache);
    caches_.push_back(std::move(cache));
  }

  void readAttributes(unsigned int cpu, unsigned int index, Cache& cache) {
    cache.id = cpus_.number("cpu", cpu, "/cache/index", index, "/id");
    cache.lineSize = unlessZero(cpus_.number("cpu", cpu, "/cache/index", index, "/coherency_line_size"));
    cache.size = readSize(cpu, index, cache.lineSize);
    cache.sets = unlessZero(cpus_.number("cpu", cpu, "/cache/index", index, "/number_of_sets"));
    cache.ways = cpus_.number("cpu", cpu, "/cache/index", index, "/ways_of_associativity");
    cache.writePolicy = meaning(policyWords, cpus_.text("cpu", cpu, "/cache/index", index, "/write_policy"));
  }

  std::optional<unsigned int> readSize(unsigned int cpu, unsigned int index, std::optional<unsigned int> lineSize) {
    const auto text = cpus_.text("cpu", cpu, "/cache/index", index, "/size");
    const std::optional<unsigned int> size = kibibytes(text);
    const bool isPlausible = size && cacheBlocks(std::uint64_t{*size} * bytesPerKibibyte, lineSize);
    if (text && !isPlausible) {
      machine_.noteUnreadOfCpu(cpu, "cache/index" + std::to_string(index) + "/size",
                               "it holds no plausible size of a cache", "report it to the maker of the firmware");
    }
    return isPlausible ? unlessZero(size) : std::nullopt;
  }

  // A cache belongs to a processor by its lowest CPU that has one.
  void dropUnplaced() {
    const CpuSet placed = topology_.placed();
    std::vector<Cache> kept;
    for (Cache& cache : caches_) {
      CpuSet owners = cache.cpus;
      owners.keepOnly(placed);
      cache.owner = owners.first();
      if (!owners.empty()) {
        kept.push_back(std::move(cache));
      } else {
        machine_.noteUnreadOfCpu(cache.sourceCpu, "cache/index" + std::to_string(cache.index),
                                 "no CPU that shares the cache has a known processor",
                                 "set these CPUs online, or mount sysfs on /sys");
      }
    }
    caches_ = std::move(kept);
  }

  std::vector<Sharing>& toldAt(unsigned int index) {
    if (index >= told_.size()) {
      told_.resize(index + 1);
    }
    return told_[index];
  }

  // The CPUs that have a cache of this level and contents already.
  CpuSet& coveredBy(const Cache& cache) {
    const auto same = std::ranges::find_if(covered_, [&](const Covered& covered) {
      return covered.level == cache.level && covered.contents == cache.contents;
    });
    return same != covered_.end() ? same->cpus : covered_.emplace_back(Covered{cache.level, cache.contents, {}}).cpus;
  }

  // Data before instructions, as people list them.
  static unsigned int order(const Cache& cache) {
    return cache.contents == CacheContents::Data ? 0 : cache.contents == CacheContents::Instructions ? 1 : 2;
  }

  Machine& machine_;
  Attributes& cpus_;
  const Topology& topology_;
  std::string_view sharingFile_;  // empty until a cache was found
  std::vector<Cache> caches_;
  std::vector<std::vector<Sharing>> told_;  // by index
  std::vector<Covered> covered_;
};

}  // namespace

std::optional<CacheBlocks> cacheBlocks(std::uint64_t bytes, std::optional<unsigned int> lineSize) {
  constexpr std::uint64_t most = std::numeric_limits<std::uint32_t>::max();
  const unsigned int size = lineSize ? *lineSize : bytes <= most ? 1 : bytesPerKibibyte;
  const std::uint64_t count = bytes / size;
  return count <= most ? std::optional(CacheBlocks{size, static_cast<unsigned int>(count)}) : std::nullopt;
}

std::vector<Cache> readCaches(Machine& machine, const Topology& topology) {
  return CacheReader(machine, topology).read();
}

}  // namespace Tarn::Inventory
