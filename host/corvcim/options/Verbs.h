#ifndef HOST_CORVCIM_OPTIONS_VERBS_H
#define HOST_CORVCIM_OPTIONS_VERBS_H

#include <span>
#include <string>
#include <string_view>

namespace Corvcim {

enum class Verb {
  Overview,
  Classes,
  EnumerateInstances,
  EnumerateInstanceNames,
  GetInstance,
  Associators,
  AssociatorNames,
  References,
  ReferenceNames,
  Inventory,
  Snapshot,
  Diff,
  Explain,
  Tree,
  Health,
  Help
};

enum class Format { Text, Table, Csv, Mof, Json, Svg, Dot };

inline constexpr Format allFormats[] = {Format::Text, Format::Table, Format::Csv, Format::Mof,
                                        Format::Json, Format::Svg,   Format::Dot};

/// Whether programs read the format: always in English and in UTF-8.
constexpr bool isForPrograms(Format format) {
  return format == Format::Csv || format == Format::Mof || format == Format::Json;
}

/// Whether the format has columns, which a list of properties can choose.
constexpr bool hasColumns(Format format) {
  return format == Format::Table || format == Format::Csv;
}

/// What the command line may say after one verb, and what its help says.
struct VerbSyntax {
  std::string_view name;
  Verb verb;
  std::string_view operands = {};  ///< as the usage line names them
  unsigned minimumOperands = 0;
  unsigned maximumOperands = 0;
  std::string_view summary;
  std::span<const Format> formats;  ///< the output formats that the verb knows
  bool isRequest = false;           ///< asks providers for one operation
  bool isAssociation = false;       ///< takes the options that name ends and classes
  std::string_view details = {};    ///< further paragraphs of the verb's own help
};

/// All verbs, in the order in which the help lists them. Overview has no name and is not listed.
std::span<const VerbSyntax> verbs();

/// The verb of that name, or NULL.
const VerbSyntax* findVerb(std::string_view name);

/// The syntax of `corvcim` without a verb.
const VerbSyntax& overviewSyntax();

/// The verb and its operands, as they are written: "ei CLASS [PROPERTY,...]".
std::string callOf(const VerbSyntax& verb);

std::string_view formatName(Format format);

/// The names of the formats, as a sentence lists them: "text, mof or json".
std::string formatList(std::span<const Format> formats);

}  // namespace Corvcim

#endif
