#include "platform/instrumentation/kernel/CpuInfo.h"

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

TEST(CpuInfo, TakesTheFirstFieldForACpuWithoutItsOwn) {
  const CpuInfo info("processor\t: 0\nmodel\t: 1\n\nprocessor\t: 1\n\nHardware\t: Board\n");

  EXPECT_EQ(info.field(1, "model"), "1");
  EXPECT_EQ(info.field(0, "Hardware"), "Board");
  EXPECT_EQ(info.field(5, "model"), "1");
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
