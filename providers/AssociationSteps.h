#ifndef TARN_ASSOCIATIONSTEPS_H
#define TARN_ASSOCIATIONSTEPS_H

#include <iterator>
#include <span>
#include <string_view>

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
};

/// The elements that the 16-bit count of results reaches.
template <class Element>
std::span<Element> counted(std::vector<Element>& elements) {
  return std::span(elements).first(countOf(elements));
}

/// Fails the request, with the same words for the client and for the log.
inline void fail(const Association& association, CMPIStatus* status, const char* text,
                 unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) {
  setFailure(association.broker, status, text);
  association.events.message(LevelError, text, line, function);
}

/// Fails the request with words of their own for the client and for the log.
struct FailureTexts {
  const char* status;
  const char* log;
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
  CMPIObjectPath* path = CMNewObjectPath(association.broker, namespaceOf(cop), association.className, nullptr);
  if (!isNull(path)) {
    stampPath(path, cop);
  }
  return path;
}

inline void setEnds(const Association& association, CMPIInstance* instance, const CMPIObjectPath* first,
                    const CMPIObjectPath* second) {
  CMSetProperty(instance, association.first.name, &first, CMPI_ref);
  CMSetProperty(instance, association.second.name, &second, CMPI_ref);
}

/// What a walk over all pairs says where it fails; a NULL status text leaves the status alone.
struct WalkTexts {
  const char* noPaths;
  FailureTexts nullNear;
  const char* noRelated;
  FailureTexts nullFar;
  FailureTexts noAssociationPath;
};

/// The near ends of a walk: all object paths of one class, the key that leads on from them, and how many
/// elements to expect at the far end of each, where that is known.
struct NearEnds {
  const char* objectClass;
  unsigned short (CPUObjFactory::*allPaths)(const CMPIBroker*, const CMPIObjectPath*, Paths&, CMPIStatus*);
  unsigned short (CPUObjFactory::*expected)() const;
  const char* key;
  unsigned short (CPUObjFactory::*expectedFar)() const = nullptr;
};

/// Walks over every near end and, from its key, every element that `related` finds for it. Hands each
/// pair to `link`, as a new path of the association and the paths of its two ends, until that returns
/// false. False when the walk did not reach its end.
template <class Related, class Link>
bool forEachPair(const Association& association, CPUObjFactory* factory, const CMPIObjectPath* cop, CMPIStatus* status,
                 const NearEnds& nearEnds, const WalkTexts& texts, Related related, Link link,
                 unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) {
  Paths nearPaths;
  nearPaths.reserve((factory->*nearEnds.expected)());
  if ((factory->*nearEnds.allPaths)(association.broker, cop, nearPaths, status) != 0) {
    association.events.message(LevelError, texts.noPaths, line, function);
    return false;
  }
  const bool nearIsFirst = std::string_view(nearEnds.objectClass) == association.first.objectClass;
  for (CMPIObjectPath* near : counted(nearPaths)) {
    if (isNull(near)) {
      fail(association, status, texts.nullNear, line, function);
      return false;
    }
    stampPath(near, cop);
    Instances elements;
    if (nearEnds.expectedFar != nullptr) {
      elements.reserve((factory->*nearEnds.expectedFar)());
    }
    if (related(stringKey(near, nearEnds.key), elements) != 0) {
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
    CMAddKey(path, association.first.name, &first, CMPI_ref);
    CMAddKey(path, association.second.name, &second, CMPI_ref);
    CMReturnObjectPath(result, path);
    return true;
  };
}

/// The way from a request's object to the elements of one target class.
struct Direction {
  const char* targetClass;
  const char* sourceKey;
  unsigned short (CPUObjFactory::*expected)() const;
  unsigned short (CPUObjFactory::*navigate)(const CMPIBroker*, const CMPIObjectPath*, CMPIString*, const char**, bool,
                                            Instances&, CMPIStatus*);
};

/// What an association request looks for, and how much of it.
struct Search {
  CPUObjFactory* factory;
  const CMPIObjectPath* cop;
  const CMPIObjectPath* target;
  const char** properties;
  bool isObjPath;
  CMPIStatus* status;
};

/// The elements at the far end of a request, and the end of the association that they stand at.
struct FarEnds {
  Instances elements;
  bool areFirst = false;
};

/// Finds the elements at the far end; none for a target class that neither direction leads to. False,
/// and the direction's own text logged, when the navigation failed.
inline bool findRelated(const Association& association, const Search& search, const Direction (&directions)[2],
                        const char* const (&failures)[2], FarEnds& related, unsigned int line = __builtin_LINE(),
                        const char* function = __builtin_FUNCTION()) {
  const std::string_view targetClass = classNameOf(search.target);
  for (std::size_t i = 0; i < std::size(directions); ++i) {
    const Direction& direction = directions[i];
    if (targetClass != direction.targetClass) {
      continue;
    }
    related.areFirst = targetClass == association.first.objectClass;
    related.elements.reserve((search.factory->*direction.expected)());
    if ((search.factory->*direction.navigate)(association.broker, search.target,
                                              stringKey(search.cop, direction.sourceKey), search.properties,
                                              search.isObjPath, related.elements, search.status) != 0) {
      association.events.message(LevelError, failures[i], line, function);
      return false;
    }
  }
  return true;
}

/// The association of two objects on its own path; what the broker answers when it cannot make it.
inline CMPIInstance* newAssociation(const Association& association, const CMPIObjectPath* path,
                                    const CMPIObjectPath* first, const CMPIObjectPath* second, const char** properties,
                                    const char** filterKeys) {
  CMPIInstance* instance = CMNewInstance(association.broker, path, nullptr);
  if (!isNull(instance)) {
    CMSetPropertyFilter(instance, properties, filterKeys);
    setEnds(association, instance, first, second);
  }
  return instance;
}

/// Collects each pair of a walk as an association of its own; one that the broker cannot make is left out.
inline auto collectPairs(const Association& association, const char** properties, const char** filterKeys,
                         Instances& instances) {
  return [&association, properties, filterKeys, &instances](const CMPIObjectPath* path, const CMPIObjectPath* first,
                                                            const CMPIObjectPath* second) {
    CMPIInstance* instance = newAssociation(association, path, first, second, properties, filterKeys);
    if (!isNull(instance)) {
      instances.push_back(instance);
    }
    return true;
  };
}

/// How the references of a request are built: on the association's template path, between the object
/// that the request starts from and those at the far end. With `filterKeys` the property list filters
/// them.
struct ReferenceTemplate {
  const CMPIObjectPath* source;
  const CMPIObjectPath* path;
  const char** properties = nullptr;
  const char** filterKeys = nullptr;
};

/// One reference; NULL when the broker has none.
inline CMPIInstance* newReference(const Association& association, const ReferenceTemplate& from,
                                  const CMPIObjectPath* far, bool farIsFirst) {
  CMPIInstance* instance = CMNewInstance(association.broker, from.path, nullptr);
  if (isNull(instance)) {
    return nullptr;
  }
  if (from.filterKeys != nullptr) {
    CMSetPropertyFilter(instance, from.properties, from.filterKeys);
  }
  setEnds(association, instance, farIsFirst ? far : from.source, farIsFirst ? from.source : far);
  return instance;
}

/// Hands the reference to each related element to `use`, with the element's path; what could not be
/// built is left out.
template <class Use>
void forEachReference(const Association& association, const ReferenceTemplate& from, FarEnds& related, Use use) {
  for (const CMPIInstance* element : counted(related.elements)) {
    CMPIObjectPath* far = pathOf(element);
    if (isNull(far)) {
      continue;
    }
    stampPath(far, from.source);
    CMPIInstance* reference = newReference(association, from, far, related.areFirst);
    if (!isNull(reference)) {
      use(reference, far);
    }
  }
}

/// Delivers a reference's own path, in the namespace of `cop` and with this system's host name.
inline void deliverStampedPathOf(const CMPIResult* result, const CMPIInstance* reference, const CMPIObjectPath* cop) {
  CMPIObjectPath* path = pathOf(reference);
  if (!isNull(path)) {
    stampPath(path, cop);
    CMReturnObjectPath(result, path);
  }
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

/// The same, each in the namespace of `cop` and with this system's host name.
inline void deliverStampedPathsOf(const CMPIResult* result, Instances& elements, const CMPIObjectPath* cop) {
  for (const CMPIInstance* element : counted(elements)) {
    deliverStampedPathOf(result, element, cop);
  }
}

}  // namespace Tarn::CPUProvider

#endif
