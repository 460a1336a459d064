#include "platform/instrumentation/LiveSource.h"

#include <algorithm>
#include <string>
#include <string_view>

#include "platform/instrumentation/Caches.h"
#include "platform/instrumentation/CoreKinds.h"
#include "platform/instrumentation/CpuIdentity.h"
#include "platform/instrumentation/Error.h"
#include "platform/instrumentation/Machine.h"
#include "platform/instrumentation/NodePaths.h"
#include "platform/instrumentation/PropertyTable.h"
#include "platform/instrumentation/SystemModel.h"
#include "platform/instrumentation/Topology.h"
#include "platform/instrumentation/TreeBuilder.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

/// What is known of a processor beside its place: the kernel's words on its first CPU, or where it has
/// several kinds of core, on the first CPU of each.
struct ProcessorFacts {
  CpuIdentity identity;
  std::optional<unsigned int> maxClockSpeed;
};

class LiveReader {
 public:
  explicit LiveReader(FileSystem& root)
      : machine_(root),
        topology_(readTopology(machine_)),
        kinds_(readCoreKinds(machine_, topology_)),
        caches_(readCaches(machine_, topology_.present, topology_.online)) {
    if (topology_.packages.empty()) {
      throw InventoryError("can not read the inventory", root.nameOf("sys/devices/system/cpu"),
                           "neither this directory nor /proc/cpuinfo tells of a processor",
                           "mount sysfs on /sys and proc on /proc");
    }
  }

  Tree read() {
    addSystem();
    for (const Package& package : topology_.packages) {
      const std::string path = processorPath(package);
      addProcessor(package, path);
      addCores(package, path);
      addCaches(package, path);
    }
    for (const Unread& entry : machine_.unread().entries()) {
      tree_.unread(entry);
    }
    return tree_.build();
  }

 private:
  void addSystem() {
    const std::string model = readSystemModel(machine_);
    tree_.system().description(model.empty() ? "Computer system" : model);
    addText(PropSystemModel, model);
    addText(PropSystemManufacturer, readSystemManufacturer(machine_));
  }

  void addProcessor(const Package& package, const std::string& path) {
    const ProcessorFacts facts = readFacts(package);
    const CpuIdentity& identity = facts.identity;
    tree_.processor(path).status(statusOf(package.cpus)).description(described("Processor", path)).cpus(package.cpus);
    tree_.number(PropFamily, identity.family);
    tree_.number(PropHardwareThreads, package.cpus.count());
    tree_.list(PropRequestedStatesSupported, {1});
    if (!package.cores.empty()) {
      const auto enabled =
          std::ranges::count_if(package.cores, [this](const Core& core) { return isOnline(core.cpus); });
      tree_.number(PropProcessorCores, static_cast<unsigned int>(package.cores.size()));
      tree_.number(PropEnabledCores, static_cast<unsigned int>(enabled));
    }
    addNumber(PropDataWidth, identity.width);
    addNumber(PropAddressWidth, identity.width);
    addNumber(PropMaxClockSpeed, facts.maxClockSpeed);
    addNumber(PropCurrentClockSpeed, identity.clockSpeed);
    addText(PropProcessorName, identity.name);
    addText(PropStepping, identity.stepping);
    addText(PropProcessorId, identity.processorId);
  }

  ProcessorFacts readFacts(const Package& package) {
    ProcessorFacts facts;
    unsigned int first = CpuSet::limit;
    for (const CoreKind& kind : kinds_) {
      const unsigned int cpu = firstOnline(package.cpus, kind.cpus);
      if (cpu == CpuSet::limit) {
        continue;
      }
      const CpuIdentity identity = identifyCpu(machine_.cpuInfo(), cpu);
      const std::optional<unsigned int> speed = readMegahertz(cpu, "cpuinfo_max_freq");
      if (first == CpuSet::limit) {
        first = cpu;
        facts = {identity, speed};
        if (!speed) {
          machine_.noteUnreadOfCpu(cpu, "cpufreq/cpuinfo_max_freq",
                                   "load the processor's frequency driver; most virtual machines have none");
        }
      } else {
        merge(facts.identity, identity);
        facts.maxClockSpeed = std::max(facts.maxClockSpeed, speed);
      }
    }
    if (first != CpuSet::limit && !facts.identity.clockSpeed) {
      facts.identity.clockSpeed = readMegahertz(first, "scaling_cur_freq");
    }
    return facts;
  }

  // What two kinds of core do not share, the processor as a whole does not have.
  static void merge(CpuIdentity& all, const CpuIdentity& other) {
    if (all.name != other.name) {
      all.name += " + " + other.name;
    }
    if (all.stepping != other.stepping || all.processorId != other.processorId) {
      all.stepping.clear();
      all.processorId.clear();
    }
  }

  // From one CPU for each kind of core: asking for a frequency can make the kernel measure it.
  std::optional<unsigned int> readMegahertz(unsigned int cpu, const char* name) {
    const std::optional<unsigned int> kilohertz = machine_.cpus().number("cpu", cpu, "/cpufreq/", name);
    return kilohertz ? std::optional(*kilohertz / 1000 + (*kilohertz % 1000 >= 500 ? 1 : 0)) : std::nullopt;
  }

  void addCores(const Package& package, const std::string& processor) {
    const std::vector<std::string> paths = corePaths(processor, package.cores);
    for (std::size_t i = 0; i < paths.size(); ++i) {
      const Core& core = package.cores[i];
      tree_.core(paths[i]).status(statusOf(core.cpus)).description(describeCore(core, paths[i])).cpus(core.cpus);
    }
  }

  std::string describeCore(const Core& core, const std::string& path) const {
    const auto kind = std::ranges::find_if(kinds_, [&](const CoreKind& k) { return k.cpus.intersects(core.cpus); });
    std::string text = described(kind == kinds_.end() ? "Core" : kind->name, path);
    if (path.find('@') == std::string::npos) {
      text += partOf("cluster", core.place.cluster) + partOf("die", core.place.die);
    }
    return text;
  }

  // A cache stands below the processor of its lowest CPU, also where several processors share it.
  void addCaches(const Package& package, const std::string& processor) {
    std::vector<const Cache*> own;
    for (const Cache& cache : caches_) {
      if (package.cpus.contains(cache.cpus.first())) {
        own.push_back(&cache);
      }
    }
    const std::vector<std::string> paths = cachePaths(processor, own);
    for (std::size_t i = 0; i < own.size(); ++i) {
      addCache(*own[i], paths[i]);
    }
  }

  void addCache(const Cache& cache, const std::string& path) {
    tree_.cache(path).status(statusOf(cache.cpus)).description(describeCache(cache, path)).cpus(cache.cpus);
    tree_.number(PropCacheLevel, levelCode(cache.level));
    tree_.text(PropCacheName, cacheName(cache));
    if (cache.contents) {
      tree_.number(PropCacheType, static_cast<unsigned int>(*cache.contents));
    }
    addNumber(PropCacheAssociativity, associativityCode(cache));
    addNumber(PropCacheWritePolicy, cache.writePolicy);
    addNumber(PropCacheBlockSize, cache.lineSize);
    const std::optional<unsigned int> blocks = blocksOf(cache);
    addNumber(PropCacheNumberOfBlocks, blocks);
    addNumber(PropCacheConsumableBlocks, blocks);
  }

  static std::string describeCache(const Cache& cache, const std::string& path) {
    const std::string_view contents = cache.contents == CacheContents::Data           ? " data"
                                      : cache.contents == CacheContents::Instructions ? " instruction"
                                                                                      : "";
    return described("L" + std::to_string(cache.level) + std::string(contents) + " cache", path);
  }

  static unsigned int levelCode(unsigned int level) { return level >= 1 && level <= 3 ? level + 2 : 1; }

  static std::optional<unsigned int> associativityCode(const Cache& cache) {
    constexpr unsigned int fully = 2;
    if (cache.sets == 1U && cache.ways != 1U) {
      return fully;
    }
    switch (cache.ways.value_or(0)) {
      case 1:
        return 1;
      case 2:
        return 3;
      case 4:
        return 4;
      case 8:
        return 5;
      case 16:
        return 6;
      default:
        return std::nullopt;
    }
  }

  static std::optional<unsigned int> blocksOf(const Cache& cache) {
    if (!cache.size || !cache.lineSize) {
      return std::nullopt;
    }
    return static_cast<unsigned int>(std::uint64_t{*cache.size} * 1024 / *cache.lineSize);
  }

  // The kind of part and its number, which its path ends with: "L2 cache 3", "Core at CPU 8".
  static std::string described(const std::string& label, std::string_view path) {
    const std::size_t mark = path.find_last_of("@.CP");
    return label + (path[mark] == '@' ? " at CPU " : " ") + std::string(path.substr(mark + 1));
  }

  static std::string partOf(const char* group, std::optional<unsigned int> number) {
    return number.value_or(0) == 0 ? std::string() : std::string(" of ") + group + ' ' + std::to_string(*number);
  }

  bool isOnline(const CpuSet& cpus) const { return cpus.intersects(topology_.online); }

  unsigned int statusOf(const CpuSet& cpus) const { return isOnline(cpus) ? Status::inUse : Status::offline; }

  unsigned int firstOnline(const CpuSet& cpus, const CpuSet& kind) const {
    unsigned int cpu = cpus.first();
    while (cpu != CpuSet::limit && !(topology_.online.contains(cpu) && kind.contains(cpu))) {
      cpu = cpus.next(cpu);
    }
    return cpu;
  }

  void addNumber(Properties id, std::optional<unsigned int> value) {
    if (value) {
      tree_.number(id, *value);
    }
  }

  void addText(Properties id, std::string_view value) {
    if (!value.empty()) {
      tree_.text(id, value);
    }
  }

  Machine machine_;
  const Topology topology_;
  const std::vector<CoreKind> kinds_;
  const std::vector<Cache> caches_;
  TreeBuilder tree_;
};

}  // namespace

Tree readLiveInventory(FileSystem& root) {
  return LiveReader(root).read();
}

}  // namespace Tarn::Inventory
