#include "tests/support/ProviderTest.h"

#include <CPUObjFactory.h>

#include <utility>

namespace Support {

using Corvcim::ObjectPath;
using Corvcim::Operation;
using Corvcim::OperationKind;
using Corvcim::PropertyList;
using Corvcim::Response;
using Tarn::CPUProvider::CPUObjFactory;

void forgetInventory() {
  CPUObjFactory* factory = CPUObjFactory::getFactoryInstance(false, false, false);
  factory->_processorList.clear();
  factory->_cpuMemoryList.clear();
  factory->_cpuProcCoreList.clear();
  CPUObjFactory::_processorMap.clear();
  CPUObjFactory::_cpuMemoryMap.clear();
  CPUObjFactory::_cpuProcCoreMap.clear();
  CPUObjFactory::_isProcPopulated = false;
  CPUObjFactory::_isMemPopulated = false;
  CPUObjFactory::_isProcCorePopulated = false;
}

ProviderTest::ProviderTest() {
  forgetInventory();
  forgetTraces();
}

ProviderTest::~ProviderTest() {
  EXPECT_EQ(broker.liveObjects(), 0U);
}

CMPIInstanceMI* ProviderTest::instanceMI(const std::string& className) {
  return providerOf(className).createInstanceMI(broker.handle(), nullptr, nullptr);
}

CMPIAssociationMI* ProviderTest::associationMI(const std::string& className) {
  return providerOf(className).createAssociationMI(broker.handle(), nullptr, nullptr);
}

Response ProviderTest::enumerateInstances(const std::string& className, const PropertyList& properties) {
  return broker.enumerateInstances(instanceMI(className), classPath(className), properties);
}

Response ProviderTest::enumerateInstanceNames(const std::string& className) {
  return broker.enumerateInstanceNames(instanceMI(className), classPath(className));
}

Response ProviderTest::getInstance(const ObjectPath& path, const PropertyList& properties) {
  return broker.getInstance(instanceMI(path.className), path, properties);
}

Response ProviderTest::associate(const std::string& associationClass, OperationKind kind, const ObjectPath& source,
                                 const Corvcim::AssociationFilter& filter, const PropertyList& properties) {
  return broker.perform(associationMI(associationClass), Operation{kind, source, properties, filter});
}

void ProviderTest::forgetTraces() {
  Scripted::takeMessages();
  Scripted::takeComparisons();
  Scripted::inventory().clearCalls();
  static_cast<void>(broker.services().takeRecord());
  broker.services().resetCounts();
}

Response answered(std::vector<Corvcim::Instance> instances) {
  return {CMPI_RC_OK, std::nullopt, std::move(instances), {}, 1};
}

Response answered(std::vector<ObjectPath> paths) {
  return {CMPI_RC_OK, std::nullopt, {}, std::move(paths), 1};
}

Response answeredNothing() {
  return {CMPI_RC_OK, std::nullopt, {}, {}, 1};
}

Response withoutDone(Response response) {
  response.doneCalls = 0;
  return response;
}

std::vector<ObjectPath> pathsOf(const Response& response) {
  std::vector<ObjectPath> paths;
  for (const Corvcim::Instance& each : response.instances) {
    paths.push_back(each.path);
  }
  return paths;
}

std::string outcome(const Response& response) {
  return Corvcim::statusName(response.rc) + (response.message ? " |" + *response.message + "|" : " no message") +
         (response.doneCalls == 0   ? " not done"
          : response.doneCalls == 1 ? " done"
                                    : " done more than once");
}

std::vector<std::string> detailsOf(const std::vector<Corvcim::ServiceCall>& record, const std::string& service) {
  std::vector<std::string> details;
  for (const Corvcim::ServiceCall& call : record) {
    if (call.service == service) {
      details.push_back(call.detail);
    }
  }
  return details;
}

}  // namespace Support
