#include "tests/factory/FactoryTest.h"

namespace FactoryTests {

namespace {

std::string identifierIn(const std::vector<Corvcim::NamedValue>& values) {
  for (const char* name : {"DeviceID", "InstanceID"}) {
    if (const Corvcim::Value* value = Corvcim::findValue(values, name)) {
      return value->asString();
    }
  }
  return "without identifier";
}

}  // namespace

Processor fullProcessor(const std::string& deviceId) {
  Processor processor;
  processor.setProcessorDeviceID(deviceId);
  processor.setInstanceId("NERITH:" + deviceId);
  processor.setElementName("  CPU 1 ");
  processor.setName(" Model 9000");
  processor.setFamily(1);
  processor.setCurrentClockSpeed(2100);
  processor.setMaxClockSpeed(3700);
  processor.setExternalClockSpeed(100);
  processor.setCPUStatus(21);
  processor.setEnabledState(1);
  processor.setRequestedState(1);
  processor.setOperationalStatus(13);
  processor.setHealthState(21);
  processor.setDataWidth(64);
  processor.setAddressWidth(48);
  processor.setStepping("7");
  processor.setUniqueId("0FA9");
  processor.setUpgradeMethod(54);
  processor.setRequestedStatesSupported({1, 3, 1});
  processor.setNumberOfProcessorCores(16);
  processor.setNumberOfEnabledCores(15);
  processor.setNumberOfHardwareThreads(32);
  return processor;
}

ProcessorCore fullCore(const std::string& instanceId) {
  ProcessorCore core;
  core.setInstanceID(instanceId);
  core.setElementName(" Core 1 ");
  core.setCoreEnabledState(3);
  core.setEnabledState(16);
  core.setRequestedState(1);
  core.setHealthState(24);
  core.setOperationalStatus(20);
  return core;
}

Memory fullCache(const std::string& deviceId) {
  Memory cache;
  cache.setMemoryDeviceID(deviceId);
  cache.setElementName(" Cache 1 ");
  cache.setCacheName(" L1 ");
  cache.setBlockSize(64);
  cache.setNumberOfBlocks(0xFFFFFFFF);
  cache.setConsumableBlocks(0x80000000);
  cache.setEnabledState(16);
  cache.setHealthState(24);
  cache.setRequestedState(1);
  cache.setOperationalStatus(20);
  cache.setCacheLevel(4);
  cache.setCacheWritePolicy(1);
  cache.setCacheType(2);
  cache.setCacheAssociativity(5);
  return cache;
}

FactoryTest::FactoryTest() {
  factory()._processorList.clear();
  factory()._cpuMemoryList.clear();
  factory()._cpuProcCoreList.clear();
  CPUObjFactory::_processorMap.clear();
  CPUObjFactory::_cpuMemoryMap.clear();
  CPUObjFactory::_cpuProcCoreMap.clear();
  CPUObjFactory::_isProcPopulated = false;
  CPUObjFactory::_isMemPopulated = false;
  CPUObjFactory::_isProcCorePopulated = false;
  ref_ = path("HALDA_Anything");
  hostBroker_.services().record(true);
  forgetTraces();
}

void placeProcessor(const std::string& id) {
  CPUObjFactory::_processorMap[id] = fullProcessor(id);
}

void placeCore(const std::string& id) {
  CPUObjFactory::_cpuProcCoreMap[id] = fullCore(id);
}

void placeCache(const std::string& id) {
  CPUObjFactory::_cpuMemoryMap[id] = fullCache(id);
}

CPUObjFactory& FactoryTest::factory() {
  // Fetched once, so that no test's events begin with the fetching.
  static CPUObjFactory& theFactory = *CPUObjFactory::getFactoryInstance(false, false, false);
  return theFactory;
}

void FactoryTest::place(const Processor& processor) {
  CPUObjFactory::_processorMap[processor.getProcessorDeviceID()] = processor;
}

void FactoryTest::place(const ProcessorCore& core) {
  CPUObjFactory::_cpuProcCoreMap[core.getInstanceID()] = core;
}

void FactoryTest::place(const Memory& cache) {
  CPUObjFactory::_cpuMemoryMap[cache.getMemoryDeviceID()] = cache;
}

void FactoryTest::forgetTraces() {
  Scripted::takeMessages();
  Scripted::inventory().clearCalls();
  static_cast<void>(hostBroker_.services().takeRecord());
  hostBroker_.services().resetCounts();
  recording_.takeProperties();
  recording_.takeKeys();
}

CMPIObjectPath* FactoryTest::path(const std::string& className, const std::string& nameSpace) {
  Corvcim::ObjectPath value;
  value.nameSpace = nameSpace;
  value.className = className;
  return request_.objectPath(value);
}

std::string FactoryTest::shown(const CMPIStatus& rc) {
  return Corvcim::statusName(rc.rc) + (rc.msg != nullptr ? " |" + Corvcim::textOf(rc.msg) + "|" : "");
}

Lines identifiersOf(const std::vector<CMPIInstance*>& instances) {
  Lines identifiers;
  for (const CMPIInstance* instance : instances) {
    identifiers.push_back(instance == nullptr ? "NULL" : identifierIn(Corvcim::valueOf(instance).properties));
  }
  return identifiers;
}

Lines identifiersOf(const std::vector<CMPIObjectPath*>& paths) {
  Lines identifiers;
  for (const CMPIObjectPath* path : paths) {
    identifiers.push_back(path == nullptr ? "NULL" : identifierIn(Corvcim::valueOf(path).keys));
  }
  return identifiers;
}

std::string requestParameters(const CMPIBroker* broker, const CMPIObjectPath* ref, const std::string& more) {
  return " broker=" + Scripted::address(broker) + " ref=" + Scripted::address(ref) + more;
}

}  // namespace FactoryTests
