#include "CacheAssociation.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUAssociatedCache = "Corvane.CPUAssociatedCacheProvider";
static constexpr EventLog events{loggerCPUAssociatedCache, "CPUAssociatedCacheMemoryProvider.cpp", LevelInfo};

static const Association association{
    events, broker, cpuAssociatedCacheMemoryClass, {"Antecedent", cpuMemoryClass}, {"Dependent", cpuProcessorClass}};

CORVANE_REFUSED_OPERATIONS(CPUAssociatedCacheMemory)
CORVANE_ASSOCIATION_CLEANUP(CPUAssociatedCacheMemory)

unsigned short CPUAssociatedCacheMemoryCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                     std::vector<CMPIInstance*>& instances);

namespace {

CPUObjFactory* factoryOfProcessorsAndCaches() {
  return CPUObjFactory::getFactoryInstance(true, true, false);
}

/// The association is served only while no cores have been collected in the process: with cores known,
/// the caches belong to them.
bool coresAreKnown(const CPUObjFactory* factory) {
  return factory->getNumberOfProcCoreInstances() != 0;
}

constexpr CacheAssociation provider{
    .association = association,
    .factory = factoryOfProcessorsAndCaches,
    .isSuspended = coresAreKnown,
    .makeInstances = CPUAssociatedCacheMemoryCMPIInstances,

    .walk = {.nearClass = cpuMemoryClass,
             .nearPaths = &CPUObjFactory::getAllCPUMemoryCMPIObjPaths,
             .expectedNear = &CPUObjFactory::getNumberOfMemInstances,
             .key = "DeviceID",
             .farElements = related<&CPUObjFactory::getProcessorRefByMemoryHandle>},
    .instanceTexts =
        {.noPaths = "***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***",
         .nullNear = {"CMPIObjectPath is                 NULL for CPUMemory", "CMPIObjectPath is NULL for CPUMemory"},
         .noRelated =
             "***Can't get Processor ObjectPaths based on passed in Mem                 DeviceID. Exiting EnumerateInstanceNames***",
         .nullFar = {"CMPIObjectPath is                     NULL for CPUProcessor",
                     "CMPIObjectPath is NULL for CPUProcessor"},
         .noAssociationPath = {"Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory",
                               "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory."}},
    .nameTexts =
        {.noPaths = "getAllCPUMemoryCMPIObjPaths Failed",
         .nullNear = "CMPIObjectPath is NULL for CPUMemory",
         .noRelated =
             "***Can't get Processor ObjectPaths based on passed in Mem                 DeviceID. Exiting EnumerateInstanceNames***",
         .nullFar = "CMPIObjectPath is NULL for CPUProcessor",
         .noAssociationPath = "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemoryClass."},

    .directions = {{cpuProcessorClass, "DeviceID", &CPUObjFactory::getNumberOfProcInstances,
                    related<&CPUObjFactory::getProcessorRefByMemoryHandle>},
                   {cpuMemoryClass, "DeviceID", &CPUObjFactory::getNumberOfMemInstances,
                    related<&CPUObjFactory::getCPUMemoryRefByProcessorHandle>}},
    .associatorsFailed = {"***Can't get Processor instances related to Memory.                 Exiting Associators***",
                          "***Can't get Memory instances related to Processor.                 Exiting Associators***"},
    .associatorNamesFailed =
        {"***Can't get processor ObjPaths related to Processor.                 Exiting AssociatorNames***",
         "***Can't get Memory ObjectPaths related to Processor.                 Exiting AssociatorNames***"},
    .referencesFailed = {"***Can't get Processor instances                 Exiting References***",
                         "***Can't get Memory instances.                 Exiting References***"},
    .referenceNamesFailed = {"***Can't get Processor ObjPaths.                 Exiting ReferenceNames***",
                             "***Can't get Memory ObjPaths.                 Exiting ReferenceNames***"},

    .tracesClasses = false,
    .referencesDescribe = false,
};

}  // namespace

unsigned short CPUAssociatedCacheMemoryCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                     std::vector<CMPIInstance*>& instances) {
  return makeInstances(provider, cop, properties, instances);
}

CMPIStatus CPUAssociatedCacheMemory_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                  const CMPIResult* result, const CMPIObjectPath* cop,
                                                  const char** properties) {
  return enumInstances(provider, {result, cop, properties});
}

CMPIStatus CPUAssociatedCacheMemory_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                      const CMPIResult* result, const CMPIObjectPath* cop) {
  return enumInstanceNames(provider, {result, cop});
}

CMPIStatus CPUAssociatedCacheMemory_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* cop,
                                                const char** properties) {
  return getInstance(provider, {result, cop, properties});
}

CMPIStatus CPUAssociatedCacheMemory_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* cop,
                                                const char* assocClass, const char* resultClass, const char* /*role*/,
                                                const char* /*resultRole*/, const char** properties) {
  return associators(provider, {result, cop, properties, assocClass, resultClass});
}

CMPIStatus CPUAssociatedCacheMemory_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                    const CMPIResult* result, const CMPIObjectPath* cop,
                                                    const char* assocClass, const char* resultClass,
                                                    const char* /*role*/, const char* /*resultRole*/) {
  return associatorNames(provider, {result, cop, nullptr, assocClass, resultClass});
}

CMPIStatus CPUAssociatedCacheMemory_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                               const CMPIResult* result, const CMPIObjectPath* cop,
                                               const char* resultClass, const char* /*role*/, const char** properties) {
  return references(provider, {result, cop, properties, nullptr, resultClass});
}

CMPIStatus CPUAssociatedCacheMemory_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                   const CMPIResult* result, const CMPIObjectPath* cop,
                                                   const char* /*resultClass*/, const char* /*role*/) {
  return referenceNames(provider, {result, cop});
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUAssociatedCacheMemoryProvider",
    entry<CPUAssociatedCacheMemory_Cleanup, association>,
    entry<CPUAssociatedCacheMemory_EnumInstanceNames, association>,
    entry<CPUAssociatedCacheMemory_EnumInstances, association>,
    entry<CPUAssociatedCacheMemory_GetInstance, association>,
    entry<CPUAssociatedCacheMemory_CreateInstance, association>,
    entry<CPUAssociatedCacheMemory_ModifyInstance, association>,
    entry<CPUAssociatedCacheMemory_DeleteInstance, association>,
    entry<CPUAssociatedCacheMemory_ExecQuery, association>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUAssociatedCacheMemoryProvider",
    entry<CPUAssociatedCacheMemory_AssociationCleanup, association>,
    entry<CPUAssociatedCacheMemory_Associators, association>,
    entry<CPUAssociatedCacheMemory_AssociatorNames, association>,
    entry<CPUAssociatedCacheMemory_References, association>,
    entry<CPUAssociatedCacheMemory_ReferenceNames, association>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUAssociatedCacheMemoryProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                                    const CMPIContext* /*context*/,
                                                                                    CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}

CORVANE_EXPORTED CMPIAssociationMI* CPUAssociatedCacheMemoryProvider_Create_AssociationMI(
    const CMPIBroker* caller, const CMPIContext* /*context*/, CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIAssociationMI mi = {nullptr, &assocMIFT__};
  return registerBroker(broker, caller, mi);
}
