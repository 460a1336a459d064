#include "CacheAssociation.h"

namespace Tarn::CPUProvider {

namespace {

/// Sets the cache's properties on an association of it. False, and the failure logged, when the cache is unknown.
bool describeCache(const Association& association, CPUObjFactory* factory, CMPIInstance* instance,
                   const CMPIObjectPath* cache, CMPIStatus* status, unsigned int line, const char* function) {
  CPUObjFactory::ProcCacheData data{};
  if (factory->getAssocCacheData(association.broker, stringKey(cache, "DeviceID"), data, status) != 0) {
    association.events.message(LevelError, "Error retrieving CPU AssociatedCacheMemory data", line, function);
    return false;
  }
  for (const CacheProperty& property : cacheProperties) {
    setProperty(instance, property.name, uint16Value, data.*property.datum);
  }
  return true;
}

bool isSuspended(const CacheAssociation& provider, const CPUObjFactory* factory) {
  return provider.isSuspended != nullptr && provider.isSuspended(factory);
}

}  // namespace

unsigned short makeInstances(const CacheAssociation& provider, const CMPIObjectPath* cop, const char** properties,
                             Instances& instances, unsigned int line, const char* function) {
  const Association& association = provider.association;
  association.events.providerEntry(line, function);
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = provider.factory();
  // An association that the broker could not make is handed on as it is.
  const auto append = [&](const CMPIObjectPath* path, const CMPIObjectPath* cache, const CMPIObjectPath* dependent) {
    CMPIInstance* instance = newAssociation(association, path, cache, dependent, properties);
    if (!isNull(instance) && !describeCache(association, factory, instance, cache, &status, line, function)) {
      return false;
    }
    instances.push_back(instance);
    return true;
  };
  const bool complete =
      isSuspended(provider, factory) ||
      forEachPair(association, provider.walk, provider.instanceTexts, {factory, cop, &status}, append, line, function);
  association.events.providerExit(line, function);
  return complete ? 0 : 1;
}

CMPIStatus enumInstances(const CacheAssociation& provider, const AssociationRequest& request) {
  const EventLog& events = provider.association.events;
  events.providerEntry(request.line, request.function);
  Instances instances;
  if (provider.makeInstances(request.cop, request.properties, instances) == 0) {
    // Also the associations that the broker could not make.
    for (const CMPIInstance* instance : counted(instances)) {
      CMReturnInstance(request.result, instance);
    }
  }
  CMReturnDone(request.result);
  events.providerExit(request.line, request.function);
  return succeeded();
}

CMPIStatus enumInstanceNames(const CacheAssociation& provider, const AssociationRequest& request) {
  const EventLog& events = provider.association.events;
  events.providerEntry(request.line, request.function);
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = provider.factory();
  if (!isSuspended(provider, factory)) {
    forEachPair(provider.association, provider.walk, provider.nameTexts, {factory, request.cop, &status},
                deliverName(provider.association, request.result), request.line, request.function);
  }
  events.providerExit(request.line, request.function);
  CMReturnDone(request.result);
  return status;
}

CMPIStatus getInstance(const CacheAssociation& provider, const AssociationRequest& request) {
  const EventLog& events = provider.association.events;
  events.providerEntry(request.line, request.function);
  CMPIStatus status = succeeded();
  Instances instances;
  if (!lacksKeys(provider.association, request.cop, &status, request.line, request.function) &&
      provider.makeInstances(request.cop, request.properties, instances) == 0) {
    deliverMatch(request.result, instances, [&](CMPIObjectPath* path) {
      stampPath(path, request.cop);
      return isObjPathsEqualWithLog(provider.association.broker, request.cop, path, true);
    });
  }
  CMReturnDone(request.result);
  events.providerExit(request.line, request.function);
  return status;
}

namespace {

/// Runs an association operation: its steps answer whether they came to their end, which is marked in the log.
template <class Steps>
CMPIStatus navigate(const CacheAssociation& provider, const AssociationRequest& request, Steps steps) {
  const EventLog& events = provider.association.events;
  events.providerEntry(request.line, request.function);
  Navigation navigation(provider.association, provider.factory(), request.cop, request.line, request.function);
  if (isSuspended(provider, navigation.factory) || steps(navigation)) {
    events.providerExit(request.line, request.function);
  }
  return navigation.status;
}

void traceClasses(const CacheAssociation& provider, const AssociationRequest& request) {
  if (provider.tracesClasses) {
    const EventLog& events = provider.association.events;
    events.variable("_RefLeftClass = ", request.assocClass, request.line, request.function);
    events.variable("_RefRightClass = ", request.resultClass, request.line, request.function);
  }
}

}  // namespace

CMPIStatus associators(const CacheAssociation& provider, const AssociationRequest& request) {
  return navigate(provider, request, [&](Navigation& navigation) {
    traceClasses(provider, request);
    if (!navigation.findTarget(request.assocClass, request.resultClass, "Object Path is NULL in Associators.") ||
        !navigation.findElements(provider.directions, request.properties, false, provider.associatorsFailed)) {
      return false;
    }
    deliver(request.result, navigation.elements);
    return true;
  });
}

CMPIStatus associatorNames(const CacheAssociation& provider, const AssociationRequest& request) {
  return navigate(provider, request, [&](Navigation& navigation) {
    traceClasses(provider, request);
    if (!navigation.findTarget(request.assocClass, request.resultClass, "Object Path is NULL in AssociatorNames.") ||
        !navigation.findElements(provider.directions, nullptr, true, provider.associatorNamesFailed)) {
      return false;
    }
    for (const CMPIInstance* element : counted(navigation.elements)) {
      deliverStampedPathOf(request.result, element, request.cop);
    }
    return true;
  });
}

CMPIStatus references(const CacheAssociation& provider, const AssociationRequest& request) {
  return navigate(provider, request, [&](Navigation& navigation) {
    const Association& association = provider.association;
    if (provider.tracesClasses) {
      association.events.variable("resultClass = ", request.resultClass, request.line, request.function);
    }
    if (!navigation.findTargetOfReferences("Object Path is NULL in References.") ||
        !navigation.findElements(provider.directions, request.properties, false, provider.referencesFailed)) {
      return false;
    }
    navigation.filterReferences(request.properties);
    navigation.forEachReference([&](CMPIInstance* reference, const CMPIObjectPath* far) {
      if (provider.referencesDescribe) {
        const CMPIObjectPath* cache = navigation.elementsAreFirst ? far : request.cop;
        describeCache(association, navigation.factory, reference, cache, &navigation.status, request.line,
                      request.function);
      }
      CMReturnInstance(request.result, reference);
    });
    return true;
  });
}

CMPIStatus referenceNames(const CacheAssociation& provider, const AssociationRequest& request) {
  return navigate(provider, request, [&](Navigation& navigation) {
    if (!navigation.findTargetOfReferences("Object Path is NULL in ReferenceNames.") ||
        !navigation.findElements(provider.directions, nullptr, true, provider.referenceNamesFailed)) {
      return false;
    }
    navigation.filterReferences(nullptr);
    navigation.forEachReference([&](const CMPIInstance* reference, const CMPIObjectPath* /*far*/) {
      deliverStampedPathOf(request.result, reference, request.cop);
    });
    return true;
  });
}

}  // namespace Tarn::CPUProvider
