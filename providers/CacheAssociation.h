#ifndef TARN_CACHEASSOCIATION_H
#define TARN_CACHEASSOCIATION_H

#include "Navigation.h"

/// The two associations of caches, with processors and with cores. They carry the cache's own properties. Each
/// says in a CacheAssociation what is its own; the operations below say what they do with it.
namespace Tarn::CPUProvider {

struct CacheAssociation {
  const Association& association;
  CPUObjFactory* (*factory)();
  /// Whether the association is not served at present, for which there may be a reason.
  bool (*isSuspended)(const CPUObjFactory* factory);
  /// Makes all instances; 0, or 1 when it did not come to the end.
  unsigned short (*makeInstances)(const CMPIObjectPath* cop, const char** properties, Instances& instances);

  PairWalk walk;
  WalkTexts instanceTexts;
  WalkTexts nameTexts;

  Direction directions[2];
  DirectionTexts associatorsFailed;
  DirectionTexts associatorNamesFailed;
  DirectionTexts referencesFailed;
  DirectionTexts referenceNamesFailed;

  bool tracesClasses;       ///< whether the classes that a request names are logged
  bool referencesDescribe;  ///< whether References answers the cache's properties, too
};

/// One request, and the entry point that reports it.
struct AssociationRequest {
  const CMPIResult* result;
  const CMPIObjectPath* cop;
  const char** properties = nullptr;
  const char* assocClass = nullptr;
  const char* resultClass = nullptr;
  unsigned int line = __builtin_LINE();
  const char* function = __builtin_FUNCTION();
};

/// All instances, into `instances`; the builder that an association's makeInstances calls.
unsigned short makeInstances(const CacheAssociation& provider, const CMPIObjectPath* cop, const char** properties,
                             Instances& instances, unsigned int line = __builtin_LINE(),
                             const char* function = __builtin_FUNCTION());

CMPIStatus enumInstances(const CacheAssociation& provider, const AssociationRequest& request);
CMPIStatus enumInstanceNames(const CacheAssociation& provider, const AssociationRequest& request);
CMPIStatus getInstance(const CacheAssociation& provider, const AssociationRequest& request);

// These never call CMReturnDone.

CMPIStatus associators(const CacheAssociation& provider, const AssociationRequest& request);
CMPIStatus associatorNames(const CacheAssociation& provider, const AssociationRequest& request);
CMPIStatus references(const CacheAssociation& provider, const AssociationRequest& request);
CMPIStatus referenceNames(const CacheAssociation& provider, const AssociationRequest& request);

}  // namespace Tarn::CPUProvider

#endif
