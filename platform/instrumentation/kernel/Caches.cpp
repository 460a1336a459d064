#include "platform/instrumentation/kernel/Caches.h"

#include <algorithm>
#include <array>
#include <string>
#include <tuple>

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

class CacheReader {
 public:
  CacheReader(Machine& machine, const CpuSet& present, const CpuSet& online)
      : machine_(machine), cpus_(machine.cpus()), present_(present), online_(online) {}

  std::vector<Cache> read() {
    for (const unsigned int cpu : present_) {
      unsigned int index = 0;
      while (readCache(cpu, index)) {
        ++index;
      }
      // While a CPU is offline most kernels have nothing to say about its caches.
      if (index == 0 && online_.contains(cpu)) {
        machine_.noteUnreadOfCpu(cpu, "cache",
                                 "mount sysfs on /sys; "
                                 "some virtual machines have no such directory");
      }
    }
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
    const auto sharing = cpus_.text("cpu", cpu, "/cache/index", index, "/shared_cpu_list");
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
    CpuSet cpus = CpuSet::fromList(*sharing).value_or(CpuSet());
    cpus.keepOnly(present_);
    cpus.add(cpu);
    told.push_back({std::string(*sharing), cpus});
    addCache(cpu, index, std::move(cpus));
    return true;
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
    cache.size = unlessZero(kibibytes(cpus_.text("cpu", cpu, "/cache/index", index, "/size")));
    cache.lineSize = unlessZero(cpus_.number("cpu", cpu, "/cache/index", index, "/coherency_line_size"));
    cache.sets = unlessZero(cpus_.number("cpu", cpu, "/cache/index", index, "/number_of_sets"));
    cache.ways = cpus_.number("cpu", cpu, "/cache/index", index, "/ways_of_associativity");
    cache.writePolicy = meaning(policyWords, cpus_.text("cpu", cpu, "/cache/index", index, "/write_policy"));
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
  const CpuSet& present_;
  const CpuSet& online_;
  std::vector<Cache> caches_;
  std::vector<std::vector<Sharing>> told_;  // by index
  std::vector<Covered> covered_;
};

}  // namespace

std::vector<Cache> readCaches(Machine& machine, const CpuSet& present, const CpuSet& online) {
  return CacheReader(machine, present, online).read();
}

}  // namespace Tarn::Inventory
