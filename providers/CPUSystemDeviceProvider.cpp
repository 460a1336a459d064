#include <algorithm>

#include "AssociationSteps.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUSystemDevice = "Corvane.CPUSystemDeviceProvider";
static constexpr EventLog events{loggerCPUSystemDevice, "CPUSystemDeviceProvider.cpp", LevelInfo};

static const Association association{events,
                                     broker,
                                     cpuSystemDeviceClass,
                                     {"GroupComponent", computerSystemClass},
                                     {"PartComponent", cpuProcessorClass}};
static const char* filterKeys[] = {"GroupComponent", "PartComponent", nullptr};

CORVANE_REFUSED_OPERATIONS(CPUSystemDevice)
CORVANE_ASSOCIATION_CLEANUP(CPUSystemDevice)

namespace {

CPUObjFactory* factoryOfProcessors() {
  return CPUObjFactory::getFactoryInstance(true, false, false);
}

// The computer system is another provider's: its names and instances come from the broker. Brokers
// answer a failed call with a failing status, and then with an enumeration or without one. The static is
// read before the up-call: during it, a registration may write it.

/// Logs and returns false when the broker's answer is a failure.
bool answered(const CMPIStatus& status, unsigned int line = __builtin_LINE(),
              const char* function = __builtin_FUNCTION()) {
  if (status.rc == CMPI_RC_OK) {
    return true;
  }
  events.message(LevelError, "Call to CBEnumInstances of target Class Failed.", line, function);
  return false;
}

CMPIEnumeration* enumerateSystemNames(const CMPIContext* context, const CMPIObjectPath* systemClass,
                                      CMPIStatus* status) {
  return upCall([&, caller = broker] { return CBEnumInstanceNames(caller, context, systemClass, status); });
}

CMPIEnumeration* enumerateSystems(const CMPIContext* context, const CMPIObjectPath* systemClass, CMPIStatus* status) {
  return upCall([&, caller = broker] { return CBEnumInstances(caller, context, systemClass, nullptr, status); });
}

/// Hands each element of an enumeration, an instance or a path, to `handle`, until that returns false. What
/// the broker fails to give is left out; one that has given nothing for very long would never come to the end,
/// and is not asked on.
template <class Element, class Handle>
bool forEach(const CMPIEnumeration* enumeration, Element* CMPIValue::*kind, Handle handle,
             const char* function = __builtin_FUNCTION()) {
  constexpr int patience = 1000;
  if (isNull(enumeration)) {
    return true;
  }
  int callsInVain = 0;
  while (CMHasNext(enumeration, nullptr) != 0) {
    const CMPIData data = CMGetNext(enumeration, nullptr);
    if (hasValue(data) && !isNull(data.value.*kind)) {
      callsInVain = 0;
      if (!handle(data.value.*kind)) {
        return false;
      }
    } else if (++callsInVain == patience) {
      events.message(LevelError, "1000 calls in a row gave no computer system: the enumeration is given up",
                     __builtin_LINE(), function);
      break;
    }
  }
  return true;
}

/// Whether a request's result class leaves room for elements of the target class: it names that class or
/// its parent.
bool leavesRoomFor(std::string_view targetClass, const char* resultClass) {
  struct Row {
    std::string_view targetClass;
    std::string_view parent;
  };
  constexpr Row rows[] = {{computerSystemClass, "CIM_ComputerSystem"}, {cpuProcessorClass, "CIM_Processor"}};
  const Row* row = std::ranges::find(rows, targetClass, &Row::targetClass);
  return resultClass == nullptr || row == std::end(rows) || equalIgnoringCase(resultClass, row->targetClass) ||
         equalIgnoringCase(resultClass, row->parent);
}

/// Traced under the call that yields it, which is what this variable has always been called.
std::string_view tracedClassOf(const CMPIObjectPath* target, unsigned int line = __builtin_LINE(),
                               const char* function = __builtin_FUNCTION()) {
  const char* name = classNameOf(target);
  events.variable("((targetClass)->ft->getCharPtr((targetClass),(&rc)))", name, line, function);
  return name;
}

/// Hands every pair of a computer system and a processor to `link`, as a new path of the association and
/// the paths of its two ends, until that returns false.
/// The status is the broker's when its answer was a failure. False when the walk did not reach its end.
template <class Link>
bool forEachPair(const CMPIObjectPath* cop, const CMPIContext* context, CMPIStatus* status,
                 const FailureTexts& nullProcessor, const FailureTexts& noAssociationPath, Link link,
                 const char* function = __builtin_FUNCTION()) {
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* systemClass = CMNewObjectPath(broker, namespaceOf(cop), computerSystemClass, nullptr);
  if (isNull(systemClass)) {
    fail(association, status,
         FailureTexts{"Create CMPIObjectPath failed.", "Create CMPIObjectPath failed for ComputerSystemClass."},
         __builtin_LINE(), function);
    return false;
  }
  const CMPIEnumeration* systems = enumerateSystemNames(context, systemClass, status);
  if (!answered(*status, __builtin_LINE(), function)) {
    return false;
  }
  const auto linkProcessors = [&](const CMPIObjectPath* system) {
    Paths processors;
    processors.reserve(factory->getNumberOfProcInstances());
    if (factory->getAllCPUProcCMPIObjPaths(broker, cop, processors, status) != 0) {
      events.message(LevelError, "getAllCPUProcCMPIObjPaths Failed", __builtin_LINE(), function);
      return false;
    }
    for (CMPIObjectPath* processor : counted(processors)) {
      if (isNull(processor)) {
        fail(association, status, nullProcessor, __builtin_LINE(), function);
        return false;
      }
      stampPath(processor, cop);
      CMPIObjectPath* path = newAssociationPath(association, cop);
      if (isNull(path)) {
        fail(association, status, noAssociationPath, __builtin_LINE(), function);
        return false;
      }
      if (!link(path, system, processor)) {
        return false;
      }
    }
    return true;
  };
  return forEach(systems, &CMPIValue::ref, linkProcessors, function);
}

}  // namespace

unsigned short CPUSystemDeviceCMPIInstances(const CMPIObjectPath* cop, const char** properties, const CMPIContext* ctx,
                                            std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  const bool complete = forEachPair(
      cop, ctx, &status,
      {"CMPIObjectPath is                     NULL for CPUProcessor", "CMPIObjectPath is NULL for CPUProcessor"},
      // The words of another association, as they have always been.
      {"Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory",
       "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory."},
      collectPairs(association, properties, filterKeys, instances));
  events.providerExit();
  return complete ? 0 : 1;
}

CMPIStatus CPUSystemDevice_EnumInstances(CMPIInstanceMI* /*mi*/, const CMPIContext* context, const CMPIResult* result,
                                         const CMPIObjectPath* cop, const char** properties) {
  events.providerEntry();
  Instances instances;
  if (CPUSystemDeviceCMPIInstances(cop, properties, context, instances) == 0) {
    deliver(result, instances);
  }
  CMReturnDone(result);
  events.providerExit();
  return succeeded();
}

CMPIStatus CPUSystemDevice_EnumInstanceNames(CMPIInstanceMI* /*mi*/, const CMPIContext* context,
                                             const CMPIResult* result, const CMPIObjectPath* cop) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  forEachPair(cop, context, &status,
              {"CMPIObjectPath is NULL for CPUProcessor", "CMPIObjectPath is NULL for CPUProcessor"},
              {"Create CMPIObjectPath failed for                     cpuSystemDeviceClass.",
               "Create CMPIObjectPath failed for                     cpuSystemDeviceClass."},
              deliverName(association, result));
  events.providerExit();
  CMReturnDone(result);
  return status;
}

CMPIStatus CPUSystemDevice_GetInstance(CMPIInstanceMI* /*mi*/, const CMPIContext* context, const CMPIResult* result,
                                       const CMPIObjectPath* cop, const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  Instances instances;
  if (!lacksKeys(association, cop, &status) && CPUSystemDeviceCMPIInstances(cop, properties, context, instances) == 0) {
    deliverMatch(result, instances, [&](const CMPIObjectPath* path) { return isObjPathsEqual(cop, path, true); });
  }
  CMReturnDone(result);
  events.providerExit();
  return status;
}

// The association operations never call CMReturnDone.

CMPIStatus CPUSystemDevice_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* context, const CMPIResult* result,
                                       const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                       const char* /*role*/, const char* /*resultRole*/, const char** properties) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    events.providerExit();
    return succeeded();
  }
  const std::string_view targetClass = tracedClassOf(target);
  if (!leavesRoomFor(targetClass, resultClass)) {
    events.providerExit();
    return succeeded();
  }
  if (targetClass == computerSystemClass) {
    const CMPIEnumeration* systems = enumerateSystems(context, target, &status);
    if (!answered(status)) {
      return status;
    }
    forEach(systems, &CMPIValue::inst, [&](const CMPIInstance* system) {
      CMReturnInstance(result, system);
      return true;
    });
  } else if (targetClass == cpuProcessorClass) {
    Instances processors;
    processors.reserve(factory->getNumberOfProcInstances());
    if (factory->getAllCPUProcCMPIInstances(broker, target, properties, false, processors, &status) != 0) {
      events.message(LevelError, "***Can't get Processor ObjectPaths.                 Exiting Associators***");
    } else {
      deliver(result, processors);
    }
  }
  events.providerExit();
  return status;
}

CMPIStatus CPUSystemDevice_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* context,
                                           const CMPIResult* result, const CMPIObjectPath* cop, const char* assocClass,
                                           const char* resultClass, const char* /*role*/, const char* /*resultRole*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, assocClass, resultClass, &status);
  if (isNull(target)) {
    events.providerExit();
    return succeeded();
  }
  const std::string_view targetClass = tracedClassOf(target);
  if (!leavesRoomFor(targetClass, resultClass)) {
    events.providerExit();
    return succeeded();
  }
  if (targetClass == computerSystemClass) {
    const CMPIEnumeration* systems = enumerateSystemNames(context, target, &status);
    if (!answered(status)) {
      return status;
    }
    forEach(systems, &CMPIValue::ref, [&](const CMPIObjectPath* system) {
      CMReturnObjectPath(result, system);
      return true;
    });
  } else if (targetClass == cpuProcessorClass) {
    Paths processors;
    processors.reserve(factory->getNumberOfProcInstances());
    if (factory->getAllCPUProcCMPIObjPaths(broker, target, processors, &status) != 0) {
      events.message(LevelError, "***Can't get Processor ObjectPaths.                 Exiting AssociatorNames***");
    } else {
      deliver(result, processors);
    }
  }
  events.providerExit();
  return status;
}

namespace {

/// Hands the path at the far end of each of the request's associations to `link`, and whether it stands at
/// the association's first end. False, and the failure logged, when the far ends could not be had.
template <class Link>
bool forEachFarEnd(CPUObjFactory* factory, const CMPIObjectPath* cop, const CMPIContext* context,
                   const CMPIObjectPath* target, CMPIStatus* status, const char* noProcessors, Link link,
                   const char* function = __builtin_FUNCTION()) {
  const std::string_view targetClass = classNameOf(target);
  if (targetClass == cpuProcessorClass) {
    Paths processors;
    processors.reserve(factory->getNumberOfProcInstances());
    if (factory->getAllCPUProcCMPIObjPaths(broker, target, processors, status) != 0) {
      events.message(LevelError, noProcessors, __builtin_LINE(), function);
      return false;
    }
    for (CMPIObjectPath* processor : counted(processors)) {
      stampPath(processor, cop);
      link(processor, false);
    }
  } else if (targetClass == computerSystemClass) {
    const CMPIEnumeration* systems = enumerateSystemNames(context, target, status);
    if (!answered(*status, __builtin_LINE(), function)) {
      return false;
    }
    const auto linkSystem = [&](const CMPIObjectPath* system) {
      link(system, true);
      return true;
    };
    forEach(systems, &CMPIValue::ref, linkSystem, function);
  }
  return true;
}

}  // namespace

CMPIStatus CPUSystemDevice_References(CMPIAssociationMI* /*mi*/, const CMPIContext* context, const CMPIResult* result,
                                      const CMPIObjectPath* cop, const char* /*resultClass*/, const char* /*role*/,
                                      const char** /*properties*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    fail(association, &status, "Object Path is NULL in References.");
    return status;
  }
  const auto link = [&](const CMPIObjectPath* far, bool farIsFirst) {
    const CMPIInstance* reference = newReference(association, {cop, templatePath}, far, farIsFirst);
    if (!isNull(reference)) {
      CMReturnInstance(result, reference);
    }
  };
  if (forEachFarEnd(factory, cop, context, target, &status, "getAllCPUProcCMPIObjPaths Failed", link)) {
    events.providerExit();
  }
  return status;
}

CMPIStatus CPUSystemDevice_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* context,
                                          const CMPIResult* result, const CMPIObjectPath* cop,
                                          const char* /*resultClass*/, const char* /*role*/) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* target =
      factory->get_assoc_targetClass_ObjectPath(broker, cop, association.className, nullptr, &status);
  const CMPIObjectPath* templatePath = newAssociationPath(association, cop);
  if (isNull(target) || isNull(templatePath)) {
    fail(association, &status, "Object Path is NULL in ReferenceNames.");
    return status;
  }
  const auto link = [&](const CMPIObjectPath* far, bool farIsFirst) {
    deliverStampedPathOf(result, newReference(association, {cop, templatePath}, far, farIsFirst), cop);
  };
  if (forEachFarEnd(factory, cop, context, target, &status,
                    "***Can't get Processor instances                 Exiting References***", link)) {
    events.providerExit();
  }
  return status;
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUSystemDeviceProvider",
    entry<CPUSystemDevice_Cleanup, broker>,
    entry<CPUSystemDevice_EnumInstanceNames, broker>,
    entry<CPUSystemDevice_EnumInstances, broker>,
    entry<CPUSystemDevice_GetInstance, broker>,
    entry<CPUSystemDevice_CreateInstance, broker>,
    entry<CPUSystemDevice_ModifyInstance, broker>,
    entry<CPUSystemDevice_DeleteInstance, broker>,
    entry<CPUSystemDevice_ExecQuery, broker>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUSystemDeviceProvider",
    entry<CPUSystemDevice_AssociationCleanup, broker>,
    entry<CPUSystemDevice_Associators, broker>,
    entry<CPUSystemDevice_AssociatorNames, broker>,
    entry<CPUSystemDevice_References, broker>,
    entry<CPUSystemDevice_ReferenceNames, broker>,
};

}  // namespace Tarn::CPUProvider

CORVANE_EXPORTED CMPIInstanceMI* CPUSystemDeviceProvider_Create_InstanceMI(const CMPIBroker* caller,
                                                                           const CMPIContext* /*context*/,
                                                                           CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIInstanceMI mi = {nullptr, &instMIFT__};
  return registerBroker(broker, caller, mi);
}

CORVANE_EXPORTED CMPIAssociationMI* CPUSystemDeviceProvider_Create_AssociationMI(const CMPIBroker* caller,
                                                                                 const CMPIContext* /*context*/,
                                                                                 CMPIStatus* /*status*/) {
  using namespace Tarn::CPUProvider;
  static CMPIAssociationMI mi = {nullptr, &assocMIFT__};
  return registerBroker(broker, caller, mi);
}
