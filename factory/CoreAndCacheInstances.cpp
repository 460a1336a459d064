#include <CPUObjFactory.h>

#include "InstanceBuilder.h"

namespace Tarn::CPUProvider {

namespace {

using Core = ProcessorCore;

constexpr Property<Core> coreProperties[] = {
    {"Caption", localized, L"MSGID_CPU_PROC_CORE_CAPTION"},
    {"Description", localized, L"MSGID_CPU_PROC_CORE_DESCRIPTION"},
    {"ElementName", chars<&Core::getElementName>},
    {"CoreEnabledState", uint16<&Core::getCoreEnabledState>},
    {"EnabledState", uint16<&Core::getEnabledState>},
    {"RequestedState", uint16<&Core::getRequestedState>},
    {"HealthState", uint16<&Core::getHealthState>},
    {"OperationalStatus", uint16Array<&Core::getOperationalStatus>},
};

constexpr Property<Memory> memoryProperties[] = {
    {"Caption", localized, L"MSGID_CPU_MEMORY_CAPTION"},
    {"Description", localized, L"MSGID_CPU_MEMORY_DESCRIPTION"},
    {"ElementName", chars<&Memory::getElementName>},
    {"Name", chars<&Memory::getCacheName>},
    {"BlockSize", uint64<&Memory::getBlockSize>},
    {"NumberOfBlocks", uint64<&Memory::getNumberOfBlocks>},
    {"ConsumableBlocks", uint64<&Memory::getConsumableBlocks>},
    {"EnabledState", uint16<&Memory::getEnabledState>},
    {"HealthState", uint16<&Memory::getHealthState>},
    {"RequestedState", uint16<&Memory::getRequestedState>},
    {"OperationalStatus", uint16Array<&Memory::getOperationalStatus>},
};

constexpr InstanceClass<Core> coreInstances{
    cpuProcessorCoreClass, KeyStyle::InstanceId, &Core::getInstanceID, coreProperties,
    ArrayFailure{"Create Array for Property OperationalStatus failed.", LevelError, true}};

constexpr InstanceClass<Memory> memoryInstances{
    cpuMemoryClass, KeyStyle::Device, &Memory::getMemoryDeviceID, memoryProperties,
    ArrayFailure{"Create Array for Property OperationalStatus failed.", LevelError, false}};

}  // namespace

const char* selectionOfCoresAndCaches(std::string_view name) {
  const char* selection = selectionOf(coreInstances.properties, name);
  return selection != nullptr ? selection : selectionOf(memoryInstances.properties, name);
}

CMPIInstance* CPUObjFactory::makeCPUProcCoreInstance(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                     ProcessorCore procCore, const char** properties, bool isObjPath,
                                                     CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},       {" ref=", ref},
                                 {" procCore=", &procCore},  {" properties=", properties},
                                 {" isObjPath=", isObjPath}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  CMPIInstance* instance = makeInstance(coreInstances, broker, ref, procCore, properties, isObjPath, rc);
  factoryEvents.exiting(parameters);
  return instance;
}

CMPIInstance* CPUObjFactory::makeCPUMemoryInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Memory cpuMem,
                                                   const char** properties, bool isObjPath, CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},       {" ref=", ref},
                                 {" cpuMem=", &cpuMem},      {" properties=", properties},
                                 {" isObjPath=", isObjPath}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  CMPIInstance* instance = makeInstance(memoryInstances, broker, ref, cpuMem, properties, isObjPath, rc);
  factoryEvents.exiting(parameters);
  return instance;
}

}  // namespace Tarn::CPUProvider
