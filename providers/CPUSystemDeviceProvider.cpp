#include <algorithm>

#include "ComputerSystems.h"
#include "Navigation.h"

namespace Tarn::CPUProvider {

static const CMPIBroker* broker = nullptr;
static const std::string loggerCPUSystemDevice = "Corvane.CPUSystemDeviceProvider";
static constexpr EventLog events{loggerCPUSystemDevice, "CPUSystemDeviceProvider.cpp", LevelInfo};

static const Association association{events,
                                     broker,
                                     cpuSystemDeviceClass,
                                     {"GroupComponent", computerSystemClass},
                                     {"PartComponent", cpuProcessorClass}};

CORVANE_REFUSED_OPERATIONS(CPUSystemDevice)
CORVANE_ASSOCIATION_CLEANUP(CPUSystemDevice)

namespace {

CPUObjFactory* factoryOfProcessors() {
  return CPUObjFactory::getFactoryInstance(true, false, false);
}

/// All processors' paths; false, and `failure` logged, when the factory has none.
bool findProcessors(CPUObjFactory* factory, const CMPIObjectPath* ref, Paths& processors, CMPIStatus* status,
                    const char* failure, const char* function) {
  processors.reserve(factory->getNumberOfProcInstances());
  if (factory->getAllCPUProcCMPIObjPaths(broker, ref, processors, status) != 0) {
    events.message(LevelError, failure, __builtin_LINE(), function);
    return false;
  }
  return true;
}

/// What a walk says where it fails.
struct SystemWalkTexts {
  FailureTexts nullProcessor;
  FailureTexts noAssociationPath;
};

/// Hands every pair of a computer system and a processor to `link`, as a new path of the association and the
/// paths of its two ends, until that returns false. False when the walk did not reach its end; the status is
/// the broker's when its answer was a failure.
template <class Link>
bool forEachSystemAndProcessor(const CMPIObjectPath* cop, const CMPIContext* context, CMPIStatus* status,
                               const SystemWalkTexts& texts, Link link, const char* function = __builtin_FUNCTION()) {
  CPUObjFactory* factory = factoryOfProcessors();
  const CMPIObjectPath* systemClass = CMNewObjectPath(broker, namespaceOf(cop), computerSystemClass, nullptr);
  if (isNull(systemClass)) {
    fail(association, status,
         {"Create CMPIObjectPath failed.", "Create CMPIObjectPath failed for ComputerSystemClass."}, __builtin_LINE(),
         function);
    return false;
  }
  const auto linkProcessors = [&](const CMPIObjectPath* system) {
    Paths processors;
    if (!findProcessors(factory, cop, processors, status, "getAllCPUProcCMPIObjPaths Failed", function)) {
      return false;
    }
    for (CMPIObjectPath* processor : counted(processors)) {
      if (isNull(processor)) {
        fail(association, status, texts.nullProcessor, __builtin_LINE(), function);
        return false;
      }
      stampPath(processor, cop);
      CMPIObjectPath* path = newAssociationPath(association, cop);
      if (isNull(path)) {
        fail(association, status, texts.noAssociationPath, __builtin_LINE(), function);
        return false;
      }
      if (!link(path, system, processor)) {
        return false;
      }
    }
    return true;
  };
  return forEachSystemName(association, {context, systemClass, status}, linkProcessors, __builtin_LINE(), function);
}

}  // namespace

unsigned short CPUSystemDeviceCMPIInstances(const CMPIObjectPath* cop, const char** properties, const CMPIContext* ctx,
                                            std::vector<CMPIInstance*>& instances) {
  events.providerEntry();
  CMPIStatus status = succeeded();
  const bool complete = forEachSystemAndProcessor(
      cop, ctx, &status,
      // The second names another association. Clients and log filters match this text: do not correct it.
      {{"CMPIObjectPath is                     NULL for CPUProcessor", "CMPIObjectPath is NULL for CPUProcessor"},
       {"Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory",
        "Create CMPIObjectPath failed for                     cpuAssociatedCacheMemory."}},
      collectPairs(association, properties, instances));
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
  forEachSystemAndProcessor(cop, context, &status,
                            {"CMPIObjectPath is NULL for CPUProcessor",
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

namespace {

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

/// The operations that answer the far ends themselves. Each function delivers the elements of one class; false
/// ends the request without an exit mark.
template <class Systems, class Processors>
CMPIStatus answerFarEnds(const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                         Systems deliverSystems, Processors deliverProcessors, unsigned int line = __builtin_LINE(),
                         const char* function = __builtin_FUNCTION()) {
  events.providerEntry(line, function);
  Navigation navigation(association, factoryOfProcessors(), cop, line, function);
  if (!navigation.lookUpTarget(assocClass, resultClass)) {
    events.providerExit(line, function);
    return succeeded();
  }
  const std::string_view targetClass = classNameOf(navigation.target);
  // The variable bears the call that yields it. Log filters match this name.
  events.variable("((targetClass)->ft->getCharPtr((targetClass),(&rc)))", targetClass.data(), line, function);
  if (!leavesRoomFor(targetClass, resultClass)) {
    events.providerExit(line, function);
    return succeeded();
  }
  if (targetClass == computerSystemClass && !deliverSystems(navigation)) {
    return navigation.status;
  }
  if (targetClass == cpuProcessorClass) {
    deliverProcessors(navigation);
  }
  events.providerExit(line, function);
  return navigation.status;
}

}  // namespace

CMPIStatus CPUSystemDevice_Associators(CMPIAssociationMI* /*mi*/, const CMPIContext* context, const CMPIResult* result,
                                       const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                       const char* /*role*/, const char* /*resultRole*/, const char** properties) {
  const auto deliverSystems = [&, function = __func__](Navigation& navigation) {
    const auto deliverSystem = [&](const CMPIInstance* system) {
      CMReturnInstance(result, system);
      return true;
    };
    return forEachSystem(association, {context, navigation.target, &navigation.status}, deliverSystem, __builtin_LINE(),
                         function);
  };
  const auto deliverProcessors = [&, function = __func__](Navigation& navigation) {
    Instances processors;
    processors.reserve(navigation.factory->getNumberOfProcInstances());
    if (navigation.factory->getAllCPUProcCMPIInstances(broker, navigation.target, properties, false, processors,
                                                       &navigation.status) != 0) {
      events.message(LevelError, "***Can't get Processor ObjectPaths.                 Exiting Associators***",
                     __builtin_LINE(), function);
    } else {
      deliver(result, processors);
    }
  };
  return answerFarEnds(cop, assocClass, resultClass, deliverSystems, deliverProcessors);
}

CMPIStatus CPUSystemDevice_AssociatorNames(CMPIAssociationMI* /*mi*/, const CMPIContext* context,
                                           const CMPIResult* result, const CMPIObjectPath* cop, const char* assocClass,
                                           const char* resultClass, const char* /*role*/, const char* /*resultRole*/) {
  const auto deliverSystems = [&, function = __func__](Navigation& navigation) {
    const auto deliverSystem = [&](const CMPIObjectPath* system) {
      CMReturnObjectPath(result, system);
      return true;
    };
    return forEachSystemName(association, {context, navigation.target, &navigation.status}, deliverSystem,
                             __builtin_LINE(), function);
  };
  const auto deliverProcessors = [&, function = __func__](Navigation& navigation) {
    Paths processors;
    if (findProcessors(navigation.factory, navigation.target, processors, &navigation.status,
                       "***Can't get Processor ObjectPaths.                 Exiting AssociatorNames***", function)) {
      deliver(result, processors);
    }
  };
  return answerFarEnds(cop, assocClass, resultClass, deliverSystems, deliverProcessors);
}

namespace {

/// The operations that answer references. Hands the one to each far end to `deliverReference`; a far end that
/// could not be had ends the request without an exit mark.
template <class Deliver>
CMPIStatus answerReferences(const CMPIObjectPath* cop, const CMPIContext* context, const char* nullTarget,
                            const char* noProcessors, Deliver deliverReference, unsigned int line = __builtin_LINE(),
                            const char* function = __builtin_FUNCTION()) {
  events.providerEntry(line, function);
  Navigation navigation(association, factoryOfProcessors(), cop, line, function);
  if (!navigation.findTargetOfReferences(nullTarget)) {
    return navigation.status;
  }
  const auto link = [&](const CMPIObjectPath* far, bool farIsFirst) {
    const CMPIInstance* reference = navigation.newReference(far, farIsFirst);
    if (!isNull(reference)) {
      deliverReference(reference);
    }
    return true;
  };
  const std::string_view targetClass = classNameOf(navigation.target);
  if (targetClass == cpuProcessorClass) {
    Paths processors;
    if (!findProcessors(navigation.factory, navigation.target, processors, &navigation.status, noProcessors,
                        function)) {
      return navigation.status;
    }
    for (CMPIObjectPath* processor : counted(processors)) {
      if (!isNull(processor)) {
        stampPath(processor, cop);
        link(processor, false);
      }
    }
  } else if (targetClass == computerSystemClass) {
    const auto linkSystem = [&](const CMPIObjectPath* system) { return link(system, true); };
    if (!forEachSystemName(association, {context, navigation.target, &navigation.status}, linkSystem, line, function)) {
      return navigation.status;
    }
  }
  events.providerExit(line, function);
  return navigation.status;
}

}  // namespace

CMPIStatus CPUSystemDevice_References(CMPIAssociationMI* /*mi*/, const CMPIContext* context, const CMPIResult* result,
                                      const CMPIObjectPath* cop, const char* /*resultClass*/, const char* /*role*/,
                                      const char** /*properties*/) {
  return answerReferences(cop, context, "Object Path is NULL in References.", "getAllCPUProcCMPIObjPaths Failed",
                          [&](const CMPIInstance* reference) { CMReturnInstance(result, reference); });
}

CMPIStatus CPUSystemDevice_ReferenceNames(CMPIAssociationMI* /*mi*/, const CMPIContext* context,
                                          const CMPIResult* result, const CMPIObjectPath* cop,
                                          const char* /*resultClass*/, const char* /*role*/) {
  return answerReferences(cop, context, "Object Path is NULL in ReferenceNames.",
                          "***Can't get Processor instances                 Exiting References***",
                          [&](const CMPIInstance* reference) { deliverStampedPathOf(result, reference, cop); });
}

static const CMPIInstanceMIFT instMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "instanceCPUSystemDeviceProvider",
    entry<CPUSystemDevice_Cleanup, association>,
    entry<CPUSystemDevice_EnumInstanceNames, association>,
    entry<CPUSystemDevice_EnumInstances, association>,
    entry<CPUSystemDevice_GetInstance, association>,
    entry<CPUSystemDevice_CreateInstance, association>,
    entry<CPUSystemDevice_ModifyInstance, association>,
    entry<CPUSystemDevice_DeleteInstance, association>,
    entry<CPUSystemDevice_ExecQuery, association>,
};

static const CMPIAssociationMIFT assocMIFT__ = {
    interfaceVersion,
    interfaceVersion,
    "associationCPUSystemDeviceProvider",
    entry<CPUSystemDevice_AssociationCleanup, association>,
    entry<CPUSystemDevice_Associators, association>,
    entry<CPUSystemDevice_AssociatorNames, association>,
    entry<CPUSystemDevice_References, association>,
    entry<CPUSystemDevice_ReferenceNames, association>,
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
