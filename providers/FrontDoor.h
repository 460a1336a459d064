#ifndef TARN_FRONTDOOR_H
#define TARN_FRONTDOOR_H

#include "AssociationSteps.h"

#ifdef CORVANE_STANDARD_REQUESTS
#include <algorithm>
#include <iterator>
#include <vector>
#endif

/// Makes requests ordinary before they reach the operations, in a build with CORVANE_STANDARD_REQUESTS.
///
/// The operations compare names exactly and expect every name that they compare. Clients leave names out, spell
/// them in any case, and name parent classes; brokers ask every association provider about any object. Such
/// requests go on in the library's spelling, or are answered with nothing if they ask for something else.
namespace Tarn::CPUProvider {

#ifdef CORVANE_STANDARD_REQUESTS

namespace detail {

inline bool isAbsent(const char* name) {
  return name == nullptr || *name == '\0';
}

/// Whether a filter lets this class through: it is absent, or names the class or one of its parents.
inline bool admitsClass(const char* filter, std::string_view className) {
  while (!isAbsent(filter) && !equalIgnoringCase(filter, className)) {
    const auto* const derived = std::ranges::find(classParents, className, &ClassParent::name);
    if (derived == std::end(classParents)) {
      return false;
    }
    className = derived->parent;
  }
  return true;
}

inline bool admitsRole(const char* filter, const Reference& end) {
  return isAbsent(filter) || equalIgnoringCase(filter, end.name);
}

/// A property's name in the library's spelling; the name itself if neither the association nor any class of instances
/// has that property.
inline const char* spelledName(const char* name, const Association* association) {
  if (association != nullptr) {
    for (const Reference* end : {&association->first, &association->second}) {
      if (equalIgnoringCase(end->name, name)) {
        return end->name;
      }
    }
    for (const CacheProperty& property : cacheProperties) {
      if (equalIgnoringCase(property.name, name)) {
        return property.name;
      }
    }
  }
  return selectionName(name);
}

/// A property list in the library's spelling. No list stays none.
class PropertyList {
 public:
  /// For instances of an association, its references are added if its filter does not let them pass as keys. The
  /// factory's filters let the keys of all other instances pass.
  explicit PropertyList(const char** asked, const Association* association = nullptr) : isGiven_(asked != nullptr) {
    if (!isGiven_) {
      return;
    }
    for (; *asked != nullptr; ++asked) {
      names_.push_back(spelledName(*asked, association));
    }
    if (association != nullptr && std::string_view(association->filterKeys[0]) != association->first.name) {
      names_.insert(names_.end(), {association->first.name, association->second.name});
    }
    names_.push_back(nullptr);
  }

  const char** names() { return isGiven_ ? names_.data() : nullptr; }

 private:
  bool isGiven_;
  std::vector<const char*> names_;
};

inline PropertyList ownProperties(const Association& association, const char** asked) {
  return PropertyList(asked, &association);
}

template <class Provider>
PropertyList ownProperties(const Provider& /*provider*/, const char** asked) {
  return PropertyList(asked);
}

/// A request's source with its class in the library's spelling; the source itself if it is spelled so, or if the
/// broker cannot make a copy.
class SpelledSource {
 public:
  SpelledSource(const CMPIObjectPath* source, const char* className)
      : source_(source),
        copy_(className == std::string_view(classNameOf(source)) ? nullptr : CMClone(source, nullptr)) {
    if (!isNull(copy_)) {
      CMSetClassName(copy_, className);
      source_ = copy_;
    }
  }
  ~SpelledSource() {
    if (!isNull(copy_)) {
      CMRelease(copy_);
    }
  }
  SpelledSource(const SpelledSource&) = delete;
  SpelledSource& operator=(const SpelledSource&) = delete;

  const CMPIObjectPath* path() const { return source_; }

 private:
  const CMPIObjectPath* source_;
  CMPIObjectPath* copy_;
};

/// What a client's request filters by; an absent name filters nothing.
struct AssociationFilter {
  const char* assocClass;
  const char* resultClass;
  const char* role;
  const char* resultRole;
};

/// Performs a request from an object at one of the association's ends whose filters admit the association and its
/// far end: `perform` takes the source and the class of the far end. Any other request finds nothing.
template <class Perform>
CMPIStatus performOrdinary(const Association& association, const CMPIResult* result, const CMPIObjectPath* source,
                           const AssociationFilter& filter, Perform perform) {
  const std::string_view sourceClass = isNull(source) ? "" : classNameOf(source);
  const bool startsAtFirst = equalIgnoringCase(sourceClass, association.first.objectClass);
  const bool startsAtSecond = equalIgnoringCase(sourceClass, association.second.objectClass);
  const Reference& near = startsAtFirst ? association.first : association.second;
  const Reference& far = startsAtFirst ? association.second : association.first;
  if ((!startsAtFirst && !startsAtSecond) || !admitsClass(filter.assocClass, association.className) ||
      !admitsClass(filter.resultClass, far.objectClass) || !admitsRole(filter.role, near) ||
      !admitsRole(filter.resultRole, far)) {
    CMReturnDone(result);
    return succeeded();
  }
  const SpelledSource spelled(source, near.objectClass);
  return perform(spelled.path(), far.objectClass);
}

// By its signature, what a function table holds for an operation of the provider that `Provider` describes.

template <auto Operation, const auto& Provider, class Signature = decltype(Operation)>
struct Ordinary {
  static constexpr auto operation = Operation;
};

// EnumInstances and GetInstance.
template <auto Operation, const auto& Provider>
struct Ordinary<Operation, Provider,
                CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                               const char**)> {
  static CMPIStatus operation(CMPIInstanceMI* mi, const CMPIContext* context, const CMPIResult* result,
                              const CMPIObjectPath* path, const char** properties) {
    return Operation(mi, context, result, path, ownProperties(Provider, properties).names());
  }
};

// Associators, and without a property list AssociatorNames.
template <auto Operation, const auto& Provider, class... Properties>
struct Ordinary<Operation, Provider,
                CMPIStatus (*)(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                               const char*, const char*, const char*, const char*, Properties...)> {
  static CMPIStatus operation(CMPIAssociationMI* mi, const CMPIContext* context, const CMPIResult* result,
                              const CMPIObjectPath* source, const char* assocClass, const char* resultClass,
                              const char* role, const char* resultRole, Properties... properties) {
    return performOrdinary(Provider, result, source, {assocClass, resultClass, role, resultRole},
                           [&](const CMPIObjectPath* spelled, const char* farClass) {
                             return Operation(mi, context, result, spelled, Provider.className, farClass, role,
                                              resultRole, PropertyList(properties).names()...);
                           });
  }
};

// References, and without a property list ReferenceNames. Their result class is the association.
template <auto Operation, const auto& Provider, class... Properties>
struct Ordinary<Operation, Provider,
                CMPIStatus (*)(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                               const char*, const char*, Properties...)> {
  static CMPIStatus operation(CMPIAssociationMI* mi, const CMPIContext* context, const CMPIResult* result,
                              const CMPIObjectPath* source, const char* resultClass, const char* role,
                              Properties... properties) {
    return performOrdinary(Provider, result, source, {resultClass, nullptr, role, nullptr},
                           [&](const CMPIObjectPath* spelled, const char* /*farClass*/) {
                             return Operation(mi, context, result, spelled, Provider.className, role,
                                              ownProperties(Provider, properties).names()...);
                           });
  }
};

}  // namespace detail

template <auto Operation, const auto& Provider>
inline constexpr auto ordinary = detail::Ordinary<Operation, Provider>::operation;

#else

template <auto Operation, const auto& Provider>
inline constexpr auto ordinary = Operation;

#endif

/// What a function table holds for an operation of the provider that `Provider` describes.
template <auto Operation, const auto& Provider>
inline constexpr auto entry = guarded<ordinary<Operation, Provider>, Provider>;

}  // namespace Tarn::CPUProvider

#endif
