#include "tests/factory/FactoryTest.h"

using namespace FactoryTests;
using Corvcim::Failure;
using Corvcim::FailureResult;

// Between a processor and its capabilities, by way of the processor map.

namespace {

constexpr const char* toCapabilities = "getProcessorCapRefByProcHandle";
constexpr const char* toProcessor = "getProcessorRefByProcCapHandle";

class CapabilitiesNavigation : public FactoryTest {
 protected:
  CapabilitiesNavigation() {
    place(fullProcessor("a"));
    place(fullProcessor("b"));
    place(fullProcessor("c"));
  }

  unsigned short findCapabilities(const std::string& deviceId, const char** properties = nullptr) {
    key_ = key(deviceId);
    return factory().getProcessorCapRefByProcHandle(broker_, ref_, key_, properties, instances_, &rc_);
  }

  unsigned short findProcessor(const std::string& instanceId, const char** properties = nullptr) {
    key_ = key(instanceId);
    return factory().getProcessorRefByProcCapHandle(broker_, ref_, key_, properties, instances_, &rc_);
  }

  std::string parameters() const {
    return requestParameters(broker_, ref_,
                             " key=" + Scripted::address(key_) + " properties=" + Scripted::address(nullptr) +
                                 " instances=" + Scripted::address(&instances_) + " rc=" + Scripted::address(&rc_));
  }

  CMPIString* key_ = nullptr;
  std::vector<CMPIInstance*> instances_;
};

}  // namespace

TEST_F(CapabilitiesNavigation, AProcessorHasItsCapabilities) {
  EXPECT_EQ(findCapabilities("b"), 0);

  EXPECT_EQ(identifiersOf(instances_), Lines{"NERITH:b"});
  EXPECT_EQ(Corvcim::valueOf(instances_[0]).path.className, "HALDA_CPUProcessorCapabilities");
  const Lines expected = {events.entering(detail, toCapabilities, parameters()),
                          events.variable(detail, toCapabilities, "deviceID", "b"),
                          events.variable(detail, toCapabilities, "instanceId", "NERITH:b"),
                          events.exiting(detail, toCapabilities, parameters())};
  EXPECT_EQ(Scripted::takeEventsOf(toCapabilities), expected);
}

TEST_F(CapabilitiesNavigation, CapabilitiesHaveTheirProcessor) {
  EXPECT_EQ(findProcessor("NERITH:b"), 0);

  EXPECT_EQ(identifiersOf(instances_), Lines{"b"});
  EXPECT_EQ(Corvcim::valueOf(instances_[0]).path.className, "HALDA_CPUProcessor");
  const Lines expected = {events.entering(detail, toProcessor, parameters()),
                          events.variable(detail, toProcessor, "instanceID", "NERITH:b"),
                          events.exiting(detail, toProcessor, parameters())};
  EXPECT_EQ(Scripted::takeEventsOf(toProcessor), expected);
}

TEST_F(CapabilitiesNavigation, GoesThroughTheLookups) {
  findCapabilities("b");
  EXPECT_FALSE(Scripted::takeEventsOf("getOneCPUProcCapCMPIInstance").empty());

  findProcessor("NERITH:b");
  EXPECT_FALSE(Scripted::takeEventsOf("getOneCPUProcCMPIInstance").empty());
}

TEST_F(CapabilitiesNavigation, HandsThePropertiesOnAndAppends) {
  findCapabilities("b", names({"NumberOfHardwareThreads"}));
  EXPECT_EQ(recording_.takeProperties(), (Lines{"InstanceID chars |NERITH:b|", "NumberOfHardwareThreads uint16 32"}));

  findProcessor("NERITH:a", names({"Stepping"}));
  EXPECT_EQ(recording_.takeProperties().back(), "Stepping chars |7|");

  EXPECT_EQ(identifiersOf(instances_), (Lines{"NERITH:b", "a"}));
}

TEST_F(CapabilitiesNavigation, AProcessorThatIsNotThereFailsAndLeavesTheExitUnmarked) {
  for (const char* deviceId : {"d", "", "B", " b", "b "}) {
    forgetTraces();

    EXPECT_EQ(findCapabilities(deviceId), 1) << deviceId;

    const std::vector<Scripted::Event> reported = Scripted::takeEvents();
    ASSERT_EQ(reported.size(), 3U);
    EXPECT_EQ(reported[0].withoutLine(), events.entering(detail, toCapabilities, parameters()));
    EXPECT_EQ(reported[1].withoutLine(), events.variable(detail, toCapabilities, "deviceID", deviceId));
    EXPECT_EQ(reported[2].text, "MESSAGE [File: CPUObjFactory.cpp, Line: 2044]: Processor map empty");
    EXPECT_EQ(reported[2].line, 2044);
    EXPECT_EQ(reported[2].level, 6000);
  }
  EXPECT_TRUE(instances_.empty());
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
}

TEST_F(CapabilitiesNavigation, WithoutProcessorsTheWayThereFailsAndTheWayBackFindsNothing) {
  CPUObjFactory::_processorMap.clear();

  EXPECT_EQ(findCapabilities("a"), 1);
  EXPECT_EQ(findProcessor("NERITH:a"), 0);

  EXPECT_TRUE(instances_.empty());
}

TEST_F(CapabilitiesNavigation, CapabilitiesThatAreNotThereFindNothing) {
  for (const char* instanceId : {"NERITH:d", "nerith:b", "b", "", " NERITH:b"}) {
    forgetTraces();

    EXPECT_EQ(findProcessor(instanceId), 0) << instanceId;

    const Lines expected = {events.entering(detail, toProcessor, parameters()),
                            events.variable(detail, toProcessor, "instanceID", instanceId),
                            events.exiting(detail, toProcessor, parameters())};
    EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected) << instanceId;
  }
  EXPECT_TRUE(instances_.empty());
}

TEST_F(CapabilitiesNavigation, EveryProcessorWithTheInstanceIdIsFoundInTheOrderOfKeys) {
  CPUObjFactory::_processorMap["c"].setInstanceId("NERITH:a");

  EXPECT_EQ(findProcessor("NERITH:a"), 0);
  EXPECT_EQ(identifiersOf(instances_), (Lines{"a", "c"}));

  // And the capabilities of each are those of both.
  instances_.clear();
  EXPECT_EQ(findCapabilities("c"), 0);
  EXPECT_EQ(identifiersOf(instances_), (Lines{"NERITH:a", "NERITH:a"}));
}

TEST_F(CapabilitiesNavigation, AFailedStringFindsNothingAndIsNoFailure) {
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    forgetTraces();
    hostBroker_.services().failNth("newString", 1, Failure{result, CMPI_RC_ERR_ACCESS_DENIED, "no"});
    EXPECT_EQ(findCapabilities("b"), 0);
    EXPECT_EQ(Scripted::takeEventsOf(toCapabilities).back(), events.exiting(detail, toCapabilities, parameters()));

    hostBroker_.services().failNth("newString", 1, Failure{result, CMPI_RC_ERR_ACCESS_DENIED, "no"});
    EXPECT_EQ(findProcessor("NERITH:b"), 0);
    EXPECT_EQ(Scripted::takeEventsOf(toProcessor).back(), events.exiting(detail, toProcessor, parameters()));
  }
  EXPECT_TRUE(instances_.empty());
}

TEST_F(CapabilitiesNavigation, AfterAFailedStringTheWalkGoesOn) {
  CPUObjFactory::_processorMap["c"].setInstanceId("NERITH:a");
  hostBroker_.services().failNth("newString", 1);

  EXPECT_EQ(findProcessor("NERITH:a"), 0);

  EXPECT_EQ(identifiersOf(instances_), Lines{"c"});
}

TEST_F(CapabilitiesNavigation, AProcessorThatItsOwnLookupMissesFailsAndLeavesTheExitUnmarked) {
  // The map's key and the record's identifier differ: the lookup of the identifier finds nothing.
  CPUObjFactory::_processorMap["b"].setProcessorDeviceID("elsewhere");
  CPUObjFactory::_processorMap["c"].setInstanceId("NERITH:b");

  EXPECT_EQ(findProcessor("NERITH:b"), 1);

  EXPECT_TRUE(instances_.empty());
  const Lines expected = {
      events.entering(detail, toProcessor, parameters()),
      events.variable(detail, toProcessor, "instanceID", "NERITH:b"),
      events.message(error, toProcessor, "***getCPUProcessorCapFromCPUProcessor failed***"),
  };
  EXPECT_EQ(Scripted::takeEventsOf(toProcessor), expected);
}

TEST_F(CapabilitiesNavigation, AppendsTheNullOfABuilder) {
  hostBroker_.services().failNth("newInstance", 1);
  EXPECT_EQ(findCapabilities("b"), 0);
  hostBroker_.services().failNth("newInstance", 1);
  EXPECT_EQ(findProcessor("NERITH:b"), 0);

  EXPECT_EQ(identifiersOf(instances_), (Lines{"NULL", "NULL"}));
}
