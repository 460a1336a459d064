#include "tests/support/ProviderTest.h"

#include <CPUObjFactory.h>

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

}  // namespace Support
