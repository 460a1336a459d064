#include "tests/platform/inventory/sources/live/XeonPackages.h"

namespace Tarn::Inventory {

KernelFiles packages(unsigned int count) {
  KernelFiles files;
  files.cpus("0-" + std::to_string(count - 1)).file("sys/class/dmi/id/product_name", "Box\n");
  for (unsigned int cpu = 0; cpu < count; ++cpu) {
    const std::string own = std::to_string(cpu);
    files.x86Block(cpu).maxFrequency(cpu, "4000000");
    files.cpu(cpu, {.package = static_cast<int>(cpu), .core = 0, .siblings = own});
    files.cache(cpu, 0, {.level = 2, .cpus = own, .id = own, .size = "512K", .sets = "1024"});
  }
  return files;
}

Support::SmbiosProcessor xeon(const std::string& socket) {
  constexpr std::uint64_t id = 0xBFEBFBFF00050657;  // what x86Block makes up
  return {.socket = socket, .id = id, .version = "Intel(R) Xeon(R) CPU", .cores = 1, .coresEnabled = 1, .threads = 1};
}

unsigned int statusAt(const Tree& tree, const std::string& path) {
  return nodeAt(tree, path).status;
}

}  // namespace Tarn::Inventory
