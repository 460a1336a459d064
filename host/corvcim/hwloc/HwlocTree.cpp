#include <algorithm>
#include <array>
#include <stdexcept>

#include "host/corvcim/hwloc/HwlocConversion.h"
#include "host/corvcim/hwloc/HwlocParts.h"
#include "platform/inventory/sources/kernel/CpuIdentity.h"
#include "platform/inventory/sources/kernel/SystemModel.h"
#include "platform/inventory/sources/live/CacheNodes.h"
#include "platform/inventory/sources/live/CoreNodes.h"
#include "platform/inventory/sources/live/NodePaths.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/PlainText.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Corvcim {
namespace {

using namespace Tarn::Inventory;
using namespace Tarn::NodeLexicon;

struct Translation {
  const char* hwloc;
  std::string_view kernel;
};
// hwloc keeps what it finds in /proc/cpuinfo under names of its own. Told as the kernel does it means the
// same here as it would on the machine.
constexpr std::array translations = {
    Translation{"CPUArchitecture", "CPU architecture"},
    Translation{"CPUFamilyNumber", "cpu family"},
    Translation{"CPUImplementer", "CPU implementer"},
    Translation{"CPUModel", "model name"},
    Translation{"CPUModelNumber", "model"},
    Translation{"CPUPart", "CPU part"},
    Translation{"CPURevision", "CPU revision"},
    Translation{"CPUStepping", "stepping"},
    Translation{"CPUVariant", "CPU variant"},
    Translation{"CPUVendor", "vendor_id"},
};

/// What the package says of itself, or in older files the machine.
std::string_view remark(hwloc_obj_t package, const char* name) {
  std::string_view text;
  for (hwloc_obj_t object = package; object != nullptr && text.empty(); object = object->parent) {
    text = infoOf(object, name);
  }
  return text;
}

std::string onOneLine(std::string_view text) {
  std::string line(text);
  std::ranges::replace_if(
      line, [](char c) { return c == '\n' || c == '\r'; }, ' ');
  return line;
}

CpuIdentity identify(hwloc_obj_t package) {
  std::string text = "processor\t: 0\n";
  for (const Translation& translation : translations) {
    const std::string value = onOneLine(remark(package, translation.hwloc));
    if (!value.empty()) {
      text += std::string(translation.kernel) + "\t: " + value + '\n';
    }
  }
  if (remark(package, "Architecture") == "x86_64") {
    text += "flags\t: lm\n";
  }
  CpuIdentity identity = identifyCpu(CpuInfo(text), 0);
  if (identity.architecture == Architecture::Unknown) {
    identity.vendor = remark(package, "CPUVendor");
    identity.name = remark(package, "CPUModel");
    identity.family = cimFamily(identity.vendor, identity.name, FamilyRow::any, FamilyRow::any);
  }
  return identity;
}

/// What the firmware says by one of these names, unless nobody filled it in.
std::string_view firmwareRemark(hwloc_obj_t object, std::initializer_list<const char*> names) {
  for (const char* name : names) {
    if (const std::string_view text = infoOf(object, name); !text.empty() && !isPlaceholder(text)) {
      return text;
    }
  }
  return {};
}

class Writer {
 public:
  Writer(hwloc_topology_t topology, const std::string& name)
      : machine_(hwloc().getObjByDepth(topology, 0, 0)), parts_(readParts(topology)), name_(name) {}

  Tree write() {
    addSystem();
    for (const HwlocPackage& package : parts_.packages) {
      const std::string path = processorPath(package.package);
      addProcessor(package, path);
      addCores(package.package, path);
      addCaches(package, path);
    }
    if (!parts_.homeless.empty()) {
      tree_.unread({name_, "nothing tells which package CPUs " + parts_.homeless.toList() + " belong to",
                    "they may have been offline; describe the machine while they are online"});
    }
    return tree_.build();
  }

 private:
  void addSystem() {
    const std::string model = plainText(firmwareRemark(machine_, {"DMIProductName", "PlatformModel"}));
    tree_.system().description(model.empty() ? "Computer system" : model);
    addText(PropSystemModel, model);
    addText(PropSystemManufacturer, firmwareRemark(machine_, {"DMISysVendor"}));
    addText(PropSystemName, infoOf(machine_, "HostName"));
  }

  void addProcessor(const HwlocPackage& entry, const std::string& path) {
    const Package& package = entry.package;
    const CpuIdentity identity = identify(entry.object);
    tree_.processor(path)
        .status(statusOf(package.cpus))
        .description(describeByPath("Processor", path))
        .cpus(package.cpus);
    tree_.number(PropFamily, identity.family);
    tree_.number(PropHardwareThreads, package.cpus.count());
    tree_.list(PropRequestedStatesSupported, {1});
    if (!package.cores.empty()) {
      const auto enabled = std::ranges::count_if(
          package.cores, [this](const Core& core) { return core.cpus.intersects(parts_.online); });
      tree_.number(PropProcessorCores, static_cast<unsigned int>(package.cores.size()));
      tree_.number(PropEnabledCores, static_cast<unsigned int>(enabled));
    }
    addNumber(PropDataWidth, identity.width);
    addNumber(PropAddressWidth, identity.width);
    addNumber(PropMaxClockSpeed, maxClockOf(package));
    addText(PropProcessorName, identity.name);
    addText(PropStepping, identity.stepping);
    addText(PropProcessorId, identity.processorId);
  }

  std::optional<unsigned int> maxClockOf(const Package& package) const {
    std::optional<unsigned int> clock;
    for (const HwlocCoreKind& kind : parts_.kinds) {
      if (kind.cpus.intersects(package.cpus)) {
        clock = std::max(clock, kind.maxClock);
      }
    }
    return clock;
  }

  void addCores(const Package& package, const std::string& processor) {
    const std::vector<std::string> paths = corePaths(processor, package.cores);
    for (std::size_t i = 0; i < paths.size(); ++i) {
      const Core& core = package.cores[i];
      tree_.core(paths[i])
          .status(statusOf(core.cpus))
          .description(describeCore(kindOf(core), core.place, paths[i]))
          .cpus(core.cpus);
    }
  }

  std::string kindOf(const Core& core) const {
    const auto kind = std::ranges::find_if(parts_.kinds, [&](const HwlocCoreKind& candidate) {
      return !candidate.name.empty() && candidate.cpus.intersects(core.cpus);
    });
    const bool hasKinds = parts_.kinds.size() > 1 && kind != parts_.kinds.end();
    return std::string(hasKinds ? kind->name : "Core");
  }

  void addCaches(const HwlocPackage& package, const std::string& processor) {
    std::vector<const Cache*> caches;
    for (const HwlocCache& entry : package.caches) {
      caches.push_back(&entry.cache);
    }
    const std::vector<std::string> paths = cachePaths(processor, caches);
    for (std::size_t i = 0; i < paths.size(); ++i) {
      addCache(package.caches[i], paths[i]);
    }
  }

  void addCache(const HwlocCache& entry, const std::string& path) {
    const Cache& cache = entry.cache;
    tree_.cache(path).status(statusOf(cache.cpus)).description(describeCache(cache, path)).cpus(cache.cpus);
    tree_.number(PropCacheLevel, levelCode(cache.level));
    tree_.text(PropCacheName, cacheName(cache));
    tree_.number(PropCacheType, static_cast<unsigned int>(*cache.contents));
    addNumber(PropCacheAssociativity, associativityCode(cache));
    if (entry.bytes == 0) {
      addNumber(PropCacheBlockSize, cache.lineSize);
      return;
    }
    const std::optional<CacheBlocks> blocks = cacheBlocks(entry.bytes, cache.lineSize);
    if (!blocks) {
      throw std::invalid_argument("the cache " + path + " has " + std::to_string(entry.bytes) +
                                  " bytes, more than an inventory can hold");
    }
    tree_.number(PropCacheBlockSize, blocks->size);
    tree_.number(PropCacheNumberOfBlocks, blocks->count);
    tree_.number(PropCacheConsumableBlocks, blocks->count);
  }

  unsigned int statusOf(const CpuSet& cpus) const {
    return cpus.intersects(parts_.online) ? Status::inUse : Status::offline;
  }

  void addNumber(Properties id, std::optional<unsigned int> value) {
    if (value) {
      tree_.number(id, *value);
    }
  }

  void addText(Properties id, std::string_view value) {
    if (const std::string text = plainText(value); !text.empty()) {
      tree_.text(id, text);
    }
  }

  hwloc_obj_t machine_;
  const HwlocParts parts_;
  const std::string& name_;
  TreeBuilder tree_;
};

Tree convert(const HwlocTopology& topology, const std::string& name) {
  try {
    return Writer(topology.get(), name).write();
  } catch (const std::invalid_argument& refused) {
    throw InventoryError("cannot read the inventory", name, refused.what(), "correct the description");
  }
}

}  // namespace

Tree treeOfXml(const std::string& text, const std::string& name) {
  return convert(loadXml(text, name), name);
}

Tree treeOfSynthetic(const std::string& description, const std::string& name) {
  return convert(loadSynthetic(description, name), name);
}

}  // namespace Corvcim
