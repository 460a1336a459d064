#include "Navigation.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUEleCap = "Corvane.CPUElementCapabilitiesProvider";
static constexpr EventLog events{loggerCPUEleCap, "CPUElementCapabilitiesProvider.cpp", LevelInfo};

// The keys that property lists are filtered with are another association's: what clients receive depends on
// them, so they stay.
static const Association association{events,
                                     broker,
                                     cpuElementCapClass,
                                     {"ManagedElement", cpuProcessorClass},
                                     {"Capabilities", cpuProcessorCapClass},
                                     {"Antecedent", "Dependent", nullptr}};

CORVANE_REFUSED_OPERATIONS(CPUElementCapabilities)
CORVANE_ASSOCIATION_CLEANUP(CPUElementCapabilities)

namespace {

constexpr PairWalk capabilitiesOfProcessors{
    .nearClass = cpuProcessorClass,
    .nearPaths = &CPUObjFactory::getAllCPUProcCMPIObjPaths,
    .expectedNear = &CPUObjFactory::getNumberOfProcInstances,
    .key = "DeviceID",
    .farElements = related<&CPUObjFactory::getProcessorCapRefByProcHandle>,
};

constexpr FailureTexts nullProcessor{"CMPIObjectPath is                 NULL for Processor",
                                     "CMPIObjectPath is NULL for Processor"};
constexpr FailureTexts nullCapabilities{"CMPIObjectPath is                     NULL for ProcessorCapabilities",
                                        "CMPIObjectPath is NULL for ProcessorCapabilities"};
constexpr FailureTexts noAssociationPath{"Create CMPIObjectPath failed for ElementCapabilities",
                                         "Create CMPIObjectPath failed for ElementCapabilities."};

constexpr WalkTexts instanceTexts{
    "***Can't get ElementCapabilities ObjectPaths.             Exiting EnumerateInstanceNames***", nullProcessor,
    "***Can't get ObjectPaths for EnabledLogicalElementCap.                 Exiting EnumerateInstanceNames***",
    nullCapabilities, noAssociationPath};

constexpr WalkTexts nameTexts{"getAllCPUProcCMPIObjPaths Failed", nullProcessor,
                              "getProcessorCapRefByProcHandle Failed for DeviceId", nullCapabilities,
                              noAssociationPath};

constexpr Direction directions[] = {{cpuProcessorCapClass, "DeviceID", &CPUObjFactory::getNumberOfProcInstances,
                                     related<&CPUObjFactory::getProcessorCapRefByProcHandle>},
                                    {cpuProcessorClass, "InstanceID", &CPUObjFactory::getNumberOfProcInstances,
                                     related<&CPUObjFactory::getProcessorRefByProcCapHandle>}};
constexpr DirectionTexts silently = {nullptr, nullptr};

CPUObjFactory* factoryOfProcessors() {
  return CPUObjFactory::getFactoryInstance(true, false, false);
}

}  // namespace

unsigned short ElementCapabilitiesCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  const bool complete =
      forEachPair(association, capabilitiesOfProcessors, instanceTexts,
                  {factoryOfProcessors(), cop, &status, properties}, collectPairs(association, properties, instances));
  events.providerExit();
  return complete ? 0 : 1;
}

CMPIStatus CPUElementCapabilities_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                const CMPIResult* result, const CMPIObjectPath* cop,
                                                const char** properties) {
  events.providerEntry();
  Instances instances;
  if (ElementCapabilitiesCMPIInstances(cop, properties, instances) == 0) {
    deliver(result, instances);
  }
  events.providerExit();
  CMReturnDone(result);
  return succeeded();
}

CMPIStatus CPUElementCapabilities_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                                    const CMPIResult* result, const CMPIObjectPath* cop) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  forEachPair(association, capabilitiesOfProcessors, nameTexts, {factoryOfProcessors(), cop, &status},
              deliverName(association, result));
  events.providerExit();
  CMReturnDone(result);
  return status;
}

CMPIStatus CPUElementCapabilities_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* /*context*/,
                                              const CMPIResult* result, const CMPIObjectPath* cop,
                                              const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  Instances instances;
  if (!lacksKeys(association, cop, &status) && ElementCapabilitiesCMPIInstances(cop, properties, instances) == 0) {
    deliverMatch(result, instances, [&](const CMPIObjectPath* path) { return isObjPathsEqual(cop, path, true); });
  }
  events.providerExit();
  CMReturnDone(result);
  return status;
}

// The association operations never call CMReturnDone, and leave a NULL target to the status that the
// target-class lookup set.

CMPIStatus CPUElementCapabilities_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                              const CMPIResult* result, const CMPIObjectPath* cop,
                                              const char* assocClass, const char* resultClass, const char* /*role*/,
                                              const char* /*resultRole*/, const char** properties) {
  events.providerEntry();
  Navigation navigation(association, factoryOfProcessors(), cop);
  if (!navigation.findTarget(assocClass, resultClass, {nullptr, "Object Path is NULL in Associations."}) ||
      !navigation.findElements(directions, properties, false, silently)) {
    return navigation.status;
  }
  deliver(result, navigation.elements);
  events.providerExit();
  return navigation.status;
}

CMPIStatus CPUElementCapabilities_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                  const CMPIResult* result, const CMPIObjectPath* cop,
                                                  const char* assocClass, const char* resultClass, const char* /*role*/,
                                                  const char* /*resultRole*/) {
  events.providerEntry();
  Navigation navigation(association, factoryOfProcessors(), cop);
  if (!navigation.findTarget(assocClass, resultClass, {nullptr, "Object Path is NULL in AssociatorNames."}) ||
      !navigation.findElements(directions, nullptr, true, silently)) {
    return navigation.status;
  }
  deliverPathsOf(result, navigation.elements);
  events.providerExit();
  return navigation.status;
}

CMPIStatus CPUElementCapabilities_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                             const CMPIResult* result, const CMPIObjectPath* cop,
                                             const char* /*resultClass*/, const char* /*role*/,
                                             const char** /*properties*/) {
  events.providerEntry();
  Navigation navigation(association, factoryOfProcessors(), cop);
  if (!navigation.findTargetOfReferences({nullptr, "Object Path is NULL in References."}) ||
      !navigation.findElements(directions, nullptr, true, silently)) {
    return navigation.status;
  }
  navigation.forEachReference(
      [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) { CMReturnInstance(result, reference); });
  events.providerExit();
  return navigation.status;
}

CMPIStatus CPUElementCapabilities_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                 const CMPIResult* result, const CMPIObjectPath* cop,
                                                 const char* /*resultClass*/, const char* /*role*/) {
  events.providerEntry();
  Navigation navigation(association, factoryOfProcessors(), cop);
  if (!navigation.findTargetOfReferences({nullptr, "Object Path is NULL in ReferenceNames."}) ||
      !navigation.findElements(directions, nullptr, true, silently)) {
    return navigation.status;
  }
  navigation.forEachReference([&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) {
    CMPIObjectPath* path = pathOf(reference);
    if (!isNull(path)) {
      CMSetNameSpace(path, namespaceOf(cop));
      CMReturnObjectPath(result, path);
    }
  });
  events.providerExit();
  return navigation.status;
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUElementCapabilitiesProvider",
    entry<CPUElementCapabilities_Cleanup, association>,
    entry<CPUElementCapabilities_EnumInstanceNames, association>,
    entry<CPUElementCapabilities_EnumInstances, association>,
    entry<CPUElementCapabilities_GetInstance, association>,
    entry<CPUElementCapabilities_CreateInstance, association>,
    entry<CPUElementCapabilities_ModifyInstance, association>,
    entry<CPUElementCapabilities_DeleteInstance, association>,
    entry<CPUElementCapabilities_ExecQuery, association>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUElementCapabilitiesProvider",
    entry<CPUElementCapabilities_AssociationCleanup, association>,
    entry<CPUElementCapabilities_Associators, association>,
    entry<CPUElementCapabilities_AssociatorNames, association>,
    entry<CPUElementCapabilities_References, association>,
    entry<CPUElementCapabilities_ReferenceNames, association>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUElementCapabilitiesProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                                  const CMPIContext* /*context*/,
                                                                                  CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}

CORVANE_EXPORTED CMPIAssociationMI* CPUElementCapabilitiesProvider_Create_AssociationMI(const CMPIBroker* caller,
                                                                                        const CMPIContext* /*context*/,
                                                                                        CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIAssociationMI mi = {nullptr, &assocMIFT__};
  return registerBroker(broker, caller, mi);
}
