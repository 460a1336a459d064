#include <CPUClassNames.h>
#include <CPUObjFactory.h>
#include <CmpiObjects.h>

#include <string_view>

#include "BuildRequest.h"
#include "FactoryEvents.h"

namespace Tarn::CPUProvider {

namespace {

/// From one kind of element to the related records of another.
template <class Record>
struct Relationship {
  const char* handleName;  ///< the handle's name in traces
  unsigned short (*query)(std::string, std::vector<Record>&);
  Builder<Record> build;
  const char* failure;
  const char* failureAsVariable = nullptr;  ///< where the failure is traced as a variable of this name
};

constexpr Relationship<ProcessorCore> coresOfProcessor{
    "deviceID", getCPUProcCoresFromCPUProcessor, &CPUObjFactory::makeCPUProcCoreInstance,
    "***getCPUProcCoresFromCPUProcessor failed***", "\"***getCPUProcCoresFromCPUProcessor failed***\""};
constexpr Relationship<Memory> cachesOfCore{"instanceId", getCPUMemoriesFromCPUProcessorCore,
                                            &CPUObjFactory::makeCPUMemoryInstance,
                                            "***getCPUMemoriesFromCPUProcessorCore failed***"};
constexpr Relationship<ProcessorCore> coresOfCache{"deviceID", getCPUProcessorCoresFromCPUMemory,
                                                   &CPUObjFactory::makeCPUProcCoreInstance,
                                                   "***getCPUProcessorCoresFromCPUMemory failed***"};
constexpr Relationship<Memory> cachesOfProcessor{"deviceId", getCPUMemoriesFromCPUProcessor,
                                                 &CPUObjFactory::makeCPUMemoryInstance,
                                                 "***getCPUMemoriesFromCPUProcessor failed***"};
constexpr Relationship<Processor> processorOfCache{"deviceID", getCPUProcessorsFromCPUMemory,
                                                   &CPUObjFactory::makeCPUProcInstance,
                                                   "***getCPUProcessorsFromCPUMemory failed***"};
constexpr Relationship<Processor> processorOfCore{"instanceID", getCPUProcessorsFromCPUProcCore,
                                                  &CPUObjFactory::makeCPUProcInstance,
                                                  "***getCPUProcessorsFromCPUProcCore failed***"};

template <class Record>
unsigned short follow(CPUObjFactory& factory, const Relationship<Record>& relationship, CMPIString* key,
                      const BuildRequest& request, const char* function = __builtin_FUNCTION()) {
  const ParameterList parameters{{" broker=", request.broker},
                                 {" ref=", request.ref},
                                 {" key=", key},
                                 {" properties=", request.properties},
                                 {" isObjPath=", request.isObjPath},
                                 {" instances=", &request.instances},
                                 {" rc=", request.rc}};
  factoryEvents.entering(parameters, __builtin_LINE(), function);
  const std::string handle = charsOf(key, request.rc);
  factoryEvents.variable(relationship.handleName, handle.c_str(), __builtin_LINE(), function);

  std::vector<Record> records;
  if (relationship.query(handle, records) == 0) {
    for (const Record& record : records) {
      append(factory, relationship.build, record, request);
    }
  } else if (relationship.failureAsVariable != nullptr) {
    factoryEvents.variable(LevelError, relationship.failureAsVariable, relationship.failure, __builtin_LINE(),
                           function);
  } else {
    factoryEvents.message(LevelError, relationship.failure, __builtin_LINE(), function);
  }
  factoryEvents.exiting(parameters, __builtin_LINE(), function);
  return 0;
}

/// The far end of an association by the class at the near end.
struct Target {
  const char* sourceClass;
  const char* association;
  const char* message;
  const char* targetClass;
};

constexpr Target targets[] = {
    {cpuMemoryClass, cpuAssociatedCacheMemoryClass, "Target Class is cpuProcessorClass", cpuProcessorClass},
    {cpuProcessorClass, cpuAssociatedCacheMemoryClass, "Target Class is cpuMemoryClass", cpuMemoryClass},
    {cpuMemoryClass, cpuCoreAssociatedCacheMemoryClass, "Target Class is cpuProcessorCoreClass", cpuProcessorCoreClass},
    {cpuProcessorCoreClass, cpuCoreAssociatedCacheMemoryClass, "Target Class is cpuMemoryClass", cpuMemoryClass},
    {computerSystemClass, cpuSystemDeviceClass, "Target Class is cpuProcessorClass", cpuProcessorClass},
    {cpuProcessorClass, cpuSystemDeviceClass, "Target Class is ComputerSystemClass", computerSystemClass},
    {cpuProcessorCapClass, cpuElementCapClass, "Target Class is cpuProcessorClass", cpuProcessorClass},
    {cpuProcessorClass, cpuElementCapClass, "Target Class is cpuProcessorCapClass", cpuProcessorCapClass},
    {cpuProcessorCoreClass, cpuConcreteComponentClass, "Target Class is cpuProcessorClass", cpuProcessorClass},
    {cpuProcessorClass, cpuConcreteComponentClass, "Target Class is cpuProcessorCoreClass", cpuProcessorCoreClass},
};

/// Fixed: log filters know this message by its line.
constexpr unsigned int processorMapEmptyLine = 2044;

constexpr Target noTarget{"", "", "Target Class is empty", ""};

const Target& findTarget(std::string_view sourceClass, const char* association) {
  if (association != nullptr) {
    for (const Target& target : targets) {
      if (sourceClass == target.sourceClass && std::string_view(association) == target.association) {
        return target;
      }
    }
  }
  return noTarget;
}

}  // namespace

unsigned short CPUObjFactory::getProcessorCoreRefByProcHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                              CMPIString* key, const char** properties, bool isObjPath,
                                                              std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  return follow(*this, coresOfProcessor, key, {broker, ref, properties, isObjPath, instances, rc});
}

unsigned short CPUObjFactory::getCPUMemoryRefByProcessorCoreHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                                   CMPIString* key, const char** properties,
                                                                   bool isObjPath,
                                                                   std::vector<CMPIInstance*>& instances,
                                                                   CMPIStatus* rc) {
  return follow(*this, cachesOfCore, key, {broker, ref, properties, isObjPath, instances, rc});
}

unsigned short CPUObjFactory::getProcessorCoreRefByMemoryHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                                CMPIString* key, const char** properties,
                                                                bool isObjPath, std::vector<CMPIInstance*>& instances,
                                                                CMPIStatus* rc) {
  return follow(*this, coresOfCache, key, {broker, ref, properties, isObjPath, instances, rc});
}

unsigned short CPUObjFactory::getCPUMemoryRefByProcessorHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                               CMPIString* key, const char** properties, bool isObjPath,
                                                               std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  return follow(*this, cachesOfProcessor, key, {broker, ref, properties, isObjPath, instances, rc});
}

unsigned short CPUObjFactory::getProcessorRefByMemoryHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                            CMPIString* key, const char** properties, bool isObjPath,
                                                            std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  return follow(*this, processorOfCache, key, {broker, ref, properties, isObjPath, instances, rc});
}

unsigned short CPUObjFactory::getProcessorRefByProcCoreHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                              CMPIString* key, const char** properties, bool isObjPath,
                                                              std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  return follow(*this, processorOfCore, key, {broker, ref, properties, isObjPath, instances, rc});
}

unsigned short CPUObjFactory::getProcessorCapRefByProcHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                             CMPIString* key, const char** properties,
                                                             std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{
      {" broker=", broker},        {" ref=", ref}, {" key=", key}, {" properties=", properties},
      {" instances=", &instances}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string deviceId = charsOf(key, rc);
  factoryEvents.variable("deviceID", deviceId.c_str());

  const auto entry = _processorMap.find(deviceId);
  if (entry == _processorMap.end()) {
    factoryEvents.message(LevelError, "Processor map empty", processorMapEmptyLine);
    return 1;
  }
  const std::string instanceId = entry->second.getInstanceId();
  factoryEvents.variable("instanceId", instanceId.c_str());
  CMPIString* capabilitiesKey = CMNewString(broker, instanceId.c_str(), rc);
  if (!isNull(capabilitiesKey) &&
      getOneCPUProcCapCMPIInstance(broker, ref, capabilitiesKey, properties, instances, rc) != 0) {
    factoryEvents.message(LevelError, "***getCPUProcessorCapFromCPUProcessor failed***");
    return 1;
  }
  factoryEvents.exiting(parameters);
  return 0;
}

unsigned short CPUObjFactory::getProcessorRefByProcCapHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                             CMPIString* key, const char** properties,
                                                             std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{
      {" broker=", broker},        {" ref=", ref}, {" key=", key}, {" properties=", properties},
      {" instances=", &instances}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string instanceId = charsOf(key, rc);
  factoryEvents.variable("instanceID", instanceId.c_str());

  for (const auto& [deviceId, processor] : _processorMap) {
    if (processor.getInstanceId() != instanceId) {
      continue;
    }
    CMPIString* processorKey = CMNewString(broker, processor.getProcessorDeviceID().c_str(), rc);
    if (!isNull(processorKey) && getOneCPUProcCMPIInstance(broker, ref, processorKey, properties, instances, rc) != 0) {
      factoryEvents.message(LevelError, "***getCPUProcessorCapFromCPUProcessor failed***");
      return 1;
    }
  }
  factoryEvents.exiting(parameters);
  return 0;
}

unsigned short CPUObjFactory::getAssocCacheData(const CMPIBroker* broker, CMPIString* cpuMemDeviceid,
                                                ProcCacheData& procCache, CMPIStatus* rc) {
  const ParameterList parameters{
      {" broker=", broker}, {" cpuMemDeviceid=", cpuMemDeviceid}, {" procCache=", &procCache}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string deviceId = charsOf(cpuMemDeviceid, rc);
  factoryEvents.variable("deviceId", deviceId.c_str());

  const auto entry = _cpuMemoryMap.find(stripSpaces(deviceId));
  if (entry == _cpuMemoryMap.end()) {
    factoryEvents.message(LevelError, "CPU Memory map is empty");
    return 1;
  }
  const Memory& cache = entry->second;
  procCache = {cache.getCacheLevel(), cache.getCacheWritePolicy(), 0, cache.getCacheType(),
               cache.getCacheAssociativity()};
  factoryEvents.exiting(parameters);
  return 0;
}

const char* CPUObjFactory::get_assoc_targetClass_Name(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                                      const char* _RefLeftClass, const char* _RefRightClass,
                                                      CMPIStatus* rc) {
  const ParameterList parameters{{" _broker=", _broker},
                                 {" ref=", ref},
                                 {" _RefLeftClass=", _RefLeftClass},
                                 {" _RefRightClass=", _RefRightClass},
                                 {" rc=", rc}};
  factoryEvents.entering(parameters);
  const Target& target = findTarget(classNameOf(ref), _RefLeftClass);
  factoryEvents.message(LevelInfo, target.message);
  factoryEvents.exiting(parameters);
  return target.targetClass;
}

CMPIObjectPath* CPUObjFactory::get_assoc_targetClass_ObjectPath(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                                                const char* _RefLeftClass, const char* _RefRightClass,
                                                                CMPIStatus* rc) {
  const ParameterList parameters{{" _broker=", _broker},
                                 {" ref=", ref},
                                 {" _RefLeftClass=", _RefLeftClass},
                                 {" _RefRightClass=", _RefRightClass},
                                 {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string_view targetName = get_assoc_targetClass_Name(_broker, ref, _RefLeftClass, _RefRightClass, rc);
  factoryEvents.variable("targetName", targetName.data());

  CMPIObjectPath* path = nullptr;
  if (!targetName.empty()) {
    path = newPath(_broker, ref, targetName.data(), getSystemName(), nullptr, rc);
  }
  factoryEvents.exiting(parameters);
  return path;
}

}  // namespace Tarn::CPUProvider
