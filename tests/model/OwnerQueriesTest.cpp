#include <CPU.h>

#include <string>
#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/seam/ScriptedTest.h"

using Scripted::internalPath;
using Scripted::inventory;
using Scripted::Lines;
using Tarn::CPUProvider::getCPUProcessorsFromCPUMemory;
using Tarn::CPUProvider::getCPUProcessorsFromCPUProcCore;
using Tarn::CPUProvider::Processor;

// From a core or a cache up to the processor that owns it: two queries of one kind.

namespace {

struct OwnerQuery {
  const char* name;
  unsigned short (*find)(std::string, std::vector<Processor>&);
  const char* child;   // of cpu1 in the usual tree
  const char* handle;  // what its trace calls the identifier
};

void PrintTo(const OwnerQuery& query, std::ostream* stream) {
  *stream << query.name;
}

class OwnerQueries : public Scripted::ScriptedTest, public ::testing::WithParamInterface<OwnerQuery> {
 protected:
  static void makeUsualTree() {
    inventory().system("Model");
    inventory().processor("cpu0").core("core0").cache("cache0");
    inventory().fullProcessor("cpu1").core("core1").cache("cache1");
    inventory().processor("cpu2").core("core2").cache("cache2");
  }

  unsigned short find(const std::string& identifier) { return GetParam().find(identifier, processors_); }

  std::vector<std::string> found() const {
    std::vector<std::string> identifiers;
    for (const Processor& processor : processors_) {
      identifiers.push_back(processor.getProcessorDeviceID());
    }
    return identifiers;
  }

  std::vector<Processor> processors_;
};

}  // namespace

TEST_P(OwnerQueries, FindTheProcessorThatOwnsTheChildAsTheCollectionReportsIt) {
  makeUsualTree();

  EXPECT_EQ(find(GetParam().child), 0);

  ASSERT_EQ(found(), Lines{"cpu1"});
  EXPECT_EQ(processors_[0].getInstanceId(), "NERITH:cpu1");
  EXPECT_EQ(processors_[0].getFamily(), 198);
  EXPECT_EQ(processors_[0].getNumberOfHardwareThreads(), 24);
}

TEST_P(OwnerQueries, AskTheInventoryStepByStepAndCollectOnce) {
  makeUsualTree();

  find(GetParam().child);

  const std::string child = GetParam().child;
  Lines calls = inventory().calls();
  std::erase(calls, "operator bool()");
  const Lines expected = {"Instrumentation()", "convertStringToPath(" + child + ")",
                          "selectNode(" + internalPath(child) + ")", "getPathToParentNode()",
                          "convertPathToString(" + internalPath("cpu1") + ")", "selectNode(4)",
                          "convertStringToPath(cpu1)", "setFilter(0, " + internalPath("cpu1") + ")", "getPathToNode()",
                          "convertPathToString(" + internalPath("cpu1") + ")",
                          // the collection
                          "Instrumentation()", "selectNode(4)"};
  ASSERT_GE(calls.size(), expected.size());
  calls.resize(expected.size());
  EXPECT_EQ(calls, expected);
  EXPECT_EQ(inventory().count("selectNode(4)"), 2U);
  EXPECT_EQ(inventory().count("operator++()"), 3U);
}

TEST_P(OwnerQueries, ReportTheirFrameAndTheIdentifier) {
  makeUsualTree();

  find(GetParam().child);

  const std::string parameters = " matchedProcessors=" + Scripted::address(&processors_);
  const Lines expected = {model.entering(detail, GetParam().name, parameters),
                          model.variable(detail, GetParam().name, GetParam().handle, GetParam().child),
                          model.exiting(detail, GetParam().name, parameters)};
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().name), expected);
}

TEST_P(OwnerQueries, AppendToWhatIsThere) {
  makeUsualTree();

  EXPECT_EQ(find(GetParam().child), 0);
  EXPECT_EQ(find(GetParam().child), 0);

  EXPECT_EQ(found(), (Lines{"cpu1", "cpu1"}));
}

TEST_P(OwnerQueries, AnIdentifierThatNamesNoNodeFails) {
  makeUsualTree();

  for (const char* identifier : {"nothing", "", "CORE1", "CACHE1", " core1", "cache1 "}) {
    EXPECT_EQ(find(identifier), 1) << identifier;
  }

  EXPECT_TRUE(processors_.empty());
  EXPECT_EQ(inventory().count("selectNode(4)"), 0U);
}

TEST_P(OwnerQueries, ATreeWithoutProcessorsFails) {
  inventory().system("Model").core(GetParam().child).parent("system");

  EXPECT_EQ(find(GetParam().child), 1);

  EXPECT_TRUE(processors_.empty());
  EXPECT_EQ(inventory().count("selectNode(4)"), 1U);
}

TEST_P(OwnerQueries, AChildWhoseParentIsNoProcessorFailsSilently) {
  makeUsualTree();
  inventory().core("elsewhere").parent("system");

  EXPECT_EQ(find("elsewhere"), 1);

  EXPECT_TRUE(processors_.empty());
  const std::string parameters = " matchedProcessors=" + Scripted::address(&processors_);
  const Lines expected = {model.entering(detail, GetParam().name, parameters),
                          model.variable(detail, GetParam().name, GetParam().handle, "elsewhere"),
                          model.exiting(detail, GetParam().name, parameters)};
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().name), expected);
}

TEST_P(OwnerQueries, AnOwnerThatTheCollectionSkippedIsNotFoundAndNoFailure) {
  for (const unsigned int status : {0U, 15U}) {
    inventory().reset();
    inventory().system("Model").processor("cpu0").processor("cpu1").status(status).core("core1").cache("cache1");

    EXPECT_EQ(find(GetParam().child), 0) << status;

    EXPECT_TRUE(processors_.empty()) << status;
  }
}

TEST_P(OwnerQueries, AnOwnerWithBlanksAroundItsPathMatchesNoRecord) {
  inventory().system("Model").processor(" cpu1 ").core("core1").cache("cache1");

  EXPECT_EQ(find(GetParam().child), 0);

  EXPECT_TRUE(processors_.empty());
}

TEST_P(OwnerQueries, OfProcessorsThatShareAPathTheFirstIsFound) {
  using Tarn::NodeLexicon::PropFamily;
  inventory().system("Model").processor("cpu1").has(PropFamily, 10U).processor("cpu1").has(PropFamily, 20U);
  inventory().core("core1").cache("cache1");

  EXPECT_EQ(find(GetParam().child), 0);

  ASSERT_EQ(processors_.size(), 1U);
  EXPECT_EQ(processors_[0].getFamily(), 10);
}

INSTANTIATE_TEST_SUITE_P(Both, OwnerQueries,
                         ::testing::Values(OwnerQuery{"getCPUProcessorsFromCPUProcCore",
                                                      getCPUProcessorsFromCPUProcCore, "core1", "instanceID"},
                                           OwnerQuery{"getCPUProcessorsFromCPUMemory", getCPUProcessorsFromCPUMemory,
                                                      "cache1", "deviceID"}),
                         [](const auto& tested) { return std::string(tested.param.name); });
