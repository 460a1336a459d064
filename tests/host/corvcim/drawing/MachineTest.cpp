#include "host/corvcim/drawing/Machine.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "host/corvcim/drawing/PartLabels.h"
#include "host/corvcim/drawing/PartShapes.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Machines.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::TreeBuilder;
using testing::ElementsAre;
using testing::SizeIs;
using namespace Tarn::NodeLexicon;

std::vector<std::string> labels(const std::vector<CacheUnit>& caches) {
  std::vector<std::string> texts;
  for (const CacheUnit& cache : caches) {
    texts.push_back(labelOf(cache));
  }
  return texts;
}

TEST(Machine, PrivateCachesBelongToTheirCoreAndSharedOnesStandAboveTheirCores) {
  const Machine machine = readMachine(Testing::twoCoreMachine(), "desk");

  EXPECT_EQ(machine.systemName, "desk");
  EXPECT_EQ(machine.model, "DeskBox 2");
  ASSERT_THAT(machine.processors, SizeIs(1));
  ASSERT_THAT(machine.processors[0].parts, SizeIs(1));
  const MachinePart& shared = machine.processors[0].parts[0];
  EXPECT_THAT(labels(shared.caches), ElementsAre("L3 16 MiB"));
  EXPECT_EQ(shared.coreCount, 2U);
  ASSERT_THAT(shared.parts, SizeIs(2));
  EXPECT_EQ(shared.parts[1].corePath, "P0.C1");
  EXPECT_THAT(labels(shared.parts[1].caches), ElementsAre("L2 2 MiB", "L1d 48 KiB", "L1i 32 KiB"));
}

TEST(Machine, SharedCachesNest) {
  const Machine machine = readMachine(Testing::hybridLaptop(), "lap");

  const MachinePart& thirdLevel = machine.processors[0].parts.at(0);
  ASSERT_THAT(thirdLevel.parts, SizeIs(3));
  EXPECT_TRUE(thirdLevel.parts[0].isCore());
  EXPECT_TRUE(thirdLevel.parts[1].isCore());
  EXPECT_THAT(labels(thirdLevel.parts[2].caches), ElementsAre("L2 2 MiB"));
  EXPECT_THAT(thirdLevel.parts[2].parts, SizeIs(4));
  EXPECT_EQ(thirdLevel.coreCount, 6U);
}

TEST(Machine, CachesOfOneLevelWithTheSameCoresStandTogether) {
  TreeBuilder builder;
  builder.processor("P0");
  builder.core("P0.C0").cpus({0}).core("P0.C1").cpus({1});
  builder.cache("P0.I").number(PropCacheLevel, 3).number(PropCacheType, 1).cpus({0, 1});
  builder.cache("P0.D").number(PropCacheLevel, 3).number(PropCacheType, 2).cpus({0, 1});

  const Machine machine = readMachine(builder.build(), "x");

  ASSERT_THAT(machine.processors.at(0).parts, SizeIs(1));
  EXPECT_THAT(labels(machine.processors[0].parts[0].caches), ElementsAre("L1d", "L1i"));
}

TEST(Machine, CachesWithoutKnownSharersAreKeptAside) {
  const Machine machine = readMachine(Testing::smallBoard(), "x");

  EXPECT_THAT(labels(machine.processors.at(0).otherCaches), ElementsAre("System cache"));
  EXPECT_THAT(machine.processors.at(1).parts, SizeIs(0));
}

TEST(Machine, CoresWithoutKnownCpusStandForThemselves) {
  TreeBuilder builder;
  builder.processor("P0").core("P0.C0").core("P0.C1");
  builder.cache("P0.L3").number(PropCacheLevel, 5).cpus({0, 1});

  const Machine machine = readMachine(builder.build(), "x");

  EXPECT_THAT(machine.processors.at(0).parts, SizeIs(2));
  EXPECT_THAT(labels(machine.processors[0].otherCaches), ElementsAre("L3"));
}

TEST(Machine, CachesThatOverlapWithoutNestingLoseNoCore) {
  TreeBuilder builder;
  builder.processor("P0");
  for (unsigned int i = 0; i < 3; ++i) {
    builder.core("P0.C" + std::to_string(i)).cpus({i});
  }
  builder.cache("P0.A").number(PropCacheLevel, 4).cpus({0, 1});
  builder.cache("P0.B").number(PropCacheLevel, 4).cpus({1, 2});

  const Machine machine = readMachine(builder.build(), "x");

  EXPECT_THAT(coresOf(machine.processors.at(0).parts), SizeIs(3));
}

TEST(Machine, SizesAreThoseOfBigCaches) {
  TreeBuilder builder;
  builder.processor("P0").core("P0.C0").cpus({0});
  builder.cache("P0.L3").number(PropCacheLevel, 5).cpus({0});
  builder.number(PropCacheBlockSize, 64).number(PropCacheNumberOfBlocks, 1U << 30U);

  const Machine machine = readMachine(builder.build(), "x");

  EXPECT_THAT(labels(machine.processors.at(0).parts.at(0).caches), ElementsAre("L3 64 GiB"));
}

TEST(Machine, TextsOfTheInventoryArePrintable) {
  const Machine machine = readMachine(Testing::strangeTexts(), "bad\nname");

  EXPECT_EQ(machine.systemName, "bad\\nname");
  EXPECT_EQ(machine.model, "A<b>&\"c\"\\n\\x1B[31m");
}

}  // namespace
}  // namespace Corvcim
