#include <gtest/gtest.h>

#include "platform/inventory/sources/Source.h"
#include "platform/inventory/sources/files/MemoryFileSystem.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "tests/platform/inventory/KernelFiles.h"
#include "tests/platform/inventory/sources/live/Origins.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;

Tree explained(const KernelFiles& files) {
  MemoryFileSystem root(files.files());
  return readLiveInventory(root, Detail::WithOrigins);
}

Origin originAt(const Tree& tree, const std::string& path, Properties id) {
  const Origin* origin = tree.origin(tree.find('/' + path), id);
  return origin == nullptr ? Origin() : *origin;
}

TEST(Origin, EveryValueOfAMachineHasOne) {
  KernelFiles files;
  files.cpus("0-1").x86Block(0).x86Block(1).maxFrequency(0, "3500000");
  files.cpu(0, {.package = 0, .core = 4, .siblings = "0-1"}).cpu(1, {.package = 0, .core = 4, .siblings = "0-1"});
  files.cache(0, 0, {.level = 2, .cpus = "0-1", .id = "9", .size = "512K", .sets = "1024", .writePolicy = "WriteBack"});
  files.file("sys/class/dmi/id/product_name", "Box 1\n").file("sys/class/dmi/id/sys_vendor", "Boxes Inc.\n");

  EXPECT_EQ(originsOf(explained(files)),
            R"(system status: (fixed): : the computer that tells this is in use
system description: /sys/class/dmi/id/product_name: Box 1: as it stands
system SystemModel: /sys/class/dmi/id/product_name: Box 1: as it stands
system SystemManufacturer: /sys/class/dmi/id/sys_vendor: Boxes Inc.: as it stands
P0 status: /sys/devices/system/cpu/online: 0-1: CPUs 0-1 make up the part: one at least is online, so it is in use
P0 description: /sys/devices/system/cpu/cpu0/topology/physical_package_id: 0: the kernel's number of the package
P0 DataWidth: /proc/cpuinfo, processor 0: flags: lm: 64 with the flag lm, else 32
P0 MaxClockSpeed: /sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq: 3500000: kHz, rounded to whole MHz
P0 AddressWidth: /proc/cpuinfo, processor 0: flags: lm: 64 with the flag lm, else 32
P0 CurrentClockSpeed: /proc/cpuinfo, processor 0: cpu MHz: 2100.000: rounded to whole MHz
P0 HardwareThreads: /sys/devices/system/cpu/cpu0/topology/physical_package_id: 0: CPUs 0-1 are one processor: 2
P0 EnabledCores: /sys/devices/system/cpu/online: 0-1: cores with a CPU online: 1
P0 ProcessorCores: /sys/devices/system/cpu/cpu0/topology/thread_siblings_list: 0-1: CPUs that it puts together are one core; cores of the processor: 1
P0 Family: /proc/cpuinfo, processor 0: vendor_id: GenuineIntel; model name: Intel(R) Xeon(R) CPU; cpu family: 6; model: 85: row GenuineIntel, "Xeon" of the table of CIM families
P0 ProcessorId: /proc/cpuinfo, processor 0: cpu family: 6; model: 85; stepping: 7: the CPUID signature that they make up, its bytes from the lowest on
P0 Stepping: /proc/cpuinfo, processor 0: stepping: 7: as it stands
P0 ProcessorName: /proc/cpuinfo, processor 0: model name: Intel(R) Xeon(R) CPU: as it stands
P0 RequestedStatesSupported: (fixed): : every processor that works can be enabled
P0.C4 status: /sys/devices/system/cpu/online: 0-1: CPUs 0-1 make up the part: one at least is online, so it is in use
P0.C4 description: /sys/devices/system/cpu/cpu0/topology/core_id: 4: the kernel's number of the core
P0.L2.9 status: /sys/devices/system/cpu/online: 0-1: CPUs 0-1 make up the part: one at least is online, so it is in use
P0.L2.9 description: /sys/devices/system/cpu/cpu0/cache/index0/id: 9: level, contents and the kernel's number of the cache
P0.L2.9 CacheAssociativity: /sys/devices/system/cpu/cpu0/cache/index0/ways_of_associativity: 8: ways: 1 is 1, 2 is 3, 4 is 4, 8 is 5, 16 is 6
P0.L2.9 CacheType: /sys/devices/system/cpu/cpu0/cache/index0/type: Unified: Instruction is 1, Data 2, Unified 3
P0.L2.9 CacheLevel: /sys/devices/system/cpu/cpu0/cache/index0/level: 2: L1 is 3, L2 4, L3 5, any other 1
P0.L2.9 CacheBlockSize: /sys/devices/system/cpu/cpu0/cache/index0/coherency_line_size: 64: bytes, as it stands
P0.L2.9 CacheWritePolicy: /sys/devices/system/cpu/cpu0/cache/index0/write_policy: WriteBack: WriteBack is 1, WriteThrough 2
P0.L2.9 CacheConsumableBlocks: /sys/devices/system/cpu/cpu0/cache/index0/size: 512K: the size by coherency_line_size
P0.L2.9 CacheNumberOfBlocks: /sys/devices/system/cpu/cpu0/cache/index0/size: 512K: the size by coherency_line_size
P0.L2.9 CacheName: /sys/devices/system/cpu/cpu0/cache/index0/level: 2: L and the level, after it d for data, i for instructions
)");
}

TEST(Origin, OfTheLiveMachineIsToldForEveryValue) {
  EXPECT_EQ(unexplainedValues(loadInventory("live", Detail::WithOrigins)), std::vector<std::string>());
}

TEST(Origin, OfAnOfflineProcessorSaysWhyItIsUnknown) {
  KernelFiles files;
  files.cpus("0-1").online("0").x86Block(0);
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"}).cpu(1, {.package = 1, .core = 0, .siblings = "1"});

  const Tree tree = explained(files);

  EXPECT_EQ(originAt(tree, "P1", PropFamily),
            (Origin{"/sys/devices/system/cpu/online", "0", "no CPU of the processor is online to tell it: unknown"}));
  EXPECT_EQ(
      *tree.statusOrigin(tree.find("/P1")),
      (Origin{"/sys/devices/system/cpu/online", "0", "CPUs 1 make up the part: none is online, so it is offline"}));
  EXPECT_TRUE(unexplainedValues(tree).empty());
}

TEST(Origin, OfAnArmCoreNamesTheRowOfItsDesign) {
  KernelFiles files;
  files.cpus("0").cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  files.file("proc/cpuinfo",
             "processor\t: 0\nCPU implementer\t: 0x41\nCPU architecture: 8\nCPU variant\t: 0x0\nCPU part\t: 0xd08\n"
             "CPU revision\t: 3\n");

  const Tree tree = explained(files);

  EXPECT_EQ(originAt(tree, "P0", PropProcessorName),
            (Origin{"/proc/cpuinfo, processor 0", "CPU implementer: 0x41; CPU part: 0xd08",
                    "row 0x41, 0xd08 (Cortex-A72) of the table of Arm designs"}));
  EXPECT_TRUE(unexplainedValues(tree).empty());
}

TEST(Origin, OfAFamilyWithoutARowSaysSo) {
  KernelFiles files;
  files.cpus("0").cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  files.file("proc/cpuinfo", "processor\t: 0\nvendor_id\t: Nobody\ncpu family\t: 6\nmodel\t: 1\n");

  EXPECT_EQ(originAt(explained(files), "P0", PropFamily),
            (Origin{"/proc/cpuinfo, processor 0", "vendor_id: Nobody; model name: (not there); cpu family: 6; model: 1",
                    "no row of the table of CIM families fits: unknown"}));
}

TEST(Origin, OfWhatAnUnknownArchitectureTellsIsExplainedAsWell) {
  KernelFiles files;
  files.cpus("0").cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  files.file("proc/cpuinfo", "processor\t: 0\nsomething\t: else\n");

  EXPECT_EQ(originAt(explained(files), "P0", PropFamily).rule, "no field tells the architecture: unknown");
}

TEST(Origin, OfEachKindOfCoreIsInTheNameOfTheProcessor) {
  KernelFiles files;
  files.cpus("0-1");
  files.file("proc/cpuinfo",
             "processor\t: 0\nCPU implementer\t: 0x41\nCPU architecture: 8\nCPU part\t: 0xd03\n\n"
             "processor\t: 1\nCPU implementer\t: 0x41\nCPU architecture: 8\nCPU part\t: 0xd08\n");
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"}).cpu(1, {.package = 0, .core = 1, .siblings = "1"});

  const Origin origin = originAt(explained(files), "P0", PropProcessorName);

  EXPECT_EQ(origin.source, "/proc/cpuinfo, processor 0; /proc/cpuinfo, processor 1");
  EXPECT_EQ(origin.raw, "CPU implementer: 0x41; CPU part: 0xd03; CPU implementer: 0x41; CPU part: 0xd08");
}

TEST(Origin, OfAPackageThatOnlyCpuInfoTellsIsThere) {
  KernelFiles files;
  files.cpus("0").file("proc/cpuinfo", "processor\t: 0\ncpu family\t: 6\nphysical id\t: 3\n");

  const Tree tree = explained(files);

  EXPECT_EQ(*tree.descriptionOrigin(tree.find("/P3")),
            (Origin{"/proc/cpuinfo, processor 0", "physical id: 3", "the kernel's number of the package"}));
}

}  // namespace
}  // namespace Tarn::Inventory
