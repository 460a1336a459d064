#include "InstanceProvider.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUMemory = "Corvane.CPUMemoryProvider";
static constexpr EventLog events{loggerCPUMemory, "CPUMemoryProvider.cpp", LevelInfo};

static const InstanceProvider provider{
    .events = events,
    .broker = broker,
    .isProc = false,
    .isMem = true,
    .isProcCore = false,
    .getAllInstances = &CPUObjFactory::getAllCPUMemoryCMPIInstances,
    .getOneInstance = &CPUObjFactory::getOneCPUMemoryCMPIInstance,
    .getAllPaths = &CPUObjFactory::getAllCPUMemoryCMPIObjPaths,
    .getInstance = {.key = "DeviceID",
                    .tracesKey = false,
                    .failsWithoutKeys = true,
                    .noKeys = "At least one key should be passed",
                    .oneFailed = "***Can't get Instance.                                Exiting GetInstance***",
                    .allFailed = {}},
    .enumInstances = {.expected = nullptr,
                      .variable = nullptr,
                      .failed = "***Can't get Instances.            Exiting EnumerateInstanceNames***"},
    .enumInstanceNames = {.expected = &CPUObjFactory::getNumberOfMemInstances,
                          .variable = {},
                          .failed = "***Can't get ObjectPaths.                     Exiting EnumerateInstanceNames***"},
};

CORVANE_REFUSED_OPERATIONS(CPUMemory)

CMPIStatus CPUMemory_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/, const CMPIResult* result,
                                       const CMPIObjectPath* reference) {
  return enumInstanceNames(provider, {result, reference, nullptr});
}

CMPIStatus CPUMemory_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/, const CMPIResult* result,
                                   const CMPIObjectPath* reference, const char** properties) {
  return enumInstances(provider, {result, reference, properties});
}

CMPIStatus CPUMemory_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/, const CMPIResult* result,
                                 const CMPIObjectPath* reference, const char** properties) {
  return getInstance(provider, {result, reference, properties});
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUMemoryProvider",
    entry<CPUMemory_Cleanup, provider>,
    entry<CPUMemory_EnumInstanceNames, provider>,
    entry<CPUMemory_EnumInstances, provider>,
    entry<CPUMemory_GetInstance, provider>,
    entry<CPUMemory_CreateInstance, provider>,
    entry<CPUMemory_ModifyInstance, provider>,
    entry<CPUMemory_DeleteInstance, provider>,
    entry<CPUMemory_ExecQuery, provider>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUMemoryProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                     const CMPIContext* /*context*/,
                                                                     CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}
