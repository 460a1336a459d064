#include <CPU.h>

#include <map>
#include <string>
#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/model/StandardError.h"
#include "tests/seam/ScriptedTest.h"

using Scripted::inventory;
using Scripted::Lines;
using Scripted::Operation;
using Scripted::Thrown;
using Tarn::CPUProvider::getMemoryInstances;
using Tarn::CPUProvider::getProcessorCoreInstances;
using Tarn::CPUProvider::getProcessorInstances;
using Tarn::CPUProvider::Memory;
using Tarn::CPUProvider::Processor;
using Tarn::CPUProvider::ProcessorCore;

// Every operation of the cursor throws in turn, at each of its calls during a whole walk.

namespace {

class CollectionFailures : public Scripted::ScriptedTest {
 protected:
  static void makeInventory() {
    inventory().reset();
    inventory().system("Virtual Model").fullProcessor("cpu0").fullProcessor("cpu1").core("core0").core("core1");
    inventory().fullCache("cache0").fullCache("cache1");
    Scripted::takeMessages();
  }

  /// How often a whole walk calls each operation; those that no call names come once for the record.
  static std::map<Operation, unsigned int> callsOf(const Lines& calls) {
    std::map<Operation, unsigned int> counts;
    for (const std::string& call : calls) {
      ++counts[operationOf(call)];
    }
    return counts;
  }

  static Operation operationOf(const std::string& call) {
    static const std::map<std::string, Operation> names = {
        {"Instrumentation", Operation::Construct},   {"selectNode", Operation::SelectType},
        {"operator bool", Operation::Test},          {"operator++", Operation::Next},
        {"getNodeStatus", Operation::GetNodeStatus}, {"getNodeDescription", Operation::GetNodeDescription},
        {"getPathToNode", Operation::GetPathToNode}, {"convertPathToString", Operation::ConvertPathToString},
        {"getProperty", Operation::GetProperty},
    };
    return names.at(call.substr(0, call.find('(')));
  }

  /// Runs `check` for each call of a whole walk, with that call set to fail.
  template <class Record, class Check>
  static void failEachCallOf(unsigned short (*collect)(std::vector<Record>&), Thrown thrown, Check check) {
    makeInventory();
    std::vector<Record> records;
    ASSERT_EQ(collect(records), 0);
    ASSERT_EQ(records.size(), 2U);
    for (const auto& [operation, count] : callsOf(inventory().calls())) {
      for (unsigned int n = 1; n <= count; ++n) {
        SCOPED_TRACE("operation " + std::to_string(static_cast<int>(operation)) + ", call " + std::to_string(n));
        makeInventory();
        inventory().failNth(operation, n, thrown);
        check();
        EXPECT_EQ(inventory().livingCursors(), 0);
      }
    }
  }

  /// Records are appended before the cursor goes on, so that many of them must have stayed.
  static std::size_t recordsToExpect() { return inventory().count("operator++()"); }

  static std::string lastMessage(const std::vector<std::string>& events) {
    return events.size() < 2 ? "" : events[events.size() - 2];
  }
};

}  // namespace

TEST_F(CollectionFailures, OfProcessorsAreLoggedAndTheRecordsBeforeAreKept) {
  for (const Thrown thrown : {Thrown::Standard, Thrown::Unusual}) {
    failEachCallOf<Processor>(getProcessorInstances, thrown, [] {
      std::vector<Processor> processors;
      unsigned short result = 0;

      const std::string printed = standardErrorOf([&] { result = getProcessorInstances(processors); });

      EXPECT_EQ(result, 1);
      EXPECT_EQ(printed, "");
      EXPECT_EQ(processors.size(), recordsToExpect());
      const Lines events = Scripted::takeEventsOf("getProcessorInstances");
      EXPECT_EQ(lastMessage(events), model.message(error, "getProcessorInstances", "Caught Exception"));
      EXPECT_EQ(events.back(),
                model.exiting(detail, "getProcessorInstances", " processors=" + Scripted::address(&processors)));
    });
  }
}

TEST_F(CollectionFailures, OfCoresAreLoggedAndTheRecordsBeforeAreKept) {
  for (const Thrown thrown : {Thrown::Standard, Thrown::Unusual}) {
    failEachCallOf<ProcessorCore>(getProcessorCoreInstances, thrown, [] {
      std::vector<ProcessorCore> cores;
      unsigned short result = 0;

      const std::string printed = standardErrorOf([&] { result = getProcessorCoreInstances(cores); });

      EXPECT_EQ(result, 1);
      EXPECT_EQ(printed, "");
      EXPECT_EQ(cores.size(), recordsToExpect());
      const std::string function = "getProcessorCoreInstances";
      const std::string parameters = " procCores=" + Scripted::address(&cores);
      const Lines expected = {model.entering(detail, function, parameters),
                              model.message(error, function, "Caught Exception: "),
                              model.exiting(detail, function, parameters)};
      EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
    });
  }
}

TEST_F(CollectionFailures, OfCachesGoToStandardErrorAndTheRecordsBeforeAreKept) {
  failEachCallOf<Memory>(getMemoryInstances, Thrown::Standard, [] {
    std::vector<Memory> memories;
    unsigned short result = 0;

    const std::string printed = standardErrorOf([&] { result = getMemoryInstances(memories); });

    EXPECT_EQ(result, 1);
    EXPECT_EQ(printed, std::string(Scripted::thrownText) + "\n");
    EXPECT_EQ(memories.size(), recordsToExpect());
    const std::string parameters = " memories=" + Scripted::address(&memories);
    const Lines expected = {model.entering(detail, "getMemoryInstances", parameters),
                            model.exiting(detail, "getMemoryInstances", parameters)};
    EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
  });
}

TEST_F(CollectionFailures, OfCachesThatAreNoStandardExceptionsPassOn) {
  failEachCallOf<Memory>(getMemoryInstances, Thrown::Unusual, [] {
    std::vector<Memory> memories;
    EXPECT_THROW(getMemoryInstances(memories), Scripted::UnusualException);
    EXPECT_EQ(memories.size(), recordsToExpect());
  });
}

TEST_F(CollectionFailures, ACollectionWorksAgainAfterwards) {
  makeInventory();
  inventory().failNth(Operation::Next, 1);
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 1);
  EXPECT_EQ(getProcessorInstances(processors), 0);

  EXPECT_EQ(processors.size(), 3U);
}
