#include "CacheAssociation.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUAssociatedCache = "Corvane.CPUAssociatedCacheProvider";
static constexpr EventLog events{loggerCPUAssociatedCache, "CPUAssociatedCacheMemoryProvider.cpp", LevelInfo};

static const Association association{
    events, broker, cpuAssociatedCacheMemoryClass, {"Antecedent", cpuMemoryClass}, {"Dependent", cpuProcessorClass}};

CORVANE_REFUSED_OPERATIONS(CPUAssociatedCacheMemory)
CORVANE_ASSOCIATION_CLEANUP(CPUAssociatedCacheMemory)

namespace {

constexpr NearEnds caches{cpuMemoryClass, &CPUObjFactory::getAllCPUMemoryCMPIObjPaths,
                          &CPUObjFactory::getNumberOfMemInstances, "DeviceID"};

constexpr WalkTexts instanceTexts{
    "***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***",
    {"CMPIObjectPath is                 NULL for CPUMemory", "CMPIObjectPath is NULL for CPUMemory"},
    "***Can't get Processor ObjectPaths based on passed in Mem                 DeviceID. Exiting EnumerateInstanceNames***",
    {"CMPIObjectPath is                     NULL for CPUProcessor", "CMPIObjectPath is NULL for CPUProcessor"},
    {"Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory",
     "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory."}};

constexpr WalkTexts nameTexts{
    "getAllCPUMemoryCMPIObjPaths Failed",
    {"CMPIObjectPath is NULL for CPUMemory", "CMPIObjectPath is NULL for CPUMemory"},
    "***Can't get Processor ObjectPaths based on passed in Mem                 DeviceID. Exiting EnumerateInstanceNames***",
    {"CMPIObjectPath is NULL for CPUProcessor", "CMPIObjectPath is NULL for CPUProcessor"},
    {"Create CMPIObjectPath failed for                     cpuAssociatedCacheMemoryClass.",
     "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemoryClass."}};

constexpr Direction directions[] = {{cpuProcessorClass, "DeviceID", &CPUObjFactory::getNumberOfProcInstances,
                                     &CPUObjFactory::getProcessorRefByMemoryHandle},
                                    {cpuMemoryClass, "DeviceID", &CPUObjFactory::getNumberOfMemInstances,
                                     &CPUObjFactory::getCPUMemoryRefByProcessorHandle}};

CPUObjFactory* factoryOfProcessorsAndCaches() {
  return CPUObjFactory::getFactoryInstance(true, true, false);
}

/// The association is served only while no cores have been collected in the process: with cores known,
/// the caches belong to them.
bool coresAreKnown(const CPUObjFactory* factory) {
  return factory->getNumberOfProcCoreInstances() != 0;
}

/// Finds the processor of a cache, for a walk over all of them.
auto processorOf(CPUObjFactory* factory, const CMPIObjectPath* cop, CMPIStatus* status) {
  return [=](CMPIString* key, Instances& processors) {
    return factory->getProcessorRefByMemoryHandle(broker, cop, key, nullptr, true, processors, status);
  };
}

}  // namespace

unsigned short CPUAssociatedCacheMemoryCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                     std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCaches();
  if (coresAreKnown(factory)) {
    events.providerExit();
    return 0;
  }
  const auto link = [&, function = __func__](const CMPIObjectPath* path, const CMPIObjectPath* cache,
                                             const CMPIObjectPath* processor) {
    return appendCacheAssociation(association, factory, path, cache, processor, properties, instances, &status,
                                  __builtin_LINE(), function);
  };
  const bool complete =
      forEachPair(association, factory, cop, &status, caches, instanceTexts, processorOf(factory, cop, &status), link);
  events.providerExit();
  return complete ? 0 : 1;
}

CMPIStatus CPUAssociatedCacheMemory_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                  const CMPIResult* result, const CMPIObjectPath* cop,
                                                  const char** properties) {
  events.providerEntry();
  Instances instances;
  if (CPUAssociatedCacheMemoryCMPIInstances(cop, properties, instances) == 0) {
    deliver(result, instances);
  }
  CMReturnDone(result);
  events.providerExit();
  return succeeded();
}

CMPIStatus CPUAssociatedCacheMemory_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                      const CMPIResult* result, const CMPIObjectPath* cop) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCaches();
  if (!coresAreKnown(factory)) {
    forEachPair(association, factory, cop, &status, caches, nameTexts, processorOf(factory, cop, &status),
                deliverName(association, result));
  }
  events.providerExit();
  CMReturnDone(result);
  return status;
}

CMPIStatus CPUAssociatedCacheMemory_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* cop,
                                                const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  Instances instances;
  if (!lacksKeys(association, cop, &status) && CPUAssociatedCacheMemoryCMPIInstances(cop, properties, instances) == 0) {
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

CMPIStatus CPUAssociatedCacheMemory_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* cop,
                                                const char* assocClass, const char* resultClass, const char* /*role*/,
                                                const char* /*resultRole*/, const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCaches();
  if (coresAreKnown(factory)) {
    events.providerExit();
    return status;
  }
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    fail(association, &status, "Object Path is NULL in Associators.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, properties, false, &status}, directions,
                   {"***Can't get Processor instances related to Memory.                 Exiting Associators***",
                    "***Can't get Memory instances related to Processor.                 Exiting Associators***"},
                   related)) {
    return status;
  }
  deliver(result, related.elements);
  events.providerExit();
  return status;
}

CMPIStatus CPUAssociatedCacheMemory_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                    const CMPIResult* result, const CMPIObjectPath* cop,
                                                    const char* assocClass, const char* resultClass,
                                                    const char* /*role*/, const char* /*resultRole*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCaches();
  if (coresAreKnown(factory)) {
    events.providerExit();
    return status;
  }
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    fail(association, &status, "Object Path is NULL in AssociatorNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, nullptr, true, &status}, directions,
                   {"***Can't get processor ObjPaths related to Processor.                 Exiting AssociatorNames***",
                    "***Can't get Memory ObjectPaths related to Processor.                 Exiting AssociatorNames***"},
                   related)) {
    return status;
  }
  deliverStampedPathsOf(result, related.elements, cop);
  events.providerExit();
  return status;
}

CMPIStatus CPUAssociatedCacheMemory_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                               const CMPIResult* result, const CMPIObjectPath* cop,
                                               const char* /*resultClass*/, const char* /*role*/,
                                               const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCaches();
  if (coresAreKnown(factory)) {
    events.providerExit();
    return status;
  }
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    fail(association, &status, "Object Path is NULL in References.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, properties, false, &status}, directions,
                   {"***Can't get Processor instances                 Exiting References***",
                    "***Can't get Memory instances.                 Exiting References***"},
                   related)) {
    return status;
  }
  forEachReference(
      association, {cop, templatePath, properties, cacheAssociationKeys}, related,
      [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) { CMReturnInstance(result, reference); });
  events.providerExit();
  return status;
}

CMPIStatus CPUAssociatedCacheMemory_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                   const CMPIResult* result, const CMPIObjectPath* cop,
                                                   const char* /*resultClass*/, const char* /*role*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCaches();
  if (coresAreKnown(factory)) {
    events.providerExit();
    return status;
  }
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    fail(association, &status, "Object Path is NULL in ReferenceNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, nullptr, true, &status}, directions,
                   {"***Can't get Processor ObjPaths.                 Exiting ReferenceNames***",
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
    "instanceCPUAssociatedCacheMemoryProvider",
    entry<CPUAssociatedCacheMemory_Cleanup, broker>,
    entry<CPUAssociatedCacheMemory_EnumInstanceNames, broker>,
    entry<CPUAssociatedCacheMemory_EnumInstances, broker>,
    entry<CPUAssociatedCacheMemory_GetInstance, broker>,
    entry<CPUAssociatedCacheMemory_CreateInstance, broker>,
    entry<CPUAssociatedCacheMemory_ModifyInstance, broker>,
    entry<CPUAssociatedCacheMemory_DeleteInstance, broker>,
    entry<CPUAssociatedCacheMemory_ExecQuery, broker>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUAssociatedCacheMemoryProvider",
    entry<CPUAssociatedCacheMemory_AssociationCleanup, broker>,
    entry<CPUAssociatedCacheMemory_Associators, broker>,
    entry<CPUAssociatedCacheMemory_AssociatorNames, broker>,
    entry<CPUAssociatedCacheMemory_References, broker>,
    entry<CPUAssociatedCacheMemory_ReferenceNames, broker>,
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
