#include "InstanceProvider.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUProcessorCore = "Corvane.CPUProcessorCoreProvider";
static constexpr EventLog events{loggerCPUProcessorCore, "CPUProcessorCoreProvider.cpp", LevelInfo};

static const InstanceProvider provider{
    .events = events,
    .broker = broker,
    .isProc = false,
    .isMem = false,
    .isProcCore = true,
    .getAllInstances = &CPUObjFactory::getAllCPUProcCoreCMPIInstances,
    .getOneInstance = &CPUObjFactory::getOneCPUProcCoreCMPIInstance,
    .getAllPaths = &CPUObjFactory::getAllCPUProcCoreCMPIObjPaths,
    .getInstance = {.key = "InstanceID",
                    .tracesKey = true,
                    .failsWithoutKeys = true,
                    .noKeys = "At least one key should be passed",
                    .oneFailed = "getOneCPUProcCoreCMPIInstance Failed",
                    .allFailed = "getAllCPUProcCoreCMPIInstances Failed"},
    .enumInstances = {.expected = &CPUObjFactory::getNumberOfProcInstances,  // a guess: there are more cores
                      .variable = "numInstances",
                      .failed = "getAllCPUProcCoreCMPIInstances Failed"},
    .enumInstanceNames = {.expected = &CPUObjFactory::getNumberOfProcInstances,
                          .variable = {},
                          .failed = "getAllCPUProcCoreCMPIObjPaths Failed"},
};

CORVANE_REFUSED_OPERATIONS(CPUProcessorCore)

CMPIStatus CPUProcessorCore_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                              const CMPIResult* result, const CMPIObjectPath* reference) {
  return enumInstanceNames(provider, {result, reference, nullptr});
}

CMPIStatus CPUProcessorCore_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                          const CMPIResult* result, const CMPIObjectPath* reference,
                                          const char** properties) {
  return enumInstances(provider, {result, reference, properties});
}

CMPIStatus CPUProcessorCore_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                        const CMPIResult* result, const CMPIObjectPath* reference,
                                        const char** properties) {
  return getInstance(provider, {result, reference, properties});
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUProcessorCoreProvider",
    entry<CPUProcessorCore_Cleanup, provider>,
    entry<CPUProcessorCore_EnumInstanceNames, provider>,
    entry<CPUProcessorCore_EnumInstances, provider>,
    entry<CPUProcessorCore_GetInstance, provider>,
    entry<CPUProcessorCore_CreateInstance, provider>,
    entry<CPUProcessorCore_ModifyInstance, provider>,
    entry<CPUProcessorCore_DeleteInstance, provider>,
    entry<CPUProcessorCore_ExecQuery, provider>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUProcessorCoreProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                            const CMPIContext* /*context*/,
                                                                            CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}
