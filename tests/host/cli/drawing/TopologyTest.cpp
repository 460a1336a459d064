#include "host/cli/drawing/Topology.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "platform/instrumentation/tree/TreeBuilder.h"
#include "tests/host/cli/Machines.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::TreeBuilder;
using testing::ElementsAre;
using testing::SizeIs;
using namespace Tarn::NodeLexicon;

std::vector<std::string> labels(const std::vector<CacheUnit>& caches) {
  std::vector<std::string> texts;
  for (const CacheUnit& cache : caches) {
    texts.push_back(cache.label());
  }
  return texts;
}

TEST(Topology, PrivateCachesBelongToTheirCoreAndSharedOnesStandAboveTheirCores) {
  const Topology topology = readTopology(Testing::twoCoreMachine(), "desk");

  EXPECT_EQ(topology.systemName, "desk");
  EXPECT_EQ(topology.model, "DeskBox 2");
  ASSERT_THAT(topology.processors, SizeIs(1));
  ASSERT_THAT(topology.processors[0].parts, SizeIs(1));
  const TopologyPart& shared = topology.processors[0].parts[0];
  EXPECT_THAT(labels(shared.caches), ElementsAre("L3 16 MiB"));
  EXPECT_EQ(shared.coreCount, 2U);
  ASSERT_THAT(shared.parts, SizeIs(2));
  EXPECT_EQ(shared.parts[1].corePath, "P0.C1");
  EXPECT_THAT(labels(shared.parts[1].caches), ElementsAre("L2 2 MiB", "L1d 48 KiB", "L1i 32 KiB"));
}

TEST(Topology, SharedCachesNest) {
  const Topology topology = readTopology(Testing::hybridLaptop(), "lap");

  const TopologyPart& thirdLevel = topology.processors[0].parts.at(0);
  ASSERT_THAT(thirdLevel.parts, SizeIs(3));
  EXPECT_TRUE(thirdLevel.parts[0].isCore());
  EXPECT_TRUE(thirdLevel.parts[1].isCore());
  EXPECT_THAT(labels(thirdLevel.parts[2].caches), ElementsAre("L2 2 MiB"));
  EXPECT_THAT(thirdLevel.parts[2].parts, SizeIs(4));
  EXPECT_EQ(thirdLevel.coreCount, 6U);
}

TEST(Topology, CachesOfOneLevelWithTheSameCoresStandTogether) {
  TreeBuilder builder;
  builder.processor("P0");
  builder.core("P0.C0").cpus({0}).core("P0.C1").cpus({1});
  builder.cache("P0.I").number(PropCacheLevel, 3).number(PropCacheType, 1).cpus({0, 1});
  builder.cache("P0.D").number(PropCacheLevel, 3).number(PropCacheType, 2).cpus({0, 1});

  const Topology topology = readTopology(builder.build(), "x");

  ASSERT_THAT(topology.processors.at(0).parts, SizeIs(1));
  EXPECT_THAT(labels(topology.processors[0].parts[0].caches), ElementsAre("L1d", "L1i"));
}

TEST(Topology, CachesWithoutKnownSharersAreKeptAside) {
  const Topology topology = readTopology(Testing::smallBoard(), "x");

  EXPECT_THAT(labels(topology.processors.at(0).otherCaches), ElementsAre("System cache"));
  EXPECT_THAT(topology.processors.at(1).parts, SizeIs(0));
}

TEST(Topology, CoresWithoutKnownCpusStandForThemselves) {
  TreeBuilder builder;
  builder.processor("P0").core("P0.C0").core("P0.C1");
  builder.cache("P0.L3").number(PropCacheLevel, 5).cpus({0, 1});

  const Topology topology = readTopology(builder.build(), "x");

  EXPECT_THAT(topology.processors.at(0).parts, SizeIs(2));
  EXPECT_THAT(labels(topology.processors[0].otherCaches), ElementsAre("L3"));
}

TEST(Topology, CachesThatOverlapWithoutNestingLoseNoCore) {
  TreeBuilder builder;
  builder.processor("P0");
  for (unsigned int i = 0; i < 3; ++i) {
    builder.core("P0.C" + std::to_string(i)).cpus({i});
  }
  builder.cache("P0.A").number(PropCacheLevel, 4).cpus({0, 1});
  builder.cache("P0.B").number(PropCacheLevel, 4).cpus({1, 2});

  const Topology topology = readTopology(builder.build(), "x");

  EXPECT_THAT(coresOf(topology.processors.at(0).parts), SizeIs(3));
}

TEST(Topology, SizesAreThoseOfBigCaches) {
  TreeBuilder builder;
  builder.processor("P0").core("P0.C0").cpus({0});
  builder.cache("P0.L3").number(PropCacheLevel, 5).cpus({0});
  builder.number(PropCacheBlockSize, 64).number(PropCacheNumberOfBlocks, 1U << 30U);

  const Topology topology = readTopology(builder.build(), "x");

  EXPECT_THAT(labels(topology.processors.at(0).parts.at(0).caches), ElementsAre("L3 64 GiB"));
}

TEST(Topology, NeighboursOfOneShapeFormARun) {
  const Topology topology = readTopology(Testing::smallBoard(), "x");
  const TopologyPart& shared = topology.processors.at(0).parts.at(0);

  std::vector<std::size_t> lengths;
  for (const PartRun run : runsOfShape(shared.parts)) {
    lengths.push_back(run.size());
  }

  EXPECT_THAT(lengths, ElementsAre(3, 1));
  EXPECT_THAT(runsOfShape(shared.parts, States::Ignored), SizeIs(1));
}

TEST(Topology, StatesHaveNames) {
  EXPECT_EQ(stateNote(1), "");
  EXPECT_EQ(stateNote(12), "offline");
  EXPECT_EQ(stateNote(15), "empty socket");
  EXPECT_EQ(stateNote(16), "disabled");
  EXPECT_EQ(stateNote(24), "failed");
  EXPECT_EQ(stateNote(20), "status 20");
}

TEST(Topology, EqualCachesAreCounted) {
  const CacheUnit first = {"L2", 1U << 20U, 1};
  const CacheUnit off = {"L2", 1U << 20U, 16};

  EXPECT_EQ(labelsOf(std::vector<CacheUnit>{first, first, off}), "2 × L2 1 MiB, L2 1 MiB (disabled)");
}

TEST(Topology, TextsOfTheInventoryArePrintable) {
  const Topology topology = readTopology(Testing::strangeTexts(), "bad\nname");

  EXPECT_EQ(topology.systemName, "bad\\nname");
  EXPECT_EQ(topology.model, "A<b>&\"c\"\\n\\x1B[31m");
}

}  // namespace
}  // namespace Corvcim
