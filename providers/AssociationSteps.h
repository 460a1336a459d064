#ifndef TARN_ASSOCIATIONSTEPS_H
#define TARN_ASSOCIATIONSTEPS_H

#include <string_view>
#include <type_traits>

#include "ProviderFrame.h"

/// The steps that association operations are made of. What an operation does with them, and in which
/// order, stands in the provider's own file.
namespace Tarn::CPUProvider {

/// One end of an association: the reference's name and the class that it refers to.
struct Reference {
  const char* name;
  const char* objectClass;
};

/// An association class and the provider that serves it.
struct Association {
  const EventLog& events;
  const CMPIBroker* const& broker;
  const char* className;
  Reference first;
  Reference second;
  /// What no property list filters away. Brokers take it as mutable pointers, and write none of them.
  mutable const char* filterKeys[3] = {first.name, second.name, nullptr};
};

/// A property that the associations of caches have beside their references, and the datum of the cache that it shows.
struct CacheProperty {
  const char* name;
  CMPIUint16 CPUObjFactory::ProcCacheData::*datum;
};

inline constexpr CacheProperty cacheProperties[] = {
    {"Level", &CPUObjFactory::ProcCacheData::level},
    {"WritePolicy", &CPUObjFactory::ProcCacheData::writePolicy},
    {"ReadPolicy", &CPUObjFactory::ProcCacheData::readPolicy},
    {"CacheType", &CPUObjFactory::ProcCacheData::cacheType},
    {"Associativity", &CPUObjFactory::ProcCacheData::associativity},
};

/// What is said of a failure: to the client, unless that is NULL, and in the log.
struct FailureTexts {
  const char* status;
  const char* log;

  // NOLINTNEXTLINE(google-explicit-constructor,hicpp-explicit-conversions): tables read better without the type
  constexpr FailureTexts(const char* text) : status(text), log(text) {}
  constexpr FailureTexts(const char* statusText, const char* logText) : status(statusText), log(logText) {}
};

inline void fail(const Association& association, CMPIStatus* status, const FailureTexts& texts,
                 unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) {
  if (texts.status != nullptr) {
    setFailure(association.broker, status, texts.status);
  }
  association.events.message(LevelError, texts.log, line, function);
}

/// Whether GetInstance was asked for nothing in particular, which fails.
inline bool lacksKeys(const Association& association, const CMPIObjectPath* cop, CMPIStatus* status,
                      unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) {
  if (CMGetKeyCount(cop, nullptr) != 0) {
    return false;
  }
  fail(association, status, "At least one key should be passed", line, function);
  return true;
}

/// An element's own object path; NULL for an element that could not be built.
inline CMPIObjectPath* pathOf(const CMPIInstance* element) {
  return isNull(element) ? nullptr : CMGetObjectPath(element, nullptr);
}

/// An empty path of the association class, in the namespace of `cop`; NULL when the broker has none.
inline CMPIObjectPath* newAssociationPath(const Association& association, const CMPIObjectPath* cop) {
  return newPath(association.broker, cop, association.className, getSystemName(), nullptr, nullptr);
}

inline void setEnds(const Association& association, CMPIInstance* instance, const CMPIObjectPath* first,
                    const CMPIObjectPath* second) {
  setProperty(instance, association.first.name, first);
  setProperty(instance, association.second.name, second);
}

/// What the factory is asked for the elements that belong to the one with a key.
struct Search {
  const CMPIBroker* broker;
  const CMPIObjectPath* ref;
  CMPIString* key;
  const char** properties;
  bool isObjPath;
  CMPIStatus* status;
};

using FindRelated = unsigned short (*)(CPUObjFactory* factory, const Search& search, Instances& found);

/// Asks one of the factory's navigation functions. Those of capabilities always build whole instances.
template <auto Navigate>
unsigned short related(CPUObjFactory* factory, const Search& of, Instances& found) {
  using ToWholeInstances = unsigned short (CPUObjFactory::*)(const CMPIBroker*, const CMPIObjectPath*, CMPIString*,
                                                             const char**, Instances&, CMPIStatus*);
  if constexpr (std::is_same_v<decltype(Navigate), ToWholeInstances>) {
    return (factory->*Navigate)(of.broker, of.ref, of.key, of.properties, found, of.status);
  } else {
    return (factory->*Navigate)(of.broker, of.ref, of.key, of.properties, of.isObjPath, found, of.status);
  }
}

/// A walk over all pairs of an association: from all object paths of one class, the near ends, by the key of
/// each to the elements at its far end.
struct PairWalk {
  const char* nearClass;
  unsigned short (CPUObjFactory::*nearPaths)(const CMPIBroker*, const CMPIObjectPath*, Paths&, CMPIStatus*);
  CountRecords expectedNear;
  const char* key;
  FindRelated farElements;
  CountRecords expectedFar = nullptr;  ///< of each near end, if that is known
};

/// What a walk says where it fails.
struct WalkTexts {
  const char* noPaths;
  FailureTexts nullNear;
  const char* noRelated;
  FailureTexts nullFar;
  FailureTexts noAssociationPath;
};

/// For whom a walk is made.
struct WalkRequest {
  CPUObjFactory* factory;
  const CMPIObjectPath* cop;
  CMPIStatus* status;
  const char** properties = nullptr;  ///< that the elements at the far ends shall have
};

/// Hands each pair of a walk to `link`, as a new path of the association and the paths of its two ends, until
/// that returns false. False when the walk did not reach its end.
template <class Link>
bool forEachPair(const Association& association, const PairWalk& walk, const WalkTexts& texts,
                 const WalkRequest& request, Link link, unsigned int line = __builtin_LINE(),
                 const char* function = __builtin_FUNCTION()) {
  const auto& [factory, cop, status, properties] = request;
  Paths nearPaths;
  nearPaths.reserve((factory->*walk.expectedNear)());
  if ((factory->*walk.nearPaths)(association.broker, cop, nearPaths, status) != 0) {
    association.events.message(LevelError, texts.noPaths, line, function);
    return false;
  }
  const bool nearIsFirst = std::string_view(walk.nearClass) == association.first.objectClass;
  for (CMPIObjectPath* near : counted(nearPaths)) {
    if (isNull(near)) {
      fail(association, status, texts.nullNear, line, function);
      return false;
    }
    stampPath(near, cop);
    Instances elements;
    if (walk.expectedFar != nullptr) {
      elements.reserve((factory->*walk.expectedFar)());
    }
    const Search search{association.broker, cop, stringKey(near, walk.key), properties, true, status};
    if (walk.farElements(factory, search, elements) != 0) {
      association.events.message(LevelError, texts.noRelated, line, function);
      return false;
    }
    for (const CMPIInstance* element : counted(elements)) {
      if (isNull(element)) {
        continue;
      }
      CMPIObjectPath* far = pathOf(element);
      if (isNull(far)) {
        fail(association, status, texts.nullFar, line, function);
        return false;
      }
      stampPath(far, cop);
      CMPIObjectPath* path = newAssociationPath(association, cop);
      if (isNull(path)) {
        fail(association, status, texts.noAssociationPath, line, function);
        return false;
      }
      if (!(nearIsFirst ? link(path, near, far) : link(path, far, near))) {
        return false;
      }
    }
  }
  return true;
}

/// Delivers the name of each pair of a walk: the association's path with the two ends as its keys.
inline auto deliverName(const Association& association, const CMPIResult* result) {
  return [&association, result](CMPIObjectPath* path, const CMPIObjectPath* first, const CMPIObjectPath* second) {
    addKey(path, association.first.name, first);
    addKey(path, association.second.name, second);
    CMReturnObjectPath(result, path);
    return true;
  };
}

/// The association of two objects on its own path; what the broker answers when it cannot make it.
inline CMPIInstance* newAssociation(const Association& association, const CMPIObjectPath* path,
                                    const CMPIObjectPath* first, const CMPIObjectPath* second,
                                    const char** properties) {
  CMPIInstance* instance = CMNewInstance(association.broker, path, nullptr);
  if (!isNull(instance)) {
    CMSetPropertyFilter(instance, properties, association.filterKeys);
    setEnds(association, instance, first, second);
  }
  return instance;
}

/// Collects each pair of a walk as an association of its own; one that the broker cannot make is left out.
inline auto collectPairs(const Association& association, const char** properties, Instances& instances) {
  return [&association, properties, &instances](const CMPIObjectPath* path, const CMPIObjectPath* first,
                                                const CMPIObjectPath* second) {
    CMPIInstance* instance = newAssociation(association, path, first, second, properties);
    if (!isNull(instance)) {
      instances.push_back(instance);
    }
    return true;
  };
}

/// Delivers the first instance whose path `matches`; instances that could not be built do not count.
template <class Matches>
void deliverMatch(const CMPIResult* result, Instances& instances, Matches matches) {
  for (CMPIInstance* instance : counted(instances)) {
    CMPIObjectPath* path = pathOf(instance);
    if (!isNull(path) && matches(path)) {
      CMReturnInstance(result, instance);
      return;
    }
  }
}

/// Delivers the elements' own paths.
inline void deliverPathsOf(const CMPIResult* result, Instances& elements) {
  for (const CMPIInstance* element : counted(elements)) {
    const CMPIObjectPath* path = pathOf(element);
    if (!isNull(path)) {
      CMReturnObjectPath(result, path);
    }
  }
}

/// Delivers an instance's own path, in the namespace of `cop` and with this system's host name.
inline void deliverStampedPathOf(const CMPIResult* result, const CMPIInstance* instance, const CMPIObjectPath* cop) {
  CMPIObjectPath* path = pathOf(instance);
  if (!isNull(path)) {
    stampPath(path, cop);
    CMReturnObjectPath(result, path);
  }
}

}  // namespace Tarn::CPUProvider

#endif
