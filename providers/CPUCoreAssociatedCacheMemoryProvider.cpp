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

namespace {

constexpr NearEnds cores{cpuProcessorCoreClass, &CPUObjFactory::getAllCPUProcCoreCMPIObjPaths,
                         &CPUObjFactory::getNumberOfProcCoreInstances, "InstanceID"};

constexpr WalkTexts instanceTexts{
    "***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***",
    {"CMPIObjectPath is                 NULL for CPUProcessorCore", "CMPIObjectPath is NULL for CPUProcessorCore"},
    "***Can't get CPUMemory ObjectPaths based on passed in ProcessorCore                 InstanceID. Exiting EnumerateInstanceNames***",
    {"CMPIObjectPath is                     NULL for CPUMemory", "CMPIObjectPath is NULL for CPUMemory"},
    {"Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemory",
     "Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemory."}};

constexpr WalkTexts nameTexts{
    "getAllCPUProcCoreCMPIObjPaths Failed",
    {"CMPIObjectPath is NULL for CPUProcessorCore", "CMPIObjectPath is NULL for CPUProcessorCore"},
    "***Can't get Memory ObjectPaths based on passed in ProcessorCore                InstanceID. Exiting EnumerateInstanceNames***",
    {"CMPIObjectPath is NULL for CPUMemory", "CMPIObjectPath is NULL for CPUMemory"},
    {"Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemoryClass.",
     "Create CMPIObjectPath failed for                     CPUCoreAssociatedCacheMemoryClass."}};

constexpr Direction directions[] = {{cpuProcessorCoreClass, "DeviceID", &CPUObjFactory::getNumberOfProcCoreInstances,
                                     &CPUObjFactory::getProcessorCoreRefByMemoryHandle},
                                    {cpuMemoryClass, "InstanceID", &CPUObjFactory::getNumberOfMemInstances,
                                     &CPUObjFactory::getCPUMemoryRefByProcessorCoreHandle}};

CPUObjFactory* factoryOfCachesAndCores() {
  return CPUObjFactory::getFactoryInstance(false, true, true);
}

/// Finds the caches of a core, for a walk over all of them.
auto cachesOf(CPUObjFactory* factory, const CMPIObjectPath* cop, CMPIStatus* status) {
  return [=](CMPIString* key, Instances& caches) {
    return factory->getCPUMemoryRefByProcessorCoreHandle(broker, cop, key, nullptr, true, caches, status);
  };
}

}  // namespace

unsigned short CPUCoreAssociatedCacheMemoryCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                         std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfCachesAndCores();
  const auto link = [&, function = __func__](const CMPIObjectPath* path, const CMPIObjectPath* cache,
                                             const CMPIObjectPath* core) {
    return appendCacheAssociation(association, factory, path, cache, core, properties, instances, &status,
                                  __builtin_LINE(), function);
  };
  const bool complete =
      forEachPair(association, factory, cop, &status, cores, instanceTexts, cachesOf(factory, cop, &status), link);
  events.providerExit();
  return complete ? 0 : 1;
}

CMPIStatus CPUCoreAssociatedCacheMemory_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                      const CMPIResult* result, const CMPIObjectPath* cop,
                                                      const char** properties) {
  events.providerEntry();
  Instances instances;
  if (CPUCoreAssociatedCacheMemoryCMPIInstances(cop, properties, instances) == 0) {
    deliver(result, instances);
  }
  CMReturnDone(result);
  events.providerExit();
  return succeeded();
}

CMPIStatus CPUCoreAssociatedCacheMemory_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                          const CMPIResult* result, const CMPIObjectPath* cop) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfCachesAndCores();
  forEachPair(association, factory, cop, &status, cores, nameTexts, cachesOf(factory, cop, &status),
              deliverName(association, result));
  events.providerExit();
  CMReturnDone(result);
  return status;
}

CMPIStatus CPUCoreAssociatedCacheMemory_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                    const CMPIResult* result, const CMPIObjectPath* cop,
                                                    const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  Instances instances;
  if (!lacksKeys(association, cop, &status) &&
      CPUCoreAssociatedCacheMemoryCMPIInstances(cop, properties, instances) == 0) {
    deliverMatch(result, instances, [&](CMPIObjectPath* path) {
      stampPath(path, cop);
      return isObjPathsEqualWithLog(broker, cop, path, true);
    });
  }
  CMReturnDone(result);
  events.providerExit();
  return status;
}

// The association operations never call CMReturnDone.

CMPIStatus CPUCoreAssociatedCacheMemory_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                    const CMPIResult* result, const CMPIObjectPath* cop,
                                                    const char* assocClass, const char* resultClass,
                                                    const char* /*role*/, const char* /*resultRole*/,
                                                    const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfCachesAndCores();
  events.variable("_RefLeftClass = ", assocClass);
  events.variable("_RefRightClass = ", resultClass);
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    fail(association, &status, "Object Path is NULL in Associators.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, properties, false, &status}, directions,
                   {"***Can't get ProcessorCore instances related to Memory.                 Exiting Associators***",
                    "***Can't get Memory instances related to ProcessorCore.                 Exiting Associators***"},
                   related)) {
    return status;
  }
  deliver(result, related.elements);
  events.providerExit();
  return status;
}

CMPIStatus CPUCoreAssociatedCacheMemory_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                        const CMPIResult* result, const CMPIObjectPath* cop,
                                                        const char* assocClass, const char* resultClass,
                                                        const char* /*role*/, const char* /*resultRole*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfCachesAndCores();
  events.variable("_RefLeftClass = ", assocClass);
  events.variable("_RefRightClass = ", resultClass);
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    fail(association, &status, "Object Path is NULL in AssociatorNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(
          association, {factory, cop, target, nullptr, true, &status}, directions,
          {"***Can't get processorcore ObjPaths related to Memory.                 Exiting AssociatorNames***",
           "***Can't get Memory ObjectPaths related to ProcessorCore.                 Exiting AssociatorNames***"},
          related)) {
    return status;
  }
  deliverStampedPathsOf(result, related.elements, cop);
  events.providerExit();
  return status;
}

CMPIStatus CPUCoreAssociatedCacheMemory_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                   const CMPIResult* result, const CMPIObjectPath* cop,
                                                   const char* resultClass, const char* /*role*/,
                                                   const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfCachesAndCores();
  events.variable("resultClass = ", resultClass);
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    fail(association, &status, "Object Path is NULL in References.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, properties, false, &status}, directions,
                   {"***Can't get ProcessorCore instances                 Exiting References***",
                    "***Can't get Memory instances.                 Exiting References***"},
                   related)) {
    return status;
  }
  forEachReference(association, {cop, templatePath, properties, cacheAssociationKeys}, related,
                   [&, function = __func__](CMPIInstance* reference, const CMPIObjectPath* far) {
                     setCacheProperties(association, factory, reference, related.areFirst ? far : cop, &status,
                                        __builtin_LINE(), function);
                     CMReturnInstance(result, reference);
                   });
  events.providerExit();
  return status;
}

CMPIStatus CPUCoreAssociatedCacheMemory_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                       const CMPIResult* result, const CMPIObjectPath* cop,
                                                       const char* /*resultClass*/, const char* /*role*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfCachesAndCores();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    fail(association, &status, "Object Path is NULL in ReferenceNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, nullptr, true, &status}, directions,
                   {"***Can't get ProcessorCore ObjPaths.                 Exiting ReferenceNames***",
                    "***Can't get Memory ObjPaths.                 Exiting ReferenceNames***"},
                   related)) {
    return status;
  }
  forEachReference(association, {cop, templatePath, nullptr, cacheAssociationKeys}, related,
                   [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) {
                     deliverStampedPathOf(result, reference, cop);
                   });
  events.providerExit();
  return status;
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUCoreAssociatedCacheMemoryProvider",
    entry<CPUCoreAssociatedCacheMemory_Cleanup, broker>,
    entry<CPUCoreAssociatedCacheMemory_EnumInstanceNames, broker>,
    entry<CPUCoreAssociatedCacheMemory_EnumInstances, broker>,
    entry<CPUCoreAssociatedCacheMemory_GetInstance, broker>,
    entry<CPUCoreAssociatedCacheMemory_CreateInstance, broker>,
    entry<CPUCoreAssociatedCacheMemory_ModifyInstance, broker>,
    entry<CPUCoreAssociatedCacheMemory_DeleteInstance, broker>,
    entry<CPUCoreAssociatedCacheMemory_ExecQuery, broker>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUCoreAssociatedCacheMemoryProvider",
    entry<CPUCoreAssociatedCacheMemory_AssociationCleanup, broker>,
    entry<CPUCoreAssociatedCacheMemory_Associators, broker>,
    entry<CPUCoreAssociatedCacheMemory_AssociatorNames, broker>,
    entry<CPUCoreAssociatedCacheMemory_References, broker>,
    entry<CPUCoreAssociatedCacheMemory_ReferenceNames, broker>,
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
