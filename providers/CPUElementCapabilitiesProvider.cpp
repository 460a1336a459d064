#include "AssociationSteps.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUEleCap = "Corvane.CPUElementCapabilitiesProvider";
static constexpr EventLog events{loggerCPUEleCap, "CPUElementCapabilitiesProvider.cpp", LevelInfo};

static const Association association{
    events, broker, cpuElementCapClass, {"ManagedElement", cpuProcessorClass}, {"Capabilities", cpuProcessorCapClass}};
// Not this association's own references: property lists have always been filtered with these.
static const char* filterKeys[] = {"Antecedent", "Dependent", nullptr};

CORVANE_REFUSED_OPERATIONS(CPUElementCapabilities)
CORVANE_ASSOCIATION_CLEANUP(CPUElementCapabilities)

namespace {

constexpr NearEnds processors{cpuProcessorClass, &CPUObjFactory::getAllCPUProcCMPIObjPaths,
                              &CPUObjFactory::getNumberOfProcInstances, "DeviceID"};

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

CPUObjFactory* factoryOfProcessors() {
  return CPUObjFactory::getFactoryInstance(true, false, false);
}

/// Finds the capabilities of a processor, for a walk over all of them.
auto capabilitiesOf(CPUObjFactory* factory, const CMPIObjectPath* cop, const char** properties, CMPIStatus* status) {
  return [=](CMPIString* key, Instances& capabilities) {
    return factory->getProcessorCapRefByProcHandle(broker, cop, key, properties, capabilities, status);
  };
}

/// The processor of capabilities, or the capabilities of a processor. False when the navigation failed.
bool findRelated(CPUObjFactory* factory, const CMPIObjectPath* cop, const CMPIObjectPath* target,
                 const char** properties, FarEnds& related, CMPIStatus* status) {
  const std::string_view targetClass = classNameOf(target);
  related.areFirst = targetClass == association.first.objectClass;
  related.elements.reserve(factory->getNumberOfProcInstances());
  if (targetClass == cpuProcessorCapClass) {
    return factory->getProcessorCapRefByProcHandle(broker, target, stringKey(cop, "DeviceID"), properties,
                                                   related.elements, status) == 0;
  }
  if (targetClass == cpuProcessorClass) {
    return factory->getProcessorRefByProcCapHandle(broker, target, stringKey(cop, "InstanceID"), properties,
                                                   related.elements, status) == 0;
  }
  return true;
}

}  // namespace

unsigned short ElementCapabilitiesCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const bool complete = forEachPair(association, factory, cop, &status, processors, instanceTexts,
                                    capabilitiesOf(factory, cop, properties, &status),
                                    collectPairs(association, properties, filterKeys, instances));
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
  CPUObjFactory* factory = factoryOfProcessors();
  forEachPair(association, factory, cop, &status, processors, nameTexts, capabilitiesOf(factory, cop, nullptr, &status),
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
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    events.message(LevelError, "Object Path is NULL in Associations.");
    return status;
  }
  FarEnds related;
  if (!findRelated(factory, cop, target, properties, related, &status)) {
    return status;
  }
  deliver(result, related.elements);
  events.providerExit();
  return status;
}

CMPIStatus CPUElementCapabilities_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                  const CMPIResult* result, const CMPIObjectPath* cop,
                                                  const char* assocClass, const char* resultClass, const char* /*role*/,
                                                  const char* /*resultRole*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    events.message(LevelError, "Object Path is NULL in AssociatorNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(factory, cop, target, nullptr, related, &status)) {
    return status;
  }
  deliverPathsOf(result, related.elements);
  events.providerExit();
  return status;
}

CMPIStatus CPUElementCapabilities_References(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                             const CMPIResult* result, const CMPIObjectPath* cop,
                                             const char* /*resultClass*/, const char* /*role*/,
                                             const char** /*properties*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    events.message(LevelError, "Object Path is NULL in References.");
    return status;
  }
  FarEnds related;
  if (!findRelated(factory, cop, target, nullptr, related, &status)) {
    return status;
  }
  forEachReference(
      association, {cop, templatePath}, related,
      [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) { CMReturnInstance(result, reference); });
  events.providerExit();
  return status;
}

CMPIStatus CPUElementCapabilities_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* /*context*/,
                                                 const CMPIResult* result, const CMPIObjectPath* cop,
                                                 const char* /*resultClass*/, const char* /*role*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    events.message(LevelError, "Object Path is NULL in ReferenceNames.");
    return status;
  }
  FarEnds related;
  if (!findRelated(factory, cop, target, nullptr, related, &status)) {
    return status;
  }
  forEachReference(association, {cop, templatePath}, related,
                   [&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) {
                     CMPIObjectPath* path = pathOf(reference);
                     if (!isNull(path)) {
                       CMSetNameSpace(path, namespaceOf(cop));
                       CMReturnObjectPath(result, path);
                     }
                   });
  events.providerExit();
  return status;
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUElementCapabilitiesProvider",
    entry<CPUElementCapabilities_Cleanup, broker>,
    entry<CPUElementCapabilities_EnumInstanceNames, broker>,
    entry<CPUElementCapabilities_EnumInstances, broker>,
    entry<CPUElementCapabilities_GetInstance, broker>,
    entry<CPUElementCapabilities_CreateInstance, broker>,
    entry<CPUElementCapabilities_ModifyInstance, broker>,
    entry<CPUElementCapabilities_DeleteInstance, broker>,
    entry<CPUElementCapabilities_ExecQuery, broker>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUElementCapabilitiesProvider",
    entry<CPUElementCapabilities_AssociationCleanup, broker>,
    entry<CPUElementCapabilities_Associators, broker>,
    entry<CPUElementCapabilities_AssociatorNames, broker>,
    entry<CPUElementCapabilities_References, broker>,
    entry<CPUElementCapabilities_ReferenceNames, broker>,
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
