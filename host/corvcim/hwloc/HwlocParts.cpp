#include "host/corvcim/hwloc/HwlocParts.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <stdexcept>
#include <tuple>

namespace Corvcim {
namespace {

using Tarn::Inventory::Cache;
using Tarn::Inventory::CacheContents;
using Tarn::Inventory::Core;
using Tarn::Inventory::CpuSet;

std::optional<unsigned int> numberOf(hwloc_obj_t object) {
  return object == nullptr || object->os_index == HWLOC_UNKNOWN_INDEX ? std::nullopt
                                                                      : std::optional<unsigned int>(object->os_index);
}

std::optional<unsigned int> toNumber(std::string_view text) {
  unsigned int number = 0;
  const auto parsed = std::from_chars(text.data(), text.data() + text.size(), number);
  const bool whole = parsed.ec == std::errc() && parsed.ptr == text.data() + text.size();
  return whole ? std::optional(number) : std::nullopt;
}

template <class Holds>
hwloc_obj_t above(hwloc_obj_t object, Holds holds) {
  do {
    object = object->parent;
  } while (object != nullptr && !holds(object));
  return object;
}

hwloc_obj_t above(hwloc_obj_t object, hwloc_obj_type_t type) {
  return above(object, [type](hwloc_obj_t candidate) { return candidate->type == type; });
}

bool isCluster(hwloc_obj_t object) {
  return object->type == HWLOC_OBJ_GROUP && object->subtype != nullptr &&
         std::string_view(object->subtype) == "Cluster";
}

CacheContents contentsOf(hwloc_obj_cache_type_t type) {
  switch (type) {
    case HWLOC_OBJ_CACHE_DATA:
      return CacheContents::Data;
    case HWLOC_OBJ_CACHE_INSTRUCTION:
      return CacheContents::Instructions;
    case HWLOC_OBJ_CACHE_UNIFIED:
      break;
  }
  return CacheContents::Unified;
}

HwlocCache readCache(hwloc_obj_t object) {
  const hwloc_obj_attr_u::hwloc_cache_attr_s& attributes = object->attr->cache;
  HwlocCache result;
  Cache& cache = result.cache;
  cache.level = attributes.depth;
  cache.contents = contentsOf(attributes.type);
  cache.id = numberOf(object);
  cache.cpus = cpuSetOf(object->complete_cpuset);
  if (attributes.linesize != 0) {
    cache.lineSize = attributes.linesize;
  }
  constexpr int fully = -1;  // and 0 where it is not known
  if (attributes.associativity == fully) {
    cache.sets = 1;
  } else if (attributes.associativity > 0) {
    cache.ways = static_cast<unsigned int>(attributes.associativity);
  }
  result.bytes = attributes.size;
  return result;
}

struct KindName {
  std::string_view type;
  std::string_view name;
};
constexpr std::array kindNames = {KindName{"IntelAtom", "Efficient core"}, KindName{"IntelCore", "Performance core"}};

HwlocCoreKind readKind(hwloc_const_cpuset_t cpus, unsigned int infoCount, const hwloc_info_s* infos) {
  HwlocCoreKind kind{cpuSetOf(cpus), {}, {}};
  for (const hwloc_info_s* info = infos; info != infos + infoCount; ++info) {
    const std::string_view name = info->name;
    if (name == "FrequencyMaxMHz") {
      kind.maxClock = toNumber(info->value);
    } else if (name == "CoreType") {
      const auto* const row = std::ranges::find(kindNames, std::string_view(info->value), &KindName::type);
      kind.name = row == kindNames.end() ? std::string_view() : row->name;
    }
  }
  return kind;
}

std::vector<HwlocCoreKind> readKinds(hwloc_topology_t topology) {
  std::vector<HwlocCoreKind> kinds;
  const int count = hwloc().cpukindsGetNr(topology, 0);
  const std::unique_ptr<hwloc_bitmap_s, decltype(&hwloc_bitmap_free)> cpus(hwloc().bitmapAlloc(), hwloc().bitmapFree);
  for (int index = 0; index < count; ++index) {
    unsigned int infoCount = 0;
    hwloc_info_s* infos = nullptr;
    if (hwloc().cpukindsGetInfo(topology, static_cast<unsigned int>(index), cpus.get(), nullptr, &infoCount, &infos,
                                0) == 0) {
      kinds.push_back(readKind(cpus.get(), infoCount, infos));
    }
  }
  return kinds;
}

class Collection {
 public:
  explicit Collection(hwloc_topology_t topology)
      : topology_(topology), machine_(hwloc().getObjByDepth(topology, 0, 0)) {}

  HwlocParts collect() {
    forEach([](hwloc_obj_t object) { return object->type == HWLOC_OBJ_PACKAGE; },
            [this](hwloc_obj_t object) { addPackage(numberOf(object), object); });
    if (parts_.packages.empty()) {
      addPackage(std::nullopt, machine_);
    }
    settleIds();
    std::ranges::sort(parts_.packages, {},
                      [](const HwlocPackage& entry) { return std::tuple(entry.package.id, entry.package.lowestCpu); });
    forEach([](hwloc_obj_t object) { return object->type == HWLOC_OBJ_CORE; },
            [this](hwloc_obj_t object) { addCore(object); });
    forEach([](hwloc_obj_t object) { return hwloc().objTypeIsCache(object->type) != 0; },
            [this](hwloc_obj_t object) { addCache(object); });
    for (HwlocPackage& entry : parts_.packages) {
      sort(entry);
    }
    parts_.kinds = readKinds(topology_);
    parts_.online = cpuSetOf(machine_->cpuset);
    parts_.homeless = cpuSetOf(machine_->complete_cpuset);
    for (const HwlocPackage& entry : parts_.packages) {
      parts_.homeless.remove(entry.package.cpus);
    }
    return std::move(parts_);
  }

 private:
  template <class Holds, class Action>
  void forEach(Holds holds, Action action) const {
    for (int depth = 0; depth < hwloc().topologyGetDepth(topology_); ++depth) {
      for (unsigned int i = 0; i < hwloc().getNbobjsByDepth(topology_, depth); ++i) {
        if (hwloc_obj_t object = hwloc().getObjByDepth(topology_, depth, i); holds(object)) {
          action(object);
        }
      }
    }
  }

  void addPackage(std::optional<unsigned int> id, hwloc_obj_t object) {
    CpuSet cpus = cpuSetOf(object->complete_cpuset);
    if (cpus.empty()) {
      throw std::invalid_argument("a package has no CPUs");
    }
    const unsigned int lowest = cpus.first();
    parts_.packages.push_back({{id, lowest, std::move(cpus), {}}, object, {}});
  }

  /// A number that two packages have names neither.
  void settleIds() {
    std::vector<std::optional<unsigned int>> ids;
    for (const HwlocPackage& entry : parts_.packages) {
      ids.push_back(entry.package.id);
    }
    for (HwlocPackage& entry : parts_.packages) {
      if (std::ranges::count(ids, entry.package.id) > 1) {
        entry.package.id.reset();
      }
    }
  }

  /// The package that the CPU belongs to; nullptr where nothing tells it.
  HwlocPackage* packageOf(unsigned int cpu) {
    const auto found = std::ranges::find_if(
        parts_.packages, [cpu](const HwlocPackage& entry) { return entry.package.cpus.contains(cpu); });
    return found == parts_.packages.end() ? nullptr : &*found;
  }

  void addCore(hwloc_obj_t object) {
    CpuSet cpus = cpuSetOf(object->complete_cpuset);
    if (HwlocPackage* package = packageOf(cpus.first())) {
      // On x86 a core's number is unique in its die.
      const bool isX86 = !infoOf(package->object, "CPUFamilyNumber").empty();
      hwloc_obj_t cluster = isX86 ? nullptr : above(object, isCluster);
      package->package.cores.push_back(
          {{numberOf(above(object, HWLOC_OBJ_DIE)), numberOf(cluster), numberOf(object)}, std::move(cpus)});
    }
  }

  void addCache(hwloc_obj_t object) {
    HwlocCache cache = readCache(object);
    if (HwlocPackage* package = packageOf(cache.cache.cpus.first())) {
      package->caches.push_back(std::move(cache));
    }
  }

  static void sort(HwlocPackage& entry) {
    std::ranges::sort(entry.package.cores, {}, [](const Core& core) {
      return std::tuple(core.place.die, core.place.cluster, core.place.core, core.cpus.first());
    });
    std::ranges::sort(entry.caches, {}, [](const HwlocCache& cache) {
      return std::tuple(cache.cache.level, cache.cache.contents == CacheContents::Instructions,
                        cache.cache.cpus.first());
    });
  }

  hwloc_topology_t topology_;
  hwloc_obj_t machine_;
  HwlocParts parts_;
};

}  // namespace

HwlocParts readParts(hwloc_topology_t topology) {
  return Collection(topology).collect();
}

std::string_view infoOf(hwloc_obj_t object, const char* name) {
  const char* value = hwloc_obj_get_info_by_name(object, name);
  return value == nullptr ? std::string_view() : value;
}

}  // namespace Corvcim
