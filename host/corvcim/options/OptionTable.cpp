#include "host/corvcim/options/OptionTable.h"

#include <algorithm>
#include <iterator>
#include <vector>

#include "host/corvcim/options/SourceArgument.h"
#include "platform/locale/Catalogue.h"

namespace Corvcim {
namespace {

constexpr Scope everyVerb = {[](const VerbSyntax&) { return true; }, "", true};
constexpr Scope associationVerbs = {[](const VerbSyntax& verb) { return verb.isAssociation; },
                                    "it belongs to ai, ain, ri and rin"};
constexpr Scope associatorVerbs = {
    [](const VerbSyntax& verb) { return verb.verb == Verb::Associators || verb.verb == Verb::AssociatorNames; },
    "it belongs to ai and ain, as a reference has no far end"};
constexpr Scope oneInventory = {[](const VerbSyntax& verb) { return verb.verb != Verb::Diff; },
                                "A and B say which inventories", true};
constexpr Scope onlyInventory = {[](const VerbSyntax& verb) { return verb.verb == Verb::Inventory; },
                                 "it belongs to inventory"};
constexpr Scope columnVerbs = {[](const VerbSyntax& verb) { return std::ranges::any_of(verb.formats, hasColumns); },
                               "its output has no columns"};
constexpr Scope onlyDiff = {[](const VerbSyntax& verb) { return verb.verb == Verb::Diff; }, "it belongs to diff"};
constexpr Scope requests = {[](const VerbSyntax& verb) { return verb.isRequest; },
                            "it belongs to ei, ein, gi, ai, ain, ri and rin"};
constexpr Scope onlySnapshot = {[](const VerbSyntax& verb) { return verb.verb == Verb::Snapshot; },
                                "it belongs to snapshot"};

template <std::string Options::*member>
void setTo(Options& options, const std::string& value) {
  options.*member = value;
}

template <bool Options::*member>
void setTrue(Options& options, const std::string& /*value*/) {
  options.*member = true;
}

template <std::optional<std::string> AssociationOptions::*member>
void narrow(Options& options, const std::string& value) {
  options.association.*member = value;
}

void setFormat(Options& options, const std::string& name) {
  const auto* const found = std::ranges::find(allFormats, std::string_view(name), formatName);
  if (found == std::end(allFormats)) {
    failUsage("unknown output format " + inQuotes(name) + ": it can be " + formatList(allFormats));
  }
  options.format = *found;
}

void setNameSpace(Options& options, const std::string& name) {
  if (name.empty()) {
    failUsage("the namespace is empty");
  }
  options.nameSpace = name;
}

std::vector<std::string> splitAtCommas(std::string_view list) {
  std::vector<std::string> names;
  while (!list.empty()) {
    const std::size_t comma = list.find(',');
    const std::string_view name = list.substr(0, comma);
    if (!name.empty()) {
      names.emplace_back(name);
    }
    list = comma == std::string_view::npos ? std::string_view() : list.substr(comma + 1);
  }
  return names;
}

void setIgnoredFields(Options& options, const std::string& list) {
  options.ignoredFields = splitAtCommas(list);
}

void setInventory(Options& options, const std::string& source) {
  checkSource("--inventory", source);
  options.inventory = source;
}

void setLanguage(Options& options, const std::string& id) {
  if (!Tarn::Locale::isTranslated(id)) {
    std::string known;
    for (const std::string& language : Tarn::Locale::translatedLanguages()) {
      known.append(known.empty() ? "" : ", ").append(language);
    }
    failUsage("unknown language " + inQuotes(id) + ": it can be " + known);
  }
  options.language = id;
}

constexpr OptionSyntax syntaxTable[] = {
    {"--inventory", "-i", "SOURCE", "source", oneInventory, setInventory, "where the inventory comes from",
     ": live, root:DIR (a captured /sys and /proc), snapshot:FILE, json:FILE, hwloc:FILE, or smbios:FILE (a dump of the firmware's tables), alone or over another: smbios:FILE+live; FILE without its kind, or - for standard input",
     "Where the inventory comes from:\n"
     ".Cm live\n"
     "(this machine),\n"
     ".Cm root: Ns Ar directory\n"
     "(a captured root directory with\n"
     ".Pa sys\n"
     "and\n"
     ".Pa proc ) ,\n"
     ".Cm snapshot: Ns Ar file ,\n"
     ".Cm json: Ns Ar file ,\n"
     "or\n"
     ".Cm smbios: Ns Ar file ,\n"
     "a dump of the firmware's tables as\n"
     ".Ql dmidecode --dump-bin\n"
     "writes it.\n"
     "The dump can stand for the tables of another source:\n"
     ".Cm smbios: Ns Ar file Ns Cm +live ,\n"
     ".Cm smbios: Ns Ar file Ns Cm +root: Ns Ar directory .\n"
     ".Cm hwloc: Ns Ar file\n"
     "and\n"
     ".Cm hwloc-synthetic: Ns Ar text\n"
     "are converted as\n"
     ".Fl -from\n"
     "does it.\n"
     "The name of a\n"
     ".Ar file\n"
     "or a directory may stand alone: its first bytes show the kind.\n"
     ".Cm -\n"
     "is standard input, alone or as the\n"
     ".Ar file .\n"
     "Standard input and pipes are read once, whole, also by verbs that ask several processes.\n"
     "Without the option, the agent's configuration decides; its default is this machine.\n"},
    {"--output", "-o", "FORMAT", "format", everyVerb, setFormat, "output format",
     ": text, table, csv, mof or json; for tree: text, json, svg or dot",
     ".Cm text\n"
     "for people (the default),\n"
     ".Cm table\n"
     "for people with a line for each instance,\n"
     ".Cm csv , mof\n"
     "or\n"
     ".Cm json\n"
     "for programs; for\n"
     ".Cm tree\n"
     ".Cm text , json , svg\n"
     "or\n"
     ".Cm dot .\n"
     "Not every verb has every format;\n"
     ".Nm\n"
     ".Ar verb\n"
     ".Fl -help\n"
     "lists those that it has.\n"
     "CSV, MOF and JSON are always in English, in UTF-8, in base units, and valid whatever the inventory\n"
     "holds; a JSON property without a value is null.\n"
     ".Pp\n"
     ".Cm table\n"
     "and\n"
     ".Cm csv\n"
     "have a row for each instance, or for each path with its keys, below a row with the names of the\n"
     "columns.\n"
     "The columns are the properties that were listed, in that order.\n"
     "Without a list they are all properties that the instances have, after\n"
     ".Li Class\n"
     "if there are instances of several classes; an empty list means the keys.\n"
     ".Cm csv\n"
     "is that of RFC 4180: lines end with CR LF, and a field that contains a comma, a double quote, CR or\n"
     "LF stands in double quotes, with its own double quotes doubled.\n"
     "Codes and numbers have neither names nor units, references are paths, and lists are written as JSON\n"
     "writes them.\n"
     "A property without a value is an empty field, an empty text is\n"
     ".Li \\(dq\\(dq .\n"},
    {"--columns", "", "PROP,...", "", columnVerbs, setPropertyList, "the columns of a table or of csv, in this order",
     "",
     "The columns of\n"
     ".Cm table\n"
     "and\n"
     ".Cm csv ,\n"
     "also for verbs that take no list of properties.\n"},
    {"--namespace", "-n", "NS", "namespace", everyVerb, setNameSpace, "namespace of classes and paths without one",
     " (root/cimv2)",
     "The namespace of classes and paths that are given without one.\n"
     "The default is\n"
     ".Li root/cimv2 ,\n"
     "the only one that classes are served in; any other is refused, but with\n"
     ".Fl -as-is .\n"},
    {"--library", "-l", "FILE", "file", everyVerb, setTo<&Options::library>, "the provider library", "",
     "The provider library.\n"
     "The default is the one that was built or installed with this program.\n"},
    {"--companion", "", "FILE", "file", everyVerb, setTo<&Options::companion>, "the library with HALDA_ComputerSystem",
     "",
     "The library that provides\n"
     ".Li HALDA_ComputerSystem .\n"},
    {"--from", "", "DESCRIPTION", "description", onlyInventory, setTo<&Options::convertFrom>, "what inventory converts",
     ": hwloc:FILE (XML of lstopo) or hwloc-synthetic:\"package:2 core:4 pu:2\"",
     "What\n"
     ".Cm inventory\n"
     "converts:\n"
     ".Cm hwloc: Ns Ar file ,\n"
     "an XML file as\n"
     ".Xr lstopo 1\n"
     "writes it, or\n"
     ".Cm hwloc-synthetic: Ns Ar text ,\n"
     "levels of a machine and how many there are of each in the one above, such as\n"
     ".Li package:2 l3:1 l2:4 core:1 pu:2 .\n"
     "Parts get the paths that they have on the machine itself.\n"
     "Nothing but the description is read, in particular no\n"
     ".Ev HWLOC_\n"
     "variable.\n"
     "A program that was built without hwloc says so.\n"},
    {"--ignore", "", "FIELD,...", "field", onlyDiff, setIgnoredFields, "what diff leaves out",
     ", such as CurrentClockSpeed",
     "What\n"
     ".Cm diff\n"
     "leaves out:\n"
     ".Li type , parent , status , description , cpus\n"
     "or the name of a property, such as\n"
     ".Li CurrentClockSpeed ,\n"
     "which changes by itself.\n"},
    {"--as-is", "", "", "", requests, setTrue<&Options::asIs>,
     "sends a request as it was typed, without a broker's checks", "",
     "Sends the request of\n"
     ".Cm ei , ein , gi , ai , ain , ri\n"
     "or\n"
     ".Cm rin\n"
     "as it was typed, and shows what the provider itself answers.\n"
     "Without it\n"
     ".Nm\n"
     "does what a good broker does: it refuses names that do not exist, gives providers the exact names of\n"
     "classes and properties, and applies result classes and roles.\n"
     "With it a class goes to the provider of every class that it names or stands for, an association request\n"
     "to the providers of the associations that\n"
     ".Fl ac\n"
     "names or stands for, or else of all.\n"},
    {"--unmasked", "", "", "", onlySnapshot, setTrue<&Options::unmasked>,
     "keeps serial numbers and the like in a snapshot", "",
     "Keeps serial numbers and other identifiers in what\n"
     ".Cm snapshot\n"
     "writes.\n"},
    {"--language", "", "ID", "language", everyVerb, setLanguage, "language of captions and descriptions",
     ", such as de_AT",
     "The language of captions and descriptions in text:\n"
     ".Li @languages@ ,\n"
     "also with a region or a codeset, such as\n"
     ".Li de_AT\n"
     "or\n"
     ".Li fr_CA.UTF-8 .\n"},
    {"--help", "-h", "", "", everyVerb, setTrue<&Options::wantsHelp>, "this help",
     "; after a verb the help of that verb", "Shows the help; after a verb, the help of that verb.\n"},
    {"--version", "-V", "", "", everyVerb, setTrue<&Options::wantsVersion>, "the version", "", "Shows the version.\n"},
    {"", "-ac", "CLASS", "class", associationVerbs, narrow<&AssociationOptions::associationClass>, "association class",
     "", "The association class.\n"},
    {"", "-arc", "CLASS", "class", associationVerbs, narrow<&AssociationOptions::resultClass>, "class of the result",
     "",
     "The class of the result; for\n"
     ".Cm ri\n"
     "and\n"
     ".Cm rin ,\n"
     "whose results are associations, the same as\n"
     ".Fl ac .\n"},
    {"", "-ar", "ROLE", "role", associationVerbs, narrow<&AssociationOptions::role>, "role of PATH in the association",
     "", "The role of the path in the association: the name of the reference that refers to it.\n"},
    {"", "-arr", "ROLE", "role", associatorVerbs, narrow<&AssociationOptions::resultRole>,
     "role of the result (ai and ain)", "",
     "The role of the result;\n"
     ".Cm ai\n"
     "and\n"
     ".Cm ain\n"
     "only.\n"},
};

}  // namespace

std::span<const OptionSyntax> optionTable() {
  return syntaxTable;
}

std::string inQuotes(std::string_view word) {
  return "'" + std::string(word) + "'";
}

void failUsage(const std::string& text) {
  throw UsageError(text + "; see 'corvcim --help'");
}

/// The command line is at fault here, so the message does not mention the configuration, which names a source as well.
void checkSource(std::string_view said, std::string_view source) {
  if (!isSourceArgument(source)) {
    failUsage(std::string(said) + ": " + inQuotes(source) +
              " is neither a file nor another source of an inventory: it can be " + std::string(sourceArgumentForms));
  }
}

void setPropertyList(Options& options, const std::string& list) {
  options.hasPropertyList = true;
  options.properties = splitAtCommas(list);
}

}  // namespace Corvcim
