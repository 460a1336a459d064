#include "platform/inventory/sources/live/NodePaths.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

using Paths = std::vector<std::string>;

Core core(std::optional<unsigned int> number, const CpuSet& cpus) {
  return {.place = {.die = {}, .cluster = {}, .core = number}, .cpus = cpus};
}

Cache cache(unsigned int level, std::optional<CacheContents> contents, std::optional<unsigned int> id,
            const CpuSet& cpus) {
  Cache cache;
  cache.level = level;
  cache.contents = contents;
  cache.id = id;
  cache.cpus = cpus;
  return cache;
}

TEST(NodePaths, OfProcessorsHaveTheirNumberElseTheirLowestCpu) {
  EXPECT_EQ(processorPath({.id = 0, .lowestCpu = 0, .cpus = {}, .cores = {}}), "P0");
  EXPECT_EQ(processorPath({.id = 9999, .lowestCpu = 4, .cpus = {}, .cores = {}}), "P9999");
  EXPECT_EQ(processorPath({.id = 10000, .lowestCpu = 4, .cpus = {}, .cores = {}}), "P@4");
  EXPECT_EQ(processorPath({.id = {}, .lowestCpu = 8, .cpus = {}, .cores = {}}), "P@8");
}

TEST(NodePaths, OfCoresHaveTheirNumberElseTheirLowestCpu) {
  EXPECT_EQ(corePaths("P0", {core(0, {0}), core(12, {1}), core({}, {2})}), (Paths{"P0.C0", "P0.C12", "P0.C@2"}));
}

TEST(NodePaths, OfCoresWithOneNumberAllHaveTheirLowestCpu) {
  EXPECT_EQ(corePaths("P0", {core(3, {5, 6}), core(3, {7}), core(4, {8})}), (Paths{"P0.C@5", "P0.C@7", "P0.C4"}));
}

TEST(NodePaths, NameDiesAndClustersButTheFirst) {
  Core grouped = core(7, {1});
  grouped.place.die = 2;
  grouped.place.cluster = 3;
  Core first = core(7, {2});
  first.place.die = 0;
  first.place.cluster = 0;
  EXPECT_EQ(corePaths("P1", {grouped, first}), (Paths{"P1.D2.K3.C7", "P1.C7"}));
}

TEST(NodePaths, ThatWouldBeTooLongAreByCpu) {
  Core far = core(15210, {127});
  far.place.cluster = 15124;
  EXPECT_EQ(corePaths("P36", {far}), Paths{"P36.C@127"});
}

TEST(NodePaths, OfCachesHaveLevelContentsAndNumber) {
  const Cache numbered = cache(1, CacheContents::Data, 7, {3});
  const Cache unnumbered = cache(3, CacheContents::Unified, {}, {0, 1, 2});
  const Cache unknown = cache(2, {}, 7, {3});

  EXPECT_EQ(cachePaths("P1", {&numbered, &unnumbered, &unknown}), (Paths{"P1.L1d.7", "P1.L3@0", "P1.L2x.7"}));
}

TEST(NodePaths, OfTheLargestMachinesBuiltTodayFitFifteenCharacters) {
  const Cache last = cache(1, CacheContents::Instructions, 2047, {4095});
  const std::string processor = processorPath({.id = 31, .lowestCpu = 0, .cpus = {}, .cores = {}});

  for (const std::string& path :
       {processor, corePaths(processor, {core(511, {4095})}).front(), cachePaths(processor, {&last}).front()}) {
    EXPECT_LE(path.size(), 15U) << path;
    EXPECT_EQ(path.find(' '), std::string::npos);
  }
}

}  // namespace
}  // namespace Tarn::Inventory
