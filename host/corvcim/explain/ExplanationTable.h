#ifndef HOST_CORVCIM_EXPLAIN_EXPLANATIONTABLE_H
#define HOST_CORVCIM_EXPLAIN_EXPLANATIONTABLE_H

#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "host/corvcim/text/NodeFields.h"

namespace Corvcim {

/// A table of the library that turns the inventory's codes into CIM values.
struct CodeTable {
  struct Row {
    unsigned int code;
    std::string_view value;
  };
  std::string_view name;
  std::span<const Row> rows;
  std::string_view otherwise;  ///< for any code without a row
};

/// What the library does to make a value.
enum class Step {
  Constant,  ///< it takes nothing from the inventory
  Copied,    ///< numbers and texts as they are
  Coded,     ///< a code by a table
  Computed   ///< anything else
};

/// Where a CIM property of an instance comes from in the inventory.
struct PropertySource {
  std::string_view className;
  std::string_view property;
  std::string_view field;  ///< of the node (NodeFields.h), or "path"; empty where there is none
  Step step;
  std::string_view words;    ///< what the library does; for a copy only what is special about it
  std::string_view unknown;  ///< what it does where the inventory does not have the field
  const CodeTable* codes = nullptr;
  std::string_view ifVirtual = {};  ///< the value in a virtual machine, whatever the inventory says
};

/// The properties of all classes that are explained, in the order of the class table.
std::span<const PropertySource> propertySources();

/// A datum of the inventory on its way to the library.
struct Datum {
  std::optional<FieldValue> value;
  bool isVirtual = false;  ///< the system's model says that the machine is virtual
};

/// What the library does with the datum, in words: "table EnabledState: 12 is 6".
std::string describeStep(const PropertySource& source, const Datum& datum);

/// The value that the library makes of the datum, as plain text, where the step is one that can be
/// followed here: a copy or a code of something that is known.
std::optional<std::string> expectedValue(const PropertySource& source, const Datum& datum);

}  // namespace Corvcim

#endif
