#include "platform/instrumentation/kernel/KernelProcessor.h"

#include <algorithm>
#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "platform/instrumentation/kernel/CpuIdentityOrigin.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

constexpr const char* kilohertzRule = "kHz, rounded to whole MHz";

class Reader {
 public:
  Reader(const KernelView& kernel, const Package& package)
      : kernel_(kernel), machine_(kernel.machine), package_(package) {}

  KernelProcessor read() {
    readIdentity();
    addIdentity();
    addCounts();
    addRequestedStates(result_.facts);
    return std::move(result_);
  }

 private:
  void readIdentity() {
    CpuIdentity& identity = result_.identity;
    for (const CoreKind& kind : kernel_.kinds) {
      const unsigned int cpu = firstOnline(kind.cpus);
      if (cpu == CpuSet::limit) {
        continue;
      }
      const CpuIdentity own = identifyCpu(machine_.cpuInfo(), cpu);
      const std::optional<unsigned int> speed = readMegahertz(cpu, "cpuinfo_max_freq");
      cpus_.push_back(cpu);
      if (cpus_.size() == 1) {
        identity = own;
        if (!speed) {
          machine_.noteUnreadOfCpu(cpu, "cpufreq/cpuinfo_max_freq",
                                   "load the processor's frequency driver; most virtual machines have none");
        }
      } else {
        merge(identity, own);
      }
      if (speed > maxSpeed_) {
        maxSpeed_ = speed;
        fastest_ = cpu;
      }
    }
    if (!cpus_.empty() && !identity.clockSpeed) {
      identity.clockSpeed = readMegahertz(cpus_.front(), "scaling_cur_freq");
      clockFromDriver_ = identity.clockSpeed.has_value();
    }
  }

  // What two kinds of core do not share, the processor as a whole does not have.
  void merge(CpuIdentity& all, const CpuIdentity& other) {
    if (all.name != other.name) {
      all.name += " + " + other.name;
      namesDiffer_ = true;
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

  unsigned int firstOnline(const CpuSet& kind) const {
    CpuSet cpus = package_.cpus;
    cpus.keepOnly(kernel_.topology.online);
    cpus.keepOnly(kind);
    return cpus.first();
  }

  void addIdentity() {
    const CpuIdentity& identity = result_.identity;
    Facts& facts = result_.facts;
    facts.number(PropFamily, identity.family, told(PropFamily));
    facts.number(PropDataWidth, identity.width, told(PropDataWidth));
    facts.number(PropAddressWidth, identity.width, told(PropAddressWidth));
    facts.number(PropMaxClockSpeed, maxSpeed_, fromDriver(fastest_, "cpufreq/cpuinfo_max_freq"));
    facts.number(
        PropCurrentClockSpeed, identity.clockSpeed,
        clockFromDriver_ ? fromDriver(cpus_.front(), "cpufreq/scaling_cur_freq") : told(PropCurrentClockSpeed));
    facts.text(PropProcessorName, identity.name, namesDiffer_ ? toldByEachKind() : told(PropProcessorName));
    facts.text(PropStepping, identity.stepping, told(PropStepping));
    facts.text(PropProcessorId, identity.processorId, told(PropProcessorId));
  }

  void addCounts() {
    const auto threads = package_.cpus.count();
    result_.facts.number(PropHardwareThreads, threads, [this_ = parts(), threads] {
      return originOfPackage(*this_.kernel, *this_.package,
                             "CPUs " + this_.package->cpus.toList() + " are one processor: " + std::to_string(threads));
    });
    if (package_.cores.empty()) {
      return;
    }
    const auto cores = static_cast<unsigned int>(package_.cores.size());
    result_.facts.number(PropProcessorCores, cores, [this_ = parts(), cores] {
      static constexpr std::array<std::string_view, 3> suffixes = {"topology/thread_siblings_list",
                                                                   "topology/core_cpus_list", "topology/core_id"};
      return this_.kernel->machine.originOfCpus(
          this_.package->cores.front().cpus, suffixes, "core id",
          "CPUs that it puts together are one core; cores of the processor: " + std::to_string(cores));
    });
    const auto enabled = static_cast<unsigned int>(
        std::ranges::count_if(package_.cores, [this](const Core& core) { return kernel_.isOnline(core.cpus); }));
    result_.facts.number(PropEnabledCores, enabled, [this_ = parts(), enabled] {
      return this_.kernel->machine.originInCpuDirectory("online",
                                                        "cores with a CPU online: " + std::to_string(enabled));
    });
  }

  // What the origins refer to; it outlives this reader.
  struct Parts {
    const KernelView* kernel;
    const Package* package;
  };
  Parts parts() const { return {&kernel_, &package_}; }

  Facts::Explain told(Properties id) const {
    if (cpus_.empty()) {
      return [this_ = parts()] {
        return this_.kernel->machine.originInCpuDirectory("online",
                                                          "no CPU of the processor is online to tell it: unknown");
      };
    }
    return [kernel = &kernel_, cpu = cpus_.front(), id] {
      const Machine& machine = kernel->machine;
      return originOfIdentity(machine, cpu, identifyCpu(machine.cpuInfo(), cpu), id);
    };
  }

  Facts::Explain toldByEachKind() const {
    return [kernel = &kernel_, cpus = cpus_] {
      const Machine& machine = kernel->machine;
      Origin all;
      for (const unsigned int cpu : cpus) {
        const Origin own = originOfIdentity(machine, cpu, identifyCpu(machine.cpuInfo(), cpu), PropProcessorName);
        const bool first = all.source.empty();
        all.source += (first ? "" : "; ") + own.source;
        all.raw += (first ? "" : "; ") + own.raw;
        all.rule += (first ? "" : "; ") + own.rule;
      }
      return all;
    };
  }

  Facts::Explain fromDriver(unsigned int cpu, const char* suffix) const {
    return [kernel = &kernel_, cpu, suffix] { return kernel->machine.originOfCpu(cpu, suffix, kilohertzRule); };
  }

  const KernelView& kernel_;
  Machine& machine_;
  const Package& package_;
  KernelProcessor result_;
  std::vector<unsigned int> cpus_;  // the first online CPU of each kind of core
  std::optional<unsigned int> maxSpeed_;
  unsigned int fastest_ = 0;
  bool namesDiffer_ = false;
  bool clockFromDriver_ = false;
};

}  // namespace

KernelProcessor readKernelProcessor(const KernelView& kernel, const Package& package) {
  return Reader(kernel, package).read();
}

void addRequestedStates(Facts& facts) {
  facts.list(PropRequestedStatesSupported, {1}, [] {
    return Origin{"(fixed)", "", "every processor that works can be enabled"};
  });
}

Origin originOfPackage(const KernelView& kernel, const Package& package, std::string rule) {
  static constexpr std::array<std::string_view, 1> byNumber = {"topology/physical_package_id"};
  static constexpr std::array<std::string_view, 2> byList = {"topology/core_siblings_list",
                                                             "topology/package_cpus_list"};
  const Machine& machine = kernel.machine;
  if (package.id) {
    return machine.originOfCpus(package.cpus, byNumber, "physical id", std::move(rule));
  }
  Origin origin = machine.originOfCpus(package.cpus, byList, {}, rule);
  if (origin.raw.empty()) {
    origin =
        machine.originInCpuDirectory("present", "nothing tells of packages, so all CPUs are one; " + std::move(rule));
  }
  return origin;
}

}  // namespace Tarn::Inventory
