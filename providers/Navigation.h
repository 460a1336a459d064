#ifndef TARN_NAVIGATION_H
#define TARN_NAVIGATION_H

#include <iterator>
#include <optional>

#include "FrontDoor.h"

/// The steps of the operations that start from one object: Associators, References and their names.
namespace Tarn::CPUProvider {

/// The way from a request's object to the elements of one target class.
struct Direction {
  const char* targetClass;
  const char* sourceKey;
  CountRecords expected;
  FindRelated elements;
};

/// What is logged when the way in each direction is barred; NULL for nothing.
using DirectionTexts = const char* [2];

/// One request on its way from its object to those at the far end. A step that returns false ends it, with the
/// status as it stands here.
struct Navigation {
  const Association& association;
  CPUObjFactory* factory;
  const CMPIObjectPath* source;
  CMPIStatus status = succeeded();

  const CMPIObjectPath* target = nullptr;        ///< a path of the class at the far end
  const CMPIObjectPath* templatePath = nullptr;  ///< that references are made on
  Instances elements;                            ///< at the far end
  bool elementsAreFirst = false;                 ///< which end of the association that is
  std::optional<const char**> filter;            ///< of references, if they are filtered at all

  unsigned int line;
  const char* function;

  /// Failures are reported for that line of that function.
  Navigation(const Association& through, CPUObjFactory* with, const CMPIObjectPath* from,
             unsigned int atLine = __builtin_LINE(), const char* atFunction = __builtin_FUNCTION())
      : association(through), factory(with), source(from), line(atLine), function(atFunction) {}

  /// Finds out which class is at the far end; false, silently, where the request leads nowhere.
  bool lookUpTarget(const char* assocClass, const char* resultClass) {
    target = factory->get_assoc_targetClass_ObjectPath(association.broker, source, assocClass, resultClass, &status);
    return !isNull(target);
  }

  /// The same; says `absent` where the request leads nowhere.
  bool findTarget(const char* assocClass, const char* resultClass, const FailureTexts& absent) {
    if (lookUpTarget(assocClass, resultClass)) {
      return true;
    }
    fail(association, &status, absent, line, function);
    return false;
  }

  /// The same for references, which need a template as well.
  bool findTargetOfReferences(const FailureTexts& absent) {
    const bool leadsSomewhere = lookUpTarget(association.className, nullptr);
    templatePath = newAssociationPath(association, source);
    if (leadsSomewhere && !isNull(templatePath)) {
      return true;
    }
    fail(association, &status, absent, line, function);
    return false;
  }

  /// Finds the elements at the far end; none for a target class that neither direction leads to. False, and
  /// the direction's own text logged, when the factory failed.
  bool findElements(const Direction (&directions)[2], const char** properties, bool isObjPath,
                    const DirectionTexts& failures) {
    const std::string_view targetClass = classNameOf(target);
    for (std::size_t i = 0; i < std::size(directions); ++i) {
      const Direction& direction = directions[i];
      if (targetClass != direction.targetClass) {
        continue;
      }
      elementsAreFirst = targetClass == association.first.objectClass;
      elements.reserve((factory->*direction.expected)());
      const Search search{association.broker, target,    stringKey(source, direction.sourceKey),
                          properties,         isObjPath, &status};
      if (direction.elements(factory, search, elements) != 0) {
        if (failures[i] != nullptr) {
          association.events.message(LevelError, failures[i], line, function);
        }
        return false;
      }
    }
    return true;
  }

  /// References carry what this property list and the association's own keys let through.
  void filterReferences(const char** properties) { filter = properties; }

  /// The reference between the source and one object at the far end; NULL when the broker has none.
  CMPIInstance* newReference(const CMPIObjectPath* far, bool farIsFirst) const {
    CMPIInstance* instance = CMNewInstance(association.broker, templatePath, nullptr);
    if (isNull(instance)) {
      return nullptr;
    }
    if (filter) {
      CMSetPropertyFilter(instance, *filter, association.filterKeys);
    }
    setEnds(association, instance, farIsFirst ? far : source, farIsFirst ? source : far);
    return instance;
  }

  /// Hands the reference to each element to `use`, with the element's path; what could not be built is left out.
  template <class Use>
  void forEachReference(Use use) {
    for (const CMPIInstance* element : counted(elements)) {
      CMPIObjectPath* far = pathOf(element);
      if (isNull(far)) {
        continue;
      }
      stampPath(far, source);
      CMPIInstance* reference = newReference(far, elementsAreFirst);
      if (!isNull(reference)) {
        use(reference, far);
      }
    }
  }
};

}  // namespace Tarn::CPUProvider

#endif
