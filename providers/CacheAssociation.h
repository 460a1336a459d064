#ifndef TARN_CACHEASSOCIATION_H
#define TARN_CACHEASSOCIATION_H

#include "AssociationSteps.h"

/// What the two associations of caches have in common: they carry the cache's own properties.
namespace Tarn::CPUProvider {

inline const char* cacheAssociationKeys[] = {"Antecedent", "Dependent", nullptr};

/// Sets the cache's properties on an association of it. False, and the failure logged, when the cache
/// is unknown.
inline bool setCacheProperties(const Association& association, CPUObjFactory* factory, CMPIInstance* instance,
                               const CMPIObjectPath* cache, CMPIStatus* status, unsigned int line = __builtin_LINE(),
                               const char* function = __builtin_FUNCTION()) {
  CPUObjFactory::ProcCacheData data{};
  if (factory->getAssocCacheData(association.broker, stringKey(cache, "DeviceID"), data, status) != 0) {
    association.events.message(LevelError, "Error retrieving CPU AssociatedCacheMemory data", line, function);
    return false;
  }
  CMSetProperty(instance, "Level", &data.level, CMPI_uint16);
  CMSetProperty(instance, "WritePolicy", &data.writePolicy, CMPI_uint16);
  CMSetProperty(instance, "ReadPolicy", &data.readPolicy, CMPI_uint16);
  CMSetProperty(instance, "CacheType", &data.cacheType, CMPI_uint16);
  CMSetProperty(instance, "Associativity", &data.associativity, CMPI_uint16);
  return true;
}

/// Appends the association of a cache with its processor or core, also when the broker could not make
/// it. False when the cache is unknown.
inline bool appendCacheAssociation(const Association& association, CPUObjFactory* factory, const CMPIObjectPath* path,
                                   const CMPIObjectPath* cache, const CMPIObjectPath* dependent,
                                   const char** properties, Instances& instances, CMPIStatus* status, unsigned int line,
                                   const char* function) {
  CMPIInstance* instance = newAssociation(association, path, cache, dependent, properties, cacheAssociationKeys);
  if (!isNull(instance) && !setCacheProperties(association, factory, instance, cache, status, line, function)) {
    return false;
  }
  instances.push_back(instance);
  return true;
}

}  // namespace Tarn::CPUProvider

#endif
