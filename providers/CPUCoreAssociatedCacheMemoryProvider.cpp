#include "CacheAssociation.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUCoreAssociatedCache = "Corvane.CPUCoreAssociatedCacheProvider";
static constexpr EventLog events{loggerCPUCoreAssociatedCache, "CPUCoreAssociatedCacheMemoryProvider.cpp", LevelInfo};

static const Association association{events,
                                     broker,
                                     cpuCoreAssociatedCacheMemoryClass,
                                     {"Antecedent", cpuMemoryClass},
                                     {"Dependent", cpuProcessorCoreClass}};

CORVANE_REFUSED_OPERATIONS(CPUCoreAssociatedCacheMemory)
CORVANE_ASSOCIATION_CLEANUP(CPUCoreAssociatedCacheMemory)

unsigned short CPUCoreAssociatedCacheMemoryCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                         std::vector<CMPIInstance*>& instances);

namespace {

CPUObjFactory* factoryOfCachesAndCores() {
  return CPUObjFactory::getFactoryInstance(false, true, true);
}

constexpr CacheAssociation provider{
    .association = association,
    .factory = factoryOfCachesAndCores,
    .isSuspended = nullptr,
    .makeInstances = CPUCoreAssociatedCacheMemoryCMPIInstances,

    .walk = {.nearClass = cpuProcessorCoreClass,
             .nearPaths = &CPUObjFactory::getAllCPUProcCoreCMPIObjPaths,
             .expectedNear = &CPUObjFactory::getNumberOfProcCoreInstances,
             .key = "InstanceID",
             .farElements = related<&CPUObjFactory::getCPUMemoryRefByProcessorCoreHandle>},
    .instanceTexts =
        {.noPaths = "***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***",
         .nullNear = {"CMPIObjectPath is                 NULL for CPUProcessorCore",
                      "CMPIObjectPath is NULL for CPUProcessorCore"},
         .noRelated =
             "***Can't get CPUMemory ObjectPaths based on passed in ProcessorCore                 InstanceID. Exiting EnumerateInstanceNames***",
         .nullFar = {"CMPIObjectPath is                     NULL for CPUMemory",
                     "CMPIObjectPath is NULL for CPUMemory"},
         .noAssociationPath = {"Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemory",
                               "Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemory."}},
    .nameTexts =
        {.noPaths = "getAllCPUProcCoreCMPIObjPaths Failed",
         .nullNear = "CMPIObjectPath is NULL for CPUProcessorCore",
         .noRelated =
             "***Can't get Memory ObjectPaths based on passed in ProcessorCore                InstanceID. Exiting EnumerateInstanceNames***",
         .nullFar = "CMPIObjectPath is NULL for CPUMemory",
         .noAssociationPath =
             "Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemoryClass."},

    .directions = {{cpuProcessorCoreClass, "DeviceID", &CPUObjFactory::getNumberOfProcCoreInstances,
                    related<&CPUObjFactory::getProcessorCoreRefByMemoryHandle>},
                   {cpuMemoryClass, "InstanceID", &CPUObjFactory::getNumberOfMemInstances,
                    related<&CPUObjFactory::getCPUMemoryRefByProcessorCoreHandle>}},
    .associatorsFailed =
        {"***Can't get ProcessorCore instances related to Memory.                 Exiting Associators***",
         "***Can't get Memory instances related to ProcessorCore.                 Exiting Associators***"},
    .associatorNamesFailed =
        {"***Can't get processorcore ObjPaths related to Memory.                 Exiting AssociatorNames***",
         "***Can't get Memory ObjectPaths related to ProcessorCore.                 Exiting AssociatorNames***"},
    .referencesFailed = {"***Can't get ProcessorCore instances                 Exiting References***",
                         "***Can't get Memory instances.                 Exiting References***"},
    .referenceNamesFailed = {"***Can't get ProcessorCore ObjPaths.                 Exiting ReferenceNames***",
                             "***Can't get Memory ObjPaths.                 Exiting ReferenceNames***"},

    .tracesClasses = true,
    .referencesDescribe = true,
};

}  // namespace

unsigned short CPUCoreAssociatedCacheMemoryCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                         std::vector<CMPIInstance*>& instances) {
  return makeInstances(provider, cop, properties, instances);
}

CMPIStatus CPUCoreAssociatedCacheMemory_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                      const CMPIResult* result, const CMPIObjectPath* cop,
                                                      const char** properties) {
  return enumInstances(provider, {result, cop, properties});
}

CMPIStatus CPUCoreAssociatedCacheMemory_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                          const CMPIResult* result, const CMPIObjectPath* cop) {
  return enumInstanceNames(provider, {result, cop});
}

CMPIStatus CPUCoreAssociatedCacheMemory_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                    const CMPIResult* result, const CMPIObjectPath* cop,
                                                    const char** properties) {
  return getInstance(provider, {result, cop, properties});
}

CMPIStatus CPUCoreAssociatedCacheMemory_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                    const CMPIResult* result, const CMPIObjectPath* cop,
                                                    const char* assocClass, const char* resultClass,
                                                    const char* /*role*/, const char* /*resultRole*/,
                                                    const char** properties) {
  return associators(provider, {result, cop, properties, assocClass, resultClass});
}

CMPIStatus CPUCoreAssociatedCacheMemory_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                        const CMPIResult* result, const CMPIObjectPath* cop,
                                                        const char* assocClass, const char* resultClass,
                                                        const char* /*role*/, const char* /*resultRole*/) {
  return associatorNames(provider, {result, cop, nullptr, assocClass, resultClass});
}

CMPIStatus CPUCoreAssociatedCacheMemory_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                   const CMPIResult* result, const CMPIObjectPath* cop,
                                                   const char* resultClass, const char* /*role*/,
                                                   const char** properties) {
  return references(provider, {result, cop, properties, nullptr, resultClass});
}

CMPIStatus CPUCoreAssociatedCacheMemory_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                       const CMPIResult* result, const CMPIObjectPath* cop,
                                                       const char* /*resultClass*/, const char* /*role*/) {
  return referenceNames(provider, {result, cop});
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUCoreAssociatedCacheMemoryProvider",
    entry<CPUCoreAssociatedCacheMemory_Cleanup, association>,
    entry<CPUCoreAssociatedCacheMemory_EnumInstanceNames, association>,
    entry<CPUCoreAssociatedCacheMemory_EnumInstances, association>,
    entry<CPUCoreAssociatedCacheMemory_GetInstance, association>,
    entry<CPUCoreAssociatedCacheMemory_CreateInstance, association>,
    entry<CPUCoreAssociatedCacheMemory_ModifyInstance, association>,
    entry<CPUCoreAssociatedCacheMemory_DeleteInstance, association>,
    entry<CPUCoreAssociatedCacheMemory_ExecQuery, association>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUCoreAssociatedCacheMemoryProvider",
    entry<CPUCoreAssociatedCacheMemory_AssociationCleanup, association>,
    entry<CPUCoreAssociatedCacheMemory_Associators, association>,
    entry<CPUCoreAssociatedCacheMemory_AssociatorNames, association>,
    entry<CPUCoreAssociatedCacheMemory_References, association>,
    entry<CPUCoreAssociatedCacheMemory_ReferenceNames, association>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUCoreAssociatedCacheMemoryProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                                        const CMPIContext* /*context*/,
                                                                                        CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}

CORVANE_EXPORTED CMPIAssociationMI* CPUCoreAssociatedCacheMemoryProvider_Create_AssociationMI(
    const CMPIBroker* caller, const CMPIContext* /*context*/, CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIAssociationMI mi = {nullptr, &assocMIFT__};
  return registerBroker(broker, caller, mi);
}
