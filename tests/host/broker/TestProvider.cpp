// A provider library that does what the namespace of the request says, for all classes of the table
// but the capabilities, whose factory it lacks.

#include <cmpimacs.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <stdexcept>
#include <string>

#include "host/broker/Request.h"
#include "tests/host/broker/ScriptedProvider.h"

namespace Corvcim {
namespace {

const CMPIBroker* broker = nullptr;
int requests = 0;

std::string textOrNull(const char* text) {
  return text == nullptr ? "NULL" : text;
}

CMPIStatus ok() {
  return {CMPI_RC_OK, nullptr};
}

void returnInstance(const ProviderCall& call, const char* className, const std::string& id) {
  const std::string nameSpace = CMGetCharPtr(CMGetNameSpace(call.path, nullptr));
  CMPIInstance* instance =
      CMNewInstance(broker, CMNewObjectPath(broker, nameSpace.c_str(), className, nullptr), nullptr);
  CMSetProperty(instance, "DeviceID", id.c_str(), CMPI_chars);
  CMReturnInstance(call.result, instance);
}

CMPIStatus callUp(const ProviderCall& call, const char* nameSpace, const char* className) {
  CMPIStatus status = ok();
  CMPIObjectPath* path = CMNewObjectPath(broker, nameSpace, className, nullptr);
  CMPIEnumeration* instances = CBEnumInstances(broker, call.context, path, nullptr, &status);
  while (status.rc == CMPI_RC_OK && CMHasNext(instances, nullptr) != 0) {
    CMReturnInstance(call.result, CMGetNext(instances, nullptr).value.inst);
  }
  return status;
}

// The operation and what the provider was given, so that a test sees it in the answer.
std::string describe(const ScriptedProvider& provider, const ProviderCall& call) {
  std::string result = provider.lastOperation;
  for (const char* each : call.filter) {
    result += " " + textOrNull(each);
  }
  return result;
}

CMPIStatus perform(const std::string& own, const ScriptedProvider& provider, const ProviderCall& call) {
  const std::string nameSpace = CMGetCharPtr(CMGetNameSpace(call.path, nullptr));
  const std::string className = CMGetCharPtr(CMGetClassName(call.path, nullptr));
  ++requests;
  if (nameSpace == "crash") {
    raise(SIGKILL);
  }
  if (nameSpace == "exit") {
    _exit(3);
  }
  if (nameSpace == "throw") {
    throw std::runtime_error("thrown");
  }
  if (nameSpace == "throw-number") {
    throw 1;
  }
  if (nameSpace == "none") {
    return ok();
  }
  if (nameSpace == "fail" || nameSpace == "fail " + own) {
    CMReturnWithChars(broker, CMPI_RC_ERR_ACCESS_DENIED, "denied");
  }
  if (nameSpace == "count") {
    returnInstance(call, className.c_str(), std::to_string(requests));
    return ok();
  }
  if (nameSpace == "upcall") {
    return callUp(call, "plain", "HALDA_ComputerSystem");
  }
  if (nameSpace == "upcall-own") {
    return callUp(call, "plain", "HALDA_CPUMemory");
  }
  if (nameSpace == "upcall-unserved") {
    return callUp(call, "plain", "CIM_Fan");
  }
  if (nameSpace == "loop") {
    return callUp(call, "loop", className.c_str());
  }
  if (nameSpace == "upcall-crash") {
    return callUp(call, "crash", "HALDA_CPUMemory");
  }
  if (provider.lastOperation.ends_with("Names")) {
    CMReturnObjectPath(call.result, call.path);
    return ok();
  }
  returnInstance(call, own.c_str(), describe(provider, call));
  if (nameSpace == "two") {
    returnInstance(call, own.c_str(), "second");
  }
  return ok();
}

ScriptedProvider makeProvider(const std::string& own, ScriptedProvider& self) {
  return ScriptedProvider([own, &self](const ProviderCall& call) { return perform(own, self, call); });
}

}  // namespace

#define PROVIDER(NAME, CLASS)                                                                                 \
  static ScriptedProvider provider##NAME = makeProvider(CLASS, provider##NAME);                               \
  extern "C" __attribute__((visibility("default")))                                                           \
  CMPIInstanceMI* NAME##_Create_InstanceMI(const CMPIBroker* handle, const CMPIContext*, CMPIStatus*) {       \
    broker = handle;                                                                                          \
    return provider##NAME.instanceMI();                                                                       \
  }                                                                                                           \
  extern "C" __attribute__((visibility("default")))                                                           \
  CMPIAssociationMI* NAME##_Create_AssociationMI(const CMPIBroker* handle, const CMPIContext*, CMPIStatus*) { \
    broker = handle;                                                                                          \
    return provider##NAME.associationMI();                                                                    \
  }                                                                                                           \
  static_assert(true)

PROVIDER(CorvaneComputerSystemProvider, "HALDA_ComputerSystem");
PROVIDER(CPUProcessorProvider, "HALDA_CPUProcessor");
PROVIDER(CPUProcessorCoreProvider, "HALDA_CPUProcessorCore");
PROVIDER(CPUMemoryProvider, "HALDA_CPUMemory");
PROVIDER(CPUSystemDeviceProvider, "HALDA_CPUSystemDevice");
PROVIDER(CPUConcreteComponentProvider, "HALDA_CPUConcreteComponent");
PROVIDER(CPUAssociatedCacheMemoryProvider, "HALDA_CPUAssociatedCacheMemory");
PROVIDER(CPUCoreAssociatedCacheMemoryProvider, "HALDA_CPUCoreAssociatedCacheMemory");
PROVIDER(CPUElementCapabilitiesProvider, "HALDA_CPUElementCapabilities");

extern "C" __attribute__((visibility("default"))) CMPIInstanceMI* RefusingProvider_Create_InstanceMI(
    const CMPIBroker* handle, const CMPIContext*, CMPIStatus* status) {
  status->rc = CMPI_RC_ERR_ACCESS_DENIED;
  status->msg = CMNewString(handle, "no licence", nullptr);
  return nullptr;
}

}  // namespace Corvcim
