#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "tests/platform/inventory/sources/live/XeonPackages.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using Support::emptySocket;
using Support::SmbiosProcessor;
using testing::ElementsAre;

TEST(FirmwareSockets, AlikeProcessorsGoBySocketHandleAndPackageNumber) {
  SmbiosProcessor second = xeon("A");
  second.frame.handle = 0x0050;
  SmbiosProcessor first = xeon("B");
  first.frame.handle = 0x0040;

  const Tree tree = packages(2).firmware(tablesOf(second, first)).tree();

  EXPECT_EQ(textAt(tree, "P0", PropSocket), "B");
  EXPECT_EQ(textAt(tree, "P1", PropSocket), "A");
  EXPECT_TRUE(tree.disagreements().empty());
}

TEST(FirmwareSockets, TheOrderIsSaidInTheOrigin) {
  KernelFiles files = packages(2).firmware(tablesOf(xeon("A"), xeon("B")));
  MemoryFileSystem root(files.files());

  const Tree tree = readLiveInventory(root, Detail::WithOrigins);

  EXPECT_EQ(*tree.origin(tree.find("/P1"), PropSocket),
            (Origin{"SMBIOS type 4, handle 0x0011, offset 0x04", "B",
                    "as it stands; socket found by: the same signature, name, number of cores, "
                    "number of threads; 2 are alike, so by order: ascending handle to ascending package number"}));
  EXPECT_EQ(tree.origin(tree.find("/P1"), PropExternalClockSpeed)->raw, "64 00");
}

TEST(FirmwareSockets, AnEmptySocketIsAProcessorOfItsOwn) {
  const Tree tree = packages(1).firmware(tablesOf(emptySocket("CPU 2"), xeon("CPU 1"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU2"));
  EXPECT_EQ(statusAt(tree, "S:CPU2"), Status::emptySocket);
  EXPECT_EQ(nodeAt(tree, "S:CPU2").description, "Socket CPU 2");
  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU 1");
}

TEST(FirmwareSockets, ProcessorsThatTheFirmwareTookOutAreThere) {
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

TEST(FirmwareSockets, ADisabledProcessorThatTheKernelUsesIsThereOnce) {
  SmbiosProcessor enabled = xeon("CPU1");
  enabled.id = 0x000306C3;
  SmbiosProcessor disabled = xeon("CPU2");
  disabled.status = 2;

  const Tree tree = packages(1).firmware(tablesOf(enabled, disabled)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU1"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU2");
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"S:CPU1", "status", "1", "SMBIOS type 4, handle 0x0010, offset 0x18",
                                       "(no such processor)", originDirectory},
                          Disagreement{"P0", "status", "1", originDirectory + "/online", "16",
                                       "SMBIOS type 4, handle 0x0011, offset 0x18"}));
}

TEST(FirmwareSockets, WhereNoSocketFitsADisabledOneStandsForItself) {
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

TEST(FirmwareSockets, MorePackagesThanProcessorsLeaveADisabledOneOut) {
  SmbiosProcessor disabled = xeon("CPU2");
  disabled.status = 2;

  const Tree tree = packages(3).firmware(tablesOf(xeon("CPU1"), disabled, emptySocket("CPU3"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "P1", "P2", "S:CPU3"));
  EXPECT_EQ(tree.disagreements().size(), 1U);
}

TEST(FirmwareSockets, AProcessorThatTheKernelDoesNotSeeIsThereWhereItsIdentityTells) {
  SmbiosProcessor other = xeon("CPU1");
  other.id = 0x000306C3;

  const Tree tree = packages(1).firmware(tablesOf(other, xeon("CPU2"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S:CPU1"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU2");
  EXPECT_EQ(statusAt(tree, "S:CPU1"), Status::inUse);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"S:CPU1", "status", "1", "SMBIOS type 4, handle 0x0010, offset 0x18",
                                       "(no such processor)", originDirectory}));
}

TEST(FirmwareSockets, CoprocessorsAreNoProcessors) {
  SmbiosProcessor math = xeon("FPU");
  math.type = 4;

  const Tree tree = packages(1).firmware(tablesOf(math, xeon("CPU1"))).tree();

  EXPECT_EQ(textAt(tree, "P0", PropSocket), "CPU1");
  EXPECT_TRUE(tree.disagreements().empty());
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

TEST(FirmwareSockets, SocketsWithOneHandleAreTwo) {
  SmbiosProcessor empty = emptySocket("");
  empty.frame.handle = 0x00AB;

  const Tree tree = packages(1).firmware(tablesOf(xeon("CPU1"), empty, empty)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "S#00AB.1", "S#00AB.2"));
  EXPECT_EQ(tree.unread().size(), 1U) << "the table is broken";
}

TEST(FirmwareSockets, AloneIsAMachineWithoutCores) {
  KernelFiles files = KernelFiles().firmware(tablesOf(xeon("CPU1")));

  const Tree tree = files.tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("S:CPU1"));
  EXPECT_EQ(numberAt(tree, "S:CPU1", PropProcessorCores), 1U);
  EXPECT_TRUE(pathsOf(tree, NodeProcessorCore).empty()) << "none is made up from a count";
  EXPECT_FALSE(tree.unread().empty()) << "the kernel's files are missed";
}

}  // namespace
}  // namespace Tarn::Inventory
