#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/KernelFiles.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using testing::Contains;
using testing::Not;
using Paths = std::vector<std::string>;

// One package of cores with one thread each.
KernelFiles cores(unsigned int count) {
  KernelFiles files;
  files.cpus("0-" + std::to_string(count - 1));
  for (unsigned int cpu = 0; cpu < count; ++cpu) {
    files.cpu(cpu, {.package = 0, .core = static_cast<int>(cpu), .siblings = std::to_string(cpu)});
  }
  return files;
}

/// The tree of one cache.
Tree oneCache(const KernelFiles::Cache& cache) {
  return cores(1).cache(0, 0, cache).tree();
}

std::optional<unsigned int> numberOf(const KernelFiles::Cache& cache, Properties id) {
  const Tree tree = oneCache(cache);
  return numberAt(tree, pathsOf(tree, NodeCacheMemory).at(0), id);
}

TEST(Cache, IsThereOnceForAllThatShareIt) {
  KernelFiles files = cores(4);
  for (unsigned int cpu = 0; cpu < 4; ++cpu) {
    files.cache(cpu, 0, {.level = 1, .type = "Data", .cpus = std::to_string(cpu), .id = std::to_string(cpu)});
    files.cache(cpu, 1, {.level = 2, .cpus = cpu < 2 ? "0-1" : "2-3", .id = cpu < 2 ? "0" : "1"});
    files.cache(cpu, 2, {.level = 3, .cpus = "0-3", .id = "0"});
  }

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory),
            (Paths{"P0.L1d.0", "P0.L1d.1", "P0.L1d.2", "P0.L1d.3", "P0.L2.0", "P0.L2.1", "P0.L3.0"}));
  EXPECT_EQ(nodeAt(tree, "P0.L2.1").cpus, (CpuSet{2, 3}));
  EXPECT_EQ(nodeAt(tree, "P0.L3.0").cpus, (CpuSet{0, 1, 2, 3}));
}

TEST(Cache, LevelIsTheCimCode) {
  const unsigned int codes[][2] = {{1, 3}, {2, 4}, {3, 5}, {4, 1}, {0, 1}, {9, 1}};
  for (const auto& [level, code] : codes) {
    EXPECT_EQ(numberOf({.level = level, .cpus = "0"}, PropCacheLevel), code) << level;
  }
}

TEST(Cache, NameAndDescriptionTellLevelAndContents) {
  struct Row {
    const char *type, *path, *name, *description;
    std::optional<unsigned int> code;
  };
  const Row rows[] = {
      {"Data", "P0.L1d.3", "L1d", "L1 data cache 3", 2},
      {"Instruction", "P0.L1i.3", "L1i", "L1 instruction cache 3", 1},
      {"Unified", "P0.L1.3", "L1", "L1 cache 3", 3},
      {"Strange", "P0.L1x.3", "L1x", "L1 cache 3", std::nullopt},
  };
  for (const Row& row : rows) {
    const Tree tree = oneCache({.level = 1, .type = row.type, .cpus = "0", .id = "3"});
    EXPECT_EQ(pathsOf(tree, NodeCacheMemory), Paths{row.path});
    EXPECT_EQ(textAt(tree, row.path, PropCacheName), row.name);
    EXPECT_EQ(nodeAt(tree, row.path).description, row.description);
    EXPECT_EQ(numberAt(tree, row.path, PropCacheType), row.code);
  }
}

TEST(Cache, AssociativityIsTheCodeOfTheWays) {
  struct Row {
    const char *ways, *sets;
    std::optional<unsigned int> code;
  };
  const Row rows[] = {
      {"1", "64", 1},
      {"2", "64", 3},
      {"4", "64", 4},
      {"8", "64", 5},
      {"16", "64", 6},
      {"12", "64", std::nullopt},
      {"3", "64", std::nullopt},
      {"0", "64", std::nullopt},
      {"0", "1", 2},
      {"512", "1", 2},
      {"16", "1", 2},
      {"1", "1", 1},
      {"", "1", 2},
      {"", "64", std::nullopt},
      {"", "", std::nullopt},
      {"8", "", 5},
  };
  for (const Row& row : rows) {
    EXPECT_EQ(numberOf({.cpus = "0", .sets = row.sets, .ways = row.ways}, PropCacheAssociativity), row.code)
        << row.ways << " ways, " << row.sets << " sets";
  }
}

TEST(Cache, WritePolicyIsToldOnlyWhereTheKernelDoes) {
  EXPECT_EQ(numberOf({.cpus = "0", .writePolicy = "WriteBack"}, PropCacheWritePolicy), 1U);
  EXPECT_EQ(numberOf({.cpus = "0", .writePolicy = "WriteThrough"}, PropCacheWritePolicy), 2U);
  EXPECT_EQ(numberOf({.cpus = "0", .writePolicy = "Odd"}, PropCacheWritePolicy), std::nullopt);
  EXPECT_EQ(numberOf({.cpus = "0"}, PropCacheWritePolicy), std::nullopt);
}

TEST(Cache, BlocksAreSizeByLine) {
  struct Row {
    const char *size, *line;
    std::optional<unsigned int> lineSize, blocks;
  };
  const Row rows[] = {
      {"48K", "64", 64, 768},
      {"266240K", "64", 64, 4259840},
      {"2M", "128", 128, 16384},
      {"1G", "64", 64, 16777216},
      {"32768", "64", 64, 512},
      {"48K", "", 1, 49152},
      {"48K", "0", 1, 49152},
      {"4194303K", "", 1, 4294966272},
      {"4194304K", "", 1024, 4194304},
      {"4294967295K", "", 1024, 4294967295},
      {"268435455K", "64", 64, 4294967280},
      {"268435456K", "64", 64, std::nullopt},
      {"", "64", 64, std::nullopt},
      {"", "", std::nullopt, std::nullopt},
      {"0K", "64", 64, std::nullopt},
      {"lots", "64", 64, std::nullopt},
      {"9999999G", "64", 64, std::nullopt},
      {"4294967296K", "", std::nullopt, std::nullopt},
  };
  for (const Row& row : rows) {
    const KernelFiles::Cache cache{.cpus = "0", .size = row.size, .lineSize = row.line};
    EXPECT_EQ(numberOf(cache, PropCacheBlockSize), row.lineSize) << row.size << '/' << row.line;
    EXPECT_EQ(numberOf(cache, PropCacheNumberOfBlocks), row.blocks) << row.size << '/' << row.line;
    EXPECT_EQ(numberOf(cache, PropCacheConsumableBlocks), row.blocks) << row.size << '/' << row.line;
  }
}

TEST(Cache, SizesThatAreNotPlausibleAreReported) {
  const Unread implausible{"/sys/devices/system/cpu/cpu0/cache/index0/size", "it holds no plausible size of a cache",
                           "report it to the maker of the firmware"};
  for (const char* size : {"lots", "4294967296K", "4194304M", "268435456K"}) {
    const Tree tree = oneCache({.cpus = "0", .size = size});
    EXPECT_THAT(tree.unread(), Contains(implausible)) << size;
  }
  for (const char* size : {"", "0K", "268435455K"}) {
    const Tree tree = oneCache({.cpus = "0", .size = size});
    EXPECT_THAT(tree.unread(), Not(Contains(implausible))) << size;
  }
}

TEST(Cache, WithoutANumberIsNamedByItsLowestCpu) {
  KernelFiles files = cores(4);
  for (unsigned int cpu = 0; cpu < 4; ++cpu) {
    files.cache(cpu, 0, {.level = 2, .cpus = cpu < 2 ? "0-1" : "2-3"});
  }

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory), (Paths{"P0.L2@0", "P0.L2@2"}));
  EXPECT_EQ(nodeAt(tree, "P0.L2@2").description, "L2 cache at CPU 2");
}

TEST(Cache, WithANumberThatIsNotUniqueIsNamedByItsLowestCpu) {
  KernelFiles files = cores(3);
  files.cache(0, 0, {.level = 2, .cpus = "0", .id = "0"});
  files.cache(1, 0, {.level = 2, .cpus = "1", .id = "0"});
  files.cache(2, 0, {.level = 2, .cpus = "2", .id = "1"});

  EXPECT_EQ(pathsOf(files.tree(), NodeCacheMemory), (Paths{"P0.L2@0", "P0.L2@1", "P0.L2.1"}));
}

TEST(Cache, WithALongNumberIsNamedByItsLowestCpu) {
  for (const char* id : {"123456789", "4311810304", "18446744073709551615"}) {
    EXPECT_EQ(pathsOf(oneCache({.level = 2, .cpus = "0", .id = id}), NodeCacheMemory), Paths{"P0.L2@0"}) << id;
  }
}

TEST(Cache, StandsBelowTheProcessorOfItsLowestCpu) {
  KernelFiles files;
  files.cpus("0-1");
  files.cpu(0, {.package = 1, .core = 0, .siblings = "0"}).cpu(1, {.package = 0, .core = 0, .siblings = "1"});
  files.cache(0, 0, {.level = 3, .cpus = "0-1", .id = "0"}).cache(1, 0, {.level = 3, .cpus = "0-1", .id = "0"});

  EXPECT_EQ(pathsOf(files.tree(), NodeCacheMemory), Paths{"P1.L3.0"});
}

TEST(Cache, BelongsToTheLowestOfItsCpusThatHasAProcessor) {
  KernelFiles files = cores(3);
  files.cpus("0-3").online("0-2").cache(0, 0, {.level = 3, .cpus = "0-3", .id = "0"});
  files.remove(cpuDirectory + "cpu0/topology").online("1-2");

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory), Paths{"P0.L3.0"});
  EXPECT_EQ(nodeAt(tree, "P0.L3.0").cpus, (CpuSet{0, 1, 2, 3}));
}

TEST(Cache, OfCpusWithoutAProcessorIsReported) {
  KernelFiles files = cores(2);
  files.remove(cpuDirectory + "cpu1/topology").cache(1, 0, {.level = 2, .cpus = "1"});
  files.cache(0, 0, {.level = 2, .cpus = "0"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory), Paths{"P0.L2@0"});
  EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/devices/system/cpu/cpu1/cache/index0",
                                             "no CPU that shares the cache has a known processor",
                                             "set these CPUs online, or mount sysfs on /sys"}));
}

TEST(Cache, SharingIsReadFromTheMaskWithoutAList) {
  KernelFiles files = cores(4);
  for (unsigned int cpu = 0; cpu < 4; ++cpu) {
    files.cache(cpu, 0, {.level = 2, .cpus = "x"})
        .remove(cpuDirectory + "cpu" + std::to_string(cpu) + "/cache/index0/shared_cpu_list");
    files.file(cpuDirectory + "cpu" + std::to_string(cpu) + "/cache/index0/shared_cpu_map",
               cpu < 2 ? "00000000,00000003\n" : "00000000,0000000c\n");
  }

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory), (Paths{"P0.L2@0", "P0.L2@2"}));
  EXPECT_EQ(nodeAt(tree, "P0.L2@2").cpus, (CpuSet{2, 3}));
}

TEST(Cache, TheSameCacheAtAnotherPlaceForAnotherKindOfCore) {
  // The small core has no L2: what is its third cache is the fourth of the big one.
  KernelFiles files = cores(2);
  files.cache(0, 0, {.level = 1, .type = "Data", .cpus = "0"}).cache(0, 1, {.level = 3, .cpus = "0-1"});
  files.cache(1, 0, {.level = 1, .type = "Data", .cpus = "1"}).cache(1, 1, {.level = 2, .cpus = "1"});
  files.cache(1, 2, {.level = 3, .cpus = "0-1"});

  EXPECT_EQ(pathsOf(files.tree(), NodeCacheMemory), (Paths{"P0.L1d@0", "P0.L1d@1", "P0.L2@1", "P0.L3@0"}));
}

TEST(Cache, SharingThatContradictsItselfCountsNoCpuTwice) {
  KernelFiles files = cores(4);
  files.cache(0, 0, {.level = 2, .cpus = "0-2"});
  files.cache(1, 0, {.level = 2, .cpus = "1"});
  files.cache(2, 0, {.level = 2, .cpus = "2-3"});
  files.cache(3, 0, {.level = 2, .cpus = "0-2"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory), (Paths{"P0.L2@0", "P0.L2@3"}));
  EXPECT_EQ(nodeAt(tree, "P0.L2@0").cpus, (CpuSet{0, 1, 2}));
  EXPECT_EQ(nodeAt(tree, "P0.L2@3").cpus, CpuSet{3});
}

TEST(Cache, CpusThatAreNotPresentDoNotCount) {
  KernelFiles files;
  files.cpus("2-3").cpu(2, {.core = 1, .siblings = "2"}).cpu(3, {.core = 2, .siblings = "3"});
  files.cache(2, 0, {.level = 3, .cpus = "0-3"}).cache(3, 0, {.level = 3, .cpus = "0-3"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory), Paths{"P0.L3@2"});
  EXPECT_EQ(nodeAt(tree, "P0.L3@2").cpus, (CpuSet{2, 3}));
}

TEST(Cache, SharingThatIsNonsenseLeavesTheCacheToItsCpu) {
  const Tree tree = oneCache({.level = 2, .cpus = "what?"});
  EXPECT_EQ(nodeAt(tree, "P0.L2@0").cpus, CpuSet{0});
}

TEST(Cache, WithoutLevelIsLeftOutAndTold) {
  KernelFiles files = cores(1);
  files.cache(0, 0, {.level = 1, .type = "Data", .cpus = "0"}).cache(0, 1, {.level = 2, .cpus = "0"});
  files.remove(cpuDirectory + "cpu0/cache/index0/level");

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeCacheMemory), Paths{"P0.L2@0"});
  EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/devices/system/cpu/cpu0/cache/index0/level",
                                             "no such file or directory", "without it the cache is unknown"}));
}

TEST(Cache, NoneAtAllIsTold) {
  const Tree tree = cores(3).tree();

  EXPECT_TRUE(tree.ofType(NodeCacheMemory).empty());
  EXPECT_THAT(tree.unread(),
              Contains(Unread{"/sys/devices/system/cpu/cpu{0-2}/cache", "no such file or directory",
                              "mount sysfs on /sys; some kernels and virtual machines report no caches"}));
}

}  // namespace
}  // namespace Tarn::Inventory
