#include "host/corvcim/options/Verbs.h"

namespace Corvcim {
namespace {

constexpr Format textOnly[] = {Format::Text};
constexpr Format classFormats[] = {Format::Text, Format::Mof, Format::Json};
constexpr Format dataFormats[] = {Format::Text, Format::Table, Format::Csv, Format::Mof, Format::Json};
constexpr Format plainFormats[] = {Format::Text, Format::Json};
constexpr Format overviewFormats[] = {Format::Text, Format::Table, Format::Csv, Format::Json};
constexpr Format drawingFormats[] = {Format::Text, Format::Json, Format::Svg, Format::Dot};

constexpr std::string_view pathDetails =
    "PATH is an object path such as\n"
    "  root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C0\"\n"
    "as ein prints it; the namespace may be left out.\n";

constexpr std::string_view classDetails =
    "CLASS is a class name, with or without a namespace before it\n"
    "(root/cimv2:HALDA_CPUMemory).\n";

constexpr std::string_view associatorDetails =
    "PATH is an object path as ein prints it; the namespace may be left out.\n"
    "Without -ac every association class that PATH's class takes part in is asked.\n";

constexpr std::string_view referenceDetails =
    "PATH is an object path as ein prints it; the namespace may be left out.\n"
    "Without -arc (or -ac) every association class that PATH's class takes part in\n"
    "is asked.\n";

constexpr std::string_view inventoryDetails =
    "--from converts what hwloc describes, so that the library can be tried on it:\n"
    "  corvcim inventory -o json --from hwloc:machine.xml > machine.json\n"
    "  corvcim -i json:machine.json\n"
    "  corvcim inventory --from hwloc-synthetic:\"package:2 l3:1 l2:4 core:1 pu:2\"\n";

constexpr std::string_view diffDetails =
    "A and B are sources as --inventory takes them: live, root:DIR, snapshot:FILE,\n"
    "json:FILE, smbios:FILE. Parts are matched by their paths.\n"
    "--ignore CurrentClockSpeed,description leaves fields out; clocks change by\n"
    "themselves.\n"
    "\n"
    "Exit status: 0 no differences, 1 differences, 2 trouble.\n";

constexpr std::string_view explainDetails =
    "PART is a path of the inventory (P0, P0.L2.0), an object path as ein prints it,\n"
    "CLASS.KEY (HALDA_CPUMemory.P0.L2.0) or CLASS. Without it: every processor in\n"
    "short.\n"
    "PROPERTY is one or more names with commas between them.\n"
    "Of each property: the raw datum and the file or table it stands in, the\n"
    "inventory's value and the rule that made it, what the library does with it,\n"
    "which sources disagreed, and what could not be read and why.\n";

constexpr std::string_view snapshotDetails =
    "Writes every file that the inventory is read from into one, FILE or standard\n"
    "output, which -i snapshot:FILE reads as the same inventory on any machine: what\n"
    "to send along with a wrong answer. Serial numbers and other identifiers of this\n"
    "machine are masked, and the file's first lines say which; --unmasked keeps them.\n"
    "Run it as root: only root may read the firmware's tables.\n";

constexpr std::string_view healthDetails =
    "One line for each processor: OK, DEGRADED, UNKNOWN or FAILED, its path, and why.\n"
    "\n"
    "FAILED    its health is a failure\n"
    "UNKNOWN   its state or health is not known, or it cannot be asked\n"
    "DEGRADED  its health is degraded, it is not in use, not all of its cores are\n"
    "          enabled, or a core or cache of it has failed or is degraded\n"
    "\n"
    "Exit status: 0 all OK, 1 the worst is DEGRADED, 2 FAILED, 3 UNKNOWN. Mistakes on\n"
    "the command line and errors of the program are UNKNOWN.\n";

constexpr VerbSyntax overview = {
    .name = "", .verb = Verb::Overview, .summary = "one screen about the processors", .formats = overviewFormats};

constexpr VerbSyntax syntaxes[] = {
    {.name = "classes",
     .verb = Verb::Classes,
     .operands = "[CLASS]",
     .maximumOperands = 1,
     .summary = "the classes that can be asked, or all about one",
     .formats = classFormats,
     .details = "Of CLASS: its properties with their types, keys, units and value names.\n"},
    {.name = "ei",
     .verb = Verb::EnumerateInstances,
     .operands = "CLASS [PROPERTY,...]",
     .minimumOperands = 1,
     .maximumOperands = 2,
     .summary = "every instance of a class",
     .formats = dataFormats,
     .isRequest = true,
     .details = classDetails},
    {.name = "ein",
     .verb = Verb::EnumerateInstanceNames,
     .operands = "CLASS",
     .minimumOperands = 1,
     .maximumOperands = 1,
     .summary = "the paths of every instance",
     .formats = dataFormats,
     .isRequest = true,
     .details = classDetails},
    {.name = "gi",
     .verb = Verb::GetInstance,
     .operands = "PATH [PROPERTY,...]",
     .minimumOperands = 1,
     .maximumOperands = 2,
     .summary = "one instance",
     .formats = dataFormats,
     .isRequest = true,
     .details = pathDetails},
    {.name = "ai",
     .verb = Verb::Associators,
     .operands = "PATH [PROPERTY,...]",
     .minimumOperands = 1,
     .maximumOperands = 2,
     .summary = "the instances associated with one",
     .formats = dataFormats,
     .isRequest = true,
     .isAssociation = true,
     .details = associatorDetails},
    {.name = "ain",
     .verb = Verb::AssociatorNames,
     .operands = "PATH",
     .minimumOperands = 1,
     .maximumOperands = 1,
     .summary = "the paths of those",
     .formats = dataFormats,
     .isRequest = true,
     .isAssociation = true,
     .details = associatorDetails},
    {.name = "ri",
     .verb = Verb::References,
     .operands = "PATH [PROPERTY,...]",
     .minimumOperands = 1,
     .maximumOperands = 2,
     .summary = "the associations that refer to an instance",
     .formats = dataFormats,
     .isRequest = true,
     .isAssociation = true,
     .details = referenceDetails},
    {.name = "rin",
     .verb = Verb::ReferenceNames,
     .operands = "PATH",
     .minimumOperands = 1,
     .maximumOperands = 1,
     .summary = "the paths of those",
     .formats = dataFormats,
     .isRequest = true,
     .isAssociation = true,
     .details = referenceDetails},
    {.name = "inventory",
     .verb = Verb::Inventory,
     .summary = "the inventory that the library reads; -o json writes a file for json:FILE",
     .formats = plainFormats,
     .details = inventoryDetails},
    {.name = "explain",
     .verb = Verb::Explain,
     .operands = "[PART [PROPERTY]]",
     .maximumOperands = 2,
     .summary = "where values come from",
     .formats = plainFormats,
     .details = explainDetails},
    {.name = "snapshot",
     .verb = Verb::Snapshot,
     .operands = "[FILE]",
     .maximumOperands = 1,
     .summary = "the files that the inventory is read from, in one",
     .formats = textOnly,
     .details = snapshotDetails},
    {.name = "diff",
     .verb = Verb::Diff,
     .operands = "A B",
     .minimumOperands = 2,
     .maximumOperands = 2,
     .summary = "what differs between two inventories",
     .formats = plainFormats,
     .details = diffDetails},
    {.name = "tree",
     .verb = Verb::Tree,
     .summary = "system, processors, cores and caches as a drawing",
     .formats = drawingFormats,
     .details = "Caches stand above the cores that share them, as the inventory tells it.\n"},
    {.name = "health",
     .verb = Verb::Health,
     .summary = "the state of each processor, the worst first, for monitoring",
     .formats = textOnly,
     .details = healthDetails},
    {.name = "help",
     .verb = Verb::Help,
     .operands = "[VERB]",
     .maximumOperands = 1,
     .summary = "the help of a verb",
     .formats = textOnly},
};

}  // namespace

std::span<const VerbSyntax> verbs() {
  return syntaxes;
}

const VerbSyntax* findVerb(std::string_view name) {
  for (const VerbSyntax& syntax : syntaxes) {
    if (syntax.name == name) {
      return &syntax;
    }
  }
  return nullptr;
}

const VerbSyntax& overviewSyntax() {
  return overview;
}

std::string callOf(const VerbSyntax& verb) {
  std::string call(verb.name);
  return verb.operands.empty() ? call : call.append(" ").append(verb.operands);
}

std::string_view formatName(Format format) {
  switch (format) {
    case Format::Text:
      return "text";
    case Format::Table:
      return "table";
    case Format::Csv:
      return "csv";
    case Format::Mof:
      return "mof";
    case Format::Json:
      return "json";
    case Format::Svg:
      return "svg";
    case Format::Dot:
      return "dot";
  }
  return "";
}

std::string formatList(std::span<const Format> formats) {
  std::string list;
  for (std::size_t i = 0; i < formats.size(); ++i) {
    const bool isLast = i + 1 == formats.size();
    list += i == 0 ? "" : isLast ? " or " : ", ";
    list += formatName(formats[i]);
  }
  return list;
}

}  // namespace Corvcim
