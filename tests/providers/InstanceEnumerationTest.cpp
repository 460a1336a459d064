// EnumInstances and EnumInstanceNames of the four providers of plain classes.

#include "tests/providers/InstanceProviderRows.h"

namespace {

using Corvcim::FailureResult;
using Corvcim::ObjectPath;
using InstanceProviders::twoProcessors;
using Scripted::inventory;
using Scripted::Operation;
using Support::EventList;
using Support::outcome;
using Support::pathsOf;

using Paths = std::vector<ObjectPath>;

class Enumeration : public InstanceProviders::InstanceProvider {
 protected:
  Enumeration() { twoProcessors(); }

  /// `processors`: how many were collected before; the number is logged by some.
  EventList enteringInstances(unsigned int processors) const {
    EventList list = events("EnumInstances").entering();
    return row().instancesVariable ? list.variable(*row().instancesVariable, std::to_string(processors)) : list;
  }
  EventList enteringNames(unsigned int elements) const {
    EventList list = events("EnumInstanceNames").entering();
    const auto& variable = row().namesVariable;
    return variable ? list.variable(variable->text, std::to_string(elements), variable->line) : list;
  }

  void expectFailedInstances(const Corvcim::Response& response) {
    EXPECT_EQ(response.instances.size(), 0U);
    if (row().instancesFailed) {
      EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
      expectEvents(enteringInstances(0).error(row().instancesFailed->text, row().instancesFailed->line));
    } else {
      EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
      expectEvents(enteringInstances(0).exiting());
    }
  }

  void expectFailedNames(const Corvcim::Response& response, const std::string& expected, unsigned int elements) {
    EXPECT_EQ(response.paths.size(), 0U);
    EXPECT_EQ(outcome(response), expected);
    expectEvents(enteringNames(elements).error(row().namesFailed.text, row().namesFailed.line));
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachClass, Enumeration, ::testing::ValuesIn(InstanceProviders::rows()),
                         InstanceProviders::className);

TEST_P(Enumeration, AnswersEveryInstanceInTheOrderOfIdentifiers) {
  inventory().reset();
  inventory().processor("cpu2").core("core2").cache("cache2").processor("cpu10").core("core10").cache("cache10");
  const auto suffixed = [&](const std::string& number) {
    const std::string first(row().identifiers[0]);
    return path(first.substr(0, first.size() - 1) + number);
  };
  const auto response = enumerateInstances(row().className);
  EXPECT_EQ(pathsOf(response), (Paths{suffixed("10"), suffixed("2")}));
  EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
  EXPECT_EQ(collections(), 1U);
  EXPECT_EQ(otherCollections(), 0U);
}

TEST_P(Enumeration, OfInstancesIsFramedInTheLog) {
  enumerateInstances(row().className);
  const bool countsItsOwn = row().nodeType == 4;
  expectEvents(enteringInstances(countsItsOwn ? 2 : 0).exiting());
}

// Room is made, and the number logged, for as many instances as there are processors.
TEST_P(Enumeration, OfInstancesCountsTheProcessorsThatAnotherProviderCollected) {
  inventory().core("core2").cache("cache2");
  afterwards([&] { enumerateInstances("HALDA_CPUProcessor"); });
  EXPECT_EQ(enumerateInstances(row().className).instances.size(), row().nodeType == 4 ? 2U : 3U);
  expectEvents(enteringInstances(2).exiting());
}

TEST_P(Enumeration, OfInstancesOnAnEmptyInventory) {
  inventory().reset();
  expectFailedInstances(enumerateInstances(row().className));
}

TEST_P(Enumeration, OfInstancesWithAnInventoryThatBreaks) {
  inventory().failNth(Operation::GetPathToNode, 1);
  inventory().failNth(Operation::GetPathToNode, 1);
  expectFailedInstances(enumerateInstances(row().className));
}

TEST_P(Enumeration, CollectsAgainOnlyAfterAFailure) {
  inventory().reset();
  enumerateInstances(row().className);
  enumerateInstances(row().className);
  EXPECT_GE(collections(), 2U);

  twoProcessors();
  afterwards([&] { enumerateInstances(row().className); });
  EXPECT_EQ(enumerateInstances(row().className).instances.size(), 2U);
  EXPECT_EQ(collections(), 0U);
}

TEST_P(Enumeration, InstanceThatTheBrokerCouldNotMakeIsLeftOut) {
  broker.services().record(true);
  for (const auto result : {Corvcim::FailureResult::Null, Corvcim::FailureResult::HandleLess}) {
    broker.failNth("newInstance", 1, {.result = result});
    const auto response = enumerateInstances(row().className);
    EXPECT_EQ(pathsOf(response), Paths{path(row().identifiers[1])});
    EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
    EXPECT_EQ(Support::detailsOf(broker.services().takeRecord(), "returnInstance"),
              std::vector<std::string>{row().className});
  }
}

TEST_P(Enumeration, InstanceThatTheBrokerRefusesDoesNotEndTheRequest) {
  broker.failNth("returnInstance", 1);
  const auto response = enumerateInstances(row().className);
  EXPECT_EQ(pathsOf(response), Paths{path(row().identifiers[1])});
  EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
}

TEST_P(Enumeration, RequestThatCannotBeEndedKeepsItsStatus) {
  broker.failNth("returnDone", 1);
  const auto response = enumerateInstances(row().className);
  EXPECT_EQ(response.instances.size(), 2U);
  EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
}

TEST_P(Enumeration, PropertyListReachesEveryInstance) {
  const auto wanted = enumerateInstances(row().className, std::vector<std::string>{"Caption", "NoSuchProperty"});
  const auto keysOnly = enumerateInstances(row().className, std::vector<std::string>{});
  ASSERT_EQ(wanted.instances.size(), 2U);
  ASSERT_EQ(keysOnly.instances.size(), 2U);
  for (std::size_t i = 0; i < 2; ++i) {
    EXPECT_EQ(keysOnly.instances[i].properties, allPaths()[i].keys);
    auto expected = allPaths()[i].keys;
    expected.push_back({"Caption", *wanted.instances[i].property("Caption")});
    EXPECT_EQ(wanted.instances[i].properties, expected);
  }
}

TEST_P(Enumeration, OfNamesAnswersThePathsOfTheInstances) {
  const auto response = enumerateInstanceNames(row().className);
  EXPECT_EQ(response, Support::answered(allPaths()));
  expectEvents(enteringNames(2).exiting());
  EXPECT_EQ(collections(), 1U);
  EXPECT_EQ(otherCollections(), 0U);
  EXPECT_EQ(broker.callCount("newInstance"), 0U);
}

TEST_P(Enumeration, OfNamesOnAnEmptyInventory) {
  inventory().reset();
  expectFailedNames(enumerateInstanceNames(row().className), "CMPI_RC_OK no message not done", 0);
}

TEST_P(Enumeration, OfNamesStopsAtAPathThatTheBrokerCannotMake) {
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    broker.failNth("newObjectPath", 2, {.result = result});
    expectFailedNames(enumerateInstanceNames(row().className),
                      "CMPI_RC_ERR_FAILED |Create CMPIObjectPath failed.| not done", 2);
  }
}

TEST_P(Enumeration, PathThatTheBrokerRefusesDoesNotEndTheRequest) {
  broker.failNth("returnObjectPath", 1);
  EXPECT_EQ(enumerateInstanceNames(row().className), Support::answered(Paths{path(row().identifiers[1])}));
}

TEST_P(Enumeration, AnswersInTheNameSpaceOfTheRequest) {
  ObjectPath elsewhere = Support::classPath(row().className);
  elsewhere.nameSpace = "root/elsewhere";
  elsewhere.host = "client";
  Paths expected = allPaths();
  for (ObjectPath& each : expected) {
    each.nameSpace = "root/elsewhere";
  }
  EXPECT_EQ(pathsOf(broker.enumerateInstances(mi(), elsewhere)), expected);
  EXPECT_EQ(broker.enumerateInstanceNames(mi(), elsewhere).paths, expected);
}

}  // namespace
