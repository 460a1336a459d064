#include <CPU.h>

#include <string>
#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/model/StandardError.h"
#include "tests/seam/ScriptedTest.h"

using Scripted::inventory;
using Scripted::Lines;
using Scripted::Operation;
using Scripted::Thrown;
using Tarn::CPUProvider::getCPUMemoriesFromCPUProcessorCore;
using Tarn::CPUProvider::getCPUProcessorCoresFromCPUMemory;
using Tarn::CPUProvider::Memory;
using Tarn::CPUProvider::ProcessorCore;

// Between cores and caches, by way of the processor that has both.

namespace {

constexpr const char* cachesOfCore = "getCPUMemoriesFromCPUProcessorCore";
constexpr const char* coresOfCache = "getCPUProcessorCoresFromCPUMemory";

class CompositeQueries : public Scripted::ScriptedTest {
 protected:
  static void makeUsualTree() {
    inventory().system("Model");
    inventory().processor("cpu0").core("core0").cache("cache0");
    inventory().processor("cpu1").core("c").cache("z").core("a").cache("x");
    inventory().processor("cpu2").core("lone core").processor("cpu3").cache("lone cache");
  }

  unsigned short findCaches(const std::string& core) { return getCPUMemoriesFromCPUProcessorCore(core, caches_); }
  unsigned short findCores(const std::string& cache) { return getCPUProcessorCoresFromCPUMemory(cache, cores_); }

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

  Lines framed(const std::string& function, const std::string& handle, const std::string& identifier,
               const Lines& errors = {}) const {
    const std::string parameters = function == cachesOfCore ? " matchedMemories=" + Scripted::address(&caches_)
                                                            : " matchedProcCores=" + Scripted::address(&cores_);
    Lines lines = {model.entering(detail, function, parameters), model.variable(detail, function, handle, identifier)};
    for (const std::string& text : errors) {
      lines.push_back(model.message(error, function, text));
    }
    lines.push_back(model.exiting(detail, function, parameters));
    return lines;
  }

  std::vector<Memory> caches_;
  std::vector<ProcessorCore> cores_;
};

}  // namespace

TEST_F(CompositeQueries, FindEverythingOfTheOtherKindInTheSameProcessor) {
  makeUsualTree();

  EXPECT_EQ(findCaches("a"), 0);
  EXPECT_EQ(findCores("z"), 0);

  EXPECT_EQ(caches(), (Lines{"z", "x"}));
  EXPECT_EQ(cores(), (Lines{"c", "a"}));
}

TEST_F(CompositeQueries, ReportTheirFrameAndTheIdentifier) {
  makeUsualTree();

  findCaches("a");
  EXPECT_EQ(Scripted::takeEventsOf(cachesOfCore), framed(cachesOfCore, "instanceID", "a"));

  findCores("z");
  EXPECT_EQ(Scripted::takeEventsOf(coresOfCache), framed(coresOfCache, "deviceID", "z"));
}

TEST_F(CompositeQueries, GoThroughTheTwoQueriesTheyAreMadeOf) {
  makeUsualTree();

  findCaches("a");
  std::vector<std::string> entered;
  for (const Scripted::Event& event : Scripted::takeEvents()) {
    if (event.text.starts_with("ENTERING") && event.function.starts_with("getCPU")) {
      entered.push_back(event.function);
    }
  }
  EXPECT_EQ(entered, (Lines{cachesOfCore, "getCPUProcessorsFromCPUProcCore", "getCPUMemoriesFromCPUProcessor"}));

  findCores("z");
  entered.clear();
  for (const Scripted::Event& event : Scripted::takeEvents()) {
    if (event.text.starts_with("ENTERING") && event.function.starts_with("getCPU")) {
      entered.push_back(event.function);
    }
  }
  EXPECT_EQ(entered, (Lines{coresOfCache, "getCPUProcessorsFromCPUMemory", "getCPUProcCoresFromCPUProcessor"}));
}

TEST_F(CompositeQueries, CollectProcessorsOnceAndTheOtherKindForEachOfThem) {
  makeUsualTree();

  findCaches("a");

  EXPECT_EQ(inventory().count("selectNode(4)"), 2U);
  EXPECT_EQ(inventory().count("selectNode(31)"), 3U);
  EXPECT_EQ(inventory().count("selectNode(42)"), 0U);
}

TEST_F(CompositeQueries, AProcessorWithoutTheOtherKindFindsNothingAndIsNoFailure) {
  makeUsualTree();

  EXPECT_EQ(findCaches("lone core"), 0);
  EXPECT_EQ(findCores("lone cache"), 0);

  EXPECT_TRUE(caches_.empty());
  EXPECT_TRUE(cores_.empty());
}

TEST_F(CompositeQueries, ATreeWithoutTheOtherKindFailsForCoresOnly) {
  inventory().system("Model").processor("cpu0").core("core0");
  EXPECT_EQ(findCaches("core0"), 0);

  inventory().reset();
  inventory().system("Model").processor("cpu0").cache("cache0");
  EXPECT_EQ(findCores("cache0"), 1);
}

TEST_F(CompositeQueries, AnIdentifierThatNamesNoNodeFailsSilently) {
  makeUsualTree();

  EXPECT_EQ(findCaches("nothing"), 1);
  EXPECT_EQ(Scripted::takeEventsOf(cachesOfCore), framed(cachesOfCore, "instanceID", "nothing"));

  EXPECT_EQ(findCores("nothing"), 1);
  EXPECT_EQ(Scripted::takeEventsOf(coresOfCache), framed(coresOfCache, "deviceID", "nothing"));
}

TEST_F(CompositeQueries, AnOwnerThatTheCollectionSkippedFindsNothingAndIsNoFailure) {
  inventory().system("Model").processor("cpu0").status(15).core("core0").cache("cache0");

  EXPECT_EQ(findCaches("core0"), 0);
  EXPECT_EQ(findCores("cache0"), 0);

  EXPECT_TRUE(caches_.empty());
  EXPECT_TRUE(cores_.empty());
}

TEST_F(CompositeQueries, AppendToWhatIsThere) {
  makeUsualTree();

  findCaches("a");
  findCaches("core0");
  findCores("cache0");
  findCores("z");

  EXPECT_EQ(caches(), (Lines{"z", "x", "cache0"}));
  EXPECT_EQ(cores(), (Lines{"core0", "c", "a"}));
}

TEST_F(CompositeQueries, NothingIsAppendedWhenTheSecondQueryFailsOnItsWay) {
  makeUsualTree();
  // Collected are the processors, then for each child; the second child's collection of two fails.
  inventory().failNth(Operation::SelectType, 6);

  EXPECT_EQ(findCores("z"), 1);

  EXPECT_TRUE(cores_.empty());
  EXPECT_EQ(Scripted::takeEventsOf(coresOfCache), framed(coresOfCache, "deviceID", "z"));
}

TEST_F(CompositeQueries, AStandardExceptionInTheFirstQueryIsThatQuerysBusiness) {
  makeUsualTree();
  inventory().failNth(Operation::SelectPath, 1);
  unsigned short result = 0;

  const std::string printed = standardErrorOf([&] { result = findCaches("a"); });

  EXPECT_EQ(result, 1);
  EXPECT_EQ(printed, std::string(Scripted::thrownText) + "\n");
  EXPECT_EQ(Scripted::takeEventsOf(cachesOfCore), framed(cachesOfCore, "instanceID", "a"));
}

TEST_F(CompositeQueries, AnyOtherExceptionOfAQueryIsLogged) {
  makeUsualTree();
  inventory().failNth(Operation::SelectPath, 1, Thrown::Unusual);
  EXPECT_EQ(findCaches("a"), 1);
  EXPECT_EQ(Scripted::takeEventsOf(cachesOfCore), framed(cachesOfCore, "instanceID", "a", {"Caught Exception: "}));

  inventory().failNth(Operation::SelectPath, 1, Thrown::Unusual);
  EXPECT_EQ(findCores("z"), 1);
  EXPECT_EQ(Scripted::takeEventsOf(coresOfCache), framed(coresOfCache, "deviceID", "z", {"Caught Exception: "}));

  inventory().failNth(Operation::SelectPath, 2, Thrown::Unusual);
  EXPECT_EQ(findCores("z"), 1);
  EXPECT_EQ(Scripted::takeEventsOf(coresOfCache), framed(coresOfCache, "deviceID", "z", {"Caught Exception: "}));

  EXPECT_TRUE(caches_.empty());
  EXPECT_TRUE(cores_.empty());
}
