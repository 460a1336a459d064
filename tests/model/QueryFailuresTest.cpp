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
using namespace Tarn::CPUProvider;

// The four queries that read the inventory themselves: exceptions in the query, and exceptions in the
// collection that it makes.

namespace {

struct Call {
  Operation operation;
  unsigned int n;
};

enum class Style { PrintsStandardOnes, LogsAll };

struct Query {
  const char* name;
  unsigned short (*run)(std::vector<Processor>&, std::vector<Memory>&, std::vector<ProcessorCore>&);
  Style style;
  std::vector<Call> ownCalls;
  Call callOfCollection;
  const char* collectionFailed;
};

void PrintTo(const Query& query, std::ostream* stream) {
  *stream << query.name;
}

class QueryFailures : public Scripted::ScriptedTest, public ::testing::WithParamInterface<Query> {
 protected:
  QueryFailures() { makeInventory(); }

  static void makeInventory() {
    inventory().reset();
    inventory().system("Model").processor("cpu0").core("core0").core("core1").cache("cache0").cache("cache1");
    Scripted::takeMessages();
  }

  unsigned short run() { return GetParam().run(processors_, memories_, cores_); }

  std::size_t found() const { return processors_.size() + memories_.size() + cores_.size(); }

  /// Messages of the query itself.
  static Lines messages() {
    Lines lines;
    for (const std::string& line : Scripted::takeEventsOf(GetParam().name)) {
      if (line.find("|MESSAGE") != std::string::npos) {
        lines.push_back(line);
      }
    }
    return lines;
  }

  std::vector<Processor> processors_;
  std::vector<Memory> memories_;
  std::vector<ProcessorCore> cores_;
};

}  // namespace

TEST_P(QueryFailures, AStandardExceptionIsPrintedOrLoggedAndFails) {
  for (const Call& call : GetParam().ownCalls) {
    SCOPED_TRACE("operation " + std::to_string(static_cast<int>(call.operation)) + ", call " + std::to_string(call.n));
    makeInventory();
    inventory().failNth(call.operation, call.n);
    unsigned short result = 0;

    const std::string printed = standardErrorOf([&] { result = run(); });

    EXPECT_EQ(result, 1);
    if (GetParam().style == Style::PrintsStandardOnes) {
      EXPECT_EQ(printed, std::string(Scripted::thrownText) + "\n");
      EXPECT_EQ(messages(), Lines{});
    } else {
      EXPECT_EQ(printed, "");
      EXPECT_EQ(messages(), Lines{model.message(error, GetParam().name, "Caught Exception: ")});
    }
    EXPECT_EQ(inventory().livingCursors(), 0);
  }
}

TEST_P(QueryFailures, AnyOtherExceptionIsPassedOnOrLogged) {
  for (const Call& call : GetParam().ownCalls) {
    SCOPED_TRACE("operation " + std::to_string(static_cast<int>(call.operation)) + ", call " + std::to_string(call.n));
    makeInventory();
    inventory().failNth(call.operation, call.n, Thrown::Unusual);

    if (GetParam().style == Style::PrintsStandardOnes) {
      EXPECT_THROW(run(), Scripted::UnusualException);
    } else {
      EXPECT_EQ(run(), 1);
      EXPECT_EQ(messages(), Lines{model.message(error, GetParam().name, "Caught Exception: ")});
    }
    EXPECT_EQ(inventory().livingCursors(), 0);
  }
}

TEST_P(QueryFailures, AFailedCollectionHasItsTextAndFails) {
  inventory().failNth(GetParam().callOfCollection.operation, GetParam().callOfCollection.n);
  unsigned short result = 0;

  const std::string printed = standardErrorOf([&] { result = run(); });

  EXPECT_EQ(result, 1);
  EXPECT_EQ(found(), 0U);
  EXPECT_EQ(messages(), Lines{model.message(error, GetParam().name, GetParam().collectionFailed)});
  // The cache collection prints what it caught; the two others log it.
  const bool isOfCaches = std::string(GetParam().name) == "getCPUMemoriesFromCPUProcessor";
  EXPECT_EQ(printed, isOfCaches ? std::string(Scripted::thrownText) + "\n" : "");
}

TEST_P(QueryFailures, EveryExitIsMarkedUnlessAnExceptionPasses) {
  inventory().failNth(GetParam().callOfCollection.operation, GetParam().callOfCollection.n);
  standardErrorOf([&] { run(); });
  EXPECT_NE(Scripted::takeEventsOf(GetParam().name).back().find("|EXITING: "), std::string::npos);

  makeInventory();
  inventory().failNth(GetParam().ownCalls.front().operation, GetParam().ownCalls.front().n);
  standardErrorOf([&] { run(); });
  EXPECT_NE(Scripted::takeEventsOf(GetParam().name).back().find("|EXITING: "), std::string::npos);
}

namespace {

const std::vector<Call> callsOfOwnerQuery = {
    {Operation::Construct, 1},           {Operation::ConvertStringToPath, 1},
    {Operation::SelectPath, 1},          {Operation::Test, 1},
    {Operation::GetPathToParentNode, 1}, {Operation::ConvertPathToString, 1},
    {Operation::SelectType, 1},          {Operation::Test, 2},
    {Operation::ConvertStringToPath, 2}, {Operation::SetFilter, 1},
    {Operation::GetPathToNode, 1},       {Operation::ConvertPathToString, 2},
};

const std::vector<Call> callsOfChildQuery = {
    {Operation::Construct, 1},           {Operation::ConvertStringToPath, 1},
    {Operation::SelectPath, 1},          {Operation::Test, 1},
    {Operation::GetPathToNode, 1},       {Operation::ConvertPathToString, 1},
    {Operation::SelectType, 1},          {Operation::Test, 2},
    {Operation::ConvertStringToPath, 2}, {Operation::SetFilter, 1},
    {Operation::GetPathToNode, 2},       {Operation::ConvertPathToString, 2},
};

}  // namespace

INSTANTIATE_TEST_SUITE_P(
    All, QueryFailures,
    ::testing::Values(
        Query{"getCPUProcessorsFromCPUProcCore",
              [](auto& processors, auto&, auto&) { return getCPUProcessorsFromCPUProcCore("core0", processors); },
              Style::PrintsStandardOnes,
              callsOfOwnerQuery,
              {Operation::GetNodeStatus, 1},
              "Exception while getting processor based on unique id from proccores"},
        Query{"getCPUProcessorsFromCPUMemory",
              [](auto& processors, auto&, auto&) { return getCPUProcessorsFromCPUMemory("cache0", processors); },
              Style::PrintsStandardOnes,
              callsOfOwnerQuery,
              {Operation::GetNodeStatus, 1},
              "Exception while getting processor based on unique id from cache memories"},
        Query{"getCPUMemoriesFromCPUProcessor",
              [](auto&, auto& memories, auto&) { return getCPUMemoriesFromCPUProcessor("cpu0", memories); },
              Style::LogsAll,
              callsOfChildQuery,
              {Operation::GetNodeStatus, 1},
              "Error while setting filter"},
        Query{"getCPUProcCoresFromCPUProcessor",
              [](auto&, auto&, auto& cores) { return getCPUProcCoresFromCPUProcessor("cpu0", cores); },
              Style::PrintsStandardOnes,
              callsOfChildQuery,
              {Operation::GetNodeStatus, 1},
              "Exception while applying filter on Processor core"}),
    [](const auto& tested) { return std::string(tested.param.name); });

namespace {

using QueryFailuresOnTheWay = Scripted::ScriptedTest;

}  // namespace

TEST_F(QueryFailuresOnTheWay, ChildrenFoundBeforeTheFailureStay) {
  inventory().system("Model").processor("cpu0").core("core0").core("core1").cache("cache0").cache("cache1");
  std::vector<ProcessorCore> cores;
  std::vector<Memory> memories;

  // Each collection asks both children for their status; the third question is the second collection's.
  inventory().failNth(Operation::GetNodeStatus, 3);
  EXPECT_EQ(getCPUProcCoresFromCPUProcessor("cpu0", cores), 1);
  inventory().failNth(Operation::GetNodeStatus, 3);
  standardErrorOf([&] { EXPECT_EQ(getCPUMemoriesFromCPUProcessor("cpu0", memories), 1); });

  ASSERT_EQ(cores.size(), 1U);
  EXPECT_EQ(cores[0].getInstanceID(), "core0");
  ASSERT_EQ(memories.size(), 1U);
  EXPECT_EQ(memories[0].getMemoryDeviceID(), "cache0");
}

TEST_F(QueryFailuresOnTheWay, WhatTheCacheCollectionPassesOnIsLoggedByTheQuery) {
  inventory().system("Model").processor("cpu0").cache("cache0");
  inventory().failNth(Operation::GetNodeStatus, 1, Thrown::Unusual);
  std::vector<Memory> memories;

  EXPECT_EQ(getCPUMemoriesFromCPUProcessor("cpu0", memories), 1);

  const std::string function = "getCPUMemoriesFromCPUProcessor";
  const Lines events = Scripted::takeEventsOf(function);
  ASSERT_GE(events.size(), 2U);
  EXPECT_EQ(events[events.size() - 2], model.message(error, function, "Caught Exception: "));
}
