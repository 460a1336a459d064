#include "platform/inventory/sources/kernel/CpuInfo.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

TEST(CpuInfo, FindsTheFieldsOfACpu) {
  const CpuInfo info(
      "processor\t: 0\nmodel\t\t: 85\nmodel name\t: First\n\n"
      "processor\t: 7\nmodel\t\t: 86\nmodel name\t:   Second one \n\n");

  EXPECT_EQ(info.cpus(), (CpuSet{0, 7}));
  EXPECT_EQ(info.field(0, "model"), "85");
  EXPECT_EQ(info.field(7, "model"), "86");
  EXPECT_EQ(info.field(7, "model name"), "Second one");
}

TEST(CpuInfo, FindsNothingWhereThereIsNothing) {
  const CpuInfo info("processor\t: 0\nmodel\t\t:\nwp\n\n");

  EXPECT_EQ(info.field(0, "model"), "");
  EXPECT_EQ(info.field(0, "wp"), "");
  EXPECT_EQ(info.field(0, "flags"), "");
  EXPECT_EQ(CpuInfo().field(0, "model"), "");
  EXPECT_TRUE(CpuInfo().cpus().empty());
}

TEST(CpuInfo, FieldsOutsideOfTheBlocksHoldForAllCpus) {
  const CpuInfo info("system type\t: Box\n\nprocessor\t: 0\nmodel\t: 1\n\nprocessor\t: 1\n\nHardware\t: Board\n");

  EXPECT_EQ(info.field(0, "system type"), "Box");
  EXPECT_EQ(info.field(1, "Hardware"), "Board");
  EXPECT_EQ(info.field(5, "Hardware"), "Board");
}

TEST(CpuInfo, AFieldThatABlockLacksIsNotTakenFromAnotherBlock) {
  const CpuInfo info("processor\t: 0\nmodel\t: 1\n\nprocessor\t: 1\nstepping\t: 2\n\n");

  EXPECT_EQ(info.field(1, "model"), "");
  EXPECT_EQ(info.field(0, "stepping"), "");
  EXPECT_EQ(info.field(5, "model"), "");
}

TEST(CpuInfo, BlocksOfS390BeginWithTheCpusNumber) {
  const CpuInfo info(
      "vendor_id       : IBM/S390\nprocessor 0: version = 00,  machine = 8561\n"
      "processor 1: version = 00,  machine = 3931\n\n"
      "cpu number      : 0\ncpu MHz static  : 5200\n\ncpu number      : 1\ncpu MHz static  : 5000\n");

  EXPECT_EQ(info.cpus(), (CpuSet{0, 1}));
  EXPECT_EQ(info.field(1, "vendor_id"), "IBM/S390");
  EXPECT_EQ(info.field(1, "cpu MHz static"), "5000");
  EXPECT_EQ(info.field(1, "processor *"), "version = 00,  machine = 3931");
}

TEST(CpuInfo, NumberOfACpuWithinABlockIsAField) {
  const CpuInfo info("processor  : 0\ncpu number : 7\n\nprocessor  : 1\ncpu number : 7\n");

  EXPECT_EQ(info.cpus(), (CpuSet{0, 1}));
  EXPECT_EQ(info.field(1, "cpu number"), "7");
}

TEST(CpuInfo, StarInAFieldsNameIsTheCpusNumber) {
  const CpuInfo info("Cpu0ClkTck\t: 10\nCpu12ClkTck\t: 20\n");

  EXPECT_EQ(info.field(12, "Cpu*ClkTck"), "20");
  EXPECT_EQ(info.field(3, "Cpu*ClkTck"), "");
}

TEST(CpuInfo, ABlockWhoseNumberNoCpuCanHaveCountsForNone) {
  for (const char* number : {"65536", "4294967296", "99999999999999999999"}) {
    const CpuInfo info("processor\t: 1\nmodel\t: 1\n\nprocessor\t: " + std::string(number) +
                       "\nmodel\t: 2\n\nprocessor\t: 2\nmodel\t: 3\n");

    EXPECT_EQ(info.cpus(), (CpuSet{1, 2})) << number;
    EXPECT_EQ(info.field(0, "model"), "") << number;
    EXPECT_EQ(info.field(1, "model"), "1") << number;
    ASSERT_TRUE(info.misfit().has_value()) << number;
    EXPECT_EQ(info.misfit()->line, 4U);
    EXPECT_EQ(info.misfit()->name, "processor");
    EXPECT_EQ(info.misfit()->value, number);
  }
}

TEST(CpuInfo, ANumberThatDoesNotFitIsReportedWithItsLine) {
  for (const std::string name : {"core id", "cpu family", "model", "physical id", "stepping"}) {
    const CpuInfo info("processor\t: 0\n" + name + "\t: 4294967296\nSerial\t: 99999999999999999999\n");
    ASSERT_TRUE(info.misfit().has_value()) << name;
    EXPECT_EQ(info.misfit()->line, 2U);
    EXPECT_EQ(info.misfit()->name, name);

    EXPECT_FALSE(CpuInfo("processor\t: 0\n" + name + "\t: 4294967295\n").misfit().has_value()) << name;
  }
}

TEST(CpuInfo, OlderArmKernelsHaveAProcessorThatIsAText) {
  const CpuInfo info("Processor\t: ARMv7 rev 1\nprocessor\t: 0\nprocessor\t: 1\n\nCPU part\t: 0xc09\n");

  EXPECT_EQ(info.cpus(), (CpuSet{0, 1}));
  EXPECT_EQ(info.field(1, "CPU part"), "0xc09");
}

TEST(CpuInfo, BlocksMayStandInAnyOrderAndEndWithoutANewline) {
  const CpuInfo info("processor\t: 2\ncore id\t: 20\nprocessor\t: 0\ncore id\t: 10");

  EXPECT_EQ(info.field(2, "core id"), "20");
  EXPECT_EQ(info.field(0, "core id"), "10");
}

}  // namespace
}  // namespace Tarn::Inventory
