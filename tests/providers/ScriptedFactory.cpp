#include "tests/providers/ScriptedFactory.h"

#include <CPUObjFactory.h>

#include <stdexcept>

namespace ScriptedFactory {

Script& script() {
  static Script theScript;
  return theScript;
}

namespace {

std::string shown(const char* text) {
  return text != nullptr ? text : "NULL";
}

std::string shown(const CMPIString* text) {
  return text != nullptr ? CMGetCharPtr(text) : "NULL";
}

std::string classOf(const CMPIObjectPath* path) {
  return path != nullptr ? shown(CMGetClassName(path, nullptr)) : "NULL";
}

std::string shown(const char** properties) {
  if (properties == nullptr) {
    return "properties NULL";
  }
  std::string text = "properties";
  for (const char** entry = properties; *entry != nullptr; ++entry) {
    text += ' ' + std::string(*entry);
  }
  return text;
}

std::string shown(bool isObjPath) {
  return std::string("isObjPath ") + (isObjPath ? "1" : "0");
}

/// Records a call and says how it ends.
unsigned short enter(const std::string& function, const std::string& arguments, CMPIStatus* status = nullptr) {
  script().calls.push_back(function + "(" + arguments + ")");
  if (script().throwing == function) {
    throw std::runtime_error(thrownText);
  }
  const auto result = script().results.find(function);
  if (result == script().results.end() || result->second == 0) {
    return 0;
  }
  if (status != nullptr && script().failureStatus != CMPI_RC_OK) {
    *status = {script().failureStatus, nullptr};
  }
  return result->second;
}

template <class Element>
unsigned short answer(unsigned short result, std::vector<Element>& elements, const std::vector<Element>& found) {
  if (result == 0) {
    elements.insert(elements.end(), found.begin(), found.end());
  }
  return result;
}

}  // namespace

}  // namespace ScriptedFactory

namespace Tarn::CPUProvider {

using ScriptedFactory::answer;
using ScriptedFactory::classOf;
using ScriptedFactory::enter;
using ScriptedFactory::script;
using ScriptedFactory::shown;
using Instances = std::vector<CMPIInstance*>;
using Paths = std::vector<CMPIObjectPath*>;

CPUObjFactory::CPUObjFactory(bool, bool, bool) {}

CPUObjFactory* CPUObjFactory::getFactoryInstance(bool isProc, bool isMem, bool isProcCore) {
  static CPUObjFactory factory(false, false, false);
  enter(__func__, shown(isProc).back() + std::string(", ") + shown(isMem).back() + ", " + shown(isProcCore).back());
  return &factory;
}

unsigned short CPUObjFactory::getNumberOfProcInstances() const {
  enter(__func__, "");
  return 2;
}
unsigned short CPUObjFactory::getNumberOfMemInstances() const {
  enter(__func__, "");
  return 3;
}
unsigned short CPUObjFactory::getNumberOfProcCoreInstances() const {
  enter(__func__, "");
  return script().cores;
}

#define ALL_INSTANCES(function)                                                                                 \
  unsigned short CPUObjFactory::function(const CMPIBroker*, const CMPIObjectPath* ref, const char** properties, \
                                         bool isObjPath, Instances& instances, CMPIStatus* rc) {                \
    const auto result = enter(__func__, classOf(ref) + ", " + shown(properties) + ", " + shown(isObjPath), rc); \
    return answer(result, instances, script().instances);                                                       \
  }
ALL_INSTANCES(getAllCPUProcCMPIInstances)
ALL_INSTANCES(getAllCPUProcCoreCMPIInstances)
ALL_INSTANCES(getAllCPUMemoryCMPIInstances)
ALL_INSTANCES(getAllCPUProcCapCMPIInstances)

// By key: single lookups, and the navigation between a processor and its capabilities.
#define BY_KEY(function)                                                                                      \
  unsigned short CPUObjFactory::function(const CMPIBroker*, const CMPIObjectPath* ref, CMPIString* key,       \
                                         const char** properties, Instances& instances, CMPIStatus* rc) {     \
    const auto result = enter(__func__, classOf(ref) + ", key " + shown(key) + ", " + shown(properties), rc); \
    return answer(result, instances, script().instances);                                                     \
  }
BY_KEY(getOneCPUProcCMPIInstance)
BY_KEY(getOneCPUProcCoreCMPIInstance)
BY_KEY(getOneCPUMemoryCMPIInstance)
BY_KEY(getOneCPUProcCapCMPIInstance)
BY_KEY(getProcessorCapRefByProcHandle)
BY_KEY(getProcessorRefByProcCapHandle)

#define ALL_PATHS(function)                                                                             \
  unsigned short CPUObjFactory::function(const CMPIBroker*, const CMPIObjectPath* ref, Paths& objPaths, \
                                         CMPIStatus* status) {                                          \
    return answer(enter(__func__, classOf(ref), status), objPaths, script().paths);                     \
  }
ALL_PATHS(getAllCPUProcCMPIObjPaths)
ALL_PATHS(getAllCPUProcCoreCMPIObjPaths)
ALL_PATHS(getAllCPUMemoryCMPIObjPaths)
ALL_PATHS(getAllCPUProcCapCMPIObjPaths)

#define NAVIGATION(function)                                                                                      \
  unsigned short CPUObjFactory::function(const CMPIBroker*, const CMPIObjectPath* ref, CMPIString* key,           \
                                         const char** properties, bool isObjPath, Instances& instances,           \
                                         CMPIStatus* rc) {                                                        \
    const auto result = enter(                                                                                    \
        __func__, classOf(ref) + ", key " + shown(key) + ", " + shown(properties) + ", " + shown(isObjPath), rc); \
    return answer(result, instances, script().instances);                                                         \
  }
NAVIGATION(getProcessorCoreRefByProcHandle)
NAVIGATION(getCPUMemoryRefByProcessorCoreHandle)
NAVIGATION(getProcessorCoreRefByMemoryHandle)
NAVIGATION(getCPUMemoryRefByProcessorHandle)
NAVIGATION(getProcessorRefByMemoryHandle)
NAVIGATION(getProcessorRefByProcCoreHandle)

unsigned short CPUObjFactory::getAssocCacheData(const CMPIBroker*, CMPIString* cpuMemDeviceid, ProcCacheData& procCache,
                                                CMPIStatus* rc) {
  procCache = {};
  return enter(__func__, "key " + shown(cpuMemDeviceid), rc);
}

CMPIObjectPath* CPUObjFactory::get_assoc_targetClass_ObjectPath(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                                const char* left, const char* right, CMPIStatus* rc) {
  enter(__func__, classOf(ref) + ", " + shown(left) + ", " + shown(right), rc);
  if (script().targetClass.empty()) {
    return nullptr;
  }
  return CMNewObjectPath(broker, CMGetCharPtr(CMGetNameSpace(ref, nullptr)), script().targetClass.c_str(), nullptr);
}

}  // namespace Tarn::CPUProvider
