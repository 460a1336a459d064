#ifndef TESTS_SUPPORT_PROVIDERTEST_H
#define TESTS_SUPPORT_PROVIDERTEST_H

#include <gtest/gtest.h>

#include <string>

#include "host/broker/Broker.h"
#include "tests/seam/ScriptedTest.h"
#include "tests/support/EventList.h"
#include "tests/support/Paths.h"
#include "tests/support/ProviderFunctions.h"
#include "tests/support/Responses.h"

namespace Support {

/// Puts the factory back into the state in which the library is loaded: nothing collected.
void forgetInventory();

/// A test that plays the client: the providers linked in, a broker, and the scripted platform. At the
/// end nothing of the broker's may be left over.
class ProviderTest : public Scripted::ScriptedTest {
 protected:
  ProviderTest();
  ~ProviderTest() override;

  // The interfaces, registered with this test's broker.
  CMPIInstanceMI* instanceMI(const std::string& className);
  CMPIAssociationMI* associationMI(const std::string& className);

  Corvcim::Response enumerateInstances(const std::string& className, const Corvcim::PropertyList& properties = {});
  Corvcim::Response enumerateInstanceNames(const std::string& className);
  /// Of the class that serves `path`.
  Corvcim::Response getInstance(const Corvcim::ObjectPath& path, const Corvcim::PropertyList& properties = {});

  /// Any association operation, asked of one association class's provider.
  Corvcim::Response associate(const std::string& associationClass, Corvcim::OperationKind kind,
                              const Corvcim::ObjectPath& source, const Corvcim::AssociationFilter& filter = {},
                              const Corvcim::PropertyList& properties = {});

  /// Runs `requests` once and forgets what they logged, recorded and counted; what was collected stays.
  template <class Requests>
  void afterwards(Requests requests) {
    requests();
    forgetTraces();
  }
  void forgetTraces();

  Corvcim::Broker broker;
};

}  // namespace Support

#endif
