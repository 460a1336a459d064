// GetInstance of the four providers of plain classes.

#include "host/broker/Request.h"
#include "tests/providers/InstanceProviderRows.h"

namespace {

using Corvcim::FailureResult;
using Corvcim::Value;
using InstanceProviders::twoProcessors;
using Scripted::inventory;
using Support::EventList;
using Support::outcome;
using Support::pathsOf;

using Paths = std::vector<Corvcim::ObjectPath>;

class GetInstance : public InstanceProviders::InstanceProvider {
 protected:
  GetInstance() { twoProcessors(); }

  EventList entering() const { return events("GetInstance").entering(); }
  EventList enteringWithKey(std::string_view key) const {
    return row().tracesKey ? entering().variable(row().key, std::string(key)) : entering();
  }
  EventList succeeded(EventList list) const { return list.exiting(row().exitLine); }

  /// GetInstance with this path answers every instance, since the key that names one is no text.
  void expectEveryInstance(const Corvcim::ObjectPath& reference) {
    const auto response = getInstance(reference);
    EXPECT_EQ(pathsOf(response), allPaths());
    EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
    expectEvents(succeeded(entering()));
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachClass, GetInstance, ::testing::ValuesIn(InstanceProviders::rows()),
                         InstanceProviders::className);

TEST_P(GetInstance, AnswersTheInstanceThatTheKeyNames) {
  const auto response = getInstance(path(row().identifiers.back()));
  EXPECT_EQ(pathsOf(response), Paths{path(row().identifiers.back())});
  EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
  expectEvents(succeeded(enteringWithKey(row().identifiers.back())));
  EXPECT_EQ(collections(), 1U);
  EXPECT_EQ(otherCollections(), 0U);
}

TEST_P(GetInstance, LooksAtNoOtherKey) {
  const auto response = getInstance(pathWithKey(Value::string(row().identifiers.back())));
  EXPECT_EQ(pathsOf(response), Paths{path(row().identifiers.back())});
}

TEST_P(GetInstance, FindsTheKeyWhateverItsCase) {
  Corvcim::ObjectPath reference = Support::classPath(row().className);
  reference.keys.push_back(
      {row().key == std::string("DeviceID") ? "deviceid" : "instanceid", Value::string(row().identifiers[0])});
  EXPECT_EQ(pathsOf(getInstance(reference)), Paths{path(row().identifiers[0])});
}

TEST_P(GetInstance, WithoutKeysLogsAndEndsTheRequest) {
  const auto response = getInstance(Support::classPath(row().className));
  EXPECT_EQ(response.instances.size(), 0U);
  EXPECT_EQ(outcome(response), row().failsWithoutKeys ? "CMPI_RC_ERR_FAILED |At least one key should be passed| done"
                                                      : "CMPI_RC_OK no message done");
  expectEvents(entering().error(row().noKeys.text, row().noKeys.line).exiting());
  EXPECT_EQ(inventory().calls(), std::vector<std::string>());
}

TEST_P(GetInstance, WithoutKeysAndWithoutBrokerHasNoMessage) {
  Corvcim::Request request(broker, Support::testNameSpace);
  CMPIInstanceMI* interface = provider().createInstanceMI(nullptr, nullptr, nullptr);
  const CMPIStatus status = interface->ft->getInstance(
      interface, request.context(), request.result(), request.objectPath(Support::classPath(row().className)), nullptr);
  EXPECT_EQ(status.rc, row().failsWithoutKeys ? CMPI_RC_ERR_FAILED : CMPI_RC_OK);
  EXPECT_EQ(status.msg, nullptr);
}

TEST_P(GetInstance, WithoutKeysAndWithoutAMessageStringStillFails) {
  broker.failNth("newString", 1);
  const auto response = getInstance(Support::classPath(row().className));
  EXPECT_EQ(outcome(response),
            row().failsWithoutKeys ? "CMPI_RC_ERR_FAILED no message done" : "CMPI_RC_OK no message done");
}

// A count that the broker cannot give reads as no keys; only the processors' provider keeps its status.
TEST_P(GetInstance, FailingKeyCountReadsAsNoKeys) {
  broker.failNth("getKeyCount", 1, {.rc = CMPI_RC_ERR_ACCESS_DENIED, .message = "no count"});
  const auto response = getInstance(path(row().identifiers[0]));
  EXPECT_EQ(response.instances.size(), 0U);
  EXPECT_EQ(outcome(response), row().failsWithoutKeys ? "CMPI_RC_ERR_FAILED |At least one key should be passed| done"
                                                      : "CMPI_RC_ERR_ACCESS_DENIED |no count| done");
}

TEST_P(GetInstance, WithOtherKeysOnlyAnswersEveryInstance) {
  expectEveryInstance(pathWithOtherKey());
  EXPECT_EQ(collections(), 1U);
  EXPECT_EQ(otherCollections(), 0U);
}

TEST_P(GetInstance, WithANullKeyAnswersEveryInstance) {
  expectEveryInstance(pathWithKey(Value::null(CMPI_string)));
}

TEST_P(GetInstance, WithANumberForAKeyAnswersEveryInstance) {
  expectEveryInstance(pathWithKey(Value::uint64(7)));
}

TEST_P(GetInstance, WithABooleanForAKeyAnswersEveryInstance) {
  expectEveryInstance(pathWithKey(Value::boolean(true)));
}

TEST_P(GetInstance, WithAKeyThatTheBrokerCannotReadAnswersEveryInstance) {
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    broker.failNth("getKey", 1, {.result = result});
    expectEveryInstance(path(row().identifiers[0]));
  }
}

TEST_P(GetInstance, UnknownKeyFailsWithTheStatusAsItIs) {
  for (const std::string& key :
       {std::string("cpu7"), std::string(), std::string(row().identifiers[0]) + " ", std::string("CPU0")}) {
    const auto response = getInstance(pathWithKey(Value::string(key)));
    EXPECT_EQ(response.instances.size(), 0U);
    if (row().oneFailed) {
      EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
      expectEvents(enteringWithKey(key).error(row().oneFailed->text, row().oneFailed->line));
    } else {
      EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
      expectEvents(succeeded(enteringWithKey(key)));
    }
  }
}

TEST_P(GetInstance, KnownKeyOnAnEmptyInventoryFailsLikeAnUnknownOne) {
  inventory().reset();
  const auto response = getInstance(path(row().identifiers[0]));
  EXPECT_EQ(outcome(response), row().oneFailed ? "CMPI_RC_OK no message not done" : "CMPI_RC_OK no message done");
}

// The status is the one of the key that was not there.
TEST_P(GetInstance, WithOtherKeysOnlyOnAnEmptyInventory) {
  inventory().reset();
  const auto response = getInstance(pathWithOtherKey());
  EXPECT_EQ(response.instances.size(), 0U);
  EXPECT_EQ(response.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  EXPECT_EQ(response.done(), !row().allFailed);
  if (row().allFailed) {
    expectEvents(entering().error(row().allFailed->text, row().allFailed->line));
  } else {
    expectEvents(succeeded(entering()));
  }
}

TEST_P(GetInstance, InstanceThatTheBrokerCouldNotMakeIsLeftOut) {
  broker.services().record(true);
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    broker.failNth("newInstance", 1, {.result = result});
    const auto response = getInstance(path(row().identifiers[0]));
    EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
    EXPECT_EQ(Support::detailsOf(broker.services().takeRecord(), "returnInstance"), std::vector<std::string>());
  }
}

TEST_P(GetInstance, InstanceThatTheBrokerRefusesDoesNotEndTheRequest) {
  broker.failNth("returnInstance", 1);
  const auto response = getInstance(pathWithOtherKey());
  EXPECT_EQ(pathsOf(response), Paths{path(row().identifiers[1])});
  EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
}

TEST_P(GetInstance, PropertyListReachesTheInstance) {
  const auto response = getInstance(path(row().identifiers[0]), std::vector<std::string>{"Caption"});
  ASSERT_EQ(response.instances.size(), 1U);
  EXPECT_EQ(response.instances[0].properties.size(), path("NERITH:x").keys.size() + 1);
  EXPECT_NE(response.instances[0].property("Caption"), nullptr);
}

TEST_P(GetInstance, AnswersInTheNameSpaceOfTheRequest) {
  Corvcim::ObjectPath reference = path(row().identifiers[0]);
  reference.nameSpace = "root/elsewhere";
  reference.host = "client";
  const auto response = getInstance(reference);
  Corvcim::ObjectPath expected = path(row().identifiers[0]);
  expected.nameSpace = "root/elsewhere";
  EXPECT_EQ(pathsOf(response), Paths{expected});
}

TEST_P(GetInstance, LogsTheKeyBeforeItAsksTheFactory) {
  getInstance(path(row().identifiers[0]));
  const auto all = Scripted::takeEvents();
  const std::size_t firstOfFactory = 2 + (row().tracesKey ? 1U : 0U);
  ASSERT_GT(all.size(), firstOfFactory);
  EXPECT_EQ(all[firstOfFactory - 1].component, provider().component);
  EXPECT_EQ(all[firstOfFactory].component, "Corvane.CPUProvider");
  EXPECT_EQ(all[firstOfFactory].function, "getFactoryInstance");
}

}  // namespace
