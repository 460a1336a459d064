// A provider library that does what the namespace of the request says, or else the variable TEST_PROVIDER_ACTION, for
// all classes of the table but the capabilities, whose factory it lacks.

#include <cmpimacs.h>
#include <unistd.h>

#include <algorithm>
#include <csignal>
#include <cstdlib>
#include <iterator>
#include <stdexcept>
#include <string>
#include <string_view>

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

struct Asked {
  const std::string& own;  // the provider's class
  const ScriptedProvider& provider;
  const ProviderCall& call;
  std::string className;  // as the request spells it
};

// The path, or an instance that tells what the provider was given.
CMPIStatus answerPlainly(const Asked& asked) {
  if (asked.provider.lastOperation.ends_with("Names")) {
    CMReturnObjectPath(asked.call.result, asked.call.path);
  } else {
    returnInstance(asked.call, asked.own.c_str(), describe(asked.provider, asked.call));
  }
  return ok();
}

CMPIStatus answerTwice(const Asked& asked) {
  const CMPIStatus status = answerPlainly(asked);
  if (!asked.provider.lastOperation.ends_with("Names")) {
    returnInstance(asked.call, asked.own.c_str(), "second");
  }
  return status;
}

CMPIStatus refuse(const Asked&) {
  CMReturnWithChars(broker, CMPI_RC_ERR_ACCESS_DENIED, "denied");
}

void writeToStandardError(std::string_view text) {
  [[maybe_unused]] const ssize_t written = write(STDERR_FILENO, text.data(), text.size());
}

struct Action {
  std::string_view nameSpace;
  CMPIStatus (*perform)(const Asked& asked);
};

constexpr Action actions[] = {
    {"plain", answerPlainly},
    {"two", answerTwice},
    {"none", [](const Asked&) { return ok(); }},
    {"fail", refuse},
    {"count",
     [](const Asked& asked) {
       returnInstance(asked.call, asked.className.c_str(), std::to_string(requests));
       return ok();
     }},
    {"crash",
     [](const Asked&) {
       raise(SIGKILL);
       return ok();
     }},
    {"exit", [](const Asked&) -> CMPIStatus { _exit(3); }},
    {"throw", [](const Asked&) -> CMPIStatus { throw std::runtime_error("thrown"); }},
    {"throw-number", [](const Asked&) -> CMPIStatus { throw 1; }},
    {"write",
     [](const Asked& asked) {
       writeToStandardError("strange\x07\n\nstrange\x07\n");
       return answerPlainly(asked);
     }},
    {"write-abort",
     [](const Asked&) -> CMPIStatus {
       writeToStandardError("last words\n");
       std::abort();
     }},
    {"upcall", [](const Asked& asked) { return callUp(asked.call, "plain", "HALDA_ComputerSystem"); }},
    {"upcall-own", [](const Asked& asked) { return callUp(asked.call, "plain", "HALDA_CPUMemory"); }},
    {"upcall-unserved", [](const Asked& asked) { return callUp(asked.call, "plain", "CIM_Fan"); }},
    {"upcall-crash", [](const Asked& asked) { return callUp(asked.call, "crash", "HALDA_CPUMemory"); }},
    {"loop", [](const Asked& asked) { return callUp(asked.call, "loop", asked.className.c_str()); }},
};

// "fail CLASS" is for the provider of that class; the others answer plainly, as to any namespace without a row.
CMPIStatus perform(const std::string& own, const ScriptedProvider& provider, const ProviderCall& call) {
  const std::string nameSpace = CMGetCharPtr(CMGetNameSpace(call.path, nullptr));
  const Asked asked{own, provider, call, CMGetCharPtr(CMGetClassName(call.path, nullptr))};
  ++requests;
  if (nameSpace == "fail " + own) {
    return refuse(asked);
  }
  const char* const chosen = std::getenv("TEST_PROVIDER_ACTION");
  const std::string_view name = chosen == nullptr ? std::string_view(nameSpace) : chosen;
  const auto* const action = std::ranges::find(actions, name, &Action::nameSpace);
  return action == std::end(actions) ? answerPlainly(asked) : action->perform(asked);
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
