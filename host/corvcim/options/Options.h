#ifndef HOST_CORVCIM_OPTIONS_OPTIONS_H
#define HOST_CORVCIM_OPTIONS_OPTIONS_H

#include <cstddef>
#include <optional>
#include <span>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "host/corvcim/options/Verbs.h"
#include "schema/ClassTable.h"

namespace Corvcim {

/// What an association request is narrowed to, as far as it is given.
struct AssociationOptions {
  std::optional<std::string> associationClass;
  std::optional<std::string> resultClass;
  std::optional<std::string> role;
  std::optional<std::string> resultRole;
};

/// One command line, understood.
struct Options {
  std::string library;      ///< the provider library; empty: the one that belongs to this program
  std::string companion;    ///< the library with HALDA_ComputerSystem; empty: the one beside it
  std::string inventory;    ///< as settleSource takes it; empty: as the environment says
  std::string convertFrom;  ///< what the verb inventory converts, as readHwloc takes it; empty: nothing
  std::string language;     ///< as CORVANE_LANGUAGE takes it; empty: as the environment says
  std::string nameSpace{servedNameSpace};
  Format format = Format::Text;
  const VerbSyntax* verb = &overviewSyntax();
  std::vector<std::string> operands;  ///< the words after the verb, as its syntax names them
  bool hasPropertyList = false;
  std::vector<std::string> properties;  ///< an empty list selects the keys alone
  AssociationOptions association;
  std::vector<std::string> ignoredFields;  ///< what diff leaves out
  bool asIs = false;                       ///< the request goes to the providers as it was typed
  bool unmasked = false;                   ///< snapshot keeps serial numbers and the like
  bool wantsHelp = false;
  bool wantsVersion = false;

  /// The operand at that place, from 0 on; empty where it was left out.
  [[nodiscard]] std::string_view operand(std::size_t place) const {
    return place < operands.size() ? std::string_view(operands[place]) : std::string_view();
  }
};

/// A command line that cannot be understood; what() is one line that says what is wrong and how it
/// is written.
class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// Understands the arguments after the program's name. Options may stand before or after the verb;
/// "--" ends them. Throws UsageError.
Options parseOptions(std::span<const char* const> arguments);

}  // namespace Corvcim

#endif
