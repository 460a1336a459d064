#ifndef CORVCIM_CLASS_TABLE_H
#define CORVCIM_CLASS_TABLE_H

#include <cmpidt.h>

#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

/// The classes that this host knows: what a production broker would learn from MOF and registration
/// files. Everything here is constant data; all functions may be called from any thread. Class and
/// property names compare without regard to ASCII case, as everywhere in CIM.

/// The namespace that all classes are served in.
inline constexpr std::string_view servedNameSpace = "root/cimv2";

struct PropertyDefinition {
  std::string_view name;            ///< as the providers spell it
  CMPIType type;                    ///< exact CMPI type; texts are CMPI_string, references CMPI_ref
  bool key = false;                 ///< part of the object path
  std::string_view referenceClass;  ///< class at the far side of a reference; empty for anything else
  std::string_view selection = {};  ///< by which name the provider selects it in property lists; empty: by its own
};

struct ClassDefinition {
  std::string_view name;
  std::string_view parent;  ///< DMTF class that it is derived from
  bool association;
  std::span<const PropertyDefinition> properties;  ///< keys first
  std::string_view provider;                       ///< prefix of the factory functions: <provider>_Create_InstanceMI
  std::string_view library;                        ///< base name of the shared object: lib<library>.so
  std::string_view group;  ///< classes of one group share a process, classes of different groups never do
};

/// Every class with a provider, in the order in which people want to see them: system, processors,
/// their parts, then associations.
[[nodiscard]] std::span<const ClassDefinition> classDefinitions();

/// The class of this name; nullptr if the table has none (also for DMTF classes, which nobody serves).
[[nodiscard]] const ClassDefinition* findClass(std::string_view name);

/// The property or reference of this name; nullptr if the class has none.
[[nodiscard]] const PropertyDefinition* findProperty(const ClassDefinition& definition, std::string_view name);

/// The names of a property list as the providers compare them, letter by letter: every spelling that a class
/// has for it, its own name and the one by which it is selected. A name that no class has stays as it is.
[[nodiscard]] std::vector<std::string> asProvidersSpell(const std::vector<std::string>& propertyNames);

/// The name of the DMTF or table class that `name` is derived from; empty at the top and for unknown names.
[[nodiscard]] std::string_view parentOf(std::string_view name);

/// Whether `name` is `ancestor` or derived from it, through the DMTF classes. An unknown class is only itself.
[[nodiscard]] bool isA(std::string_view name, std::string_view ancestor);

/// The served classes that are `name` or derived from it, in table order; empty for an unknown name.
[[nodiscard]] std::vector<const ClassDefinition*> classesServing(std::string_view name);

/// The association classes that have an end of class `source` (or of an ancestor or child of it).
[[nodiscard]] std::vector<const ClassDefinition*> associationsOf(std::string_view source);

/// The two reference properties of an association; empty for any other class.
[[nodiscard]] std::span<const PropertyDefinition> referenceEnds(const ClassDefinition& association);

}  // namespace Corvcim

#endif
