#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>

#include "tests/platform/inventory/KernelFiles.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using testing::Contains;
using Paths = std::vector<std::string>;

TEST(Topology, SparseCpuNumbers) {
  KernelFiles files;
  files.cpus("3,70,1000");
  files.cpu(3, {.package = 0, .core = 0, .siblings = "3,1000"});
  files.cpu(1000, {.package = 0, .core = 0, .siblings = "3,1000"});
  files.cpu(70, {.package = 5, .core = 9, .siblings = "70"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), (Paths{"P0", "P5"}));
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C0", "P5.C9"}));
  EXPECT_EQ(nodeAt(tree, "P0.C0").cpus, (CpuSet{3, 1000}));
  EXPECT_EQ(numberAt(tree, "P0", PropHardwareThreads), 2U);
}

TEST(Topology, NumaNodesWithCpusAreListedByNumber) {
  KernelFiles files;
  files.cpus("0-3").cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  const std::string directory = "sys/devices/system/node/";
  files.file(directory + "node10/cpulist", "2-3\n").file(directory + "node2/cpulist", "0-1\n");
  files.file(directory + "node1/cpulist", "\n").file(directory + "node02/cpulist", "1\n");
  files.file(directory + "has_cpu", "2,10\n").fail(directory + "node3/cpulist", EACCES);

  const Tree tree = files.tree();

  ASSERT_EQ(tree.numaNodes().size(), 2U);
  EXPECT_EQ(tree.numaNodes()[0], (NumaNode{2, {0, 1}}));
  EXPECT_EQ(tree.numaNodes()[1], (NumaNode{10, {2, 3}}));
}

TEST(Topology, OrderIsThatOfTheNumbersNotOfDiscovery) {
  KernelFiles files;
  files.cpus("0-3");
  files.cpu(0, {.package = 1, .core = 7, .siblings = "0"});
  files.cpu(1, {.package = 0, .core = 5, .siblings = "1"});
  files.cpu(2, {.package = 0, .core = 2, .siblings = "2"});
  files.cpu(3, {.package = 1, .core = 1, .siblings = "3"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), (Paths{"P0", "P1"}));
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C2", "P0.C5", "P1.C1", "P1.C7"}));
}

TEST(Topology, CoreNumbersThatBeginAgainInEachDie) {
  KernelFiles files;
  files.cpus("0-3");
  for (unsigned int cpu = 0; cpu < 4; ++cpu) {
    files.cpu(cpu, {.package = 0,
                    .core = static_cast<int>(cpu % 2),
                    .die = static_cast<int>(cpu / 2),
                    .siblings = std::to_string(cpu)});
  }

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C0", "P0.C1", "P0.D1.C0", "P0.D1.C1"}));
  EXPECT_EQ(nodeAt(tree, "P0.D1.C1").description, "Core 1 of die 1");
}

TEST(Topology, ACoreInDieZeroIsCalledTheSameWithoutDies) {
  KernelFiles files;
  files.cpus("0").cpu(0, {.package = 0, .core = 4, .die = 0, .siblings = "0"});
  const Paths withDies = pathsOf(files.tree(), NodeProcessorCore);
  files.remove(cpuDirectory + "cpu0/topology/die_id");

  EXPECT_EQ(pathsOf(files.tree(), NodeProcessorCore), withDies);
}

TEST(Topology, CoreNumbersThatBeginAgainWithoutAnyDie) {
  KernelFiles files;
  files.cpus("0-2");
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  files.cpu(1, {.package = 0, .core = 0, .siblings = "1"});
  files.cpu(2, {.package = 0, .core = 1, .siblings = "2"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C@0", "P0.C@1", "P0.C1"}));
  EXPECT_EQ(nodeAt(tree, "P0.C@1").description, "Core at CPU 1");
}

TEST(Topology, ClustersDoNotCountOnX86) {
  KernelFiles files;
  files.cpus("0").cpu(0, {.package = 0, .core = 0, .cluster = 24, .siblings = "0"}).x86Block(0);
  EXPECT_EQ(pathsOf(files.tree(), NodeProcessorCore), Paths{"P0.C0"});

  files.remove("proc/").file(cpuDirectory + "modalias", "cpu:type:x86,ven0000fam0006mod0055:feature:,0000\n");
  EXPECT_EQ(pathsOf(files.tree(), NodeProcessorCore), Paths{"P0.C0"}) << "also without /proc";
}

TEST(Topology, ClustersCountElsewhere) {
  KernelFiles files;
  files.cpus("0-1").file(cpuDirectory + "modalias", "cpu:type:aarch64:feature:,0000\n");
  files.cpu(0, {.package = 0, .core = 0, .cluster = 0, .siblings = "0"});
  files.cpu(1, {.package = 0, .core = 0, .cluster = 1, .siblings = "1"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C0", "P0.K1.C0"}));
  EXPECT_EQ(nodeAt(tree, "P0.K1.C0").description, "Core 0 of cluster 1");
}

TEST(Topology, PackagesThatTheKernelDoesNotNumber) {
  KernelFiles files;
  files.cpus("0-5");
  for (unsigned int cpu = 0; cpu < 6; ++cpu) {
    files.cpu(cpu,
              {.package = -1, .core = -1, .siblings = std::to_string(cpu), .packageSiblings = cpu < 2 ? "0-1" : "2-5"});
  }

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), (Paths{"P@0", "P@2"}));
  EXPECT_EQ(nodeAt(tree, "P@2").description, "Processor at CPU 2");
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore),
            (Paths{"P@0.C@0", "P@0.C@1", "P@2.C@2", "P@2.C@3", "P@2.C@4", "P@2.C@5"}));
  EXPECT_EQ(numberAt(tree, "P@2", PropProcessorCores), 4U);
}

TEST(Topology, NumbersTooLongForAShortPath) {
  KernelFiles files;
  files.cpus("0-2");
  files.cpu(0, {.package = 36, .core = 100123, .cluster = 15124, .siblings = "0"});
  files.cpu(1, {.package = 531654, .core = 3, .siblings = "1"});
  files.cpu(2, {.package = 531655, .core = 3, .siblings = "2"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), (Paths{"P36", "P@1", "P@2"}));
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P36.C@0", "P@1.C3", "P@2.C3"}));
}

TEST(Topology, WithoutSiblingListsCoresAreTheirNumbers) {
  KernelFiles files;
  files.cpus("0-3");
  for (unsigned int cpu = 0; cpu < 4; ++cpu) {
    files.cpu(cpu, {.package = 0, .core = static_cast<int>(cpu / 2)});
  }

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C0", "P0.C1"}));
  EXPECT_EQ(nodeAt(tree, "P0.C1").cpus, (CpuSet{2, 3}));
}

TEST(Topology, TheNewerNameOfTheSiblingListServesAsWell) {
  KernelFiles files;
  files.cpus("0-1");
  files.cpu(0, {.package = 0, .core = 0}).cpu(1, {.package = 0, .core = 0});
  files.file(cpuDirectory + "cpu0/topology/core_cpus_list", "0-1\n");

  EXPECT_EQ(nodeAt(files.tree(), "P0.C0").cpus, (CpuSet{0, 1}));
}

TEST(Topology, SiblingListsThatContradictEachOther) {
  KernelFiles files;
  files.cpus("0-2");
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  files.cpu(1, {.package = 0, .core = 1, .siblings = "0-1"});
  files.cpu(2, {.package = 0, .core = 2, .siblings = "0"});

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P0.C0").cpus, CpuSet{0});
  EXPECT_EQ(nodeAt(tree, "P0.C1").cpus, CpuSet{1});
  EXPECT_EQ(nodeAt(tree, "P0.C2").cpus, CpuSet{2});
  EXPECT_EQ(numberAt(tree, "P0", PropHardwareThreads), 3U);
}

TEST(Topology, HiddenSysfsIsMadeUpForByCpuInfo) {
  KernelFiles files;
  files.file("proc/cpuinfo",
             "processor\t: 0\ncpu family\t: 6\nphysical id\t: 0\ncore id\t\t: 4\n\n"
             "processor\t: 1\ncpu family\t: 6\nphysical id\t: 1\ncore id\t\t: 4\n\n"
             "processor\t: 2\ncpu family\t: 6\nphysical id\t: 0\ncore id\t\t: 4\n\n");

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), (Paths{"P0", "P1"}));
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P0.C4", "P1.C4"}));
  EXPECT_EQ(nodeAt(tree, "P0.C4").cpus, (CpuSet{0, 2}));
  EXPECT_THAT(tree.unread(),
              Contains(Unread{"/sys/devices/system/cpu/present", "no such file or directory", "mount sysfs on /sys"}));
  EXPECT_THAT(tree.unread(),
              Contains(Unread{"/sys/devices/system/cpu/online", "no such file or directory", "mount sysfs on /sys"}));
  EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/devices/system/cpu/cpu{0-2}/topology", "no such file or directory",
                                             "mount sysfs on /sys"}));
}

TEST(Topology, WithoutAnyPlaceTheProcessorIsKnownButNotItsCores) {
  KernelFiles files;
  files.file("proc/cpuinfo", "processor\t: 0\nCPU implementer\t: 0x41\n\nprocessor\t: 1\nCPU implementer\t: 0x41\n\n");

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), Paths{"P@0"});
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), Paths{});
  EXPECT_EQ(numberAt(tree, "P@0", PropHardwareThreads), 2U);
  EXPECT_EQ(numberAt(tree, "P@0", PropProcessorCores), std::nullopt);
  EXPECT_EQ(numberAt(tree, "P@0", PropEnabledCores), std::nullopt);
}

TEST(Topology, APackageThatCannotBeReadNeverMakesAProcessor) {
  KernelFiles files;
  files.cpus("0-1");
  files.cpu(0, {.package = {}, .core = 0, .siblings = "0"}).cpu(1, {.package = 3, .core = 0, .siblings = "1"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), Paths{"P3"});
  EXPECT_EQ(nodeAt(tree, "P3").cpus, CpuSet{1});
  EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/devices/system/cpu/cpu0/topology",
                                             "no file names the CPU's processor", "mount sysfs on /sys"}));

  files.file("proc/cpuinfo", "processor\t: 0\ncpu family\t: 6\nphysical id\t: 3\n");
  EXPECT_EQ(nodeAt(files.tree(), "P3").cpus, (CpuSet{0, 1})) << "unless /proc/cpuinfo tells it";
}

TEST(Topology, APackageThatCannotBeReadIsThatOfTheCpusBesideIt) {
  KernelFiles files;
  files.cpus("0-1");
  files.cpu(0, {.package = 3, .core = 0, .siblings = "0"});
  files.cpu(1, {.package = {}, .core = 1, .siblings = "1", .packageSiblings = "0-1"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), Paths{"P3"});
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P3.C0", "P3.C1"}));
}

TEST(Topology, MasksServeWithoutLists) {
  KernelFiles files;
  files.cpus("0-3");
  for (unsigned int cpu = 0; cpu < 4; ++cpu) {
    const std::string directory = cpuDirectory + "cpu" + std::to_string(cpu) + "/topology/";
    files.cpu(cpu, {.package = -1, .core = -1});
    files.file(directory + (cpu < 2 ? "thread_siblings" : "core_cpus"), cpu < 2 ? "00000000,00000003\n" : "c\n");
    files.file(directory + (cpu < 2 ? "core_siblings" : "package_cpus"), cpu < 2 ? "3\n" : "0000000c\n");
  }

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), (Paths{"P@0", "P@2"}));
  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), (Paths{"P@0.C@0", "P@2.C@2"}));
  EXPECT_EQ(nodeAt(tree, "P@2.C@2").cpus, (CpuSet{2, 3}));
}

TEST(Topology, WithoutAListOfOnlineCpusTheirOwnFilesServe) {
  KernelFiles files;
  files.cpus("0-2").remove(cpuDirectory + "online").file(cpuDirectory + "cpu1/online", "0\n");
  files.file(cpuDirectory + "cpu2/online", "1\n");
  for (unsigned int cpu = 0; cpu < 3; ++cpu) {
    files.cpu(cpu, {.package = 0, .core = static_cast<int>(cpu), .siblings = std::to_string(cpu)});
  }

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P0.C0").status, Status::inUse) << "a CPU without the file cannot be set offline";
  EXPECT_EQ(nodeAt(tree, "P0.C1").status, Status::offline);
  EXPECT_EQ(nodeAt(tree, "P0.C2").status, Status::inUse);
  for (const Unread& entry : tree.unread()) {
    EXPECT_NE(entry.file, "/sys/devices/system/cpu/online");
  }
}

TEST(Topology, SiblingsThatAreNotPresentDoNotCount) {
  KernelFiles files;
  files.cpus("2-3");
  files.cpu(2, {.package = 0, .core = 1, .siblings = "2,6"}).cpu(3, {.package = 0, .core = 2, .siblings = "3,7"});

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P0.C1").cpus, CpuSet{2});
  EXPECT_EQ(numberAt(tree, "P0", PropHardwareThreads), 2U);
}

TEST(Topology, CpusAreFoundByTheirDirectoriesWithoutAList) {
  KernelFiles files;
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"}).cpu(12, {.package = 0, .core = 1, .siblings = "12"});
  files.file(cpuDirectory + "cpufreq/boost", "1\n").file(cpuDirectory + "cpuidle/x", "1\n");

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P0").cpus, (CpuSet{0, 12}));
}

TEST(Topology, NumbersInCpuInfoThatDoNotFitAreReported) {
  KernelFiles files;
  files.cpus("0").cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  files.file("proc/cpuinfo", "processor\t: 4294967296\ncpu family\t: 6\nmodel name\t: Nobody's\n");

  const Tree tree = files.tree();

  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), std::nullopt);
  EXPECT_THAT(tree.unread(),
              Contains(Unread{"/proc/cpuinfo, line 1",
                              "\"processor\" is 4294967296, more than this number can be; it is not used",
                              "correct the number if the file was captured; on a running machine the kernel is at "
                              "fault"}));
}

TEST(Topology, ListsWithNonsenseAreTold) {
  KernelFiles files;
  files.cpus("none").cpu(0, {.package = 0, .core = 0, .siblings = "0"});

  const Tree tree = files.tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessorCore), Paths{"P0.C0"});
  EXPECT_THAT(tree.unread(),
              Contains(Unread{"/sys/devices/system/cpu/present", "it holds no usable value",
                              "correct the file if it was captured; on a running machine the kernel is at fault"}));
}

TEST(Topology, OnlineCpusCountAsPresent) {
  KernelFiles files;
  files.cpus("0").online("0-1");
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"}).cpu(1, {.package = 0, .core = 1, .siblings = "1"});

  EXPECT_EQ(pathsOf(files.tree(), NodeProcessorCore), (Paths{"P0.C0", "P0.C1"}));
}

}  // namespace
}  // namespace Tarn::Inventory
