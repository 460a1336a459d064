// GetInstance of the five associations.

#include "host/broker/Request.h"
#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::Instance;
using Support::answered;
using Support::answeredNothing;
using Support::outcome;
using Support::withHost;
using Support::withoutNameSpace;

class AssociationGetInstance : public Association {
 protected:
  std::vector<Instance> answerOf(const Pair& pair) const {
    return {instanceOf(pair, row().enumerationsDescribeTheCache)};
  }
  Support::EventList searching() const { return leavingBuilder(enteringBuilder("GetInstance"), "GetInstance"); }
};

INSTANTIATE_TEST_SUITE_P(OfEachAssociation, AssociationGetInstance, ::testing::ValuesIn(rows()), className);

TEST_P(AssociationGetInstance, FindsEachPair) {
  for (const Pair& pair : row().pairs()) {
    EXPECT_EQ(getInstance(pathOf(pair)), answered(answerOf(pair)));
    expectEvents(searching());
  }
}

TEST_P(AssociationGetInstance, FindsWhatIsNamedWithAnotherHostOrWithoutNameSpace) {
  const Pair pair = row().pairs().back();
  EXPECT_EQ(getInstance(withHost(pathOf(pair), "client")), answered(answerOf(pair)));
  const Pair bare{withoutNameSpace(withHost(pair.first, "")), withoutNameSpace(withHost(pair.second, ""))};
  EXPECT_EQ(getInstance(withHost(pathOf(bare), "")), answered(answerOf(pair)));
}

TEST_P(AssociationGetInstance, FindsWhatIsNamedInAnotherOrderOfKeysAndAnotherCase) {
  const Pair pair = row().pairs().front();
  ObjectPath path = pathOf(pair);
  std::swap(path.keys[0], path.keys[1]);
  for (auto& key : path.keys) {
    key.name[0] = static_cast<char>(key.name[0] - 'A' + 'a');
  }
  EXPECT_EQ(getInstance(path), answered(answerOf(pair)));
}

TEST_P(AssociationGetInstance, AnswersTheFirstOfEqualInstances) {
  const auto systems = {Support::systemInstance("sysA"), Support::systemInstance("sysA")};
  broker.serveInstances("HALDA_ComputerSystem", systems);
  Pair pair = row().pairs().front();
  if (pair.first.className == "HALDA_ComputerSystem") {
    pair.first = Support::systemPath("sysA");
  }
  EXPECT_EQ(getInstance(pathOf(pair)).instances.size(), 1U);
}

TEST_P(AssociationGetInstance, OfNoSuchPairIsEmptyAndSucceeds) {
  const Pair front = row().pairs().front();
  const Pair back = row().pairs().back();
  Pair unknown = front;
  unknown.second.keys.back().value = Corvcim::Value::string("unknown");
  Pair swapped{front.second, front.first};
  for (const Pair& pair : {unknown, swapped}) {
    EXPECT_EQ(getInstance(pathOf(pair)), answeredNothing());
    expectEvents(searching());
  }
  if (row().pairs().size() < 4) {  // elsewhere the two are a pair themselves
    EXPECT_EQ(getInstance(pathOf({front.first, back.second})), answeredNothing());
  }
}

TEST_P(AssociationGetInstance, WithOneKeyOnlyFindsNothing) {
  ObjectPath path = allPaths().front();
  path.keys.pop_back();
  EXPECT_EQ(getInstance(path), answeredNothing());
}

TEST_P(AssociationGetInstance, WithKeysThatAreNoReferencesFindsNothing) {
  ObjectPath path = allPaths().front();
  path.keys[0].value = Corvcim::Value::string("a text");
  path.keys[1].value = Corvcim::Value::uint64(7);
  EXPECT_EQ(getInstance(path), answeredNothing());
}

TEST_P(AssociationGetInstance, WithoutKeysFails) {
  const auto response = getInstance(Support::classPath(row().className));
  EXPECT_EQ(outcome(response), "CMPI_RC_ERR_FAILED |At least one key should be passed| done");
  EXPECT_EQ(response.instances.size(), 0U);
  expectEvents(events("GetInstance").entering().error("At least one key should be passed").exiting());
}

TEST_P(AssociationGetInstance, WithoutKeysAndWithoutBrokerHasNoMessage) {
  Corvcim::Request request(broker, Support::testNameSpace);
  CMPIInstanceMI* interface = provider().createInstanceMI(nullptr, nullptr, nullptr);
  const CMPIStatus status = interface->ft->getInstance(
      interface, request.context(), request.result(), request.objectPath(Support::classPath(row().className)), nullptr);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(status.msg, nullptr);
  EXPECT_EQ(request.response(status).doneCalls, 1U);
}

TEST_P(AssociationGetInstance, OnAnEmptyInventoryIsEmptyAndSucceeds) {
  Scripted::inventory().reset();
  const auto response = getInstance(allPaths().front());
  EXPECT_EQ(response, answeredNothing());
}

TEST_P(AssociationGetInstance, PropertyListReachesTheInstance) {
  const Pair pair = row().pairs().back();
  const auto response = getInstance(pathOf(pair), std::vector<std::string>{"Level"});
  const bool keepsItsEnds = std::string(row().filterKeys).find(row().firstEnd) != std::string::npos;
  // Instances that lose their references to the filter lose the path that would be compared.
  ASSERT_EQ(response.instances.size(), keepsItsEnds ? 1U : 0U);
  if (keepsItsEnds) {
    EXPECT_EQ(response.instances[0].properties.size(), row().enumerationsDescribeTheCache ? 3U : 2U);
  }
}

// The comparison sees the request's path on the left and stops at the first match.
TEST_P(AssociationGetInstance, ComparesUntilTheFirstMatch) {
  const std::vector<Pair> pairs = row().pairs();
  Corvcim::Request request(broker, Support::testNameSpace);
  const CMPIObjectPath* reference = request.objectPath(pathOf(pairs[1]));
  CMPIInstanceMI* interface = mi();
  Scripted::takeComparisons();
  interface->ft->getInstance(interface, request.context(), request.result(), reference, nullptr);

  const auto comparisons = Scripted::takeComparisons();
  ASSERT_EQ(comparisons.size(), 2U);
  for (std::size_t i = 0; i < 2; ++i) {
    EXPECT_EQ(comparisons[i].withLog, row().comparesWithLog);
    EXPECT_EQ(comparisons[i].broker, row().comparesWithLog ? broker.handle() : nullptr);
    EXPECT_EQ(comparisons[i].left, reference);
    EXPECT_TRUE(comparisons[i].flag);
    EXPECT_EQ(comparisons[i].equal, i == 1);
    EXPECT_EQ(Corvcim::valueOf(comparisons[i].right), pathOf(pairs[i]));
  }
}

// Only the cache associations put their own host and the request's namespace on the candidate first.
TEST_P(AssociationGetInstance, StampsTheCandidateOnlyBeforeALoggedComparison) {
  const auto request = [&] { getInstance(allPaths().front()); };
  const unsigned int candidate = ordinalOf("getObjectPath", row().className, 1, request);
  broker.services().record(true);
  request();
  bool stamped = false;
  unsigned int seen = 0;
  for (const Corvcim::ServiceCall& call : broker.services().takeRecord()) {
    seen += call.service == "getObjectPath" ? 1U : 0U;
    stamped |= seen == candidate && call.service == "setHostname";
  }
  EXPECT_EQ(stamped, row().comparesWithLog);
}

TEST_P(AssociationGetInstance, SkipsInstancesThatTheBrokerCouldNotMake) {
  const Pair last = row().pairs().back();
  const auto request = [&] { getInstance(pathOf(last)); };
  const unsigned int first = ordinalOf("newInstance", row().className, 1, request);
  for (const Corvcim::FailureResult result : {Corvcim::FailureResult::Null, Corvcim::FailureResult::HandleLess}) {
    broker.failNth("newInstance", first, {.result = result});
    EXPECT_EQ(getInstance(pathOf(last)), answered(answerOf(last)));
  }
}

}  // namespace
