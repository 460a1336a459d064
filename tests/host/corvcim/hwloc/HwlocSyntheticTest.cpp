#include <gtest/gtest.h>

#include <cstdlib>

#include "host/corvcim/hwloc/HwlocSource.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Corvcim::Testing {
namespace {

using Tarn::Inventory::CpuSet;
using Tarn::Inventory::Tree;
using Tarn::Inventory::TreeBuilder;
using namespace Tarn::NodeLexicon;

Tree synthetic(const std::string& description) {
  return readHwloc("hwloc-synthetic:" + description);
}

std::string complaint(const std::string& source) {
  try {
    readHwloc(source);
    return "";
  } catch (const Tarn::Inventory::InventoryError& error) {
    return error.what();
  }
}

struct CacheFacts {
  const char* path;
  const char* description;
  const char* name;
  unsigned int level;
  unsigned int type;
  unsigned int blocks;
  CpuSet cpus;
};

void addCache(TreeBuilder& tree, const CacheFacts& facts) {
  tree.cache(facts.path)
      .description(facts.description)
      .cpus(facts.cpus)
      .number(PropCacheLevel, facts.level)
      .text(PropCacheName, facts.name)
      .number(PropCacheType, facts.type)
      .number(PropCacheBlockSize, 64)
      .number(PropCacheNumberOfBlocks, facts.blocks)
      .number(PropCacheConsumableBlocks, facts.blocks);
}

void addProcessor(TreeBuilder& tree, const char* path, const char* description, const CpuSet& cpus,
                  unsigned int cores) {
  tree.processor(path)
      .description(description)
      .cpus(cpus)
      .number(PropFamily, 2)
      .number(PropHardwareThreads, cpus.count())
      .number(PropProcessorCores, cores)
      .number(PropEnabledCores, cores)
      .list(PropRequestedStatesSupported, {1});
}

TEST(HwlocSynthetic, GivesItsWholeTree) {
  TreeBuilder expected;
  expected.system().description("Computer system");
  addProcessor(expected, "P0", "Processor 0", {0, 1, 2, 3}, 2);
  expected.core("P0.C0").description("Core 0").cpus({0, 1});
  expected.core("P0.C1").description("Core 1").cpus({2, 3});
  addCache(expected, {"P0.L1d@0", "L1 data cache at CPU 0", "L1d", 3, 2, 768, {0, 1}});
  addCache(expected, {"P0.L1d@2", "L1 data cache at CPU 2", "L1d", 3, 2, 768, {2, 3}});
  addCache(expected, {"P0.L1i@0", "L1 instruction cache at CPU 0", "L1i", 3, 1, 512, {0, 1}});
  addCache(expected, {"P0.L1i@2", "L1 instruction cache at CPU 2", "L1i", 3, 1, 512, {2, 3}});
  addCache(expected, {"P0.L3@0", "L3 cache at CPU 0", "L3", 5, 3, 262144, {0, 1, 2, 3}});
  addProcessor(expected, "P1", "Processor 1", {4, 5, 6, 7}, 2);
  expected.core("P1.C2").description("Core 2").cpus({4, 5});
  expected.core("P1.C3").description("Core 3").cpus({6, 7});
  addCache(expected, {"P1.L1d@4", "L1 data cache at CPU 4", "L1d", 3, 2, 768, {4, 5}});
  addCache(expected, {"P1.L1d@6", "L1 data cache at CPU 6", "L1d", 3, 2, 768, {6, 7}});
  addCache(expected, {"P1.L1i@4", "L1 instruction cache at CPU 4", "L1i", 3, 1, 512, {4, 5}});
  addCache(expected, {"P1.L1i@6", "L1 instruction cache at CPU 6", "L1i", 3, 1, 512, {6, 7}});
  addCache(expected, {"P1.L3@4", "L3 cache at CPU 4", "L3", 5, 3, 262144, {4, 5, 6, 7}});

  const Tree tree = synthetic("package:2 l3:1(size=16777216) l1d:2(size=49152) l1i:1(size=32768) core:1 pu:2");

  EXPECT_EQ(Tarn::Inventory::writeJson(tree), Tarn::Inventory::writeJson(expected.build()));
}

TEST(HwlocSynthetic, NumbersOfCpusAreThoseOfTheDescription) {
  const Tree tree = synthetic("package:2 core:2 pu:2(indexes=0,4,1,5,2,6,3,7)");

  EXPECT_EQ(tree.node(tree.find("/P0")).cpus.toList(), "0-1,4-5");
  EXPECT_EQ(tree.node(tree.find("/P1.C2")).cpus.toList(), "2,6");
}

TEST(HwlocSynthetic, WithoutPackagesThereIsOneProcessor) {
  const Tree tree = synthetic("core:2 pu:1");

  EXPECT_EQ(tree.ofType(NodeProcessor).size(), 1U);
  EXPECT_EQ(tree.node(tree.find("/P@0")).cpus.toList(), "0-1");
  EXPECT_EQ(tree.ofType(NodeProcessorCore).size(), 2U);
}

TEST(HwlocSynthetic, WithoutCoresNoneAreMadeUp) {
  const Tree tree = synthetic("package:1 pu:4");

  const auto& processor = tree.node(tree.find("/P0"));
  EXPECT_EQ(tree.ofType(NodeProcessorCore).size(), 0U);
  EXPECT_EQ(tree.number(processor, PropProcessorCores), nullptr);
  EXPECT_EQ(*tree.number(processor, PropHardwareThreads), 4U);
}

TEST(HwlocSynthetic, FourthLevelCachesHaveTheCodeOfAnyOther) {
  const Tree tree = synthetic("package:1 l4:1 core:2 pu:1");

  EXPECT_EQ(*tree.number(tree.node(tree.find("/P0.L4@0")), PropCacheLevel), 1U);
}

TEST(HwlocSynthetic, OfTheLargestMachinesToo) {
  const Tree tree = synthetic("package:8 l3:8 l2:16 core:1 pu:2");

  EXPECT_EQ(tree.ofType(NodeProcessorCore).size(), 1024U);
  for (const auto& node : tree.nodes()) {
    EXPECT_LE(node.path().size(), 15U) << node.path();
  }
}

TEST(HwlocSynthetic, WhatIsNoDescriptionIsRefused) {
  const std::string expected =
      "hwloc does not understand the description; it takes levels and how many there are of each in the one above: "
      "\"package:2 l3:1 l2:4 core:1 pu:2\"";

  EXPECT_EQ(complaint("hwloc-synthetic:foo"), "cannot read the inventory: \"foo\": " + expected);
  EXPECT_EQ(complaint("hwloc-synthetic:package:2 pu:"), "cannot read the inventory: \"package:2 pu:\": " + expected);
}

TEST(HwlocSynthetic, MoreCpusThanAnInventoryCanHaveAreRefused) {
  EXPECT_EQ(complaint("hwloc-synthetic:package:4096 pu:17"),
            "cannot read the inventory: \"package:4096 pu:17\": it describes more than 65536 CPUs; describe a smaller "
            "machine");
  EXPECT_NE(complaint("hwloc-synthetic:99999 99999"), "");
  EXPECT_NE(complaint("hwloc-synthetic:pu:99999999999999999999999"), "");
  EXPECT_EQ(complaint("hwloc-synthetic:package:2 [numa(memory=99999999999)] l3:1(size=99999999) pu:2"), "");
}

TEST(HwlocSynthetic, VariablesOfTheEnvironmentDoNotCount) {
  setenv("HWLOC_SYNTHETIC", "package:7 pu:1", 1);
  setenv("HWLOC_XMLFILE", "/nowhere.xml", 1);
  setenv("HWLOC_COMPONENTS", "stop", 1);
  setenv("HWLOC_FSROOT", "/nowhere", 1);

  EXPECT_EQ(synthetic("package:2 pu:1").ofType(NodeProcessor).size(), 2U);
  EXPECT_EQ(std::getenv("HWLOC_SYNTHETIC"), nullptr);
}

TEST(HwlocSynthetic, SourcesOfTheLibraryAreNotConverted) {
  const std::string end = "it names no description to convert; --from takes hwloc:FILE or hwloc-synthetic:DESCRIPTION";

  EXPECT_EQ(complaint("live"), "cannot convert the inventory: \"live\": " + end);
  EXPECT_EQ(complaint("hwloc-synthetic:"), "cannot convert the inventory: \"hwloc-synthetic:\": " + end);
}

}  // namespace
}  // namespace Corvcim::Testing
