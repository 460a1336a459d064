#include <gtest/gtest.h>
#include <tarn/Instrumentation.h>

#include "platform/inventory/ProcessTree.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn {
namespace {

using namespace NodeLexicon;
using Inventory::TreeBuilder;

class Cursor : public testing::Test {
 protected:
  void SetUp() override {
    Inventory::setProcessTree(std::make_shared<const Inventory::Tree>(TreeBuilder()
                                                                          .system("system")
                                                                          .text(PropSystemModel, "PowerBox 300")
                                                                          .processor("P0")
                                                                          .status(15)
                                                                          .description("Socket 0")
                                                                          .core("P0.C0")
                                                                          .cache("P0.L1.0")
                                                                          .processor("P1")
                                                                          .description("Socket 1")
                                                                          .number(PropMaxClockSpeed, 2600)
                                                                          .text(PropStepping, "B0")
                                                                          .list(PropRequestedStatesSupported, {1, 2})
                                                                          .core("P1.C0")
                                                                          .status(12)
                                                                          .core("P1.C1")
                                                                          .cache("P1.L1.0")
                                                                          .cache("P1.L2.0")
                                                                          .build()));
  }
  void TearDown() override { Inventory::setProcessTree(nullptr); }

  /// The printable paths from here to the end.
  static std::vector<std::string> rest(Instrumentation& cursor) {
    std::vector<std::string> paths;
    for (; cursor; ++cursor) {
      paths.push_back(cursor.convertPathToString(cursor.getPathToNode()));
    }
    return paths;
  }

  static std::string internal(const std::string& printable) { return Instrumentation().convertStringToPath(printable); }

  using Paths = std::vector<std::string>;
};

void expectNoNode(const Instrumentation& cursor) {
  unsigned int number = 7;
  std::string text = "kept";
  std::vector<unsigned int> list{7};
  EXPECT_FALSE(cursor);
  EXPECT_EQ(cursor.getNodeStatus(), 0U);
  EXPECT_EQ(cursor.getNodeDescription(), "");
  EXPECT_EQ(cursor.getPathToNode(), "");
  EXPECT_EQ(cursor.getPathToParentNode(), "");
  EXPECT_FALSE(cursor.getProperty(PropMaxClockSpeed, number));
  EXPECT_FALSE(cursor.getProperty(PropStepping, text));
  EXPECT_FALSE(cursor.getProperty(PropRequestedStatesSupported, list));
  EXPECT_EQ(number, 7U);
  EXPECT_EQ(text, "kept");
  EXPECT_EQ(list, std::vector<unsigned int>{7});
}

TEST_F(Cursor, StandsOnNoNodeAtFirst) {
  expectNoNode(Instrumentation());
}

TEST_F(Cursor, WalksTheNodesOfAType) {
  Instrumentation cursor;

  cursor.selectNode(NodeSystem);
  EXPECT_EQ(rest(cursor), Paths{"system"});
  cursor.selectNode(NodeProcessor);
  EXPECT_EQ(rest(cursor), (Paths{"P0", "P1"}));
  cursor.selectNode(NodeProcessorCore);
  EXPECT_EQ(rest(cursor), (Paths{"P0.C0", "P1.C0", "P1.C1"}));
  cursor.selectNode(NodeCacheMemory);
  EXPECT_EQ(rest(cursor), (Paths{"P0.L1.0", "P1.L1.0", "P1.L2.0"}));
}

TEST_F(Cursor, SelectsNothingOfATypeThatThereIsNot) {
  Instrumentation cursor;
  cursor.selectNode(NodeProcessor);

  cursor.selectNode(static_cast<NodeType>(63));

  expectNoNode(cursor);
}

TEST_F(Cursor, StaysPastTheEnd) {
  Instrumentation cursor;
  cursor.selectNode(NodeSystem);

  ++cursor;
  expectNoNode(cursor);
  ++ ++cursor;
  expectNoNode(cursor);
  ++cursor;
  cursor.selectNode(NodeSystem);
  EXPECT_TRUE(cursor);
}

TEST_F(Cursor, AdvancingOnNoNodeStaysThere) {
  Instrumentation cursor;
  ++cursor;
  expectNoNode(cursor);
}

TEST_F(Cursor, SelectsTheNodeWithAPath) {
  Instrumentation cursor;

  cursor.selectNode(internal("P1.C0"));

  ASSERT_TRUE(cursor);
  EXPECT_EQ(cursor.convertPathToString(cursor.getPathToNode()), "P1.C0");
  EXPECT_EQ(cursor.convertPathToString(cursor.getPathToParentNode()), "P1");
  EXPECT_EQ(cursor.getNodeStatus(), 12U);
  EXPECT_FALSE(++cursor) << "one node is the whole selection";
}

TEST_F(Cursor, SelectsNothingForAPathOfNoNode) {
  Instrumentation cursor;
  for (const std::string& path : {internal("P9"), internal(" P1"), internal(""), internal("p1"), std::string("P1"),
                                  std::string(), std::string("/"), std::string("P1/")}) {
    cursor.selectNode(NodeProcessor);
    cursor.selectNode(path);
    expectNoNode(cursor);
  }
}

TEST_F(Cursor, ConvertsEveryPathThereAndBack) {
  Instrumentation cursor;
  for (const NodeType type : {NodeSystem, NodeProcessor, NodeProcessorCore, NodeCacheMemory}) {
    for (cursor.selectNode(type); cursor; ++cursor) {
      const std::string path = cursor.getPathToNode();
      const std::string printable = cursor.convertPathToString(path);
      EXPECT_NE(printable, path) << "the forms cannot be mistaken for each other";
      EXPECT_EQ(cursor.convertStringToPath(printable), path);
      const std::string parent = cursor.getPathToParentNode();
      EXPECT_EQ(cursor.convertStringToPath(cursor.convertPathToString(parent)), parent);
    }
  }
}

TEST_F(Cursor, ConvertsWhatIsNoInternalPathToNothing) {
  EXPECT_EQ(Instrumentation().convertPathToString("P1"), "");
  EXPECT_EQ(Instrumentation().convertPathToString(""), "");
}

TEST_F(Cursor, TheSystemHasNoParent) {
  Instrumentation cursor;
  cursor.selectNode(NodeSystem);
  EXPECT_EQ(cursor.getPathToParentNode(), "");
}

TEST_F(Cursor, FiltersToTheNodeItself) {
  Instrumentation cursor;
  cursor.selectNode(NodeProcessor);

  cursor.setFilter(PathSelf, internal("P1"));

  EXPECT_EQ(rest(cursor), Paths{"P1"});
}

TEST_F(Cursor, FiltersToTheNodesBelowAPath) {
  Instrumentation cursor;

  cursor.selectNode(NodeCacheMemory);
  cursor.setFilter(PathChildren, internal("P1"));
  EXPECT_EQ(rest(cursor), (Paths{"P1.L1.0", "P1.L2.0"}));

  cursor.selectNode(NodeProcessorCore);
  cursor.setFilter(PathChildren, internal("P0"));
  EXPECT_EQ(rest(cursor), Paths{"P0.C0"});

  cursor.selectNode(NodeCacheMemory);
  cursor.setFilter(PathChildren, internal("system"));
  EXPECT_EQ(rest(cursor), (Paths{"P0.L1.0", "P1.L1.0", "P1.L2.0"})) << "at any depth";

  cursor.selectNode(NodeProcessor);
  cursor.setFilter(PathChildren, internal("P1"));
  EXPECT_EQ(rest(cursor), Paths{}) << "a node is not below itself";
}

TEST_F(Cursor, FiltersToNothingWhereNoNodePasses) {
  Instrumentation cursor;

  cursor.selectNode(NodeCacheMemory);
  cursor.setFilter(PathSelf, internal("P1"));
  expectNoNode(cursor);

  cursor.selectNode(NodeCacheMemory);
  cursor.setFilter(PathChildren, internal("P1.L1.0"));
  expectNoNode(cursor);

  cursor.selectNode(NodeCacheMemory);
  cursor.setFilter(PathChildren, internal("P9"));
  expectNoNode(cursor);

  cursor.selectNode(NodeCacheMemory);
  cursor.setFilter(PathSelf, "");
  expectNoNode(cursor);
}

TEST_F(Cursor, FiltersNothingWithoutASelection) {
  Instrumentation cursor;
  cursor.setFilter(PathSelf, internal("P1"));
  expectNoNode(cursor);
}

TEST_F(Cursor, AFilterStartsTheSelectionAnew) {
  Instrumentation cursor;
  cursor.selectNode(NodeProcessorCore);
  while (cursor) {
    ++cursor;
  }

  cursor.setFilter(PathChildren, internal("P1"));

  EXPECT_EQ(rest(cursor), (Paths{"P1.C0", "P1.C1"}));
}

TEST_F(Cursor, FiltersRestrictWhatIsLeftUntilTheNextSelection) {
  Instrumentation cursor;
  cursor.selectNode(NodeProcessorCore);
  cursor.setFilter(PathChildren, internal("P1"));
  cursor.setFilter(PathSelf, internal("P1.C1"));
  EXPECT_EQ(rest(cursor), Paths{"P1.C1"});

  cursor.setFilter(PathChildren, internal("P0"));
  EXPECT_EQ(rest(cursor), Paths{});

  cursor.selectNode(NodeProcessorCore);
  EXPECT_EQ(rest(cursor), (Paths{"P0.C0", "P1.C0", "P1.C1"}));
}

TEST_F(Cursor, ReadsPropertiesByTheirType) {
  Instrumentation cursor;
  cursor.selectNode(internal("P1"));
  unsigned int number = 0;
  std::string text;
  std::vector<unsigned int> list{9};

  EXPECT_TRUE(cursor.getProperty(PropMaxClockSpeed, number));
  EXPECT_TRUE(cursor.getProperty(PropStepping, text));
  EXPECT_TRUE(cursor.getProperty(PropRequestedStatesSupported, list));

  EXPECT_EQ(number, 2600U);
  EXPECT_EQ(text, "B0");
  EXPECT_EQ(list, (std::vector<unsigned int>{1, 2}));
}

TEST_F(Cursor, ReadsNoPropertyOfAnotherTypeAndNoneThatIsMissing) {
  Instrumentation cursor;
  cursor.selectNode(internal("P1"));
  unsigned int number = 7;
  std::string text = "kept";
  std::vector<unsigned int> list{7};

  EXPECT_FALSE(cursor.getProperty(PropStepping, number));
  EXPECT_FALSE(cursor.getProperty(PropRequestedStatesSupported, number));
  EXPECT_FALSE(cursor.getProperty(PropMaxClockSpeed, text));
  EXPECT_FALSE(cursor.getProperty(PropMaxClockSpeed, list));
  EXPECT_FALSE(cursor.getProperty(PropDataWidth, number));
  EXPECT_FALSE(cursor.getProperty(static_cast<Properties>(500), number));

  EXPECT_EQ(number, 7U);
  EXPECT_EQ(text, "kept");
  EXPECT_EQ(list, std::vector<unsigned int>{7});
}

TEST_F(Cursor, ReadsStatusAndDescription) {
  Instrumentation cursor;
  cursor.selectNode(NodeProcessor);

  EXPECT_EQ(cursor.getNodeStatus(), 15U);
  EXPECT_EQ(cursor.getNodeDescription(), "Socket 0");
  ++cursor;
  EXPECT_EQ(cursor.getNodeStatus(), 1U);
  EXPECT_EQ(cursor.getNodeDescription(), "Socket 1");
}

TEST_F(Cursor, CopiesWalkOnTheirOwn) {
  Instrumentation cursor;
  cursor.selectNode(NodeProcessor);
  Instrumentation copy = cursor;

  ++cursor;

  EXPECT_EQ(rest(copy), (Paths{"P0", "P1"}));
  EXPECT_EQ(rest(cursor), Paths{"P1"});
}

TEST_F(Cursor, KeepsItsTreeWhenTheProcessGetsAnother) {
  Instrumentation cursor;
  cursor.selectNode(NodeProcessor);

  Inventory::setProcessTree(std::make_shared<const Inventory::Tree>(TreeBuilder().processor("Other").build()));

  EXPECT_EQ(rest(cursor), (Paths{"P0", "P1"}));
  Instrumentation later;
  later.selectNode(NodeProcessor);
  EXPECT_EQ(rest(later), Paths{"Other"});
}

TEST_F(Cursor, AnEmptyTreeHasNothingToSelect) {
  Inventory::setProcessTree(std::make_shared<const Inventory::Tree>());
  Instrumentation cursor;
  for (const NodeType type : {NodeSystem, NodeProcessor, NodeProcessorCore, NodeCacheMemory}) {
    cursor.selectNode(type);
    expectNoNode(cursor);
  }
}

}  // namespace
}  // namespace Tarn
