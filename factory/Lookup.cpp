#include <CPUObjFactory.h>
#include <CmpiObjects.h>

#include "BuildRequest.h"
#include "FactoryEvents.h"
#include "ObjectKeys.h"

namespace Tarn::CPUProvider {

namespace {

enum Result : unsigned short { Found = 0, NothingFound = 1, PathNotCreated = 2 };

template <class Record>
void appendAll(CPUObjFactory& factory, const std::map<std::string, Record>& map, Builder<Record> build,
               const BuildRequest& request) {
  for (const auto& [identifier, record] : map) {
    append(factory, build, record, request);
  }
}

/// All records of a map that must not be empty.
template <class Record>
unsigned short appendAllOfSome(CPUObjFactory& factory, const std::map<std::string, Record>& map, Builder<Record> build,
                               const BuildRequest& request, const char* function = __builtin_FUNCTION()) {
  if (map.empty()) {
    factoryEvents.message(LevelError, "***No Instance found***", __builtin_LINE(), function);
    return NothingFound;
  }
  appendAll(factory, map, build, request);
  return Found;
}

/// The record of one key; `failure` also stands for a key that is missing in a filled map.
template <class Record>
unsigned short appendOne(CPUObjFactory& factory, const std::map<std::string, Record>& map, const std::string& key,
                         Builder<Record> build, const BuildRequest& request, const char* failure,
                         const char* function = __builtin_FUNCTION()) {
  const auto entry = map.find(key);
  if (entry == map.end()) {
    factoryEvents.message(LevelError, failure, __builtin_LINE(), function);
    return NothingFound;
  }
  append(factory, build, entry->second, request);
  return Found;
}

/// How the object paths of one class are made from its records.
template <class Record>
struct PathClass {
  const char* name;
  KeyStyle keyStyle;
  std::string (Record::*identifier)() const;
  const char* failure;
};

constexpr PathClass<Processor> processorPaths{cpuProcessorClass, KeyStyle::Device, &Processor::getProcessorDeviceID,
                                              "Create CMPIObjectPath                     failed for CPU Processor."};
constexpr PathClass<ProcessorCore> corePaths{
    cpuProcessorCoreClass, KeyStyle::InstanceId, &ProcessorCore::getInstanceID,
    "Create CMPIObjectPath                     failed for CPU Processor Core."};
constexpr PathClass<Memory> memoryPaths{cpuMemoryClass, KeyStyle::Device, &Memory::getMemoryDeviceID,
                                        "Create CMPIObjectPath                     failed for CPU Memory."};
constexpr PathClass<Processor> capabilitiesPaths{
    cpuProcessorCapClass, KeyStyle::InstanceId, &Processor::getInstanceId,
    "Create CMPIObjectPath                     failed for CPU Processor Capabilities."};

template <class Record>
unsigned short appendPaths(const PathClass<Record>& pathClass, const std::map<std::string, Record>& map,
                           const CMPIBroker* broker, const CMPIObjectPath* ref, std::vector<CMPIObjectPath*>& objPaths,
                           CMPIStatus* status, const char* function = __builtin_FUNCTION()) {
  if (map.empty()) {
    factoryEvents.message(LevelError, "***No ObjPaths found***", __builtin_LINE(), function);
    return NothingFound;
  }
  const std::string systemName = getSystemName();
  for (const auto& [identifier, record] : map) {
    CMPIObjectPath* path = newPath(broker, ref, pathClass.name, systemName, status, nullptr);
    if (isNull(path)) {
      setFailure(broker, status, "Create CMPIObjectPath failed.");
      factoryEvents.message(LevelError, pathClass.failure, __builtin_LINE(), function);
      return PathNotCreated;
    }
    const ObjectKeys keys(pathClass.keyStyle, pathClass.name, (record.*pathClass.identifier)(), systemName);
    for (const ObjectKeys::Key& key : keys) {
      addKey(path, key.name, key.value);
    }
    objPaths.push_back(path);
  }
  return Found;
}

}  // namespace

unsigned short CPUObjFactory::getAllCPUProcCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                         const char** properties, bool isObjPath,
                                                         std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},         {" ref=", ref},
                                 {" properties=", properties}, {" isObjPath=", isObjPath},
                                 {" instances=", &instances},  {" rc=", rc}};
  factoryEvents.entering(parameters);
  const unsigned short result = appendAllOfSome(*this, _processorMap, &CPUObjFactory::makeCPUProcInstance,
                                                {broker, ref, properties, isObjPath, instances, rc});
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getAllCPUProcCoreCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                             const char** properties, bool isObjPath,
                                                             std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},         {" ref=", ref},
                                 {" properties=", properties}, {" isObjPath=", isObjPath},
                                 {" instances=", &instances},  {" rc=", rc}};
  factoryEvents.entering(parameters);
  const unsigned short result = appendAllOfSome(*this, _cpuProcCoreMap, &CPUObjFactory::makeCPUProcCoreInstance,
                                                {broker, ref, properties, isObjPath, instances, rc});
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getAllCPUMemoryCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                           const char** properties, bool isObjPath,
                                                           std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},         {" ref=", ref},
                                 {" properties=", properties}, {" isObjPath=", isObjPath},
                                 {" instances=", &instances},  {" rc=", rc}};
  factoryEvents.entering(parameters);
  appendAll(*this, _cpuMemoryMap, &CPUObjFactory::makeCPUMemoryInstance,
            {broker, ref, properties, isObjPath, instances, rc});
  constexpr unsigned short result = Found;
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getAllCPUProcCapCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                            const char** properties, bool isObjPath,
                                                            std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},         {" ref=", ref},
                                 {" properties=", properties}, {" isObjPath=", isObjPath},
                                 {" instances=", &instances},  {" rc=", rc}};
  factoryEvents.entering(parameters);
  const unsigned short result = appendAllOfSome(*this, _processorMap, &CPUObjFactory::makeCPUProcCapInstance,
                                                {broker, ref, properties, isObjPath, instances, rc});
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getOneCPUProcCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                        CMPIString* key, const char** properties,
                                                        std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{
      {" broker=", broker},        {" ref=", ref}, {" key=", key}, {" properties=", properties},
      {" instances=", &instances}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string keyText = charsOf(key, rc);
  const unsigned short result = appendOne(*this, _processorMap, keyText, &CPUObjFactory::makeCPUProcInstance,
                                          {broker, ref, properties, false, instances, rc}, "Processor map is empty");
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getOneCPUProcCoreCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                            CMPIString* key, const char** properties,
                                                            std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{
      {" broker=", broker},        {" ref=", ref}, {" key=", key}, {" properties=", properties},
      {" instances=", &instances}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string keyText = charsOf(key, rc);
  factoryEvents.variable("instanceID", keyText.c_str());
  const unsigned short result =
      appendOne(*this, _cpuProcCoreMap, keyText, &CPUObjFactory::makeCPUProcCoreInstance,
                {broker, ref, properties, false, instances, rc}, "CPU Processor Core Map is empty");
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getOneCPUMemoryCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                          CMPIString* key, const char** properties,
                                                          std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{
      {" broker=", broker},        {" ref=", ref}, {" key=", key}, {" properties=", properties},
      {" instances=", &instances}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string keyText = charsOf(key, rc);
  const unsigned short result = appendOne(*this, _cpuMemoryMap, keyText, &CPUObjFactory::makeCPUMemoryInstance,
                                          {broker, ref, properties, false, instances, rc}, "CPU Memory map is empty");
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getOneCPUProcCapCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                           CMPIString* key, const char** properties,
                                                           std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  const ParameterList parameters{
      {" broker=", broker},        {" ref=", ref}, {" key=", key}, {" properties=", properties},
      {" instances=", &instances}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  const std::string keyText = charsOf(key, rc);
  factoryEvents.variable("instanceID", keyText.c_str());
  for (const auto& [deviceId, processor] : _processorMap) {
    if (processor.getInstanceId() == keyText) {
      append(*this, &CPUObjFactory::makeCPUProcCapInstance, processor, {broker, ref, properties, false, instances, rc});
    }
  }
  factoryEvents.exiting(parameters);
  return Found;
}

unsigned short CPUObjFactory::getAllCPUProcCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                        std::vector<CMPIObjectPath*>& objPaths, CMPIStatus* status) {
  const ParameterList parameters{{" broker=", broker}, {" ref=", ref}, {" objPaths=", &objPaths}, {" status=", status}};
  factoryEvents.entering(parameters);
  const unsigned short result = appendPaths(processorPaths, _processorMap, broker, ref, objPaths, status);
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getAllCPUProcCoreCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                            std::vector<CMPIObjectPath*>& objPaths,
                                                            CMPIStatus* status) {
  const ParameterList parameters{{" broker=", broker}, {" ref=", ref}, {" objPaths=", &objPaths}, {" status=", status}};
  factoryEvents.entering(parameters);
  const unsigned short result = appendPaths(corePaths, _cpuProcCoreMap, broker, ref, objPaths, status);
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getAllCPUMemoryCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                          std::vector<CMPIObjectPath*>& objPaths, CMPIStatus* status) {
  const ParameterList parameters{{" broker=", broker}, {" ref=", ref}, {" objPaths=", &objPaths}, {" status=", status}};
  factoryEvents.entering(parameters);
  const unsigned short result = appendPaths(memoryPaths, _cpuMemoryMap, broker, ref, objPaths, status);
  factoryEvents.exiting(parameters);
  return result;
}

unsigned short CPUObjFactory::getAllCPUProcCapCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                           std::vector<CMPIObjectPath*>& objPaths, CMPIStatus* status) {
  const ParameterList parameters{{" broker=", broker}, {" ref=", ref}, {" objPaths=", &objPaths}, {" status=", status}};
  factoryEvents.entering(parameters);
  const unsigned short result = appendPaths(capabilitiesPaths, _processorMap, broker, ref, objPaths, status);
  factoryEvents.exiting(parameters);
  return result;
}

}  // namespace Tarn::CPUProvider
