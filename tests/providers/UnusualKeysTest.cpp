// Keys as minimal brokers give them, seen through GetInstance of the four providers of plain classes.

#include "host/broker/Objects.h"
#include "host/broker/Request.h"
#include "tests/providers/InstanceProviderRows.h"

namespace {

using Corvcim::ObjectPath;
using Corvcim::Response;
using Corvcim::Value;
using InstanceProviders::twoProcessors;
using Support::outcome;
using Support::pathsOf;

using Paths = std::vector<ObjectPath>;

CMPIData getKey(const CMPIObjectPath* path, const char* name, CMPIStatus* status) {
  return Corvcim::objectPathOperations.getKey(path, name, status);
}

CMPIData getKeyWithoutType(const CMPIObjectPath* path, const char* name, CMPIStatus* status) {
  CMPIData key = getKey(path, name, status);
  key.type = CMPI_null;
  return key;
}

/// The state that getKeyInState gives every key.
CMPIValueState stateOfKeys = CMPI_goodValue;

CMPIData getKeyInState(const CMPIObjectPath* path, const char* name, CMPIStatus* status) {
  CMPIData key = getKeyWithoutType(path, name, status);
  key.state = stateOfKeys;
  return key;
}

CMPIData getKeyWithoutText(const CMPIObjectPath* path, const char* name, CMPIStatus* status) {
  static const CMPIStringFT textless = [] {
    CMPIStringFT table = Corvcim::stringOperations;
    table.getCharPtr = [](const CMPIString*, CMPIStatus*) -> const char* { return nullptr; };
    return table;
  }();
  const CMPIData key = getKey(path, name, status);
  key.value.string->ft = &textless;
  return key;
}

class UnusualKeys : public InstanceProviders::InstanceProvider {
 protected:
  UnusualKeys() { twoProcessors(); }

  /// GetInstance of a path whose keys are read by this function.
  Response getInstanceReading(decltype(CMPIObjectPathFT::getKey) reader, const ObjectPath& reference) {
    Corvcim::Request request(broker, Support::testNameSpace);
    CMPIObjectPathFT table = Corvcim::objectPathOperations;
    table.getKey = reader;
    CMPIObjectPath* path = request.objectPath(reference);
    path->ft = &table;
    CMPIInstanceMI* interface = mi();
    const CMPIStatus status = interface->ft->getInstance(interface, request.context(), request.result(), path, nullptr);
    return request.response(status);
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachClass, UnusualKeys, ::testing::ValuesIn(InstanceProviders::rows()),
                         InstanceProviders::className);

TEST_P(UnusualKeys, AStringWithoutItsTypeNamesItsInstance) {
  const auto response = getInstanceReading(getKeyWithoutType, path(row().identifiers[1]));
  EXPECT_EQ(pathsOf(response), Paths{path(row().identifiers[1])});
  EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
}

TEST_P(UnusualKeys, WhatIsNotThereIsNoStringWithoutItsType) {
  for (const CMPIValueState state : std::initializer_list<CMPIValueState>{CMPI_notFound, CMPI_badValue}) {
    stateOfKeys = state;
    EXPECT_EQ(pathsOf(getInstanceReading(getKeyInState, path(row().identifiers[1]))), allPaths()) << state;
  }
  EXPECT_EQ(pathsOf(getInstanceReading(getKeyWithoutType, pathWithOtherKey())), allPaths());
}

TEST_P(UnusualKeys, StringInTheStateOfANullValueNamesItsInstance) {
  stateOfKeys = CMPI_nullValue;
  EXPECT_EQ(pathsOf(getInstanceReading(getKeyInState, path(row().identifiers[1]))), Paths{path(row().identifiers[1])});
}

TEST_P(UnusualKeys, AStringWithoutTextNamesNothing) {
  const auto response = getInstanceReading(getKeyWithoutText, path(row().identifiers[0]));
  EXPECT_EQ(response.instances.size(), 0U);
  Support::EventList expected = events("GetInstance").entering();
  if (row().tracesKey) {
    expected.variable(row().key, "(null)");
  }
  if (row().oneFailed) {
    expectEvents(expected.error(row().oneFailed->text, row().oneFailed->line));
  } else {
    expectEvents(expected.exiting(row().exitLine));
  }
}

}  // namespace
