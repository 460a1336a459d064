#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "platform/inventory/sources/live/LiveSource.h"
#include "tests/platform/inventory/sources/live/XeonPackages.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using Support::SmbiosCache;
using Support::SmbiosEncoder;
using Support::SmbiosProcessor;
using testing::ElementsAre;

/// A processor with one cache, over a kernel's L2 cache of 512 KiB.
Tree withCache(KernelFiles files, const SmbiosCache& cache) {
  SmbiosEncoder tables;
  SmbiosProcessor processor = xeon("CPU1");
  processor.caches[1] = tables.add(cache);
  tables.add(processor);
  tables.end();
  return files.firmware(tables).tree();
}

TEST(FirmwareCaches, AddTheWritePolicyThatTheKernelDoesNotTell) {
  const std::optional<unsigned int> expected[] = {2, 1, 3, std::nullopt};
  for (std::uint16_t mode = 0; mode < 4; ++mode) {
    const Tree tree = withCache(packages(1), {.level = 2, .mode = mode});
    EXPECT_EQ(numberAt(tree, "P0.L2.0", PropCacheWritePolicy), expected[mode]) << mode;
  }
  KernelFiles files = packages(1);
  files.file("sys/devices/system/cpu/cpu0/cache/index0/write_policy", "WriteThrough\n");
  EXPECT_EQ(numberAt(withCache(files, {.level = 2, .mode = 1}), "P0.L2.0", PropCacheWritePolicy), 2U);
}

TEST(FirmwareCaches, OfAnotherLevelAddNothingToTheKernels) {
  const Tree tree = withCache(packages(1), {.level = 3, .mode = 1});

  EXPECT_EQ(numberAt(tree, "P0.L2.0", PropCacheWritePolicy), std::nullopt);
}

TEST(FirmwareCaches, OfAnotherSizeAreADisagreement) {
  EXPECT_TRUE(withCache(packages(1), {.level = 2, .installedKiB = 512}).disagreements().empty());

  const Tree tree = withCache(packages(1), {.level = 2, .installedKiB = 1024});

  EXPECT_EQ(numberAt(tree, "P0.L2.0", PropCacheNumberOfBlocks), 8192U) << "the kernel's";
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"P0", "L2 size", "512 KiB", originDirectory + "/cpu0/cache/index0/size",
                                       "1024 KiB", "SMBIOS type 7, handle 0x0010, offset 0x09"}));
}

TEST(FirmwareCaches, ThatTheKernelDoesNotShowBesideOthersAreADisagreement) {
  const Tree tree = withCache(packages(1), {.level = 3, .installedKiB = 1024});

  EXPECT_THAT(pathsOf(tree, NodeCacheMemory), ElementsAre("P0.L2.0"));
  EXPECT_THAT(tree.disagreements(), ElementsAre(Disagreement{"P0", "L3 size", "(none)", originDirectory + "/cpu0/cache",
                                                             "1024 KiB", "SMBIOS type 7, handle 0x0010, offset 0x09"}));
}

TEST(FirmwareCaches, ThatAreOffAndUsedAreADisagreement) {
  const Tree tree = withCache(packages(1), {.level = 2, .enabled = false});

  EXPECT_EQ(statusAt(tree, "P0.L2.0"), Status::inUse);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"P0", "L2 status", "1", originDirectory + "/cpu0/cache/index0/shared_cpu_list",
                                       "16", "SMBIOS type 7, handle 0x0010, offset 0x05"}));
}

TEST(FirmwareCaches, OfAProcessorThatIsPartlyOfflineAreNotCompared) {
  KernelFiles files = packages(2);
  files.cpu(1, {.package = 0, .core = 1, .siblings = "1"}).online("0").remove("sys/devices/system/cpu/cpu1/cache");

  EXPECT_TRUE(withCache(files, {.level = 2, .installedKiB = 1024}).disagreements().size() == 2U)
      << "the number of cores and of threads alone";
}

TEST(FirmwareCaches, AreThereWhereTheKernelShowsNone) {
  KernelFiles files = packages(1);
  files.remove("sys/devices/system/cpu/cpu0/cache");

  const Tree tree =
      withCache(files, {.level = 2, .enabled = false, .installedKiB = 1024, .type = 4, .associativity = 6});

  EXPECT_THAT(pathsOf(tree, NodeCacheMemory), ElementsAre("P0.L2d"));
  EXPECT_EQ(statusAt(tree, "P0.L2d"), Status::disabled);
  EXPECT_EQ(numberAt(tree, "P0.L2d", PropCacheNumberOfBlocks), 1048576U);
  EXPECT_EQ(numberAt(tree, "P0.L2d", PropCacheBlockSize), 1U);
  EXPECT_EQ(numberAt(tree, "P0.L2d", PropCacheAssociativity), 2U);
  EXPECT_TRUE(nodeAt(tree, "P0.L2d").cpus.empty()) << "the firmware does not tell who shares it";
}

/// A processor whose CPU is offline, beside one at work, with two caches that only the firmware tells of.
Tree withOfflineProcessor(const SmbiosCache& first, const SmbiosCache& second) {
  KernelFiles files = packages(2).online("0").remove("sys/devices/system/cpu/cpu1/cache");
  SmbiosEncoder tables;
  tables.add(xeon("CPU1"));
  SmbiosProcessor processor = xeon("CPU2");
  processor.caches = {tables.add(first), tables.add(second), 0xFFFF};
  tables.add(processor);
  tables.end();
  MemoryFileSystem root(files.firmware(tables).files());
  return readLiveInventory(root, Detail::WithOrigins);
}

TEST(FirmwareCaches, OfAProcessorThatIsOfflineAreOffline) {
  const Tree tree = withOfflineProcessor({.level = 1}, {.level = 2, .enabled = false});

  ASSERT_EQ(statusAt(tree, "P1"), Status::offline);
  EXPECT_EQ(statusAt(tree, "P1.L1"), Status::offline);
  EXPECT_EQ(*tree.statusOrigin(tree.find("/P1.L1")),
            (Origin{originDirectory + "/online", "0", "none of the processor's CPUs is online: offline, 12"}));
  EXPECT_EQ(statusAt(tree, "P1.L2"), Status::disabled) << "whether the CPUs are online or not";
  EXPECT_EQ(*tree.statusOrigin(tree.find("/P1.L2")),
            (Origin{"SMBIOS type 7, handle 0x0012, offset 0x05", "01 01", "bit 7 is 0: the cache is off, 16"}));
}

TEST(FirmwareCaches, OfAProcessorAtWorkAreOn) {
  KernelFiles files = packages(1).remove("sys/devices/system/cpu/cpu0/cache");
  SmbiosEncoder tables;
  SmbiosProcessor processor = xeon("CPU1");
  processor.caches = {tables.add(SmbiosCache{.level = 1}), tables.add(SmbiosCache{.frame = {.length = 5}}), 0xFFFF};
  tables.add(processor);
  tables.end();
  MemoryFileSystem root(files.firmware(tables).files());

  const Tree tree = readLiveInventory(root, Detail::WithOrigins);

  EXPECT_EQ(statusAt(tree, "P0.L1"), Status::inUse);
  EXPECT_EQ(tree.statusOrigin(tree.find("/P0.L1"))->rule, "bit 7 is 1: the cache is on, 1");
  EXPECT_EQ(statusAt(tree, "P0.L2"), Status::inUse);
  EXPECT_EQ(tree.statusOrigin(tree.find("/P0.L2"))->rule, "the structure ends before bit 7: taken as on, 1");
}

TEST(FirmwareCaches, ThatAreNotInstalledOrNotInTheTableAreNone) {
  KernelFiles files = packages(1);
  files.remove("sys/devices/system/cpu/cpu0/cache");
  SmbiosProcessor processor = xeon("CPU1");
  processor.caches = {0x0077, 0xFFFF, 0xFFFF};

  EXPECT_TRUE(pathsOf(withCache(files, {.level = 2, .installedKiB = 0}), NodeCacheMemory).empty());
  EXPECT_TRUE(pathsOf(files.firmware(tablesOf(processor)).tree(), NodeCacheMemory).empty());
}

TEST(FirmwareCaches, TwoOfOneNameHaveTwoPaths) {
  KernelFiles files = packages(1);
  files.remove("sys/devices/system/cpu/cpu0/cache");
  SmbiosEncoder tables;
  SmbiosProcessor processor = xeon("CPU1");
  processor.caches = {tables.add(SmbiosCache{.level = 1}), tables.add(SmbiosCache{.level = 1}), 0x0010};
  tables.add(processor);
  tables.end();

  EXPECT_THAT(pathsOf(files.firmware(tables).tree(), NodeCacheMemory), ElementsAre("P0.L1", "P0.L1#0011"));
}

}  // namespace
}  // namespace Tarn::Inventory
