#include "platform/inventory/tree/TreeBuilder.h"

#include <gtest/gtest.h>

#include <functional>
#include <stdexcept>

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;

TEST(TreeBuilder, PutsNodesBelowTheOnesBefore) {
  const Tree tree =
      TreeBuilder().system().processor("P0").core("P0.C0").cache("P0.L1d.0").processor("P1").core("P1.C0").build();

  struct Row {
    const char* path;
    NodeType type;
    NodeIndex parent;
    NodeIndex end;
  };
  const Row expected[] = {
      {"system", NodeSystem, noNode, 6},   {"P0", NodeProcessor, 0, 4}, {"P0.C0", NodeProcessorCore, 1, 3},
      {"P0.L1d.0", NodeCacheMemory, 1, 4}, {"P1", NodeProcessor, 0, 6}, {"P1.C0", NodeProcessorCore, 4, 6},
  };
  ASSERT_EQ(tree.nodes().size(), std::size(expected));
  for (NodeIndex i = 0; i < std::size(expected); ++i) {
    EXPECT_EQ(tree.node(i).path(), expected[i].path);
    EXPECT_EQ(tree.node(i).type, expected[i].type) << expected[i].path;
    EXPECT_EQ(tree.node(i).parent, expected[i].parent) << expected[i].path;
    EXPECT_EQ(tree.node(i).end, expected[i].end) << expected[i].path;
  }
}

TEST(TreeBuilder, StandsProcessorsAtTheTopWithoutASystem) {
  const Tree tree = TreeBuilder().processor("P0").core("P0.C0").build();

  EXPECT_EQ(tree.node(0).parent, noNode);
  EXPECT_TRUE(tree.ofType(NodeSystem).empty());
}

TEST(TreeBuilder, DescribesTheNodeAddedLast) {
  const Tree tree = TreeBuilder()
                        .processor("P0")
                        .number(PropMaxClockSpeed, 3000)
                        .text(PropProcessorName, "Some CPU")
                        .number(PropDataWidth, 64)
                        .list(PropRequestedStatesSupported, {1, 2})
                        .core("P0.C0")
                        .status(Status::offline)
                        .description("Core 0")
                        .cpus({0, 4})
                        .build();

  const Node& processor = tree.node(0);
  EXPECT_EQ(processor.status, 1U);
  EXPECT_EQ(*tree.number(processor, PropMaxClockSpeed), 3000U);
  EXPECT_EQ(*tree.number(processor, PropDataWidth), 64U);
  EXPECT_EQ(*tree.text(processor, PropProcessorName), "Some CPU");
  EXPECT_EQ(*tree.list(processor, PropRequestedStatesSupported), (std::vector<unsigned int>{1, 2}));
  EXPECT_EQ(tree.number(processor, PropAddressWidth), nullptr);
  EXPECT_EQ(tree.text(processor, PropStepping), nullptr);
  EXPECT_EQ(tree.numbers(processor).front().id, PropDataWidth) << "sorted";
  const Node& core = tree.node(1);
  EXPECT_EQ(core.status, Status::offline);
  EXPECT_EQ(core.description, "Core 0");
  EXPECT_EQ(core.cpus, (CpuSet{0, 4}));
  EXPECT_TRUE(tree.numbers(core).empty());
}

TEST(TreeBuilder, TreesThatSayTheSameAreEqual) {
  const auto make = [](unsigned int width) {
    return TreeBuilder().system().processor("P0").number(PropDataWidth, width).unread({"a", "b", "c"}).build();
  };

  EXPECT_EQ(make(64), make(64));
  EXPECT_NE(make(64), make(32));
}

TEST(TreeBuilder, KeepsTextsAsValidUtf8) {
  const Tree tree = TreeBuilder().system().description("A\xFF").text(PropSystemModel, "B\xFF").build();

  EXPECT_EQ(tree.node(0).description, "A\xEF\xBF\xBD");
  EXPECT_EQ(*tree.text(tree.node(0), PropSystemModel), "B\xEF\xBF\xBD");
}

TEST(TreeBuilder, KeepsTheOriginOfEachValueWhereOriginsAreCollected) {
  const auto origin = [](const char* source) { return [source] { return Origin{source, "raw", "rule"}; }; };
  const Tree tree = TreeBuilder(Detail::WithOrigins)
                        .processor("P0")
                        .status(Status::offline)
                        .from(origin("status"))
                        .description("Processor 0")
                        .from(origin("description"))
                        .number(PropMaxClockSpeed, 3000)
                        .from(origin("clock"))
                        .number(PropDataWidth, 64)
                        .text(PropProcessorName, "Some CPU")
                        .from(origin("name\xFF"))
                        .list(PropRequestedStatesSupported, {1})
                        .from(origin("states"))
                        .core("P0.C0")
                        .build();

  EXPECT_EQ(*tree.statusOrigin(0), (Origin{"status", "raw", "rule"}));
  EXPECT_EQ(tree.descriptionOrigin(0)->source, "description");
  EXPECT_EQ(tree.origin(0, PropMaxClockSpeed)->source, "clock");
  EXPECT_EQ(tree.origin(0, PropProcessorName)->source, "name\xEF\xBF\xBD");
  EXPECT_EQ(tree.origin(0, PropRequestedStatesSupported)->source, "states");
  EXPECT_EQ(tree.origin(0, PropDataWidth), nullptr) << "none was given";
  EXPECT_EQ(tree.statusOrigin(1), nullptr);
  EXPECT_EQ(tree.origin(noNode, PropDataWidth), nullptr);
}

TEST(TreeBuilder, AsksForNoOriginUnlessOriginsAreCollected) {
  const Tree tree =
      TreeBuilder().processor("P0").status(1).from([]() -> Origin { throw std::logic_error("was asked"); }).build();

  EXPECT_EQ(tree.statusOrigin(0), nullptr);
}

TEST(TreeBuilder, OriginsDoNotCountWhenTreesAreCompared) {
  const auto make = [](Detail detail) {
    return TreeBuilder(detail).system().status(1).from([] { return Origin{"a", "b", "c"}; }).build();
  };

  EXPECT_EQ(make(Detail::WithOrigins), make(Detail::Values));
}

TEST(TreeBuilder, DisagreementsCountWhenTreesAreCompared) {
  const Disagreement entry{"P0", "Family", "1", "here", "2", "there"};
  const Tree tree = TreeBuilder().system().disagreement(entry).build();

  ASSERT_EQ(tree.disagreements().size(), 1U);
  EXPECT_EQ(tree.disagreements()[0], entry);
  EXPECT_NE(tree, TreeBuilder().system().build());
}

TEST(TreeBuilder, IsEmptyAfterBuilding) {
  TreeBuilder builder;
  const Tree first = builder.system().processor("P0").build();

  const Tree second = builder.system().build();

  EXPECT_EQ(second.nodes().size(), 1U);
  EXPECT_TRUE(second.ofType(NodeProcessor).empty());
}

struct Refusal {
  const char* expected;
  std::function<void(TreeBuilder&)> action;
};

class TreeBuilderRefusal : public testing::TestWithParam<Refusal> {};

TEST_P(TreeBuilderRefusal, SaysWhatCannotBe) {
  TreeBuilder builder;
  try {
    GetParam().action(builder);
    FAIL() << "was accepted";
  } catch (const std::invalid_argument& refused) {
    EXPECT_STREQ(refused.what(), GetParam().expected);
  }
}

INSTANTIATE_TEST_SUITE_P(
    All, TreeBuilderRefusal,
    testing::Values(
        Refusal{"system \"b\": the system is the first node, and the only one of its type",
                [](TreeBuilder& b) { b.system("a").system("b"); }},
        Refusal{"system \"system\": the system is the first node, and the only one of its type",
                [](TreeBuilder& b) { b.processor("P0").system(); }},
        Refusal{"core \"C0\": cores and caches belong below a processor, and there is none yet",
                [](TreeBuilder& b) { b.system().core("C0"); }},
        Refusal{"cache \"L1\": cores and caches belong below a processor, and there is none yet",
                [](TreeBuilder& b) { b.cache("L1"); }},
        Refusal{"processor \"\": a path consists of visible ASCII characters without blanks, at least one",
                [](TreeBuilder& b) { b.processor(""); }},
        Refusal{"processor \"P 0\": a path consists of visible ASCII characters without blanks, at least one",
                [](TreeBuilder& b) { b.processor("P 0"); }},
        Refusal{"processor \"P\xEF\xBF\xBD\": a path consists of visible ASCII characters without blanks, at least one",
                [](TreeBuilder& b) { b.processor("P\xFF"); }},
        Refusal{"core \"P0\": another node has the same path",
                [](TreeBuilder& b) { b.processor("P0").core("P0").build(); }},
        Refusal{"node \"x\": there is no node type 7", [](TreeBuilder& b) { b.node(static_cast<NodeType>(7), "x"); }},
        Refusal{"processor \"P0\": there is no property 6",
                [](TreeBuilder& b) { b.processor("P0").number(static_cast<Properties>(6), 1); }},
        Refusal{"processor \"P0\": property CacheLevel belongs to a cache node",
                [](TreeBuilder& b) { b.processor("P0").number(PropCacheLevel, 3); }},
        Refusal{"processor \"P0\": property Stepping is a text, not a number",
                [](TreeBuilder& b) { b.processor("P0").number(PropStepping, 3); }},
        Refusal{"processor \"P0\": property Family is a number, not a text",
                [](TreeBuilder& b) { b.processor("P0").text(PropFamily, "x"); }},
        Refusal{"processor \"P0\": property Family is a number, not a list of numbers",
                [](TreeBuilder& b) { b.processor("P0").list(PropFamily, {1}); }},
        Refusal{"processor \"P0\": property Family is given twice",
                [](TreeBuilder& b) { b.processor("P0").number(PropFamily, 1).number(PropFamily, 1); }},
        Refusal{"processor \"P0\": an origin follows the value that it explains",
                [](TreeBuilder& b) {
                  b = TreeBuilder(Detail::WithOrigins);
                  b.processor("P0").from([] { return Origin(); });
                }},
        Refusal{"processor \"P0\": an origin follows the value that it explains",
                [](TreeBuilder& b) {
                  b = TreeBuilder(Detail::WithOrigins);
                  b.processor("P0").status(1).cpus({0}).from([] { return Origin(); });
                }},
        Refusal{"NUMA node 1 is not above those before it",
                [](TreeBuilder& b) {
                  b.numaNode({1, {0}}).numaNode({1, {1}});
                }},
        Refusal{"NUMA node 2 has no CPUs",
                [](TreeBuilder& b) {
                  b.numaNode({2, {}});
                }},
        Refusal{"inventory: there is no node yet to describe", [](TreeBuilder& b) { b.status(1); }}));

}  // namespace
}  // namespace Tarn::Inventory
