#include "InstanceProvider.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUProcessor = "Corvane.CPUProcessorProvider";
static constexpr EventLog events{loggerCPUProcessor, "CPUProcessorProvider.cpp", LevelInfo};

// The lines are fixed: log filters know this provider's messages by them.
static const InstanceProvider provider{
    .events = events,
    .broker = broker,
    .isProc = true,
    .isMem = false,
    .isProcCore = false,
    .getAllInstances = &CPUObjFactory::getAllCPUProcCMPIInstances,
    .getOneInstance = &CPUObjFactory::getOneCPUProcCMPIInstance,
    .getAllPaths = &CPUObjFactory::getAllCPUProcCMPIObjPaths,
    .getInstance = {.key = "DeviceID",
                    .tracesKey = false,
                    .failsWithoutKeys = false,
                    .noKeys = {"At least one key should be passed", 251},
                    .oneFailed = {"getOneCPUProcCMPIInstance Failed", 206},
                    .allFailed = {"getAllCPUProcCMPIInstances Failed", 229},
                    .exitLine = 257},
    .enumInstances = {.expected = &CPUObjFactory::getNumberOfProcInstances,
                      .variable = nullptr,
                      .failed = {"Failed To get CMPIInstances", 151}},
    .enumInstanceNames = {.expected = &CPUObjFactory::getNumberOfProcInstances,
                          .variable = {"numObjPaths", 95},
                          .failed = {"Failed To get the ObjectPaths", 102}},
};

CORVANE_REFUSED_OPERATIONS(CPUProcessor)

CMPIStatus CPUProcessor_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                          const CMPIResult* result, const CMPIObjectPath* reference) {
  return enumInstanceNames(provider, {result, reference, nullptr});
}

CMPIStatus CPUProcessor_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/, const CMPIResult* result,
                                      const CMPIObjectPath* reference, const char** properties) {
  return enumInstances(provider, {result, reference, properties});
}

CMPIStatus CPUProcessor_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/, const CMPIResult* result,
                                    const CMPIObjectPath* reference, const char** properties) {
  return getInstance(provider, {result, reference, properties});
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUProcessorProvider",
    entry<CPUProcessor_Cleanup, provider>,
    entry<CPUProcessor_EnumInstanceNames, provider>,
    entry<CPUProcessor_EnumInstances, provider>,
    entry<CPUProcessor_GetInstance, provider>,
    entry<CPUProcessor_CreateInstance, provider>,
    entry<CPUProcessor_ModifyInstance, provider>,
    entry<CPUProcessor_DeleteInstance, provider>,
    entry<CPUProcessor_ExecQuery, provider>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUProcessorProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                        const CMPIContext* /*context*/,
                                                                        CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}
