#ifndef TESTS_SUPPORT_PROVIDERTEST_H
#define TESTS_SUPPORT_PROVIDERTEST_H

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "host/broker/Broker.h"
#include "tests/seam/ScriptedTest.h"
#include "tests/support/EventList.h"
#include "tests/support/Paths.h"
#include "tests/support/ProviderFunctions.h"

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

/// A request that succeeded and was ended with CMReturnDone; the same without, as associations answer.
Corvcim::Response answered(std::vector<Corvcim::Instance> instances);
Corvcim::Response answered(std::vector<Corvcim::ObjectPath> paths);
Corvcim::Response answeredNothing();
Corvcim::Response withoutDone(Corvcim::Response response);

/// The paths of a response's instances, in order.
std::vector<Corvcim::ObjectPath> pathsOf(const Corvcim::Response& response);

/// What happened to a request besides its results: status, message and CMReturnDone on one line, such
/// as "CMPI_RC_ERR_FAILED |the message| done".
std::string outcome(const Corvcim::Response& response);

/// The recorded calls of one service.
std::vector<std::string> detailsOf(const std::vector<Corvcim::ServiceCall>& record, const std::string& service);

}  // namespace Support

#endif
