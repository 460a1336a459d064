#include "platform/inventory/sources/live/LiveSource.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cerrno>
#include <set>

#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/sources/files/RecordingFileSystem.h"
#include "platform/inventory/tree/Error.h"
#include "tests/platform/inventory/KernelFiles.h"
#include "tests/platform/inventory/Scratch.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using testing::Contains;

// Two packages of one core.
KernelFiles twoPackages() {
  KernelFiles files;
  files.cpus("0-1").x86Block(0, "First").x86Block(1, "Second");
  for (unsigned int cpu = 0; cpu < 2; ++cpu) {
    files.cpu(cpu, {.package = static_cast<int>(cpu), .core = 0, .siblings = std::to_string(cpu)});
    files.cache(cpu, 0, {.cpus = std::to_string(cpu)});
  }
  return files.file("sys/class/dmi/id/product_name", "Box\n");
}

std::vector<std::string> filesRead(FileSystem& files) {
  RecordingFileSystem::Record record;
  RecordingFileSystem recorder(files, record);
  readLiveInventory(recorder);
  return record.opened;
}

MemoryFileSystem fixture(const std::string& name) {
  return MemoryFileSystem(readArchive(contentsOf(fixtures + name + "/root.txt"), name));
}

TEST(LiveSource, EachProcessorTellsOfItsOwn) {
  const Tree tree = twoPackages().tree();

  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), "First");
  EXPECT_EQ(textAt(tree, "P1", PropProcessorName), "Second");
}

TEST(LiveSource, MaximumClockSpeedIsInMegahertzRounded) {
  const char* const rows[][2] = {
      {"3700000", "3700"}, {"1416499", "1416"}, {"1416500", "1417"}, {"4294967295", "4294967"}};
  for (const auto& [kilohertz, megahertz] : rows) {
    EXPECT_EQ(numberAt(twoPackages().maxFrequency(0, kilohertz).tree(), "P0", PropMaxClockSpeed),
              std::stoul(megahertz));
  }
}

TEST(LiveSource, MaximumClockSpeedIsAbsentWithoutAFrequencyDriver) {
  const Tree tree = twoPackages().tree();

  EXPECT_EQ(numberAt(tree, "P0", PropMaxClockSpeed), std::nullopt);
  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_THAT(tree.unread(),
              Contains(Unread{"/sys/devices/system/cpu/cpu{0-1}/cpufreq/cpuinfo_max_freq", "no such file or directory",
                              "load the processor's frequency driver; most virtual machines have none"}));
}

TEST(LiveSource, MaximumClockSpeedIsTheHighestOfTheProcessorsPolicies) {
  KernelFiles files;
  files.cpus("0-4");
  for (unsigned int cpu = 0; cpu < 5; ++cpu) {
    files.cpu(cpu, {.package = cpu == 4 ? 1 : 0, .core = static_cast<int>(cpu), .siblings = std::to_string(cpu)});
  }
  const std::string policies = cpuDirectory + "cpufreq/policy";
  files.file(policies + "0/cpuinfo_max_freq", "4700000\n").file(policies + "2/cpuinfo_max_freq", "5000000\n");
  files.file(policies + "4/cpuinfo_max_freq", "5500000\n");

  const Tree tree = files.tree();

  EXPECT_EQ(numberAt(tree, "P0", PropMaxClockSpeed), 5000U);
  EXPECT_EQ(numberAt(tree, "P1", PropMaxClockSpeed), 5500U);
}

TEST(LiveSource, APolicyWithTheNumberOfAHiddenCpuCountsForItsOtherCpus) {
  KernelFiles files = twoPackages();
  files.cpus("0-2").online("0-1").file(cpuDirectory + "cpufreq/policy2/cpuinfo_max_freq", "4000000\n");
  files.file(cpuDirectory + "cpufreq/policy2/related_cpus", "1 2 \n");

  const Tree tree = files.tree();

  EXPECT_EQ(numberAt(tree, "P0", PropMaxClockSpeed), std::nullopt);
  EXPECT_EQ(numberAt(tree, "P1", PropMaxClockSpeed), 4000U);
}

TEST(LiveSource, WithoutDirectoriesOfPoliciesEachCpuIsAsked) {
  KernelFiles files;
  files.cpus("0-2");
  for (unsigned int cpu = 0; cpu < 3; ++cpu) {
    files.cpu(cpu, {.package = 0, .core = static_cast<int>(cpu), .siblings = std::to_string(cpu)});
  }
  files.maxFrequency(0, "4700000").maxFrequency(1, "5000000").maxFrequency(2, "4900000");

  EXPECT_EQ(numberAt(files.tree(), "P0", PropMaxClockSpeed), 5000U);
}

TEST(LiveSource, CurrentClockSpeedComesFromCpuInfoElseFromTheDriver) {
  KernelFiles files = twoPackages();
  files.file(cpuDirectory + "cpu0/cpufreq/scaling_cur_freq", "800000\n");
  EXPECT_EQ(numberAt(files.tree(), "P0", PropCurrentClockSpeed), 2100U);

  files.file("proc/cpuinfo", "processor\t: 0\ncpu family\t: 6\n\nprocessor\t: 1\ncpu family\t: 6\n");
  EXPECT_EQ(numberAt(files.tree(), "P0", PropCurrentClockSpeed), 800U);
  EXPECT_EQ(numberAt(files.tree(), "P1", PropCurrentClockSpeed), std::nullopt);
}

TEST(LiveSource, EveryProcessorCanBeEnabled) {
  const Tree tree = twoPackages().tree();
  const auto* states = tree.list(nodeAt(tree, "P1"), PropRequestedStatesSupported);
  ASSERT_NE(states, nullptr);
  EXPECT_EQ(*states, std::vector<unsigned int>{1});
}

TEST(LiveSource, WhatOnlyTheFirmwareKnowsIsAbsent) {
  const Tree tree = twoPackages().tree();

  EXPECT_EQ(numberAt(tree, "P0", PropExternalClockSpeed), std::nullopt);
  EXPECT_EQ(numberAt(tree, "P0", PropUpgradeMethod), std::nullopt);
}

TEST(LiveSource, WithoutCpuInfoTheProcessorsAreThereWithoutName) {
  const Tree tree = twoPackages().fail("proc/cpuinfo", EACCES).tree();

  EXPECT_EQ(pathsOf(tree, NodeProcessor), (std::vector<std::string>{"P0", "P1"}));
  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), std::nullopt);
  EXPECT_EQ(numberAt(tree, "P0", PropFamily), 2U);
  EXPECT_EQ(numberAt(tree, "P0", PropAddressWidth), std::nullopt);
  EXPECT_THAT(tree.unread(),
              Contains(Unread{"/proc/cpuinfo", "permission denied", "run as root, or let this process read it"}));
}

TEST(LiveSource, HybridProcessorsNameTheirKindsOfCore) {
  KernelFiles files;
  files.cpus("0-2").x86Block(0).file("sys/devices/cpu_core/cpus", "0-1\n").file("sys/devices/cpu_atom/cpus", "2\n");
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0-1"}).cpu(2, {.package = 0, .core = 8, .siblings = "2"});
  files.maxFrequency(0, "3000000").maxFrequency(2, "3500000");

  const Tree tree = files.tree();

  EXPECT_EQ(nodeAt(tree, "P0.C0").description, "Performance core 0");
  EXPECT_EQ(nodeAt(tree, "P0.C8").description, "Efficient core 8");
  EXPECT_EQ(numberAt(tree, "P0", PropMaxClockSpeed), 3500U) << "that of the faster kind";
}

TEST(LiveSource, KindsOfCoreHaveBlanksForControlCharacters) {
  KernelFiles files;
  files.cpus("0-1").file("proc/cpuinfo",
                         "processor\t: 0\nCPU implementer\t: 0x41\033[1m\nCPU part\t: 0xffe\n\n"
                         "processor\t: 1\nCPU implementer\t: 0x41\nCPU part\t: 0xfff\n");
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"}).cpu(1, {.package = 0, .core = 1, .siblings = "1"});

  EXPECT_EQ(nodeAt(files.tree(), "P0.C0").description, "0x41 [1m 0xffe core 0");
}

TEST(LiveSource, OneKindOfCoreIsNotNamed) {
  KernelFiles files;
  files.cpus("0").x86Block(0).file("sys/devices/cpu_core/cpus", "0\n");
  files.cpu(0, {.package = 0, .core = 0, .siblings = "0"});

  EXPECT_EQ(nodeAt(files.tree(), "P0.C0").description, "Core 0");
}

TEST(LiveSource, ReadsNoFileTwice) {
  for (const char* name : {"arm64-board", "container", "dual-socket-server", "hybrid-laptop", "kvm-two-cpus",
                           "offline-cpus", "virtual-machine"}) {
    MemoryFileSystem files = fixture(name);
    const std::vector<std::string> read = filesRead(files);
    EXPECT_EQ(std::set<std::string>(read.begin(), read.end()).size(), read.size()) << name;
  }
}

TEST(LiveSource, ReadsOfFrequenciesOneFileForEachPolicy) {
  const auto frequencies = [](const char* name) {
    MemoryFileSystem files = fixture(name);
    std::vector<std::string> read = filesRead(files);
    std::erase_if(read, [](const std::string& file) { return file.find("freq") == std::string::npos; });
    return read;
  };

  EXPECT_EQ(frequencies("favoured-cores"),
            (std::vector<std::string>{
                cpuDirectory + "cpufreq/policy0/cpuinfo_max_freq", cpuDirectory + "cpufreq/policy1/cpuinfo_max_freq",
                cpuDirectory + "cpufreq/policy2/cpuinfo_max_freq", cpuDirectory + "cpufreq/policy3/cpuinfo_max_freq"}));
  EXPECT_EQ(frequencies("virtual-machine"), (std::vector<std::string>{cpuDirectory + "cpu0/cpufreq/cpuinfo_max_freq",
                                                                      cpuDirectory + "cpu2/cpufreq/cpuinfo_max_freq"}))
      << "one of each processor, as there is none";
}

TEST(LiveSource, MeasuresTheFrequencyOfOneCpu) {
  MemoryFileSystem files = fixture("arm64-board");
  const std::vector<std::string> read = filesRead(files);
  EXPECT_EQ(std::ranges::count_if(read, [](const std::string& file) { return file.ends_with("/scaling_cur_freq"); }),
            1);
}

TEST(LiveSource, ReadsOfAThreadOnlyHowItsCachesAreShared) {
  MemoryFileSystem files = fixture("dual-socket-server");
  std::vector<std::string> ofThread;
  for (const std::string& file : filesRead(files)) {
    if (file.starts_with(cpuDirectory + "cpu16/")) {
      ofThread.push_back(file.substr(cpuDirectory.size()));
    }
  }
  EXPECT_EQ(ofThread,
            (std::vector<std::string>{"cpu16/cache/index0/shared_cpu_list", "cpu16/cache/index1/shared_cpu_list",
                                      "cpu16/cache/index2/shared_cpu_list", "cpu16/cache/index3/shared_cpu_list",
                                      "cpu16/cache/index4/shared_cpu_list"}));
}

TEST(LiveSource, WithoutAnyProcessorIsAnError) {
  MemoryFileSystem nothing;
  EXPECT_THROW(readLiveInventory(nothing), InventoryError);
}

TEST(LiveSource, SurvivesFilesThatHoldNonsense) {
  const std::string nonsense[] = {"",         "\n",
                                  "-1\n",     "99999999999999999999\n",
                                  "\xFF\xFE", std::string(5000, '9'),
                                  "a-b,c",    std::string("\0\0\0", 3)};
  const MemoryFileSystem files = fixture("offline-cpus");
  for (const std::string& text : nonsense) {
    for (const auto& [path, entry] : files.files()) {
      MemoryFileSystem broken(files.files());
      broken.add(path, text);
      const Tree tree = readLiveInventory(broken);
      EXPECT_FALSE(tree.ofType(NodeProcessor).empty()) << path;
    }
  }
}

TEST(LiveSource, SurvivesFilesThatAreMissing) {
  const MemoryFileSystem files = fixture("hybrid-laptop");
  for (const auto& [path, entry] : files.files()) {
    MemoryFileSystem broken(files.files());
    broken.fail(path, EIO);
    EXPECT_EQ(pathsOf(readLiveInventory(broken), NodeProcessor).front(), "P0") << path;
  }
}

}  // namespace
}  // namespace Tarn::Inventory
