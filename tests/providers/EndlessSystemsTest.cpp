// Enumerations of computer systems with very many replies that contain no element.

#include <cmpimacs.h>

#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::OperationKind;
using Corvcim::Response;
using Support::EventList;
using Support::outcome;

/// What the enumeration of a broker gives, and how often it was asked. Every reply has the state of a null value.
struct Endless {
  const CMPIBroker* broker = nullptr;
  CMPIStatus status{CMPI_RC_OK, nullptr};  ///< of its calls
  bool ofInstances = false;
  unsigned int calls = 0;
  unsigned int end = 0;  ///< after how many calls the enumeration has no more elements; 0: never

  /// The first system comes with the thousandth call and the second with the two thousandth: no call gives
  /// another.
  bool givesElement() const { return calls == 1000 || calls == 2000; }
};

Endless endless;

CMPIData nextOfEndless(const CMPIEnumeration* /*enumeration*/, CMPIStatus* status) {
  ++endless.calls;
  if (status != nullptr) {
    *status = endless.status;
  }
  CMPIData element{};
  element.state = CMPI_nullValue;
  if (endless.givesElement()) {
    CMPIObjectPath* path =
        CMNewObjectPath(endless.broker, Support::testNameSpace.c_str(), systemClass.c_str(), nullptr);
    if (endless.ofInstances) {
      element.value.inst = CMNewInstance(endless.broker, path, nullptr);
    } else {
      element.value.ref = path;
    }
  }
  return element;
}

CMPIEnumeration* endlessEnumeration() {
  static const CMPIEnumerationFT table = [] {
    CMPIEnumerationFT functions{};
    functions.getNext = nextOfEndless;
    functions.hasNext = [](const CMPIEnumeration*, CMPIStatus*) {
      return CMPIBoolean{endless.end == 0 || endless.calls < endless.end};
    };
    return functions;
  }();
  static CMPIEnumeration enumeration{&endless, &table};
  return &enumeration;
}

/// A broker with such an enumeration.
class EndlessEnumeration : public Support::ProviderTest, public ::testing::WithParamInterface<CMPIrc> {
 protected:
  EndlessEnumeration() : record_(*broker.handle()), services_(*record_.bft) {
    scriptMachine();
    services_.enumerateInstanceNames = [](const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*,
                                          CMPIStatus* status) {
      *status = {CMPI_RC_OK, nullptr};
      return endlessEnumeration();
    };
    services_.enumerateInstances = [](const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**,
                                      CMPIStatus* status) {
      *status = {CMPI_RC_OK, nullptr};
      return endlessEnumeration();
    };
    record_.bft = &services_;
  }

  const Support::ProviderFunctions& provider() const { return Support::providerOf(systemDevice); }

  Response ask(OperationKind kind, const ObjectPath& path, unsigned int end = 0) {
    endless = {&record_, {GetParam(), nullptr}, kind == OperationKind::Associators, 0, end};
    Corvcim::Operation operation{kind, path, {}, {}};
    if (!Corvcim::isAssociationOperation(kind)) {
      return broker.perform(provider().createInstanceMI(&record_, nullptr, nullptr), operation);
    }
    operation.filter.assocClass = systemDevice;
    return broker.perform(provider().createAssociationMI(&record_, nullptr, nullptr), operation);
  }

 private:
  CMPIBroker record_;
  CMPIBrokerFT services_;
};

std::string statusName(const ::testing::TestParamInfo<CMPIrc>& tested) {
  return tested.param == CMPI_RC_OK ? "Succeeding" : "Failing";
}

INSTANTIATE_TEST_SUITE_P(OfEachKind, EndlessEnumeration, ::testing::Values(CMPI_RC_OK, CMPI_RC_ERR_FAILED), statusName);

const std::string givenUp = "1000 calls in a row gave no computer system: the enumeration is given up";

TEST_P(EndlessEnumeration, IsGivenUpAfterAThousandCallsInVain) {
  for (const OperationKind kind : associationOperations) {
    const Response response = ask(kind, Support::processorPath("cpu0"));
    EXPECT_EQ(response.instances.size() + response.paths.size(), 2U) << Corvcim::operationName(kind);
    EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
    EXPECT_EQ(endless.calls, 3000U);
    EventList events(provider(), std::string(Corvcim::operationName(kind)));
    events.entering();
    if (isAssociators(kind)) {
      events.variable("((targetClass)->ft->getCharPtr((targetClass),(&rc)))", systemClass);
    }
    Support::expectEvents(provider(), events.error(givenUp).exiting());
  }
}

TEST_P(EndlessEnumeration, DoesNotFailTheEnumerationOfAssociations) {
  const Response names = ask(OperationKind::EnumerateInstanceNames, Support::classPath(systemDevice));
  EXPECT_EQ(names.paths.size(), 4U);
  EXPECT_EQ(outcome(names), "CMPI_RC_OK no message done");
  Support::expectEvents(provider(), EventList(provider(), "EnumInstanceNames").entering().error(givenUp).exiting());
  EXPECT_EQ(ask(OperationKind::EnumerateInstances, Support::classPath(systemDevice)).instances.size(), 4U);
}

TEST_P(EndlessEnumeration, IsNotGivenUpIfItEndsAfterAThousandCallsInVain) {
  for (const OperationKind kind : associationOperations) {
    const Response response = ask(kind, Support::processorPath("cpu0"), 3000);
    EXPECT_EQ(response.instances.size() + response.paths.size(), 2U) << Corvcim::operationName(kind);
    EXPECT_EQ(endless.calls, 3000U);
    EventList events(provider(), std::string(Corvcim::operationName(kind)));
    events.entering();
    if (isAssociators(kind)) {
      events.variable("((targetClass)->ft->getCharPtr((targetClass),(&rc)))", systemClass);
    }
    Support::expectEvents(provider(), events.exiting());
  }
}

}  // namespace
