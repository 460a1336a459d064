#include "InstanceProvider.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUProcessorCap = "Corvane.CPUProcessorCapProvider";
static constexpr EventLog events{loggerCPUProcessorCap, "CPUProcessorCapabilitiesProvider.cpp", LevelInfo};

static const InstanceProvider provider{
    .events = events,
    .broker = broker,
    .isProc = true,
    .isMem = false,
    .isProcCore = false,
    .getAllInstances = &CPUObjFactory::getAllCPUProcCapCMPIInstances,
    .getOneInstance = &CPUObjFactory::getOneCPUProcCapCMPIInstance,
    .getAllPaths = &CPUObjFactory::getAllCPUProcCapCMPIObjPaths,
    .getInstance = {.key = "InstanceID",
                    .tracesKey = true,
                    .failsWithoutKeys = true,
                    .noKeys = "At least one key should be passed",
                    .oneFailed = "getOneCPUProcCapCMPIInstance Failed",
                    .allFailed = "getAllCPUProcCapCMPIInstances Failed"},
    .enumInstances = {.expected = &CPUObjFactory::getNumberOfProcInstances,
                      .variable = nullptr,
                      .failed = "getAllCPUProcCapCMPIInstances Failed "},
    .enumInstanceNames = {.expected = &CPUObjFactory::getNumberOfProcInstances,
                          .variable = {},
                          .failed = "***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***"},
};

CORVANE_REFUSED_OPERATIONS(CPUProcessorCapabilities)

CMPIStatus CPUProcessorCapabilities_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                      const CMPIResult* result, const CMPIObjectPath* reference) {
  return enumInstanceNames(provider, {result, reference, nullptr});
}

CMPIStatus CPUProcessorCapabilities_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                  const CMPIResult* result, const CMPIObjectPath* reference,
                                                  const char** properties) {
  return enumInstances(provider, {result, reference, properties});
}

CMPIStatus CPUProcessorCapabilities_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* reference,
                                                const char** properties) {
  return getInstance(provider, {result, reference, properties});
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUProcessorCapProvider",
    entry<CPUProcessorCapabilities_Cleanup, provider>,
    entry<CPUProcessorCapabilities_EnumInstanceNames, provider>,
    entry<CPUProcessorCapabilities_EnumInstances, provider>,
    entry<CPUProcessorCapabilities_GetInstance, provider>,
    entry<CPUProcessorCapabilities_CreateInstance, provider>,
    entry<CPUProcessorCapabilities_ModifyInstance, provider>,
    entry<CPUProcessorCapabilities_DeleteInstance, provider>,
    entry<CPUProcessorCapabilities_ExecQuery, provider>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUProcessorCapProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                           const CMPIContext* /*context*/,
                                                                           CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}
