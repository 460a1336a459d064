#ifndef HOST_CORVCIM_OPTIONS_OPTIONTABLE_H
#define HOST_CORVCIM_OPTIONS_OPTIONTABLE_H

#include <span>
#include <string>
#include <string_view>

#include "host/corvcim/options/Options.h"

namespace Corvcim {

/// The verbs that an option is for, and what the others answer.
struct Scope {
  bool (*holds)(const VerbSyntax& verb);
  std::string_view explanation;
  bool isGeneral = false;  ///< for all verbs but exceptions, so that the help of one verb does not list the option
};

/// An option: what it does, and what help, manual page and completions say of it.
struct OptionSyntax {
  std::string_view longName;   ///< "--output"; empty: none
  std::string_view shortName;  ///< "-o", "-arc"; empty: none
  std::string_view value;      ///< as the help names it, "FORMAT"; empty: the option has none
  std::string_view kind;       ///< of the value: the completions have a function _corvcim_KIND that offers such values
  const Scope& scope;
  void (*apply)(Options& options, const std::string& value);  ///< is given "" if the option has no value
  std::string_view summary;
  std::string_view details;  ///< what the help adds to the summary
  std::string_view manual;   ///< the paragraph of the manual page, in mdoc
};

/// All options, in the order in which the help lists them; those that narrow associations, with a short name alone,
/// last.
std::span<const OptionSyntax> optionTable();

// For the rows of the table and for what reads the command line:

std::string inQuotes(std::string_view word);

/// Throws UsageError, which ends with a hint at the help.
[[noreturn]] void failUsage(const std::string& text);

/// Refuses what settleSource could not take. `said` is where the source was named.
void checkSource(std::string_view said, std::string_view source);

/// Takes names with commas between them as the properties asked for.
void setPropertyList(Options& options, const std::string& list);

}  // namespace Corvcim

#endif
