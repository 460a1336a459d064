#include "platform/instrumentation/kernel/Topology.h"

#include <algorithm>
#include <string>
#include <tuple>
#include <utility>

namespace Tarn::Inventory {

namespace {

constexpr const char* mountSys = "mount sysfs on /sys";

/// What the kernel tells of one CPU's place.
struct CpuPlace {
  std::optional<unsigned int> package;
  std::optional<unsigned int> packageCpu;  // the lowest CPU of a package without id
  CorePlace core;
  std::optional<CpuSet> siblings;  // the CPUs of its core
};

// The number after a prefix, as in "cpu12".
std::optional<unsigned int> numberAfter(std::string_view prefix, std::string_view name) {
  return name.starts_with(prefix) ? Attributes::toNumber(name.substr(prefix.size())) : std::nullopt;
}

class TopologyReader {
 public:
  explicit TopologyReader(Machine& machine)
      : machine_(machine), cpus_(machine.cpus()), coresAreNumberedByCluster_(!isX86()) {}

  Topology read() {
    readCpuLists();
    for (const unsigned int cpu : topology_.present) {
      if (!placed_.contains(cpu)) {
        place(cpu);
      }
    }
    placeHomeless();
    placeHidden();
    sort();
    return std::move(topology_);
  }

 private:
  // On x86 a core's number is unique in its die; the clusters there only group the cores by cache.
  bool isX86() {
    const CpuInfo& info = machine_.cpuInfo();
    return info.cpus().empty() ? cpus_.text("modalias").value_or(std::string_view()).starts_with("cpu:type:x86")
                               : !info.field(info.cpus().first(), "cpu family").empty();
  }

  void readCpuLists() {
    topology_.present = readPresent();
    std::optional<CpuSet> online = cpus_.list("online");
    if (!online) {
      machine_.noteUnread(cpus_.fileName(), cpus_.error(), mountSys);
      online = machine_.cpuInfo().cpus().empty() ? topology_.present : machine_.cpuInfo().cpus();
    }
    topology_.online = *std::move(online);
    topology_.present.add(topology_.online);
  }

  CpuSet readPresent() {
    if (std::optional<CpuSet> present = cpus_.list("present"); present && !present->empty()) {
      return *std::move(present);
    }
    machine_.noteUnread(cpus_.fileName(), cpus_.error(), mountSys);
    CpuSet present = machine_.cpuInfo().cpus();
    std::vector<std::string> names;
    machine_.root().files().list(kernelCpuDirectory, names);
    for (const std::string& name : names) {
      if (const std::optional<unsigned int> cpu = numberAfter("cpu", name)) {
        present.add(*cpu);
      }
    }
    return present;
  }

  void place(unsigned int cpu) {
    std::optional<CpuPlace> known = readPlace(cpu);
    if (!known && !topology_.online.contains(cpu)) {
      hidden_.add(cpu);
      return;
    }
    if (!known) {
      machine_.noteUnreadOfCpu(cpu, "topology", mountSys);
      known.emplace();
    }
    addFromCpuInfo(cpu, *known);
    if (known->package || known->packageCpu) {
      addToCore(cpu, *known, packageOf(*known));
    } else {
      homeless_.emplace_back(cpu, *std::move(known));
    }
  }

  std::optional<CpuPlace> readPlace(unsigned int cpu) {
    CpuPlace place;
    place.package = cpus_.number("cpu", cpu, "/topology/physical_package_id");
    const FileError error = cpus_.error();
    place.core.core = cpus_.number("cpu", cpu, "/topology/core_id");
    if (error != 0 && cpus_.error() != 0) {
      return std::nullopt;
    }
    place.core.die = cpus_.number("cpu", cpu, "/topology/die_id");
    if (coresAreNumberedByCluster_) {
      place.core.cluster = cpus_.number("cpu", cpu, "/topology/cluster_id");
    }
    place.siblings = cpus_.list("cpu", cpu, "/topology/thread_siblings_list");
    if (!place.siblings) {
      place.siblings = cpus_.list("cpu", cpu, "/topology/core_cpus_list");
    }
    if (!place.package) {
      place.packageCpu = readPackageCpu(cpu);
    }
    return place;
  }

  std::optional<unsigned int> readPackageCpu(unsigned int cpu) {
    std::optional<CpuSet> package = cpus_.list("cpu", cpu, "/topology/core_siblings_list");
    if (!package) {
      package = cpus_.list("cpu", cpu, "/topology/package_cpus_list");
    }
    return package && package->contains(cpu) ? std::optional(package->first()) : std::nullopt;
  }

  // Where sysfs hides a place, /proc/cpuinfo tells it as well on some architectures.
  void addFromCpuInfo(unsigned int cpu, CpuPlace& place) const {
    const CpuInfo& info = machine_.cpuInfo();
    if (!info.cpus().contains(cpu)) {
      return;
    }
    if (!place.package && !place.packageCpu) {
      place.package = Attributes::toNumber(info.field(cpu, "physical id"));
    }
    if (!place.core.core && !place.siblings) {
      place.core.core = Attributes::toNumber(info.field(cpu, "core id"));
    }
  }

  Package& packageOf(const CpuPlace& place) {
    const auto found = std::ranges::find_if(topology_.packages, [&](const Package& package) {
      return place.package ? package.id == place.package
                           : package.cpus.contains(*place.packageCpu) || package.lowestCpu == *place.packageCpu;
    });
    if (found != topology_.packages.end()) {
      return *found;
    }
    const unsigned int none = CpuSet::limit;
    return topology_.packages.emplace_back(Package{place.package, place.packageCpu.value_or(none), {}, {}});
  }

  void addToCore(unsigned int cpu, const CpuPlace& place, Package& package) {
    // Containers may show fewer CPUs than these lists know.
    CpuSet added = place.siblings.value_or(CpuSet());
    added.keepOnly(topology_.present);
    added.remove(placed_);
    added.add(cpu);
    package.cpus.add(added);
    placed_.add(added);
    const auto same = std::ranges::find(package.cores, place.core, &Core::place);
    if (!place.siblings && same != package.cores.end()) {
      same->cpus.add(added);
    } else if (place.siblings || place.core.core) {
      package.cores.push_back({place.core, added});
    }
  }

  // Where nothing tells of any package there is one at least, and these CPUs are in it. Beside packages
  // that are known, they could be anywhere.
  void placeHomeless() {
    const bool nothingKnown = topology_.packages.empty();
    for (const auto& [cpu, place] : homeless_) {
      if (!nothingKnown) {
        machine_.noteUnreadOfCpu(cpu, "topology", "nothing tells which processor the CPU belongs to", mountSys);
      } else if (!placed_.contains(cpu)) {
        addToCore(cpu, place, packageOf({.package = {}, .packageCpu = 0, .core = {}, .siblings = {}}));
      }
    }
  }

  // While a CPU is offline most kernels hide its topology; of its core nothing is known then. The memory
  // node that it is attached to may still tell the package.
  void placeHidden() {
    for (const unsigned int cpu : hidden_) {
      machine_.noteUnreadOfCpu(cpu, "topology", "the CPU is offline and the kernel hides its place",
                               "write 1 to the file online in its directory, as root");
      if (Package* package = packageByMemoryNode(cpu)) {
        package->cpus.add(cpu);
      }
    }
  }

  Package* packageByMemoryNode(unsigned int cpu) {
    const std::string directory = "cpu" + std::to_string(cpu);
    std::vector<std::string> names;
    cpus_.files().list(directory.c_str(), names);
    for (const std::string& name : names) {
      if (numberAfter("node", name)) {
        CpuSet neighbours = cpus_.list(directory, "/", name, "/cpulist").value_or(CpuSet());
        neighbours.remove(hidden_);
        return packageOfAll(neighbours);
      }
    }
    return nullptr;
  }

  // The one package that all of these CPUs are in.
  Package* packageOfAll(const CpuSet& cpus) {
    const auto found =
        std::ranges::find_if(topology_.packages, [&](const Package& package) { return package.cpus.intersects(cpus); });
    if (found == topology_.packages.end()) {
      return nullptr;
    }
    return cpus.isSubsetOf(found->cpus) ? &*found : nullptr;
  }

  void sort() {
    for (Package& package : topology_.packages) {
      package.lowestCpu = package.cpus.first();
    }
    std::ranges::sort(topology_.packages, {},
                      [](const Package& package) { return std::tuple(package.id, package.lowestCpu); });
    for (Package& package : topology_.packages) {
      std::ranges::sort(package.cores, {}, [](const Core& core) {
        return std::tuple(core.place.die, core.place.cluster, core.place.core, core.cpus.first());
      });
    }
  }

  Machine& machine_;
  Attributes& cpus_;
  const bool coresAreNumberedByCluster_;
  Topology topology_;
  CpuSet placed_;
  CpuSet hidden_;                                            // offline, without a place
  std::vector<std::pair<unsigned int, CpuPlace>> homeless_;  // without a package
};

}  // namespace

Topology readTopology(Machine& machine) {
  return TopologyReader(machine).read();
}

}  // namespace Tarn::Inventory
