// What only the association of computer systems has: result classes, and another provider's answers.

#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::AssociationFilter;
using Corvcim::FailureResult;
using Corvcim::OperationKind;
using Corvcim::Response;
using Scripted::inventory;
using Support::answeredNothing;
using Support::EventList;
using Support::outcome;
using Support::processorPath;
using Support::systemInstance;
using Support::systemPath;
using Support::withoutDone;

const std::string upCallFailed = "Call to CBEnumInstances of target Class Failed.";

constexpr OperationKind associators[] = {OperationKind::Associators, OperationKind::AssociatorNames};
constexpr OperationKind references[] = {OperationKind::References, OperationKind::ReferenceNames};

class SystemDevice : public Support::ProviderTest {
 protected:
  SystemDevice() {
    scriptMachine();
    broker.serveInstances(systemClass, {systemInstance("sysB"), systemInstance("sysA")});
  }

  const Support::ProviderFunctions& provider() const { return Support::providerOf(systemDevice); }
  EventList entering(OperationKind kind, const std::string& target) const {
    EventList list(provider(), std::string(Corvcim::operationName(kind)));
    list.entering();
    if (isAssociators(kind)) {
      list.variable("((targetClass)->ft->getCharPtr((targetClass),(&rc)))", target);
    }
    return list;
  }

  Response ask(OperationKind kind, const ObjectPath& source, const std::optional<std::string>& resultClass = {}) {
    AssociationFilter filter;
    filter.assocClass = systemDevice;
    filter.resultClass = resultClass;
    return associate(systemDevice, kind, source, filter);
  }
  static std::size_t results(const Response& response) { return response.instances.size() + response.paths.size(); }

  /// Compares the events but for a closing exit mark.
  void expectEventsBeforeExit(OperationKind kind, EventList expected) {
    auto actual = Support::takeEventsOf(provider());
    const std::size_t count = expected.lines().size();
    ASSERT_GE(actual.size(), count);
    EventList whole = expected;
    if (actual.size() > count) {
      whole.exiting();
    }
    EXPECT_EQ(whole.linesOf(actual), whole.lines()) << Corvcim::operationName(kind);
  }
};

TEST_F(SystemDevice, ResultClassMayBeTheSystemsOrItsParentInAnyCase) {
  for (const std::string wanted : {"HALDA_ComputerSystem", "CIM_ComputerSystem", "cim_computersystem",
                                   "CIM_COMPUTERSYSTEM", "halda_COMPUTERsystem"}) {
    for (const OperationKind kind : associators) {
      EXPECT_EQ(ask(kind, processorPath("cpu0"), wanted), ask(kind, processorPath("cpu0"))) << wanted;
      EXPECT_EQ(results(ask(kind, processorPath("cpu0"), wanted)), 2U) << wanted;
    }
  }
}

TEST_F(SystemDevice, ResultClassMayBeTheProcessorsOrItsParentInAnyCase) {
  for (const std::string wanted : {"HALDA_CPUProcessor", "CIM_Processor", "cim_processor", "HALDA_CPUPROCESSOR"}) {
    for (const OperationKind kind : associators) {
      EXPECT_EQ(ask(kind, systemPath("sysA"), wanted), ask(kind, systemPath("sysA"))) << wanted;
      EXPECT_EQ(results(ask(kind, systemPath("sysA"), wanted)), 2U) << wanted;
    }
  }
}

TEST_F(SystemDevice, AnyOtherResultClassFindsNothing) {
  for (const std::string wanted : {"CIM_Processor", "CIM_System", "CIM_ComputerSystem ", "HALDA_Computer", "X", ""}) {
    for (const OperationKind kind : associators) {
      EXPECT_EQ(ask(kind, processorPath("cpu0"), wanted), withoutDone(answeredNothing())) << wanted;
    }
  }
  for (const std::string wanted :
       {"CIM_ComputerSystem", "CIM_LogicalDevice", "CIM_Processo", "HALDA_CPUProcessorCore", ""}) {
    for (const OperationKind kind : associators) {
      EXPECT_EQ(ask(kind, systemPath("sysA"), wanted), withoutDone(answeredNothing())) << wanted;
    }
  }
  EXPECT_EQ(broker.callCount("enumerateInstances") + broker.callCount("enumerateInstanceNames"), 0U);
}

TEST_F(SystemDevice, TwoSystemsAndFourProcessorsAreEightAssociations) {
  inventory().processor("cpu2").processor("cpu3");
  EXPECT_EQ(enumerateInstances(systemDevice).instances.size(), 8U);
  EXPECT_EQ(enumerateInstanceNames(systemDevice).paths.size(), 8U);
}

TEST_F(SystemDevice, EveryProcessorBelongsToWhateverSystemIsNamed) {
  for (const OperationKind kind : associationOperations) {
    EXPECT_EQ(results(ask(kind, systemPath("elsewhere"))), 2U);
    EXPECT_EQ(results(ask(kind, Support::classPath(systemClass))), 2U);
  }
}

TEST_F(SystemDevice, WhateverProcessorIsNamedBelongsToEverySystem) {
  for (const OperationKind kind : associationOperations) {
    EXPECT_EQ(results(ask(kind, processorPath("unknown"))), 2U);
    EXPECT_EQ(results(ask(kind, Support::classPath("HALDA_CPUProcessor"))), 2U);
  }
}

TEST_F(SystemDevice, AsksForSystemsInTheNameSpaceOfTheRequestAndWithoutAList) {
  std::vector<Corvcim::Operation> asked;
  broker.serve(systemClass, [&](const Corvcim::Operation& operation) {
    asked.push_back(operation);
    return Corvcim::UpcallReply{{CMPI_RC_OK, {}, {systemInstance("sysA")}, {}, 1}};
  });
  ObjectPath source = processorPath("cpu0");
  source.nameSpace = "root/elsewhere";
  AssociationFilter filter;
  filter.assocClass = systemDevice;
  associate(systemDevice, OperationKind::Associators, source, filter, std::vector<std::string>{"Caption"});
  associate(systemDevice, OperationKind::AssociatorNames, source, filter);
  ASSERT_EQ(asked.size(), 2U);
  EXPECT_EQ(asked[0].kind, OperationKind::EnumerateInstances);
  EXPECT_EQ(asked[0].properties, std::nullopt);
  EXPECT_EQ(asked[1].kind, OperationKind::EnumerateInstanceNames);
  for (const Corvcim::Operation& each : asked) {
    EXPECT_EQ(each.path.className, systemClass);
    EXPECT_EQ(each.path.nameSpace, "root/elsewhere");
  }
}

TEST_F(SystemDevice, WithoutSystemsHasNoAssociation) {
  broker.serveInstances(systemClass, {});
  EXPECT_EQ(enumerateInstances(systemDevice), answeredNothing());
  EXPECT_EQ(enumerateInstanceNames(systemDevice), answeredNothing());
  for (const OperationKind kind : associationOperations) {
    EXPECT_EQ(ask(kind, processorPath("cpu0")), withoutDone(answeredNothing()));
    EXPECT_EQ(results(ask(kind, systemPath("sysA"))), 2U);
  }
}

// No system: nobody asks for processors, so that there are none is not noticed.
TEST_F(SystemDevice, WithoutSystemsAndProcessorsIsEmptyAndSucceeds) {
  inventory().reset();
  broker.serveInstances(systemClass, {});
  EXPECT_EQ(enumerateInstanceNames(systemDevice), answeredNothing());
  Support::expectEvents(provider(), EventList(provider(), "EnumInstanceNames").entering().exiting());
}

/// The two ways in which brokers answer an up-call that failed.
class FailedUpCall : public SystemDevice, public ::testing::WithParamInterface<bool> {
 protected:
  FailedUpCall() { broker.serveFailure(systemClass, CMPI_RC_ERR_ACCESS_DENIED, "not for you", GetParam()); }
};

std::string upCallName(const ::testing::TestParamInfo<bool>& tested) {
  return tested.param ? "WithEnumeration" : "WithoutEnumeration";
}

INSTANTIATE_TEST_SUITE_P(OfEachKind, FailedUpCall, ::testing::Bool(), upCallName);

TEST_P(FailedUpCall, LeavesTheEnumerationOfInstancesEmpty) {
  EXPECT_EQ(enumerateInstances(systemDevice), answeredNothing());
  Support::expectEvents(provider(), EventList(provider(), "EnumInstances")
                                        .entering()
                                        .in("CPUSystemDeviceCMPIInstances")
                                        .entering()
                                        .error(upCallFailed)
                                        .exiting()
                                        .in("CPUSystemDevice_EnumInstances")
                                        .exiting());
}

TEST_P(FailedUpCall, LeavesGetInstanceEmpty) {
  EXPECT_EQ(getInstance(Support::associationPath(systemDevice, "GroupComponent", systemPath("sysA"), "PartComponent",
                                                 processorPath("cpu0"))),
            answeredNothing());
}

TEST_P(FailedUpCall, PassesItsStatusBackFromNames) {
  const Response response = enumerateInstanceNames(systemDevice);
  EXPECT_EQ(outcome(response), "CMPI_RC_ERR_ACCESS_DENIED |not for you| done");
  EXPECT_EQ(response.paths.size(), 0U);
  Support::expectEvents(provider(),
                        EventList(provider(), "EnumInstanceNames").entering().error(upCallFailed).exiting());
}

TEST_P(FailedUpCall, PassesItsStatusBackFromAProcessor) {
  for (const OperationKind kind : associationOperations) {
    const Response response = ask(kind, processorPath("cpu0"));
    EXPECT_EQ(outcome(response), "CMPI_RC_ERR_ACCESS_DENIED |not for you| not done");
    EXPECT_EQ(results(response), 0U);
    expectEventsBeforeExit(kind, entering(kind, systemClass).error(upCallFailed));
  }
}

TEST_P(FailedUpCall, DoesNotConcernASystem) {
  for (const OperationKind kind : associationOperations) {
    EXPECT_EQ(results(ask(kind, systemPath("sysA"))), 2U);
  }
}

// A broker that has nothing to say may answer no enumeration at all, with an OK status.
TEST_F(SystemDevice, NoEnumerationWithAnOkStatusIsEmpty) {
  const Corvcim::Failure nothing = {.result = FailureResult::Null, .rc = CMPI_RC_OK, .message = ""};
  const auto withoutEnumeration = [&](const auto& request) {
    broker.failNth("enumerateInstances", 1, nothing);
    broker.failNth("enumerateInstanceNames", 1, nothing);
    const Response response = request();
    broker.services().clearFailures();
    return response;
  };
  EXPECT_EQ(withoutEnumeration([&] { return enumerateInstances(systemDevice); }), answeredNothing());
  const Response names = withoutEnumeration([&] { return enumerateInstanceNames(systemDevice); });
  EXPECT_EQ(names.rc, CMPI_RC_OK);
  EXPECT_EQ(names.paths.size(), 0U);
  for (const OperationKind kind : associationOperations) {
    const Response response = withoutEnumeration([&] { return ask(kind, processorPath("cpu0")); });
    EXPECT_EQ(response.rc, CMPI_RC_OK);
    EXPECT_EQ(results(response), 0U);
  }
}

TEST_F(SystemDevice, PathOfTheSystemClassThatTheBrokerCannotMake) {
  const std::string status = "Create CMPIObjectPath failed.";
  const std::string log = "Create CMPIObjectPath failed for ComputerSystemClass.";
  afterwards([&] { enumerateInstances(systemDevice); });
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    broker.failNth("newObjectPath", 1, {.result = result});
    EXPECT_EQ(enumerateInstances(systemDevice), answeredNothing());
    Support::expectEvents(provider(), EventList(provider(), "EnumInstances")
                                          .entering()
                                          .in("CPUSystemDeviceCMPIInstances")
                                          .entering()
                                          .error(log)
                                          .exiting()
                                          .in("CPUSystemDevice_EnumInstances")
                                          .exiting());
    broker.failNth("newObjectPath", 1, {.result = result});
    EXPECT_EQ(outcome(enumerateInstanceNames(systemDevice)), "CMPI_RC_ERR_FAILED |" + status + "| done");
    Support::expectEvents(provider(), EventList(provider(), "EnumInstanceNames").entering().error(log).exiting());
  }
}

TEST_F(SystemDevice, SystemWithoutProcessorsSaysSo) {
  inventory().reset();
  const struct {
    OperationKind kind;
    const char* text;
  } expectations[] = {
      {OperationKind::Associators, "***Can't get Processor ObjectPaths.                 Exiting Associators***"},
      {OperationKind::AssociatorNames,
       "***Can't get Processor ObjectPaths.                 Exiting AssociatorNames***"},
      {OperationKind::References, "getAllCPUProcCMPIObjPaths Failed"},
      {OperationKind::ReferenceNames, "***Can't get Processor instances                 Exiting References***"},
  };
  for (const auto& each : expectations) {
    EXPECT_EQ(ask(each.kind, systemPath("sysA")), withoutDone(answeredNothing()));
    const EventList upTo = entering(each.kind, "HALDA_CPUProcessor").error(each.text);
    if (isAssociators(each.kind)) {
      Support::expectEvents(provider(), EventList(upTo).exiting());
    } else {
      expectEventsBeforeExit(each.kind, upTo);
    }
  }
}

TEST_F(SystemDevice, ElementsOfAnEnumerationThatCannotBeReadAreSkipped) {
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    for (const OperationKind kind : associationOperations) {
      broker.failNth("getNext", 1, {.result = result});
      EXPECT_EQ(results(ask(kind, processorPath("cpu0"))), 1U) << Corvcim::operationName(kind);
    }
    broker.failNth("getNext", 1, {.result = result});
    EXPECT_EQ(enumerateInstanceNames(systemDevice).paths.size(), 2U);
  }
}

TEST_F(SystemDevice, NothingIsLostToABrokerThatFailsForSomeElements) {
  broker.serveInstances(systemClass, {systemInstance("sysC"), systemInstance("sysB"), systemInstance("sysA")});
  for (const OperationKind kind : associationOperations) {
    broker.failNth("getNext", 1, {}, 2);
    EXPECT_EQ(results(ask(kind, processorPath("cpu0"))), 1U) << Corvcim::operationName(kind);
    broker.failNth("getNext", 2, {});
    EXPECT_EQ(results(ask(kind, processorPath("cpu0"))), 2U) << Corvcim::operationName(kind);
  }
}

TEST_F(SystemDevice, NothingIsLostToABrokerThatSetsAFailingStatusWithGoodElements) {
  broker.serveInstances(systemClass, {systemInstance("sysC"), systemInstance("sysB"), systemInstance("sysA")});
  broker.failNth("getNext", 1, {.result = FailureResult::StatusOnly}, 0);
  for (const OperationKind kind : associationOperations) {
    EXPECT_EQ(results(ask(kind, processorPath("cpu0"))), 3U) << Corvcim::operationName(kind);
  }
  EXPECT_EQ(enumerateInstances(systemDevice).instances.size(), 6U);
  EXPECT_EQ(enumerateInstanceNames(systemDevice).paths.size(), 6U);
}

}  // namespace
