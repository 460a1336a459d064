#include <gtest/gtest.h>

#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/platform/inventory/KernelFiles.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;

// Two packages of 128 cores with two threads: CPU n and n + 256 are one core; eight cores share an L3.
constexpr unsigned int packages = 2;
constexpr unsigned int coresPerPackage = 128;
constexpr unsigned int cores = packages * coresPerPackage;
constexpr unsigned int coresPerL3 = 8;

CpuSet cpusOf(unsigned int firstCore, unsigned int count) {
  CpuSet cpus;
  for (unsigned int core = firstCore; core < firstCore + count; ++core) {
    cpus.add(CpuSet{core, core + cores});
  }
  return cpus;
}

struct CacheKind {
  const char* name;
  const char* label;
  const char* type;
  unsigned int level;
  unsigned int contents;  // the inventory's code
  unsigned int kibibytes;
  unsigned int sharedBy;
};
constexpr CacheKind cacheKinds[] = {
    {"L1d", "L1 data cache ", "Data", 1, 2, 32, 1},
    {"L1i", "L1 instruction cache ", "Instruction", 1, 1, 32, 1},
    {"L2", "L2 cache ", "Unified", 2, 3, 1024, 1},
    {"L3", "L3 cache ", "Unified", 3, 3, 32768, coresPerL3},
};

KernelFiles largeMachine() {
  KernelFiles files;
  files.cpus("0-511").file("sys/class/dmi/id/product_name", "Rack Server 9000\n");
  for (unsigned int cpu = 0; cpu < 2 * cores; ++cpu) {
    const unsigned int core = cpu % cores;
    files.x86Block(cpu).maxFrequency(cpu, "3500000");
    files.cpu(cpu, {.package = static_cast<int>(core / coresPerPackage),
                    .core = static_cast<int>(core % coresPerPackage),
                    .die = 0,
                    .cluster = static_cast<int>(core),
                    .siblings = cpusOf(core, 1).toList(),
                    .packageSiblings = ""});
    unsigned int index = 0;
    for (const CacheKind& kind : cacheKinds) {
      const unsigned int number = core / kind.sharedBy;
      files.cache(cpu, index++,
                  {.level = kind.level,
                   .type = kind.type,
                   .cpus = cpusOf(number * kind.sharedBy, kind.sharedBy).toList(),
                   .id = std::to_string(number),
                   .size = std::to_string(kind.kibibytes) + "K",
                   .lineSize = "64",
                   .sets = std::to_string(kind.kibibytes * 1024 / 64 / 8),
                   .ways = "8",
                   .writePolicy = ""});
    }
  }
  return files;
}

Tree expectedTree() {
  TreeBuilder tree;
  tree.system().description("Rack Server 9000").text(PropSystemModel, "Rack Server 9000");
  for (unsigned int package = 0; package < packages; ++package) {
    const unsigned int firstCore = package * coresPerPackage;
    const std::string path = "P" + std::to_string(package);
    tree.processor(path)
        .description("Processor " + std::to_string(package))
        .cpus(cpusOf(firstCore, coresPerPackage))
        .number(PropFamily, 179)
        .number(PropDataWidth, 64)
        .number(PropAddressWidth, 64)
        .number(PropMaxClockSpeed, 3500)
        .number(PropCurrentClockSpeed, 2100)
        .number(PropProcessorCores, 128)
        .number(PropEnabledCores, 128)
        .number(PropHardwareThreads, 256)
        .text(PropProcessorName, "Intel(R) Xeon(R) CPU")
        .text(PropStepping, "7")
        .text(PropProcessorId, "57 06 05 00")
        .list(PropRequestedStatesSupported, {1});
    for (unsigned int core = 0; core < coresPerPackage; ++core) {
      const std::string number = std::to_string(core);
      tree.core(path + ".C" + number).description("Core " + number).cpus(cpusOf(firstCore + core, 1));
    }
    for (const CacheKind& kind : cacheKinds) {
      for (unsigned int core = firstCore; core < firstCore + coresPerPackage; core += kind.sharedBy) {
        const std::string number = std::to_string(core / kind.sharedBy);
        tree.cache(path + "." + kind.name + "." + number)
            .description(kind.label + number)
            .cpus(cpusOf(core, kind.sharedBy))
            .number(PropCacheLevel, kind.level + 2)
            .text(PropCacheName, kind.name)
            .number(PropCacheType, kind.contents)
            .number(PropCacheAssociativity, 5)
            .number(PropCacheBlockSize, 64)
            .number(PropCacheNumberOfBlocks, kind.kibibytes * 16)
            .number(PropCacheConsumableBlocks, kind.kibibytes * 16);
      }
    }
  }
  return tree.build();
}

TEST(LargeMachine, Of256CoresGivesItsWholeTree) {
  const Tree tree = largeMachine().tree();

  EXPECT_EQ(tree.ofType(NodeProcessorCore).size(), 256U);
  EXPECT_EQ(tree.ofType(NodeCacheMemory).size(), 800U);
  EXPECT_EQ(tree, expectedTree());
}

TEST(LargeMachine, PathsAreShort) {
  const Tree tree = largeMachine().tree();
  for (const Node& node : tree.nodes()) {
    ASSERT_LE(node.path().size(), 15U) << node.path();
  }
}

}  // namespace
}  // namespace Tarn::Inventory
