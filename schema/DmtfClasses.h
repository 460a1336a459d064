#ifndef CORVCIM_DMTF_CLASSES_H
#define CORVCIM_DMTF_CLASSES_H

#include <span>
#include <string_view>

#include "schema/ClassTable.h"

namespace Corvcim {

/// The classes of the DMTF schema above those of the class table, each with the properties of its own
/// that this product's classes have or that its clients ask for. A class of the table that declares
/// one of them overrides it, so it must have the same type: a broker drops a value of any other.
/// Constant data, from any thread.

struct DmtfClass {
  std::string_view name;
  std::string_view parent;  ///< empty at the top
  std::span<const PropertyDefinition> properties;
};

[[nodiscard]] std::span<const DmtfClass> dmtfClasses();

/// The class of this name; nullptr if there is none.
[[nodiscard]] const DmtfClass* findDmtfClass(std::string_view name);

/// The definition that a class of the table inherits for `property`: that of the nearest DMTF class above
/// it; nullptr if there is none, so that the property would be the class's own addition.
[[nodiscard]] const PropertyDefinition* inheritedProperty(const ClassDefinition& definition, std::string_view property);

}  // namespace Corvcim

#endif
