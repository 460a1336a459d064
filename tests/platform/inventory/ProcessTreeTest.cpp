#include "platform/inventory/ProcessTree.h"

#include <gtest/gtest.h>
#include <sys/utsname.h>
#include <tarn/Common.h>
#include <tarn/Instrumentation.h>

#include <algorithm>
#include <cstdlib>
#include <latch>
#include <thread>

#include "platform/inventory/sources/Source.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/platform/inventory/Scratch.h"

namespace Tarn::Inventory {
namespace {

class ProcessTree : public testing::Test {
 protected:
  ProcessTree() {
    ::setenv("CORVANE_CONFIG", (scratch_.name() + "/none").c_str(), 1);
    ::unsetenv("CORVANE_INVENTORY");
    setProcessTree(nullptr);
  }
  ScratchDirectory scratch_;
};

TEST_F(ProcessTree, IsTheLiveMachineByDefault) {
  const Tree live = loadInventory("live");
  // The current clock speed may differ from one moment to the next; the parts may not.
  ASSERT_EQ(processTree()->nodes().size(), live.nodes().size());
  for (std::size_t i = 0; i < live.nodes().size(); ++i) {
    EXPECT_EQ(processTree()->nodes()[i].internalPath, live.nodes()[i].internalPath);
  }
}

TEST_F(ProcessTree, IsWhatTheConfigurationNames) {
  const std::string source = "json:" + fixtures + "hybrid-laptop/tree.json";
  ::setenv("CORVANE_CONFIG", scratch_.write("conf", "inventory = " + source + "\n").c_str(), 1);

  EXPECT_EQ(*processTree(), loadInventory(source));
}

TEST_F(ProcessTree, IsWhatTheOverrideNamesAboveTheConfiguration) {
  const std::string source = "root:" + fixtures + "arm64-board/root.txt";
  ::setenv("CORVANE_CONFIG", scratch_.write("conf", "inventory = json:/nothing\n").c_str(), 1);
  ::setenv("CORVANE_INVENTORY", source.c_str(), 1);

  EXPECT_EQ(*processTree(), loadInventory(source));
}

TEST_F(ProcessTree, IsReadOnce) {
  ::setenv("CORVANE_INVENTORY", ("json:" + fixtures + "container/tree.json").c_str(), 1);
  const std::shared_ptr<const Tree> first = processTree();
  ::setenv("CORVANE_INVENTORY", "json:/nothing", 1);

  EXPECT_EQ(processTree(), first);
  EXPECT_EQ(Instrumentation().operator bool(), false);
  EXPECT_EQ(processTree(), first);
}

TEST_F(ProcessTree, AFailedLoadIsToldAndTriedAgain) {
  const std::string file = scratch_.name() + "/tree.json";
  ::setenv("CORVANE_INVENTORY", ("json:" + file).c_str(), 1);

  for (int attempt = 0; attempt < 2; ++attempt) {
    try {
      const Instrumentation cursor;
      FAIL() << "there is nothing to read";
    } catch (const std::exception& error) {
      EXPECT_EQ(error.what(), "cannot read the inventory: " + file +
                                  ": no such file or directory; name a file that holds an inventory as JSON");
    }
  }
  scratch_.write("tree.json", contentsOf(fixtures + "container/tree.json"));
  Instrumentation cursor;
  cursor.selectNode(NodeLexicon::NodeProcessor);
  EXPECT_TRUE(cursor);
}

TEST_F(ProcessTree, AFailedLoadIsLoggedOnce) {
  const std::string log = scratch_.name() + "/log";
  ::setenv("CORVANE_LOG", ("error:file:" + log).c_str(), 1);
  ::setenv("CORVANE_INVENTORY", "json:/nothing/here", 1);
  for (int attempt = 0; attempt < 3; ++attempt) {
    EXPECT_THROW(processTree(), InventoryError);
  }
  ::setenv("CORVANE_INVENTORY", "nonsense", 1);
  EXPECT_THROW(processTree(), InventoryError);

  const std::string text = contentsOf(log);
  EXPECT_EQ(std::ranges::count(text, '\n'), 2) << text;
  EXPECT_NE(text.find(" error Corvane.Inventory "), std::string::npos) << text;
  EXPECT_NE(text.find(" cannot read the inventory: /nothing/here: no such file or directory; "), std::string::npos)
      << text;
}

TEST_F(ProcessTree, IsReplacedAndLoadedAnew) {
  ::setenv("CORVANE_INVENTORY", ("json:" + fixtures + "container/tree.json").c_str(), 1);
  const auto mine = std::make_shared<const Tree>(TreeBuilder().system().build());

  setProcessTree(mine);
  EXPECT_EQ(processTree(), mine);

  setProcessTree(nullptr);
  EXPECT_EQ(*processTree(), loadInventory("json:" + fixtures + "container/tree.json"));
}

std::string nameOfThisHost() {
  utsname kernel{};
  return ::uname(&kernel) == 0 ? kernel.nodename : "";
}

TEST_F(ProcessTree, SystemNameOfThisMachineIsTheKernels) {
  EXPECT_EQ(getSystemName(), nameOfThisHost());
  processTree();
  EXPECT_EQ(getSystemName(), nameOfThisHost());
}

TEST_F(ProcessTree, SystemNameOfAnotherMachineIsTheInventorys) {
  ::setenv("CORVANE_INVENTORY", ("root:" + fixtures + "named-machine/root.txt").c_str(), 1);
  EXPECT_EQ(getSystemName(), "node17.example");

  setProcessTree(nullptr);
  ::setenv("CORVANE_INVENTORY", ("json:" + fixtures + "named-machine/tree.json").c_str(), 1);
  EXPECT_EQ(getSystemName(), "node17.example");
}

TEST_F(ProcessTree, SystemNameOfAnotherMachineWithoutANameIsNotThisHosts) {
  ::setenv("CORVANE_INVENTORY", ("json:" + fixtures + "container/tree.json").c_str(), 1);
  EXPECT_EQ(getSystemName(), "unnamed");

  setProcessTree(std::make_shared<const Tree>(TreeBuilder().system().text(PropSystemName, "").build()));
  EXPECT_EQ(getSystemName(), "unnamed");
}

TEST_F(ProcessTree, SystemNameOfAnInventoryThatCannotBeReadIsNotThisHosts) {
  ::setenv("CORVANE_INVENTORY", "json:/nothing/here", 1);
  EXPECT_EQ(getSystemName(), "unnamed");
}

TEST_F(ProcessTree, FirstCursorsOfManyThreadsShareOneTree) {
  ::setenv("CORVANE_INVENTORY", ("root:" + fixtures + "dual-socket-server/root.txt").c_str(), 1);
  constexpr int threads = 16;
  std::latch start(threads);
  std::vector<std::shared_ptr<const Tree>> seen(threads);
  std::vector<unsigned int> caches(threads);
  std::vector<std::jthread> running;

  for (std::size_t i = 0; i < threads; ++i) {
    running.emplace_back([&, i] {
      start.arrive_and_wait();
      Instrumentation cursor;
      for (cursor.selectNode(NodeLexicon::NodeCacheMemory); cursor; ++cursor) {
        ++caches[i];
      }
      seen[i] = processTree();
    });
  }
  running.clear();

  EXPECT_EQ(seen, std::vector<std::shared_ptr<const Tree>>(threads, processTree()));
  EXPECT_EQ(caches, std::vector<unsigned int>(threads, 50));
}

}  // namespace
}  // namespace Tarn::Inventory
