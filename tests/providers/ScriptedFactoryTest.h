#ifndef TESTS_PROVIDERS_SCRIPTEDFACTORYTEST_H
#define TESTS_PROVIDERS_SCRIPTEDFACTORYTEST_H

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "host/broker/Broker.h"
#include "host/broker/Request.h"
#include "tests/providers/ScriptedFactory.h"
#include "tests/seam/ScriptedTest.h"
#include "tests/support/EventList.h"
#include "tests/support/Paths.h"
#include "tests/support/Responses.h"

namespace ScriptedFactory {

/// One request to a provider that is linked with the scripted factory. What the script finds has to be
/// made in the request, so it is begun by the fixture.
class ScriptedFactoryTest : public Scripted::ScriptedTest {
 protected:
  ScriptedFactoryTest() : request(broker, Support::testNameSpace) {
    script() = Script();
    broker.serveInstances("HALDA_ComputerSystem", {Support::systemInstance("system")});
  }

  /// An instance with this path, as the factory finds it.
  CMPIInstance* element(const Corvcim::ObjectPath& path) { return request.instance({path, path.keys}); }
  CMPIObjectPath* path(const Corvcim::ObjectPath& value) { return request.objectPath(value); }
  /// Objects that brokers answer when they have none.
  CMPIInstance* handleLessInstance() { return &handleLessInstance_; }
  CMPIObjectPath* handleLessPath() { return &handleLessPath_; }

  /// Performs an operation of the class's provider and tells what became of it.
  Corvcim::Response perform(const std::string& className, const Corvcim::Operation& operation) {
    const Support::ProviderFunctions& provider = Support::providerOf(className);
    if (Corvcim::isAssociationOperation(operation.kind)) {
      return broker.perform(provider.createAssociationMI(broker.handle(), nullptr, nullptr), operation);
    }
    return broker.perform(provider.createInstanceMI(broker.handle(), nullptr, nullptr), operation);
  }

  /// An association operation with the provider's own association class.
  Corvcim::Response associate(const std::string& className, Corvcim::OperationKind kind,
                              const Corvcim::ObjectPath& source, const Corvcim::PropertyList& properties = {}) {
    Corvcim::AssociationFilter filter;
    filter.assocClass = className;
    filter.resultClass = resultClass;
    return perform(className, {kind, source, properties, filter});
  }

  std::vector<std::string> takeCalls() { return std::exchange(script().calls, {}); }

  Corvcim::Broker broker;
  Corvcim::Request request;
  std::optional<std::string> resultClass;  ///< of association operations

 private:
  CMPIInstance handleLessInstance_{nullptr, nullptr};
  CMPIObjectPath handleLessPath_{nullptr, nullptr};
};

}  // namespace ScriptedFactory

#endif
