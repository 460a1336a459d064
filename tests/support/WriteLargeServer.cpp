// Writes the fixture "large-server": root.txt, the files of a large machine, and tree.json, the tree they must give.
// Nothing of the inventory is used here: both files follow from the description of the machine.

#include <fstream>
#include <iostream>
#include <string>

namespace {

constexpr int packages = 2;
constexpr int coresPerPackage = 128;
constexpr int cores = packages * coresPerPackage;  // CPU n and CPU n + cores are the threads of core n
constexpr int cpus = 2 * cores;
constexpr int coresPerL3 = 8;
constexpr int lineSize = 64;

struct Cache {
  const char* name;
  const char* description;
  const char* type;
  int level;
  int kibibytes;
  int ways;
  int cores;             // that share it
  int cimType;           // CacheType
  int cimAssociativity;  // CacheAssociativity
};
constexpr Cache caches[] = {
    {"L1d", "L1 data cache", "Data", 1, 32, 8, 1, 2, 5},
    {"L1i", "L1 instruction cache", "Instruction", 1, 32, 8, 1, 1, 5},
    {"L2", "L2 cache", "Unified", 2, 1024, 8, 1, 3, 5},
    {"L3", "L3 cache", "Unified", 3, 16384, 16, coresPerL3, 3, 6},
};

/// The CPUs of consecutive cores as the kernel lists them: "0,256", "0-7,256-263".
std::string cpusOf(int firstCore, int count) {
  const auto range = [count](int first) {
    return std::to_string(first) + (count == 1 ? "" : '-' + std::to_string(first + count - 1));
  };
  return range(firstCore) + ',' + range(firstCore + cores);
}

std::string directoryOf(int cpu) {
  return "sys/devices/system/cpu/cpu" + std::to_string(cpu) + '/';
}

void writeCache(std::ostream& out, int cpu, int index) {
  const Cache& cache = caches[index];
  const int number = cpu % cores / cache.cores;
  out << "\n[" << directoryOf(cpu) << "cache/index" << index << "]\n"
      << "shared_cpu_list: " << cpusOf(number * cache.cores, cache.cores) << '\n';
  if (cpu == number * cache.cores) {
    out << "level: " << cache.level << "\ntype: " << cache.type << "\nsize: " << cache.kibibytes
        << "K\ncoherency_line_size: " << lineSize
        << "\nnumber_of_sets: " << cache.kibibytes * 1024 / lineSize / cache.ways
        << "\nways_of_associativity: " << cache.ways << "\nid: " << number << '\n';
  }
}

void writeRoot(std::ostream& out) {
  out << R"(# Written after the sysfs of two-socket servers of 2023.
# Two packages of 128 cores with two threads, 512 CPUs: CPU n and CPU n + 256 are one core, and the second
# package's cores go on counting where the first one's end. Eight cores share an L3 cache. Core numbers begin
# again in each package, cache numbers do not. Of a CPU there is what is read of it: the topology of the first
# thread of each core, the attributes of a cache for the lowest CPU that has it.

[sys/devices/system/cpu]
possible: 0-511
present: 0-511
online: 0-511
offline:
)";
  for (int cpu = 0; cpu < cpus; ++cpu) {
    if (cpu < cores) {
      out << "\n[" << directoryOf(cpu) << "topology]\nphysical_package_id: " << cpu / coresPerPackage
          << "\ncore_id: " << cpu % coresPerPackage << "\ndie_id: 0\nthread_siblings_list: " << cpusOf(cpu, 1) << '\n';
    }
    for (int index = 0; index < static_cast<int>(std::size(caches)); ++index) {
      writeCache(out, cpu, index);
    }
  }
  for (int package = 0; package < packages; ++package) {
    out << "\n[" << directoryOf(package * coresPerPackage) << "cpufreq]\ncpuinfo_max_freq: 3100000\n";
  }
  out << "\n[proc]\ncpuinfo:\n";
  for (int cpu = 0; cpu < cpus; ++cpu) {
    out << (cpu == 0 ? "" : "\t\n") << "\tprocessor\t: " << cpu
        << "\n\tvendor_id\t: AuthenticAMD\n\tcpu family\t: 25\n\tmodel\t\t: 160\n"
           "\tmodel name\t: AMD EPYC 9754 128-Core Processor\n\tstepping\t: 2\n\tcpu MHz\t\t: 2250.000\n"
        << "\tphysical id\t: " << cpu % cores / coresPerPackage << "\n\tflags\t\t: fpu sse2 ht lm\n";
  }
  out << R"(
[sys/class/dmi/id]
product_name: Rack Server 9754
sys_vendor: Server Works

[sys/firmware/dmi/tables]
smbios_entry_point! EACCES
DMI! EACCES
)";
}

void writeProcessor(std::ostream& out, int package) {
  const int firstCore = package * coresPerPackage;
  const std::string path = 'P' + std::to_string(package);
  out << R"(      {"type": "processor", "path": ")" << path << R"(", "status": 1, "description": "Processor )"
      << package << R"(", "cpus": ")" << cpusOf(firstCore, coresPerPackage)
      << R"(", "properties": {"DataWidth": 64, "MaxClockSpeed": 3100, "AddressWidth": 64, "CurrentClockSpeed": 2250, )"
         R"("HardwareThreads": 256, "ProcessorId": "02 0F AA 00", "Stepping": "2", "RequestedStatesSupported": [1], )"
         R"("EnabledCores": 128, "ProcessorCores": 128, "Family": 107, )"
         R"("ProcessorName": "AMD EPYC 9754 128-Core Processor"},)"
      << "\n       \"children\": [";
  for (int core = 0; core < coresPerPackage; ++core) {
    out << (core == 0 ? "" : ",") << "\n        {\"type\": \"core\", \"path\": \"" << path << ".C" << core
        << R"(", "status": 1, "description": "Core )" << core << R"(", "cpus": ")" << cpusOf(firstCore + core, 1)
        << R"(", "properties": {}})";
  }
  for (const Cache& cache : caches) {
    const int blocks = cache.kibibytes * 1024 / lineSize;
    for (int core = firstCore; core < firstCore + coresPerPackage; core += cache.cores) {
      const int number = core / cache.cores;
      out << ",\n        {\"type\": \"cache\", \"path\": \"" << path << '.' << cache.name << '.' << number
          << R"(", "status": 1, "description": ")" << cache.description << ' ' << number << R"(", "cpus": ")"
          << cpusOf(core, cache.cores) << R"(", "properties": {"CacheAssociativity": )" << cache.cimAssociativity
          << R"(, "CacheType": )" << cache.cimType << R"(, "CacheLevel": )" << cache.level + 2 << R"(, "CacheName": ")"
          << cache.name << R"(", "CacheBlockSize": )" << lineSize << R"(, "CacheConsumableBlocks": )" << blocks
          << R"(, "CacheNumberOfBlocks": )" << blocks << "}}";
    }
  }
  out << "\n      ]}";
}

void writeTree(std::ostream& out) {
  out << R"({
  "format": "corvane-inventory",
  "version": 1,
  "unread": [
    {"file": "/sys/firmware/dmi/tables/smbios_entry_point", "reason": "permission denied", "remedy": "run as root to see the sockets, their state and their clocks as well"}
  ],
  "nodes": [
    {"type": "system", "path": "system", "status": 1, "description": "Rack Server 9754", "properties": {"SystemModel": "Rack Server 9754", "SystemManufacturer": "Server Works"},
     "children": [
)";
  for (int package = 0; package < packages; ++package) {
    out << (package == 0 ? "" : ",\n");
    writeProcessor(out, package);
  }
  out << "\n    ]}\n  ]\n}\n";
}

bool write(const std::string& path, void (*contents)(std::ostream&)) {
  std::ofstream file(path, std::ios::binary);
  contents(file);
  file.close();
  if (!file) {
    std::cerr << "cannot write " << path << ": is its directory there and writable?\n";
  }
  return !file.fail();
}

}  // namespace

int main(int argumentCount, char** arguments) {
  if (argumentCount != 2) {
    std::cerr << "usage: " << arguments[0] << " DIRECTORY\n";
    return 2;
  }
  const std::string directory = arguments[1];
  return write(directory + "/root.txt", writeRoot) && write(directory + "/tree.json", writeTree) ? 0 : 1;
}
