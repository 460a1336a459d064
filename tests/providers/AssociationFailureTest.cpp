// What the five associations do when the broker or the factory cannot give them what they enumerate.

#include <algorithm>
#include <stdexcept>

#include "host/broker/Service.h"
#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::FailureResult;
using Corvcim::OperationKind;
using Corvcim::Response;
using Scripted::inventory;
using Support::answeredNothing;
using Support::EventList;
using Support::outcome;

/// What one failure of a walk is called: by the builder of instances and by EnumInstanceNames. Without
/// a status text the status stays as it is.
struct Texts {
  const char* log;
  const char* namesStatus;
  const char* namesLog;
};

struct FailureTexts {
  const char* className;
  const char* nearClass;
  Texts noPaths;         ///< of the ends that the walk begins with
  const char* farClass;  ///< that the far ends are instances of; NULL where they are paths
  Texts nullFarEnd;
  Texts noAssociationPath;
};

constexpr FailureTexts failures[] = {
    {"HALDA_CPUAssociatedCacheMemory",
     "HALDA_CPUMemory",
     {"***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***", "Create CMPIObjectPath failed.",
      "getAllCPUMemoryCMPIObjPaths Failed"},
     "HALDA_CPUProcessor",
     {"CMPIObjectPath is NULL for CPUProcessor", "CMPIObjectPath is NULL for CPUProcessor",
      "CMPIObjectPath is NULL for CPUProcessor"},
     {"Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory.",
      "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemoryClass.",
      "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemoryClass."}},
    {"HALDA_CPUCoreAssociatedCacheMemory",
     "HALDA_CPUProcessorCore",
     {"***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***", "Create CMPIObjectPath failed.",
      "getAllCPUProcCoreCMPIObjPaths Failed"},
     "HALDA_CPUMemory",
     {"CMPIObjectPath is NULL for CPUMemory", "CMPIObjectPath is NULL for CPUMemory",
      "CMPIObjectPath is NULL for CPUMemory"},
     {"Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemory.",
      "Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemoryClass.",
      "Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemoryClass."}},
    {"HALDA_CPUSystemDevice",
     "HALDA_CPUProcessor",
     {"getAllCPUProcCMPIObjPaths Failed", "Create CMPIObjectPath failed.", "getAllCPUProcCMPIObjPaths Failed"},
     nullptr,
     {nullptr, nullptr, nullptr},
     {"Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory.",
      "Create CMPIObjectPath failed for                     cpuSystemDeviceClass.",
      "Create CMPIObjectPath failed for                     cpuSystemDeviceClass."}},
    {"HALDA_CPUElementCapabilities",
     "HALDA_CPUProcessor",
     {"***Can't get ElementCapabilities ObjectPaths.             Exiting EnumerateInstanceNames***",
      "Create CMPIObjectPath failed.", "getAllCPUProcCMPIObjPaths Failed"},
     "HALDA_CPUProcessorCapabilities",
     {"CMPIObjectPath is NULL for ProcessorCapabilities",
      "CMPIObjectPath is                     NULL for ProcessorCapabilities",
      "CMPIObjectPath is NULL for ProcessorCapabilities"},
     {"Create CMPIObjectPath failed for ElementCapabilities.", "Create CMPIObjectPath failed for ElementCapabilities",
      "Create CMPIObjectPath failed for ElementCapabilities."}},
    {"HALDA_CPUConcreteComponent",
     "HALDA_CPUProcessor",
     {"***Can't get ConcreteComponent ObjectPaths.             Exiting EnumerateInstanceNames***",
      "Create CMPIObjectPath failed.", "getAllCPUProcCMPIObjPaths Failed"},
     "HALDA_CPUProcessorCore",
     {"CMPIObjectPath is NULL for Processors", "CMPIObjectPath is                     NULL for Processor Cores",
      "CMPIObjectPath is NULL for Processor Cores"},
     {"Create CMPIObjectPath failed for ConcreteComponent.", "Create CMPIObjectPath failed for ConcreteComponent",
      "Create CMPIObjectPath failed for ConcreteComponent"}},
};

class AssociationFailure : public Association {
 protected:
  const FailureTexts& texts() const {
    for (const FailureTexts& each : failures) {
      if (std::string(each.className) == row().className) {
        return each;
      }
    }
    throw std::out_of_range(row().className);
  }

  /// The builder gives up with this text: both its users answer nothing, and say that they succeeded.
  void expectBuilderGivesUp(const std::string& text, const Response& response, const std::string& operation) {
    EXPECT_EQ(response, answeredNothing());
    const EventList upTo = enteringBuilder(operation).error(text);
    expectEvents(leavingBuilder(upTo, operation));
  }

  void expectNamesGiveUp(const Texts& expected, const Response& response, const char* status) {
    EXPECT_EQ(outcome(response), status != nullptr ? "CMPI_RC_ERR_FAILED |" + std::string(status) + "| done"
                                                   : std::string("CMPI_RC_OK no message done"));
    expectEvents(events("EnumInstanceNames").entering().error(expected.namesLog).exiting());
  }

  /// Lets the n-th call of the service about this class fail in each way, in each enumeration.
  void expectFailure(const std::string& service, const std::string& failingClass, unsigned int n, const Texts& expected,
                     std::size_t pathsBefore) {
    const std::string name = row().className;
    afterwards([&] { enumerateInstances(name); });  // what is collected once is collected now
    for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
      const auto failNext = [&](const auto& request) {
        broker.failNth(service, ordinalOf(service, failingClass, n, request), {.result = result});
      };
      failNext([&] { enumerateInstances(name); });
      expectBuilderGivesUp(expected.log, enumerateInstances(name), "EnumInstances");

      const ObjectPath path = allPaths().back();
      failNext([&] { getInstance(path); });
      expectBuilderGivesUp(expected.log, getInstance(path), "GetInstance");

      failNext([&] { enumerateInstanceNames(name); });
      const Response names = enumerateInstanceNames(name);
      EXPECT_EQ(names.paths.size(), pathsBefore);
      expectNamesGiveUp(expected, names, expected.namesStatus);
    }
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachAssociation, AssociationFailure, ::testing::ValuesIn(rows()), className);

TEST_P(AssociationFailure, PathsOfTheNearEndsThatTheBrokerCannotMake) {
  expectFailure("newObjectPath", texts().nearClass, 2, texts().noPaths, 0);
}

TEST_P(AssociationFailure, PathOfAFarEndThatTheBrokerCannotGive) {
  if (texts().farClass == nullptr) {
    GTEST_SKIP() << "both ends are paths";
  }
  expectFailure("getObjectPath", texts().farClass, 2, texts().nullFarEnd, 1);
}

TEST_P(AssociationFailure, PathOfAnAssociationThatTheBrokerCannotMake) {
  expectFailure("newObjectPath", row().className, 2, texts().noAssociationPath, 1);
}

TEST_P(AssociationFailure, EmptyInventoryIsReported) {
  inventory().reset();
  expectBuilderGivesUp(texts().noPaths.log, enumerateInstances(row().className), "EnumInstances");
  expectBuilderGivesUp(texts().noPaths.log, getInstance(allPaths().front()), "GetInstance");
  expectNamesGiveUp(texts().noPaths, enumerateInstanceNames(row().className), nullptr);
}

TEST_P(AssociationFailure, InventoryThatBreaksIsReported) {
  for (int attempt = 0; attempt < 2; ++attempt) {
    inventory().failNth(Scripted::Operation::GetPathToNode, 1);
  }
  expectBuilderGivesUp(texts().noPaths.log, enumerateInstances(row().className), "EnumInstances");
}

// The cache associations hand on whatever the broker made; the others leave out what it did not.
TEST_P(AssociationFailure, InstanceThatTheBrokerCannotMakeDoesNotEndTheWalk) {
  const std::string name = row().className;
  afterwards([&] { enumerateInstances(name); });
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    broker.failNth("newInstance", ordinalOf("newInstance", name, 2, [&] { enumerateInstances(name); }),
                   {.result = result});
    broker.services().record(true);
    const Response response = enumerateInstances(name);
    EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
    Paths expected = allPaths();
    expected.erase(expected.begin() + 1);
    EXPECT_EQ(Support::pathsOf(response), expected);
    expectEvents(leavingBuilder(enteringBuilder("EnumInstances"), "EnumInstances"));
    std::vector<std::string> handedOn(row().pairs().size(), name);
    if (row().enumerationsDescribeTheCache) {
      handedOn[1] = "NULL";
    } else {
      handedOn.pop_back();
    }
    EXPECT_EQ(Support::detailsOf(broker.services().takeRecord(), "returnInstance"), handedOn);
  }
}

TEST_P(AssociationFailure, ReferenceThatTheBrokerCannotMakeIsLeftOut) {
  for (const FarEnds& ends : row().farEnds()) {
    for (const OperationKind kind : {OperationKind::References, OperationKind::ReferenceNames}) {
      const auto request = [&] { askOwn(kind, ends.source); };
      const unsigned int first = ordinalOf("newInstance", row().className, 1, request);
      broker.failNth("newInstance", first);
      const Response response = askOwn(kind, ends.source);
      EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
      EXPECT_EQ(response.instances.size() + response.paths.size(), ends.elements.size() - 1);
    }
  }
}

// A class name that the broker does not tell may cost results; it never turns an association round.
TEST_P(AssociationFailure, EndsAreNotSwappedWhereTheBrokerFailsToTellAClass) {
  for (const FarEnds& ends : row().farEnds()) {
    const auto request = [&] { return askOwn(OperationKind::References, ends.source); };
    request();  // collects
    forgetTraces();
    const Paths whole = Support::pathsOf(request());
    const unsigned int calls = broker.callCount("getClassName");
    ASSERT_GT(calls, 0U);
    for (unsigned int n = 1; n <= calls; ++n) {
      for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
        broker.failNth("getClassName", n, {.result = result});
        for (const ObjectPath& path : Support::pathsOf(request())) {
          EXPECT_NE(std::find(whole.begin(), whole.end(), path), whole.end()) << "call " << n << " of getClassName";
        }
        broker.services().clearFailures();
      }
    }
    forgetTraces();
  }
}

TEST_P(AssociationFailure, FarEndThatTheBrokerCannotMakeIsLeftOut) {
  for (const FarEnds& ends : row().farEnds()) {
    const std::string farClass = ends.elements.front().className;
    if (farClass == "HALDA_ComputerSystem") {
      continue;  // made by another provider
    }
    for (const OperationKind kind : associationOperations) {
      const bool namesOfDevices = texts().farClass == nullptr && kind != OperationKind::Associators;
      if (namesOfDevices) {
        continue;  // paths only
      }
      const auto request = [&] { askOwn(kind, ends.source); };
      afterwards(request);
      broker.failNth("newInstance", ordinalOf("newInstance", farClass, 1, request));
      broker.services().record(true);
      const Response response = askOwn(kind, ends.source);
      EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
      EXPECT_EQ(response.instances.size() + response.paths.size(), ends.elements.size() - 1);
      const auto record = broker.services().takeRecord();
      for (const char* service : {"returnInstance", "returnObjectPath"}) {
        const auto handedOn = Support::detailsOf(record, service);
        EXPECT_EQ(std::count(handedOn.begin(), handedOn.end(), "NULL"), 0) << service;
      }
      broker.services().record(false);
    }
  }
}

// Whatever fails once: an answer comes back, nothing is left over, and the next request is whole again.
TEST_P(AssociationFailure, NoFailureOfAServiceIsFatal) {
  const ObjectPath source = row().farEnds().front().source;
  const ObjectPath path = allPaths().front();
  const auto requests = [&] {
    enumerateInstances(row().className);
    enumerateInstanceNames(row().className);
    getInstance(path);
    for (const OperationKind kind : associationOperations) {
      askOwn(kind, source);
    }
  };
  afterwards(requests);
  for (const auto& [number, service] : Corvcim::namedServices) {
    forgetTraces();
    requests();
    const unsigned int calls = broker.callCount(service);
    for (unsigned int n = 1; n <= calls; n += 1 + calls / 4) {
      for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
        broker.failNth(service, n, {.result = result});
        requests();
        broker.services().clearFailures();
        Scripted::takeMessages();
        Scripted::takeComparisons();
      }
    }
    EXPECT_EQ(enumerateInstanceNames(row().className).paths, allPaths()) << service;
  }
}

}  // namespace
