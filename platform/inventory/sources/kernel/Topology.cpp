#include "platform/inventory/sources/kernel/Topology.h"

#include <algorithm>
#include <cerrno>
#include <span>
#include <string>
#include <tuple>
#include <utility>

namespace Tarn::Inventory {

namespace {

constexpr const char* mountSys = "mount sysfs on /sys";

/// What the kernel tells of one CPU's place.
struct CpuPlace {
  std::optional<unsigned int> package;
  std::optional<CpuSet> packageCpus;  // of a package without id
  CorePlace core;
  std::optional<CpuSet> siblings;  // the CPUs of its core
};

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
    placeCpusWithoutPackage();
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
    topology_.online = readOnline();
    topology_.present.add(topology_.online);
  }

  CpuSet readOnline() {
    if (std::optional<CpuSet> online = cpus_.list("online")) {
      return *std::move(online);
    }
    const std::string file = cpus_.fileName();
    const FileError error = cpus_.error();
    // Some kernels have the file of each CPU alone, and none for a CPU that cannot be set offline.
    CpuSet online;
    bool hasOwnFiles = false;
    for (const unsigned int cpu : topology_.present) {
      const std::optional<unsigned int> state = cpus_.number("cpu", cpu, "/online");
      hasOwnFiles = hasOwnFiles || state;
      if (state != 0U) {
        online.add(cpu);
      }
    }
    if (hasOwnFiles) {
      return online;
    }
    machine_.noteUnread(file, error, mountSys);
    return machine_.cpuInfo().cpus().empty() ? topology_.present : machine_.cpuInfo().cpus();
  }

  CpuSet readPresent() {
    if (std::optional<CpuSet> present = cpus_.list("present"); present && !present->empty()) {
      return *std::move(present);
    }
    const std::string file = cpus_.fileName();
    const FileError error = cpus_.error();
    CpuSet present;
    std::vector<std::string> names;
    machine_.root().files().list(kernelCpuDirectory, names);
    for (const std::string& name : names) {
      if (const std::optional<unsigned int> cpu = Attributes::numberAfter("cpu", name)) {
        present.add(*cpu);
      }
    }
    // Old kernels have the directories alone.
    if (present.empty() || error != ENOENT) {
      machine_.noteUnread(file, error, mountSys);
    }
    present.add(machine_.cpuInfo().cpus());
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
    if (known->package || known->packageCpus) {
      addToCore(cpu, *known, packageOf(*known));
    } else {
      withoutPackage_.emplace_back(cpu, *std::move(known));
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
    place.siblings = readOwnSet(cpu, coreCpusFiles);
    if (!place.package) {
      place.packageCpus = readOwnSet(cpu, packageCpusFiles);
    }
    return place;
  }

  // The CPUs that this one is grouped with. A set without the CPU itself, as some kernels have for one that is
  // offline, says nothing.
  std::optional<CpuSet> readOwnSet(unsigned int cpu, std::span<const std::string_view> files) {
    std::optional<CpuSet> cpus = cpus_.cpusIn(cpu, files);
    return cpus && cpus->contains(cpu) ? std::move(cpus) : std::nullopt;
  }

  // Where sysfs hides a place, /proc/cpuinfo tells it as well on some architectures.
  void addFromCpuInfo(unsigned int cpu, CpuPlace& place) const {
    const CpuInfo& info = machine_.cpuInfo();
    if (!info.cpus().contains(cpu)) {
      return;
    }
    if (!place.package && !place.packageCpus) {
      place.package = Attributes::toNumber(info.field(cpu, "physical id"));
    }
    if (!place.core.core && !place.siblings) {
      place.core.core = Attributes::toNumber(info.field(cpu, "core id"));
    }
  }

  Package& packageOf(const CpuPlace& place) {
    const unsigned int lowest = place.packageCpus ? place.packageCpus->first() : CpuSet::limit;
    const auto found = std::ranges::find_if(topology_.packages, [&](const Package& package) {
      return place.package ? package.id == place.package : package.cpus.contains(lowest) || package.lowestCpu == lowest;
    });
    if (found != topology_.packages.end()) {
      return *found;
    }
    namedBySiblings_.push_back(place.packageCpus);
    return topology_.packages.emplace_back(Package{place.package, lowest, {}, {}});
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
  // that are known, they are where their siblings say.
  void placeCpusWithoutPackage() {
    const bool nothingKnown = topology_.packages.empty();
    for (const auto& [cpu, place] : withoutPackage_) {
      if (placed_.contains(cpu)) {
        continue;
      }
      if (nothingKnown) {
        addToCore(cpu, place, packageOf({.package = {}, .packageCpus = CpuSet(), .core = {}, .siblings = {}}));
      } else if (Package* package = packageBySiblings(cpu)) {
        addToCore(cpu, place, *package);
      } else {
        machine_.noteUnreadOfCpu(cpu, "topology", "no file names the CPU's processor", mountSys);
      }
    }
  }

  // While a CPU is offline most kernels hide its topology. Siblings that are online may still name it; else
  // the memory node that it is attached to may give the package.
  void placeHidden() {
    hidden_.remove(placed_);
    for (const unsigned int cpu : hidden_) {
      machine_.noteUnreadOfCpu(cpu, "topology", "the CPU is offline and the kernel hides its place",
                               "write 1 to the file online in its directory, as root");
      Package* package = packageBySiblings(cpu);
      package = package == nullptr ? packageByMemoryNode(cpu) : package;
      if (package != nullptr) {
        package->cpus.add(cpu);
      }
    }
  }

  // The package in which a CPU counts this one among its siblings. All CPUs of a package name the same, so the
  // first one is asked.
  Package* packageBySiblings(unsigned int cpu) {
    for (std::size_t i = 0; i < topology_.packages.size(); ++i) {
      Package& package = topology_.packages[i];
      std::optional<CpuSet>& named = namedBySiblings_[i];
      if (!named) {
        CpuSet online = package.cpus;
        online.keepOnly(topology_.online);
        named = cpus_.cpusIn(online.empty() ? package.cpus.first() : online.first(), packageCpusFiles);
        named = named.value_or(CpuSet());
      }
      if (named->contains(cpu)) {
        return &package;
      }
    }
    return nullptr;
  }

  Package* packageByMemoryNode(unsigned int cpu) {
    const std::string directory = "cpu" + std::to_string(cpu);
    std::vector<std::string> names;
    cpus_.files().list(directory.c_str(), names);
    for (const std::string& name : names) {
      if (Attributes::numberAfter("node", name)) {
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
  CpuSet hidden_;                                                  // offline, without a place
  std::vector<std::pair<unsigned int, CpuPlace>> withoutPackage_;  // by CPU
  std::vector<std::optional<CpuSet>> namedBySiblings_;             // in each package, once that was asked
};

}  // namespace

CpuSet Topology::placed() const {
  CpuSet cpus;
  for (const Package& package : packages) {
    cpus.add(package.cpus);
  }
  return cpus;
}

Topology readTopology(Machine& machine) {
  return TopologyReader(machine).read();
}

}  // namespace Tarn::Inventory
