#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>

#include "platform/instrumentation/live/LiveSource.h"
#include "platform/instrumentation/tree/PropertyTable.h"
#include "tests/platform/instrumentation/KernelFiles.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using Support::emptySocket;
using Support::SmbiosCache;
using Support::SmbiosEncoder;
using Support::SmbiosProcessor;
using testing::ElementsAre;

const std::string cpuDirectory = "/sys/devices/system/cpu";
constexpr std::uint64_t xeonId = 0xBFEBFBFF00050657;  // what x86Block makes up
const std::string xeonName = "Intel(R) Xeon(R) CPU";

/// Packages of one core each, with one L2 cache, as x86Block describes their CPUs.
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

SmbiosProcessor xeon(const std::string& socket) {
  return {.socket = socket, .id = xeonId, .version = xeonName, .cores = 1, .coresEnabled = 1, .threads = 1};
}

template <class... Structures>
SmbiosEncoder tablesOf(const Structures&... structures) {
  SmbiosEncoder tables;
  (tables.add(structures), ...);
  tables.end();
  return tables;
}

std::optional<unsigned int> statusAt(const Tree& tree, const std::string& path) {
  return nodeAt(tree, path).status;
}

TEST(Firmware, AlikeProcessorsGoBySocketHandleAndPackageNumber) {
  SmbiosProcessor second = xeon("A");
  second.frame.handle = 0x0050;
  SmbiosProcessor first = xeon("B");
  first.frame.handle = 0x0040;

  const Tree tree = packages(2).firmware(tablesOf(second, first)).tree();

  EXPECT_EQ(textAt(tree, "P0", PropSocket), "B");
  EXPECT_EQ(textAt(tree, "P1", PropSocket), "A");
  EXPECT_TRUE(tree.disagreements().empty());
}

TEST(Firmware, TheOrderIsSaidInTheOrigin) {
  KernelFiles files = packages(2).firmware(tablesOf(xeon("A"), xeon("B")));
  MemoryFileSystem root(files.files());

  const Tree tree = readLiveInventory(root, Detail::WithOrigins);

  EXPECT_EQ(*tree.origin(tree.find("/P1"), PropSocket),
            (Origin{"SMBIOS type 4, handle 0x0011, offset 0x04", "B",
                    "as it stands; socket found by: the same signature, name, number of cores, "
                    "number of threads; 2 are alike, so by order: ascending handle to ascending package number"}));
  EXPECT_EQ(tree.origin(tree.find("/P1"), PropExternalClockSpeed)->raw, "64 00");
}

TEST(Firmware, AnEmptySocketIsAProcessorOfItsOwn) {
  const Tree tree = packages(1).firmware(tablesOf(emptySocket("CPU 2"), xeon("CPU 1"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU2"));
  EXPECT_EQ(statusAt(tree, "S:CPU2"), Status::emptySocket);
  EXPECT_EQ(nodeAt(tree, "S:CPU2").description, "Socket CPU 2");
  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU 1");
}

TEST(Firmware, ProcessorsThatTheFirmwareTookOutAreThere) {
  SmbiosProcessor disabled = xeon("CPU2");
  disabled.status = 2;
  SmbiosProcessor failed = xeon("CPU3");
  failed.status = 3;

  const Tree tree = packages(1).firmware(tablesOf(xeon("CPU1"), disabled, failed)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU2", "S:CPU3"));
  EXPECT_EQ(statusAt(tree, "S:CPU2"), Status::disabled);
  EXPECT_EQ(statusAt(tree, "S:CPU3"), Status::failed);
  EXPECT_TRUE(tree.disagreements().empty());
}

TEST(Firmware, ADisabledProcessorThatTheKernelUsesIsADisagreement) {
  SmbiosProcessor disabled = xeon("CPU2");
  disabled.status = 2;

  const Tree tree = packages(2).firmware(tablesOf(xeon("CPU1"), disabled)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "P1"));
  EXPECT_EQ(statusAt(tree, "P1"), Status::inUse);
  EXPECT_THAT(tree.disagreements(), ElementsAre(Disagreement{"P1", "status", "1", cpuDirectory + "/online", "16",
                                                             "SMBIOS type 4, handle 0x0011, offset 0x18"}));
}

TEST(Firmware, ADisabledProcessorThatTheKernelUsesIsThereOnce) {
  SmbiosProcessor enabled = xeon("CPU1");
  enabled.id = 0x000306C3;
  SmbiosProcessor disabled = xeon("CPU2");
  disabled.status = 2;

  const Tree tree = packages(1).firmware(tablesOf(enabled, disabled)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU1"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU2");
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"S:CPU1", "status", "1", "SMBIOS type 4, handle 0x0010, offset 0x18",
                                       "(no such processor)", cpuDirectory},
                          Disagreement{"P0", "status", "1", cpuDirectory + "/online", "16",
                                       "SMBIOS type 4, handle 0x0011, offset 0x18"}));
}

TEST(Firmware, WhereNoSocketFitsADisabledOneStandsForItself) {
  SmbiosProcessor enabled = xeon("CPU1");
  enabled.id = 0x000306C3;
  SmbiosProcessor disabled = enabled;
  disabled.socket = "CPU2";
  disabled.status = 2;

  const Tree tree = packages(1).firmware(tablesOf(enabled, disabled)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU2"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), std::nullopt);
  EXPECT_EQ(tree.disagreements().size(), 1U);
}

TEST(Firmware, SocketsThatCanNotBeToldApartAndAreTooManyStayOut) {
  const Tree tree = packages(1).firmware(tablesOf(xeon("CPU1"), xeon("CPU2"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), std::nullopt);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"system", "processors", "1: P0", cpuDirectory, "2: CPU1, CPU2",
                                       "SMBIOS type 4, handle 0x0010; SMBIOS type 4, handle 0x0011"}));
}

TEST(Firmware, MorePackagesThanProcessorsLeaveADisabledOneOut) {
  SmbiosProcessor disabled = xeon("CPU2");
  disabled.status = 2;

  const Tree tree = packages(3).firmware(tablesOf(xeon("CPU1"), disabled, emptySocket("CPU3"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "P1", "P2", "S:CPU3"));
  EXPECT_EQ(tree.disagreements().size(), 1U);
}

TEST(Firmware, OnlyEmptySocketsContradictAProcessor) {
  const Tree tree = packages(1).firmware(tablesOf(emptySocket("CPU1"))).tree();

  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"system", "processors", "1: P0", cpuDirectory, "0", "SMBIOS"}));
}

TEST(Firmware, AnotherSignatureIsAnotherProcessor) {
  SmbiosProcessor other = xeon("CPU1");
  other.id = 0x000306C3;

  const Tree tree = packages(1).firmware(tablesOf(other)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), std::nullopt);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"P0", "ProcessorId", "57 06 05 00", "/proc/cpuinfo, processor 0", "C3 06 03 00",
                                       "SMBIOS type 4, handle 0x0010, offset 0x08"}));
}

TEST(Firmware, AnIdentifierOfAnotherKindContradictsNothing) {
  SmbiosProcessor board = xeon("SoC");
  board.id = 0x000306C3;
  board.characteristics = 0x2FC;
  SmbiosProcessor removed = board;
  removed.socket = "SoC2";
  removed.status = 2;

  const Tree tree = packages(1).firmware(tablesOf(board, removed)).tree();

  EXPECT_EQ(textAt(tree, "P0", PropSocket), "SoC");
  EXPECT_EQ(textAt(tree, "P0", PropProcessorId), "57 06 05 00");
  EXPECT_EQ(textAt(tree, "S:SoC2", PropProcessorId), "C3 06 03 00 00 00 00 00") << "nothing else is known of it";
  EXPECT_TRUE(tree.disagreements().empty());
}

TEST(Firmware, WhatNobodyFilledInTellsNothing) {
  SmbiosProcessor told = xeon("CPU2");
  told.status = 2;
  told.manufacturer = "GenuineIntel";
  SmbiosProcessor blank = told;
  blank.socket = "CPU3";
  blank.id = 0xBFEBFBFF00000000;
  blank.characteristics = 0;

  const Tree tree = packages(1).firmware(tablesOf(xeon("CPU1"), told, blank)).tree();

  EXPECT_EQ(textAt(tree, "S:CPU2", PropStepping), "7");
  EXPECT_EQ(numberAt(tree, "S:CPU2", PropDataWidth), 64U);
  EXPECT_EQ(numberAt(tree, "S:CPU2", PropAddressWidth), 64U);
  EXPECT_EQ(textAt(tree, "S:CPU3", PropStepping), std::nullopt) << "the feature bits alone are there";
  EXPECT_EQ(numberAt(tree, "S:CPU3", PropDataWidth), std::nullopt);
  EXPECT_EQ(numberAt(tree, "S:CPU3", PropAddressWidth), std::nullopt);
}

TEST(Firmware, ControlCharactersOfItsTextsAreBlanks) {
  SmbiosProcessor empty = emptySocket("\001CPU\0372\177");
  SmbiosProcessor processor = xeon("CPU1");
  processor.serialNumber = "\x1B[1mSN\t1\n";
  processor.assetTag = "\x02";
  processor.partNumber = "To Be Filled By O.E.M.\x03";
  KernelFiles files = packages(1).firmware(tablesOf(processor, empty));
  MemoryFileSystem root(files.files());

  const Tree tree = readLiveInventory(root, Detail::WithOrigins);

  EXPECT_EQ(nodeAt(tree, "S:CPU2").description, "Socket CPU 2");
  EXPECT_EQ(textAt(tree, "P0", PropSerialNumber), "[1mSN 1");
  EXPECT_EQ(tree.origin(tree.find("/P0"), PropSerialNumber)->raw, "\x1B[1mSN\t1\n");
  EXPECT_EQ(textAt(tree, "P0", PropAssetTag), std::nullopt);
  EXPECT_EQ(textAt(tree, "P0", PropPartNumber), std::nullopt);
}

TEST(Firmware, AProcessorThatTheKernelDoesNotSeeIsThereWhereItsIdentityTells) {
  SmbiosProcessor other = xeon("CPU1");
  other.id = 0x000306C3;

  const Tree tree = packages(1).firmware(tablesOf(other, xeon("CPU2"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU1"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU2");
  EXPECT_EQ(statusAt(tree, "S:CPU1"), Status::inUse);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"S:CPU1", "status", "1", "SMBIOS type 4, handle 0x0010, offset 0x18",
                                       "(no such processor)", cpuDirectory}));
}

TEST(Firmware, CoprocessorsAreNoProcessors) {
  SmbiosProcessor math = xeon("FPU");
  math.type = 4;

  const Tree tree = packages(1).firmware(tablesOf(math, xeon("CPU1"))).tree();

  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU1");
  EXPECT_TRUE(tree.disagreements().empty());
}

TEST(Firmware, TablesWithoutSocketsSayNothing) {
  const Tree tree = packages(1).tree();

  EXPECT_TRUE(tree.disagreements().empty());
  EXPECT_TRUE(tree.unread().empty());
}

struct Path {
  std::string label;
  std::string expected;
};

class SocketPath : public testing::TestWithParam<Path> {};

TEST_P(SocketPath, IsTheLabelOrTheHandle) {
  SmbiosProcessor empty = emptySocket(GetParam().label);
  empty.frame.handle = 0x00AB;

  const Tree tree = packages(1).firmware(tablesOf(xeon("CPU1"), empty)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", GetParam().expected));
}

INSTANTIATE_TEST_SUITE_P(All, SocketPath,
                         testing::Values(Path{"CPU 2", "S:CPU2"}, Path{" P1-A_2 ", "S:P1-A_2"}, Path{"CPU1", "S#00AB"},
                                         Path{"CPU 1", "S#00AB"}, Path{"", "S#00AB"}, Path{"Socket 12", "S:Socket12"},
                                         Path{"A Socket 12", "S#00AB"}, Path{"CPU/2", "S#00AB"}, Path{"\xFF", "S#00AB"},
                                         Path{"Default string", "S#00AB"}));

TEST(Firmware, SocketsWithOneHandleAreTwo) {
  SmbiosProcessor empty = emptySocket("");
  empty.frame.handle = 0x00AB;

  const Tree tree = packages(1).firmware(tablesOf(xeon("CPU1"), empty, empty)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S#00AB.1", "S#00AB.2"));
  EXPECT_EQ(tree.unread().size(), 1U) << "the table is broken";
}

/// A processor with one cache, over a kernel's L2 cache of 512 KiB.
Tree withCache(KernelFiles files, const SmbiosCache& cache) {
  SmbiosEncoder tables;
  SmbiosProcessor processor = xeon("CPU1");
  processor.caches[1] = tables.add(cache);
  tables.add(processor);
  tables.end();
  return files.firmware(tables).tree();
}

TEST(Firmware, TellsTheWritePolicyThatTheKernelDoesNot) {
  const std::optional<unsigned int> expected[] = {2, 1, 3, std::nullopt};
  for (std::uint16_t mode = 0; mode < 4; ++mode) {
    const Tree tree = withCache(packages(1), {.level = 2, .mode = mode});
    EXPECT_EQ(numberAt(tree, "P0.L2.0", PropCacheWritePolicy), expected[mode]) << mode;
  }
  KernelFiles files = packages(1);
  files.file("sys/devices/system/cpu/cpu0/cache/index0/write_policy", "WriteThrough\n");
  EXPECT_EQ(numberAt(withCache(files, {.level = 2, .mode = 1}), "P0.L2.0", PropCacheWritePolicy), 2U);
}

TEST(Firmware, OfAnotherLevelTellsNothingOfACache) {
  const Tree tree = withCache(packages(1), {.level = 3, .mode = 1});

  EXPECT_EQ(numberAt(tree, "P0.L2.0", PropCacheWritePolicy), std::nullopt);
}

TEST(Firmware, CachesOfAnotherSizeAreADisagreement) {
  EXPECT_TRUE(withCache(packages(1), {.level = 2, .installedKiB = 512}).disagreements().empty());

  const Tree tree = withCache(packages(1), {.level = 2, .installedKiB = 1024});

  EXPECT_EQ(numberAt(tree, "P0.L2.0", PropCacheNumberOfBlocks), 8192U) << "the kernel's";
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"P0", "L2 size", "512 KiB", cpuDirectory + "/cpu0/cache/index0/size", "1024 KiB",
                                       "SMBIOS type 7, handle 0x0010, offset 0x09"}));
}

TEST(Firmware, ACacheThatTheKernelDoesNotShowBesideOthersIsADisagreement) {
  const Tree tree = withCache(packages(1), {.level = 3, .installedKiB = 1024});

  EXPECT_THAT(pathsOf(tree, NodeCacheMemory), ElementsAre("P0.L2.0"));
  EXPECT_THAT(tree.disagreements(), ElementsAre(Disagreement{"P0", "L3 size", "(none)", cpuDirectory + "/cpu0/cache",
                                                             "1024 KiB", "SMBIOS type 7, handle 0x0010, offset 0x09"}));
}

TEST(Firmware, ACacheThatIsOffAndUsedIsADisagreement) {
  const Tree tree = withCache(packages(1), {.level = 2, .enabled = false});

  EXPECT_EQ(statusAt(tree, "P0.L2.0"), Status::inUse);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"P0", "L2 status", "1", cpuDirectory + "/cpu0/cache/index0/shared_cpu_list",
                                       "16", "SMBIOS type 7, handle 0x0010, offset 0x05"}));
}

TEST(Firmware, CachesOfAProcessorThatIsPartlyOfflineAreNotCompared) {
  KernelFiles files = packages(2);
  files.cpu(1, {.package = 0, .core = 1, .siblings = "1"}).online("0").remove("sys/devices/system/cpu/cpu1/cache");

  EXPECT_TRUE(withCache(files, {.level = 2, .installedKiB = 1024}).disagreements().size() == 2U)
      << "the number of cores and of threads alone";
}

TEST(Firmware, TellsOfTheCachesWhereTheKernelShowsNone) {
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

TEST(Firmware, CachesOfAProcessorThatIsOfflineAreOffline) {
  const Tree tree = withOfflineProcessor({.level = 1}, {.level = 2, .enabled = false});

  ASSERT_EQ(statusAt(tree, "P1"), Status::offline);
  EXPECT_EQ(statusAt(tree, "P1.L1"), Status::offline);
  EXPECT_EQ(*tree.statusOrigin(tree.find("/P1.L1")),
            (Origin{cpuDirectory + "/online", "0", "none of the processor's CPUs is online: offline, 12"}));
  EXPECT_EQ(statusAt(tree, "P1.L2"), Status::disabled) << "whether the CPUs are online or not";
  EXPECT_EQ(*tree.statusOrigin(tree.find("/P1.L2")),
            (Origin{"SMBIOS type 7, handle 0x0012, offset 0x05", "01 01", "bit 7 is 0: the cache is off, 16"}));
}

TEST(Firmware, CachesOfAProcessorAtWorkAreOn) {
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

TEST(Firmware, CachesThatAreNotInstalledOrNotInTheTableAreNone) {
  KernelFiles files = packages(1);
  files.remove("sys/devices/system/cpu/cpu0/cache");
  SmbiosProcessor processor = xeon("CPU1");
  processor.caches = {0x0077, 0xFFFF, 0xFFFF};

  EXPECT_TRUE(pathsOf(withCache(files, {.level = 2, .installedKiB = 0}), NodeCacheMemory).empty());
  EXPECT_TRUE(pathsOf(files.firmware(tablesOf(processor)).tree(), NodeCacheMemory).empty());
}

TEST(Firmware, TwoCachesOfOneNameAreTold) {
  KernelFiles files = packages(1);
  files.remove("sys/devices/system/cpu/cpu0/cache");
  SmbiosEncoder tables;
  SmbiosProcessor processor = xeon("CPU1");
  processor.caches = {tables.add(SmbiosCache{.level = 1}), tables.add(SmbiosCache{.level = 1}), 0x0010};
  tables.add(processor);
  tables.end();

  EXPECT_THAT(pathsOf(files.firmware(tables).tree(), NodeCacheMemory), ElementsAre("P0.L1", "P0.L1#0011"));
}

TEST(Firmware, ThatMayNotBeReadIsToldWithoutAlarm) {
  const Tree tree = packages(1).fail("sys/firmware/dmi/tables/smbios_entry_point", EACCES).tree();

  EXPECT_THAT(tree.unread(),
              ElementsAre(Unread{"/sys/firmware/dmi/tables/smbios_entry_point", "permission denied",
                                 "run as root to see the sockets, their state and their clocks as well"}));
}

TEST(Firmware, ThatIsNotThereIsTold) {
  const Tree tree = packages(1).remove("sys/firmware/dmi/tables/DMI").tree();

  EXPECT_THAT(tree.unread(), ElementsAre(Unread{"/sys/firmware/dmi/tables/DMI", "no such file or directory",
                                                "it is there on machines whose firmware has SMBIOS tables; they tell "
                                                "of sockets, their state and their clocks"}));
}

TEST(Firmware, ThatIsBrokenIsToldAndTheRestCounts) {
  SmbiosEncoder tables = tablesOf(xeon("CPU1"), emptySocket("CPU2"));
  KernelFiles files = packages(1).firmware(tables);
  files.file("sys/firmware/dmi/tables/DMI", tables.table().substr(0, tables.lastOffset() + 2));

  const Tree tree = files.tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU2"));
  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_EQ(tree.unread()[0].file, "/sys/firmware/dmi/tables/DMI");
  EXPECT_THAT(tree.unread()[0].reason, testing::StartsWith("SMBIOS table, offset "));
  EXPECT_EQ(tree.unread()[0].remedy, "what is sound in the table counts; newer firmware may mend it");
}

TEST(Firmware, ThatIsNoTableIsToldAndTheKernelCounts) {
  const Tree tree = packages(1).file("sys/firmware/dmi/tables/smbios_entry_point", "garbage").tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0"));
  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_THAT(tree.unread()[0].reason, testing::StartsWith("SMBIOS entry point"));
}

TEST(Firmware, AloneIsAMachineWithoutCores) {
  KernelFiles files = KernelFiles().firmware(tablesOf(xeon("CPU1")));

  const Tree tree = files.tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("S:CPU1"));
  EXPECT_EQ(numberAt(tree, "S:CPU1", PropProcessorCores), 1U);
  EXPECT_TRUE(pathsOf(tree, NodeProcessorCore).empty()) << "none is made up from a count";
  EXPECT_FALSE(tree.unread().empty()) << "the kernel's files are missed";
}

}  // namespace
}  // namespace Tarn::Inventory
