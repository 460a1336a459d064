#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/KernelFiles.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using testing::Contains;
using Paths = std::vector<std::string>;

// Two packages of two cores with two threads; CPUs 0-3 are the first package.
KernelFiles twoPackages() {
  KernelFiles files;
  files.cpus("0-7");
  for (unsigned int cpu = 0; cpu < 8; ++cpu) {
    const unsigned int first = cpu / 2 * 2;
    const std::string siblings = std::to_string(first) + "-" + std::to_string(first + 1);
    files.cpu(cpu, {.package = static_cast<int>(cpu / 4), .core = static_cast<int>(cpu % 4 / 2), .siblings = siblings});
    files.cache(cpu, 0, {.level = 2, .cpus = siblings, .id = std::to_string(cpu / 2)});
    files.x86Block(cpu);
  }
  return files;
}

TEST(Offline, AllIsInUseWhereAllIsOnline) {
  const Tree tree = twoPackages().tree();
  for (const Node& node : tree.nodes()) {
    EXPECT_EQ(node.status, Status::inUse) << node.path();
  }
}

TEST(Offline, ACoreWithAllCpusOfflineIsOffline) {
  const Tree tree = twoPackages().online("0-1,4-7").tree();

  EXPECT_EQ(nodeAt(tree, "P0.C0").status, 1U);
  EXPECT_EQ(nodeAt(tree, "P0.C1").status, 12U);
  EXPECT_EQ(nodeAt(tree, "P0").status, 1U);
  EXPECT_EQ(nodeAt(tree, "P0.L2.1").status, 12U) << "a cache that no online CPU uses";
  EXPECT_EQ(numberAt(tree, "P0", PropProcessorCores), 2U);
  EXPECT_EQ(numberAt(tree, "P0", PropEnabledCores), 1U);
  EXPECT_EQ(numberAt(tree, "P0", PropHardwareThreads), 4U);
}

TEST(Offline, ACoreWithOneCpuOnlineIsInUse) {
  const Tree tree = twoPackages().online("0-2,4-7").tree();

  EXPECT_EQ(nodeAt(tree, "P0.C1").status, 1U);
  EXPECT_EQ(numberAt(tree, "P0", PropEnabledCores), 2U);
}

TEST(Offline, AProcessorWithAllCpusOfflineIsOffline) {
  const Tree tree = twoPackages().online("0-3").tree();

  EXPECT_EQ(nodeAt(tree, "P0").status, 1U);
  EXPECT_EQ(nodeAt(tree, "P1").status, 12U);
  EXPECT_EQ(nodeAt(tree, "P1.C0").status, 12U);
  EXPECT_EQ(numberAt(tree, "P1", PropEnabledCores), 0U);
  EXPECT_EQ(numberAt(tree, "P1", PropProcessorCores), 2U);
  EXPECT_EQ(textAt(tree, "P1", PropProcessorName), std::nullopt) << "nothing tells what it is";
  EXPECT_EQ(numberAt(tree, "P1", PropFamily), 2U);
}

TEST(Offline, HiddenCpusCountForThePackageOfTheirMemoryNode) {
  KernelFiles files = twoPackages();
  files.online("0-6").remove(cpuDirectory + "cpu7/").cpu(6, {.package = 1, .core = 1, .siblings = "6"});
  files.file(cpuDirectory + "cpu7/node1/cpulist", "4-6\n");

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P1").cpus, (CpuSet{4, 5, 6, 7}));
  EXPECT_EQ(numberAt(tree, "P1", PropHardwareThreads), 4U);
  EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/devices/system/cpu/cpu7/topology",
                                             "the CPU is offline and the kernel hides its place",
                                             "write 1 to the file online in its directory, as root"}));
}

TEST(Offline, HiddenCpusOfACoreNeverMakeACore) {
  KernelFiles files = twoPackages();
  files.online("0-5").remove(cpuDirectory + "cpu6/").remove(cpuDirectory + "cpu7/");

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C0", "P0.C1", "P1.C0"}));
  EXPECT_EQ(nodeAt(tree, "P1").cpus, (CpuSet{4, 5})) << "no memory node tells their package";
  EXPECT_EQ(tree.unread()[0].file, "/sys/devices/system/cpu/cpu{6-7}/topology");
}

TEST(Offline, AMemoryNodeOfTwoPackagesTellsNothing) {
  KernelFiles files = twoPackages();
  files.online("0-6").remove(cpuDirectory + "cpu7/").cpu(6, {.package = 1, .core = 1, .siblings = "6"});
  files.file(cpuDirectory + "cpu7/node0/cpulist", "0-6\n");

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P0").cpus, (CpuSet{0, 1, 2, 3}));
  EXPECT_EQ(nodeAt(tree, "P1").cpus, (CpuSet{4, 5, 6}));
}

// The same with numbers that the kernel does not know, and siblings that name all CPUs of their package.
KernelFiles unnumbered() {
  KernelFiles files = twoPackages();
  for (unsigned int cpu = 0; cpu < 8; ++cpu) {
    const unsigned int first = cpu / 2 * 2;
    files.cpu(cpu, {.package = -1,
                    .core = -1,
                    .siblings = std::to_string(first) + "-" + std::to_string(first + 1),
                    .packageSiblings = cpu < 4 ? "0-3" : "4-7"});
  }
  return files;
}

TEST(Offline, HiddenCpusThatAThreadNamesBelongToItsCore) {
  const Tree online = unnumbered().tree();
  const Tree tree = unnumbered().online("1-7").remove(cpuDirectory + "cpu0/").tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), pathsOf(online, NodeProcessor));
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), pathsOf(online, NodeProcessorCore));
  EXPECT_EQ(nodeAt(tree, "P@0.C@0").cpus, (CpuSet{0, 1}));
  for (const Unread& entry : tree.unread()) {
    EXPECT_FALSE(entry.file.ends_with("/topology")) << "nothing is unknown of its place";
  }
}

TEST(Offline, HiddenCpusThatASiblingNamesBelongToItsPackage) {
  for (const char* file : {"core_siblings_list", "package_cpus_list"}) {
    KernelFiles files = unnumbered();
    files.online("0-3,6-7").remove(cpuDirectory + "cpu4/").remove(cpuDirectory + "cpu5/");
    files.remove(cpuDirectory + "cpu6/topology/core_siblings_list")
        .remove(cpuDirectory + "cpu7/topology/core_siblings_list");
    files.file(cpuDirectory + "cpu6/topology/" + file, "4-7\n").file(cpuDirectory + "cpu7/topology/" + file, "4-7\n");

    const Tree tree = files.tree();

    EXPECT_EQ(pathsOf(tree, NodeProcessor), (Paths{"P@0", "P@4"}));
    EXPECT_EQ(nodeAt(tree, "P@4").cpus, (CpuSet{4, 5, 6, 7}));
    EXPECT_EQ(numberAt(tree, "P@4", PropProcessorCores), 1U) << "nothing tells their cores";
    EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/devices/system/cpu/cpu{4-5}/topology",
                                               "the CPU is offline and the kernel hides its place",
                                               "write 1 to the file online in its directory, as root"}));
  }
}

TEST(Offline, SiblingsOfANumberedPackageNameItsHiddenCpus) {
  KernelFiles files = twoPackages();
  files.online("0-6").remove(cpuDirectory + "cpu7/");
  files.cpu(4, {.package = 1, .core = 0, .siblings = "4-5", .packageSiblings = "4-7"});
  files.cpu(6, {.package = 1, .core = 1, .siblings = "6", .packageSiblings = "4-7"});

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P1").cpus, (CpuSet{4, 5, 6, 7}));
  EXPECT_EQ(numberAt(tree, "P1", PropHardwareThreads), 4U);
}

TEST(Offline, CpusWhosePlaceIsNoPlaceBelongWhereASiblingNamesThem) {
  KernelFiles files = twoPackages();
  files.online("0-6").cpu(4, {.package = 1, .core = 0, .siblings = "4-5", .packageSiblings = "4-7"});
  files.cpu(6, {.package = 1, .core = 1, .siblings = "6", .packageSiblings = "4-7"});
  files.remove(cpuDirectory + "cpu7/").cpu(7, {.package = -1, .core = -1, .siblings = " ", .packageSiblings = " "});

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P1").cpus, (CpuSet{4, 5, 6, 7}));
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C0", "P0.C1", "P1.C0", "P1.C1"}));
}

TEST(Offline, PathsStayTheSame) {
  const Paths all = pathsOf(twoPackages().tree(), NodeProcessorCore);
  KernelFiles files = twoPackages();
  files.online("1-7").remove(cpuDirectory + "cpu0/");
  files.cpu(1, {.package = 0, .core = 0, .siblings = "1"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), all);
  EXPECT_EQ(nodeAt(tree, "P0.C0").cpus, CpuSet{1});
}

}  // namespace
}  // namespace Tarn::Inventory
