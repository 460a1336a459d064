#include "platform/inventory/sources/kernel/KernelProcessor.h"

#include <algorithm>
#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "platform/inventory/sources/kernel/CpuIdentityOrigin.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

constexpr const char* kilohertzRule = "kHz, rounded to whole MHz";
constexpr const char* currentFrequencyFile = "/cpufreq/scaling_cur_freq";

class Reader {
 public:
  Reader(const KernelView& kernel, const Package& package)
      : kernel_(kernel), machine_(kernel.machine), package_(package) {}

  KernelProcessor read() {
    readIdentity();
    readMaxSpeed();
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
      cpus_.push_back(cpu);
      if (cpus_.size() == 1) {
        identity = own;
      } else {
        merge(identity, own);
      }
    }
    // Of one CPU alone: this file can make the kernel measure.
    if (!cpus_.empty() && !identity.clockSpeed) {
      identity.clockSpeed = megahertz(machine_.cpus().number("cpu", cpus_.front(), currentFrequencyFile));
      clockFromDriver_ = identity.clockSpeed.has_value();
    }
  }

  // Cores of one kind can have different limits, CPUs of one policy cannot.
  void readMaxSpeed() {
    for (const FrequencyPolicy& policy : kernel_.policies) {
      if (package_.cpus.contains(policy.cpu)) {
        readMaxSpeedIn(policy.directory);
      }
    }
    if (maxSpeed_ || cpus_.empty()) {
      return;
    }
    // Without a driver the first of each kind show it, and no other is asked.
    for (const unsigned int cpu : cpus_) {
      readMaxSpeedIn("cpu" + std::to_string(cpu) + "/cpufreq");
    }
    if (!maxSpeed_) {
      machine_.noteUnreadOfCpu(cpus_.front(), "cpufreq/cpuinfo_max_freq",
                               "load the processor's frequency driver; most virtual machines have none");
      return;
    }
    for (const Core& core : package_.cores) {
      const unsigned int cpu = firstOnline(core.cpus);
      if (cpu != CpuSet::limit && std::ranges::find(cpus_, cpu) == cpus_.end()) {
        readMaxSpeedIn("cpu" + std::to_string(cpu) + "/cpufreq");
      }
    }
  }

  void readMaxSpeedIn(const std::string& directory) {
    const std::optional<unsigned int> limit = machine_.cpus().number(directory, "/cpuinfo_max_freq");
    if (limit > maxSpeed_) {
      maxSpeed_ = limit;
      maxSpeedFile_ = directory + "/cpuinfo_max_freq";
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

  static std::optional<unsigned int> megahertz(std::optional<unsigned int> kilohertz) {
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
    facts.number(PropMaxClockSpeed, megahertz(maxSpeed_), fromDriver(maxSpeedFile_));
    facts.number(PropCurrentClockSpeed, identity.clockSpeed,
                 clockFromDriver_ ? fromDriver("cpu" + std::to_string(cpus_.front()) + currentFrequencyFile)
                                  : told(PropCurrentClockSpeed));
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
      return this_.kernel->machine.originOfCpus(
          this_.package->cores.front().cpus, coreFiles, "core id",
          "CPUs that it puts together are one core; cores of the processor: " + std::to_string(cores));
    });
    const auto enabled = static_cast<unsigned int>(
        std::ranges::count_if(package_.cores, [this](const Core& core) { return kernel_.isOnline(core.cpus); }));
    result_.facts.number(PropEnabledCores, enabled, [this_ = parts(), enabled] {
      return this_.kernel->onlineOrigin(this_.package->cpus, "cores with a CPU online: " + std::to_string(enabled));
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

  // The file is one below the directory of the CPUs.
  Facts::Explain fromDriver(const std::string& file) const {
    return [kernel = &kernel_, file] { return kernel->machine.originInCpuDirectory(file, kilohertzRule); };
  }

  const KernelView& kernel_;
  Machine& machine_;
  const Package& package_;
  KernelProcessor result_;
  std::vector<unsigned int> cpus_;        // the first online CPU of each kind of core
  std::optional<unsigned int> maxSpeed_;  // kHz
  std::string maxSpeedFile_;
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
  const Machine& machine = kernel.machine;
  if (package.id) {
    return machine.originOfCpus(package.cpus, byNumber, "physical id", std::move(rule));
  }
  Origin origin = machine.originOfCpus(package.cpus, packageCpusFiles, {}, rule);
  if (origin.raw.empty()) {
    origin =
        machine.originInCpuDirectory("present", "nothing tells of packages, so all CPUs are one; " + std::move(rule));
  }
  return origin;
}

}  // namespace Tarn::Inventory
