#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/instrumentation/KernelFiles.h"

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
