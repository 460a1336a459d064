#include <CPU.h>

#include <string>
#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/seam/ScriptedTest.h"

using Scripted::internalPath;
using Scripted::inventory;
using Scripted::Lines;
using Tarn::CPUProvider::getCPUMemoriesFromCPUProcessor;
using Tarn::CPUProvider::getCPUProcCoresFromCPUProcessor;
using Tarn::CPUProvider::Memory;
using Tarn::CPUProvider::ProcessorCore;

// From a processor down to its cores and to its caches.

namespace {

class ChildQueries : public Scripted::ScriptedTest {
 protected:
  static void makeUsualTree() {
    inventory().system("Model");
    inventory().processor("cpu0").core("core0").cache("cache0");
    inventory().processor("cpu1").core("c").fullCache("z").core("a").fullCache("x").core("b").fullCache("y");
    inventory().processor("cpu2");
  }

  unsigned short findCaches(const std::string& identifier) {
    return getCPUMemoriesFromCPUProcessor(identifier, caches_);
  }
  unsigned short findCores(const std::string& identifier) {
    return getCPUProcCoresFromCPUProcessor(identifier, cores_);
  }

  Lines caches() const {
    Lines identifiers;
    for (const Memory& memory : caches_) {
      identifiers.push_back(memory.getMemoryDeviceID());
    }
    return identifiers;
  }
  Lines cores() const {
    Lines identifiers;
    for (const ProcessorCore& core : cores_) {
      identifiers.push_back(core.getInstanceID());
    }
    return identifiers;
  }

  std::vector<Memory> caches_;
  std::vector<ProcessorCore> cores_;
};

}  // namespace

TEST_F(ChildQueries, FindTheChildrenInTheOrderOfTheTree) {
  makeUsualTree();

  EXPECT_EQ(findCaches("cpu1"), 0);
  EXPECT_EQ(findCores("cpu1"), 0);

  EXPECT_EQ(caches(), (Lines{"z", "x", "y"}));
  EXPECT_EQ(cores(), (Lines{"c", "a", "b"}));
}

TEST_F(ChildQueries, GiveTheRecordsAsTheCollectionReportsThem) {
  makeUsualTree();

  findCaches("cpu1");

  ASSERT_EQ(caches_.size(), 3U);
  EXPECT_EQ(caches_[1].getCacheName(), "L1 Data Cache");
  EXPECT_EQ(caches_[1].getCacheAssociativity(), 6);
}

TEST_F(ChildQueries, CollectAllCachesAnewForEachChild) {
  makeUsualTree();

  findCaches("cpu1");

  EXPECT_EQ(inventory().count("selectNode(31)"), 4U);
  EXPECT_EQ(inventory().count("getNodeDescription()"), 12U);
  EXPECT_EQ(inventory().count("setFilter(1, " + internalPath("cpu1") + ")"), 1U);
}

TEST_F(ChildQueries, CollectAllCoresAnewForEachChild) {
  makeUsualTree();

  findCores("cpu1");

  EXPECT_EQ(inventory().count("selectNode(42)"), 4U);
  EXPECT_EQ(inventory().count("getNodeDescription()"), 12U);
  EXPECT_EQ(inventory().count("setFilter(1, " + internalPath("cpu1") + ")"), 1U);
}

TEST_F(ChildQueries, AskTheInventoryStepByStep) {
  makeUsualTree();

  findCores("cpu0");

  Lines calls = inventory().calls();
  std::erase(calls, "operator bool()");
  const Lines expected = {"Instrumentation()", "convertStringToPath(cpu0)", "selectNode(" + internalPath("cpu0") + ")",
                          "getPathToNode()", "convertPathToString(" + internalPath("cpu0") + ")", "selectNode(42)",
                          "convertStringToPath(cpu0)", "setFilter(1, " + internalPath("cpu0") + ")", "getPathToNode()",
                          "convertPathToString(" + internalPath("core0") + ")",
                          // the collection
                          "Instrumentation()", "selectNode(42)"};
  ASSERT_GE(calls.size(), expected.size());
  calls.resize(expected.size());
  EXPECT_EQ(calls, expected);
}

TEST_F(ChildQueries, ReportTheirFrameAndTheIdentifier) {
  makeUsualTree();

  findCaches("cpu1");
  std::string function = "getCPUMemoriesFromCPUProcessor";
  std::string parameters = " matchedMemories=" + Scripted::address(&caches_);
  const Lines ofCaches = {model.entering(detail, function, parameters),
                          model.variable(detail, function, "deviceID", "cpu1"),
                          model.exiting(detail, function, parameters)};
  EXPECT_EQ(Scripted::takeEventsOf(function), ofCaches);

  findCores("cpu1");
  function = "getCPUProcCoresFromCPUProcessor";
  parameters = " matchedProcCores=" + Scripted::address(&cores_);
  const Lines ofCores = {model.entering(detail, function, parameters),
                         model.variable(detail, function, "deviceID", "cpu1"),
                         model.exiting(detail, function, parameters)};
  EXPECT_EQ(Scripted::takeEventsOf(function), ofCores);
}

TEST_F(ChildQueries, AProcessorWithoutChildrenFindsNothingAndCollectsNothing) {
  makeUsualTree();

  EXPECT_EQ(findCaches("cpu2"), 0);
  EXPECT_EQ(findCores("cpu2"), 0);

  EXPECT_TRUE(caches_.empty());
  EXPECT_TRUE(cores_.empty());
  EXPECT_EQ(inventory().count("selectNode(31)"), 1U);
  EXPECT_EQ(inventory().count("selectNode(42)"), 1U);
}

TEST_F(ChildQueries, AnIdentifierThatNamesNoNodeFindsNothingAndIsNoFailure) {
  makeUsualTree();

  for (const char* identifier : {"nothing", "", "CPU1", " cpu1", "cpu1 "}) {
    EXPECT_EQ(findCaches(identifier), 0) << identifier;
    EXPECT_EQ(findCores(identifier), 0) << identifier;
  }

  EXPECT_TRUE(caches_.empty());
  EXPECT_TRUE(cores_.empty());
  EXPECT_EQ(inventory().count("selectNode(31)"), 0U);
  EXPECT_EQ(inventory().count("selectNode(42)"), 0U);
}

TEST_F(ChildQueries, ATreeWithoutTheKindFailsForCoresOnly) {
  inventory().system("Model").processor("cpu0");

  EXPECT_EQ(findCaches("cpu0"), 0);
  EXPECT_EQ(findCores("cpu0"), 1);

  EXPECT_TRUE(caches_.empty());
  EXPECT_TRUE(cores_.empty());
  EXPECT_EQ(inventory().count("setFilter(1, " + internalPath("cpu0") + ")"), 0U);
}

TEST_F(ChildQueries, AppendToWhatIsThere) {
  makeUsualTree();

  findCaches("cpu1");
  findCaches("cpu0");
  findCores("cpu0");
  findCores("cpu1");

  EXPECT_EQ(caches(), (Lines{"z", "x", "y", "cache0"}));
  EXPECT_EQ(cores(), (Lines{"core0", "c", "a", "b"}));
}

TEST_F(ChildQueries, ChildrenWithBlanksAroundTheirPathMatchNoRecord) {
  inventory().system("Model").processor("cpu0").core(" a ").core("b").cache(" a ").cache("b");

  EXPECT_EQ(findCaches("cpu0"), 0);
  EXPECT_EQ(findCores("cpu0"), 0);

  EXPECT_EQ(caches(), Lines{"b"});
  EXPECT_EQ(cores(), Lines{"b"});
}

TEST_F(ChildQueries, ForChildrenThatShareAPathTheFirstRecordComesEachTime) {
  inventory().system("Model").processor("cpu0").cache("twin").description("first").cache("twin").description("second");

  EXPECT_EQ(findCaches("cpu0"), 0);

  ASSERT_EQ(caches_.size(), 2U);
  EXPECT_EQ(caches_[0].getElementName(), "first");
  EXPECT_EQ(caches_[1].getElementName(), "first");
}

TEST_F(ChildQueries, AlsoFindWhatBelongsToAProcessorThatTheCollectionSkips) {
  inventory().system("Model").processor("cpu0").status(15).core("core0").cache("cache0");

  EXPECT_EQ(findCaches("cpu0"), 0);
  EXPECT_EQ(findCores("cpu0"), 0);

  EXPECT_EQ(caches(), Lines{"cache0"});
  EXPECT_EQ(cores(), Lines{"core0"});
}
