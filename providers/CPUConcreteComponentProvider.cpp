#include "Navigation.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUConcrete = "Corvane.CPUConcreteComponentProvider";
static constexpr EventLog events{loggerCPUConcrete, "CPUConcreteComponentProvider.cpp", LevelInfo};

static const Association association{events,
                                     broker,
                                     cpuConcreteComponentClass,
                                     {"GroupComponent", cpuProcessorClass},
                                     {"PartComponent", cpuProcessorCoreClass}};

CORVANE_REFUSED_OPERATIONS(CPUConcreteComponent)
CORVANE_ASSOCIATION_CLEANUP(CPUConcreteComponent)

namespace {

constexpr PairWalk coresOfProcessors{
    .nearClass = cpuProcessorClass,
    .nearPaths = &CPUObjFactory::getAllCPUProcCMPIObjPaths,
    .expectedNear = &CPUObjFactory::getNumberOfProcInstances,
    .key = "DeviceID",
    .farElements = related<&CPUObjFactory::getProcessorCoreRefByProcHandle>,
    .expectedFar = &CPUObjFactory::getNumberOfProcCoreInstances,
};

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
    "Create CMPIObjectPath failed for ConcreteComponent"};

constexpr Direction directions[] = {{cpuProcessorClass, "InstanceID", &CPUObjFactory::getNumberOfProcInstances,
                                     related<&CPUObjFactory::getProcessorRefByProcCoreHandle>},
                                    {cpuProcessorCoreClass, "DeviceID", &CPUObjFactory::getNumberOfProcCoreInstances,
                                     related<&CPUObjFactory::getProcessorCoreRefByProcHandle>}};
// The second names the function of the other direction. Log filters match this text: do not correct it.
constexpr DirectionTexts navigationFailures = {"getProcessorRefByProcCoreHandle Failed for InstanceID",
                                               "getProcessorRefByProcCoreHandle Failed for DeviceID"};

CPUObjFactory* factoryOfProcessorsAndCores() {
  return CPUObjFactory::getFactoryInstance(true, false, true);
}

}  // namespace

unsigned short ConcreteComponentCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                              std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  const bool complete =
      forEachPair(association, coresOfProcessors, instanceTexts, {factoryOfProcessorsAndCores(), cop, &status},
                  collectPairs(association, properties, instances));
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
  forEachPair(association, coresOfProcessors, nameTexts, {factoryOfProcessorsAndCores(), cop, &status},
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
  Navigation navigation(association, factoryOfProcessorsAndCores(), cop);
  if (!navigation.findTarget(assocClass, resultClass, {nullptr, "Object Path is NULL in Associations."}) ||
      !navigation.findElements(directions, properties, false, navigationFailures)) {
    return navigation.status;
  }
  deliver(result, navigation.elements);
  events.providerExit();
  return navigation.status;
}

CMPIStatus CPUConcreteComponent_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* cop,
                                                const char* assocClass, const char* resultClass, const char* /*role*/,
                                                const char* /*resultRole*/) {
  events.providerEntry();
  Navigation navigation(association, factoryOfProcessorsAndCores(), cop);
  if (!navigation.findTarget(assocClass, resultClass, {nullptr, "Object Path is NULL in AssociatorNames."}) ||
      !navigation.findElements(directions, nullptr, true, navigationFailures)) {
    return navigation.status;
  }
  deliverPathsOf(result, navigation.elements);
  events.providerExit();
  return navigation.status;
}

CMPIStatus CPUConcreteComponent_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                           const CMPIResult* result, const CMPIObjectPath* cop,
                                           const char* /*resultClass*/, const char* /*role*/, const char** properties) {
  events.providerEntry();
  Navigation navigation(association, factoryOfProcessorsAndCores(), cop);
  if (!navigation.findTargetOfReferences({nullptr, "Object Path is NULL in References."}) ||
      !navigation.findElements(directions, nullptr, true, navigationFailures)) {
    return navigation.status;
  }
  navigation.filterReferences(properties);
  navigation.forEachReference(
      [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) { CMReturnInstance(result, reference); });
  events.providerExit();
  return navigation.status;
}

CMPIStatus CPUConcreteComponent_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                               const CMPIResult* result, const CMPIObjectPath* cop,
                                               const char* /*resultClass*/, const char* /*role*/) {
  events.providerEntry();
  Navigation navigation(association, factoryOfProcessorsAndCores(), cop);
  if (!navigation.findTargetOfReferences({nullptr, "Object Path is NULL in ReferenceNames."}) ||
      !navigation.findElements(directions, nullptr, true, navigationFailures)) {
    return navigation.status;
  }
  navigation.filterReferences(nullptr);
  navigation.forEachReference([&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) {
    const CMPIObjectPath* path = pathOf(reference);
    if (!isNull(path)) {
      CMReturnObjectPath(result, path);
    }
  });
  events.providerExit();
  return navigation.status;
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUConcreteComponentProvider",
    entry<CPUConcreteComponent_Cleanup, association>,
    entry<CPUConcreteComponent_EnumInstanceNames, association>,
    entry<CPUConcreteComponent_EnumInstances, association>,
    entry<CPUConcreteComponent_GetInstance, association>,
    entry<CPUConcreteComponent_CreateInstance, association>,
    entry<CPUConcreteComponent_ModifyInstance, association>,
    entry<CPUConcreteComponent_DeleteInstance, association>,
    entry<CPUConcreteComponent_ExecQuery, association>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUConcreteComponentProvider",
    entry<CPUConcreteComponent_AssociationCleanup, association>,
    entry<CPUConcreteComponent_Associators, association>,
    entry<CPUConcreteComponent_AssociatorNames, association>,
    entry<CPUConcreteComponent_References, association>,
    entry<CPUConcreteComponent_ReferenceNames, association>,
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
