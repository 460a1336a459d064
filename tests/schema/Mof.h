#ifndef TESTS_SCHEMA_MOF_H
#define TESTS_SCHEMA_MOF_H

#include <string>
#include <string_view>
#include <vector>

namespace Mof {

/// As much of MOF as class declarations and instances need. A text that is anything else throws
/// std::runtime_error with the line.

struct Qualifier {
  std::string name;
  std::vector<std::string> values;  ///< adjacent literals joined; empty for a flag such as Key
};

struct Property {
  std::string type;  ///< "uint16", "uint16[]", "ref"
  std::string name;
  std::string referenceClass;
  std::vector<Qualifier> qualifiers;
};

struct Class {
  std::string name;
  std::string parent;
  std::vector<Qualifier> qualifiers;
  std::vector<Property> properties;
};

std::vector<Class> readClasses(const std::string& file);

/// The qualifier of this name, without regard to case; nullptr if there is none.
const Qualifier* find(const std::vector<Qualifier>& qualifiers, std::string_view name);

/// The text with ASCII letters in lower case: CIM names ignore case.
std::string lowered(std::string_view text);

}  // namespace Mof

#endif
