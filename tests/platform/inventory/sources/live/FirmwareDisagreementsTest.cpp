#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "platform/inventory/tree/PropertyTable.h"
#include "tests/platform/inventory/sources/live/XeonPackages.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using Support::emptySocket;
using Support::SmbiosProcessor;
using testing::ElementsAre;

TEST(FirmwareDisagreements, ADisabledProcessorThatTheKernelUsesIsADisagreement) {
  SmbiosProcessor disabled = xeon("CPU2");
  disabled.status = 2;

  const Tree tree = packages(2).firmware(tablesOf(xeon("CPU1"), disabled)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0", "P1"));
  EXPECT_EQ(statusAt(tree, "P1"), Status::inUse);
  EXPECT_THAT(tree.disagreements(), ElementsAre(Disagreement{"P1", "status", "1", originDirectory + "/online", "16",
                                                             "SMBIOS type 4, handle 0x0011, offset 0x18"}));
}

TEST(FirmwareDisagreements, SocketsThatCannotBeToldApartAndAreTooManyStayOut) {
  const Tree tree = packages(1).firmware(tablesOf(xeon("CPU1"), xeon("CPU2"))).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), std::nullopt);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"system", "processors", "1: P0", originDirectory, "2: CPU1, CPU2",
                                       "SMBIOS type 4, handle 0x0010; SMBIOS type 4, handle 0x0011"}));
}

TEST(FirmwareDisagreements, OnlyEmptySocketsContradictAProcessor) {
  const Tree tree = packages(1).firmware(tablesOf(emptySocket("CPU1"))).tree();

  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"system", "processors", "1: P0", originDirectory, "0", "SMBIOS"}));
}

TEST(FirmwareDisagreements, AnotherSignatureIsAnotherProcessor) {
  SmbiosProcessor other = xeon("CPU1");
  other.id = 0x000306C3;

  const Tree tree = packages(1).firmware(tablesOf(other)).tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0"));
  EXPECT_EQ(textAt(tree, "P0", PropSocket), std::nullopt);
  EXPECT_THAT(tree.disagreements(),
              ElementsAre(Disagreement{"P0", "ProcessorId", "57 06 05 00", "/proc/cpuinfo, processor 0", "C3 06 03 00",
                                       "SMBIOS type 4, handle 0x0010, offset 0x08"}));
}

TEST(FirmwareDisagreements, AnIdentifierOfAnotherKindContradictsNothing) {
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

}  // namespace
}  // namespace Tarn::Inventory
