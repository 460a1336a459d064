#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>

#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "tests/platform/inventory/sources/live/XeonPackages.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using Support::emptySocket;
using Support::SmbiosEncoder;
using Support::SmbiosProcessor;
using testing::ElementsAre;

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

TEST(Firmware, TablesWithoutSocketsSayNothing) {
  const Tree tree = packages(1).tree();

  EXPECT_TRUE(tree.disagreements().empty());
  EXPECT_TRUE(tree.unread().empty());
}

TEST(Firmware, ThatMayNotBeReadIsReportedWithoutAlarm) {
  const Tree tree = packages(1).fail("sys/firmware/dmi/tables/smbios_entry_point", EACCES).tree();

  EXPECT_THAT(tree.unread(),
              ElementsAre(Unread{"/sys/firmware/dmi/tables/smbios_entry_point", "permission denied",
                                 "run as root to see the sockets, their state and their clocks as well"}));
}

TEST(Firmware, ThatIsNotThereIsReported) {
  const Tree tree = packages(1).remove("sys/firmware/dmi/tables/DMI").tree();

  EXPECT_THAT(tree.unread(), ElementsAre(Unread{"/sys/firmware/dmi/tables/DMI", "no such file or directory",
                                                "needs firmware with SMBIOS tables, which list sockets, their states "
                                                "and clocks"}));
}

TEST(Firmware, ThatIsBrokenIsReportedAndTheRestIsUsed) {
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

TEST(Firmware, ThatIsNoTableIsReportedAndTheKernelIsUsed) {
  const Tree tree = packages(1).file("sys/firmware/dmi/tables/smbios_entry_point", "garbage").tree();

  EXPECT_THAT(pathsOf(tree, NodeProcessor), ElementsAre("P0"));
  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_THAT(tree.unread()[0].reason, testing::StartsWith("SMBIOS entry point"));
}

}  // namespace
}  // namespace Tarn::Inventory
