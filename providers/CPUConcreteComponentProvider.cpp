#include "AssociationSteps.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUConcrete = "Corvane.CPUConcreteComponentProvider";
static constexpr EventLog events{loggerCPUConcrete, "CPUConcreteComponentProvider.cpp", LevelInfo};

static const Association association{events,
                                     broker,
                                     cpuConcreteComponentClass,
                                     {"GroupComponent", cpuProcessorClass},
                                     {"PartComponent", cpuProcessorCoreClass}};
static const char* filterKeys[] = {"GroupComponent", "PartComponent", nullptr};

CORVANE_REFUSED_OPERATIONS(CPUConcreteComponent)
CORVANE_ASSOCIATION_CLEANUP(CPUConcreteComponent)

namespace {

constexpr NearEnds processors{cpuProcessorClass, &CPUObjFactory::getAllCPUProcCMPIObjPaths,
                              &CPUObjFactory::getNumberOfProcInstances, "DeviceID",
                              &CPUObjFactory::getNumberOfProcCoreInstances};

constexpr WalkTexts instanceTexts{
    "***Can't get ConcreteComponent ObjectPaths.             Exiting EnumerateInstanceNames***",
    {nullptr, "CMPIObjectPath is NULL for Processor"},
    "***Can't get ObjectPaths for Processor Cores.             Exiting EnumerateInstanceNames***",
    {nullptr, "CMPIObjectPath is NULL for Processors"},
    {nullptr, "Create CMPIObjectPath failed for ConcreteComponent."}};

constexpr WalkTexts nameTexts{
    "getAllCPUProcCMPIObjPaths Failed",
    {"CMPIObjectPath is                 NULL for Processor", "CMPIObjectPath is NULL for Processor"},
    "Can't get ObjectPaths for Processor Core",
    {"CMPIObjectPath is                     NULL for Processor Cores", "CMPIObjectPath is NULL for Processor Cores"},
    {"Create CMPIObjectPath failed for ConcreteComponent", "Create CMPIObjectPath failed for ConcreteComponent"}};

constexpr Direction directions[] = {{cpuProcessorClass, "InstanceID", &CPUObjFactory::getNumberOfProcInstances,
                                     &CPUObjFactory::getProcessorRefByProcCoreHandle},
                                    {cpuProcessorCoreClass, "DeviceID", &CPUObjFactory::getNumberOfProcCoreInstances,
                                     &CPUObjFactory::getProcessorCoreRefByProcHandle}};
// The second names the function of the other direction, and always has.
constexpr const char* navigationFailures[] = {"getProcessorRefByProcCoreHandle Failed for InstanceID",
                                              "getProcessorRefByProcCoreHandle Failed for DeviceID"};

CPUObjFactory* factoryOfProcessorsAndCores() {
  return CPUObjFactory::getFactoryInstance(true, false, true);
}

/// Finds the cores of a processor, for a walk over all of them.
auto coresOf(CPUObjFactory* factory, const CMPIObjectPath* cop, CMPIStatus* status) {
  return [=](CMPIString* key, Instances& cores) {
    return factory->getProcessorCoreRefByProcHandle(broker, cop, key, nullptr, true, cores, status);
  };
}

}  // namespace

unsigned short ConcreteComponentCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                              std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCores();
  const bool complete =
      forEachPair(association, factory, cop, &status, processors, instanceTexts, coresOf(factory, cop, &status),
                  collectPairs(association, properties, filterKeys, instances));
  events.providerExit();
  return complete ? 0 : 1;
}

CMPIStatus CPUConcreteComponent_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                              const CMPIResult* result, const CMPIObjectPath* cop,
                                              const char** properties) {
  events.providerEntry();
  Instances instances;
  if (ConcreteComponentCMPIInstances(cop, properties, instances) == 0) {
    deliver(result, instances);
  }
  events.providerExit();
  CMReturnDone(result);
  return succeeded();
}

CMPIStatus CPUConcreteComponent_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                  const CMPIResult* result, const CMPIObjectPath* cop) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCores();
  forEachPair(association, factory, cop, &status, processors, nameTexts, coresOf(factory, cop, &status),
              deliverName(association, result));
  events.providerExit();
  CMReturnDone(result);
  return status;
}

CMPIStatus CPUConcreteComponent_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                            const CMPIResult* result, const CMPIObjectPath* cop,
                                            const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  Instances instances;
  if (!lacksKeys(association, cop, &status) && ConcreteComponentCMPIInstances(cop, properties, instances) == 0) {
    deliverMatch(result, instances, [&](const CMPIObjectPath* path) { return isObjPathsEqual(cop, path, true); });
  }
  events.providerExit();
  CMReturnDone(result);
  return status;
}

// The association operations never call CMReturnDone, and leave a NULL target to the status that the
// target-class lookup set.

CMPIStatus CPUConcreteComponent_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                            const CMPIResult* result, const CMPIObjectPath* cop, const char* assocClass,
                                            const char* resultClass, const char* /*role*/, const char* /*resultRole*/,
                                            const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCores();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    events.message(LevelError, "Object Path is NULL in Associations.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, properties, false, &status}, directions, navigationFailures,
                   related)) {
    return status;
  }
  deliver(result, related.elements);
  events.providerExit();
  return status;
}

CMPIStatus CPUConcreteComponent_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* cop,
                                                const char* assocClass, const char* resultClass, const char* /*role*/,
                                                const char* /*resultRole*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCores();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    events.message(LevelError, "Object Path is NULL in AssociatorNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, nullptr, true, &status}, directions, navigationFailures,
                   related)) {
    return status;
  }
  deliverPathsOf(result, related.elements);
  events.providerExit();
  return status;
}

CMPIStatus CPUConcreteComponent_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                           const CMPIResult* result, const CMPIObjectPath* cop,
                                           const char* /*resultClass*/, const char* /*role*/, const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCores();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    events.message(LevelError, "Object Path is NULL in References.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, nullptr, true, &status}, directions, navigationFailures,
                   related)) {
    return status;
  }
  forEachReference(
      association, {cop, templatePath, properties, filterKeys}, related,
      [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) { CMReturnInstance(result, reference); });
  events.providerExit();
  return status;
}

CMPIStatus CPUConcreteComponent_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                               const CMPIResult* result, const CMPIObjectPath* cop,
                                               const char* /*resultClass*/, const char* /*role*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessorsAndCores();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    events.message(LevelError, "Object Path is NULL in ReferenceNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(association, {factory, cop, target, nullptr, true, &status}, directions, navigationFailures,
                   related)) {
    return status;
  }
  forEachReference(association, {cop, templatePath, nullptr, filterKeys}, related,
                   [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) {
                     const CMPIObjectPath* path = pathOf(reference);
                     if (!isNull(path)) {
                       CMReturnObjectPath(result, path);
                     }
                   });
  events.providerExit();
  return status;
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUConcreteComponentProvider",
    entry<CPUConcreteComponent_Cleanup, broker>,
    entry<CPUConcreteComponent_EnumInstanceNames, broker>,
    entry<CPUConcreteComponent_EnumInstances, broker>,
    entry<CPUConcreteComponent_GetInstance, broker>,
    entry<CPUConcreteComponent_CreateInstance, broker>,
    entry<CPUConcreteComponent_ModifyInstance, broker>,
    entry<CPUConcreteComponent_DeleteInstance, broker>,
    entry<CPUConcreteComponent_ExecQuery, broker>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUConcreteComponentProvider",
    entry<CPUConcreteComponent_AssociationCleanup, broker>,
    entry<CPUConcreteComponent_Associators, broker>,
    entry<CPUConcreteComponent_AssociatorNames, broker>,
    entry<CPUConcreteComponent_References, broker>,
    entry<CPUConcreteComponent_ReferenceNames, broker>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUConcreteComponentProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                                const CMPIContext* /*context*/,
                                                                                CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}

CORVANE_EXPORTED CMPIAssociationMI* CPUConcreteComponentProvider_Create_AssociationMI(const CMPIBroker* caller,
                                                                                      const CMPIContext* /*context*/,
                                                                                      CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIAssociationMI mi = {nullptr, &assocMIFT__};
  return registerBroker(broker, caller, mi);
}
