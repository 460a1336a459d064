#include "host/cli/Verbs.h"

namespace Corvcim {
namespace {

constexpr Format textOnly[] = {Format::Text};
constexpr Format dataFormats[] = {Format::Text, Format::Mof, Format::Json};
constexpr Format plainFormats[] = {Format::Text, Format::Json};
constexpr Format drawingFormats[] = {Format::Text, Format::Svg, Format::Dot};

constexpr std::string_view pathDetails =
    "PATH is an object path such as\n"
    "  root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C0\"\n"
    "as ein prints it; the namespace may be left out.\n";

constexpr std::string_view classDetails =
    "CLASS is a class name, with or without a namespace before it (root/cimv2:HALDA_CPUMemory).\n";

constexpr std::string_view associatorDetails =
    "PATH is an object path as ein prints it; the namespace may be left out.\n"
    "Without -ac every association class that PATH's class takes part in is asked.\n";

constexpr std::string_view referenceDetails =
    "PATH is an object path as ein prints it; the namespace may be left out.\n"
    "Without -arc (or -ac) every association class that PATH's class takes part in is asked.\n";

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
    "CLASS.KEY (HALDA_CPUMemory.P0.L2.0) or CLASS. Without it: every processor, short.\n"
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

constexpr VerbSyntax overview = {"", Verb::Overview, "", 0, 0, "one screen about the processors", textOnly, false, ""};

constexpr VerbSyntax syntaxes[] = {
    {"classes", Verb::Classes, "", 0, 0, "the classes that can be asked, with their keys", dataFormats, false, ""},
    {"ei", Verb::EnumerateInstances, "CLASS [PROPERTY,...]", 1, 2, "every instance of a class", dataFormats, false,
     classDetails},
    {"ein", Verb::EnumerateInstanceNames, "CLASS", 1, 1, "the paths of every instance", dataFormats, false,
     classDetails},
    {"gi", Verb::GetInstance, "PATH [PROPERTY,...]", 1, 2, "one instance", dataFormats, false, pathDetails},
    {"ai", Verb::Associators, "PATH [PROPERTY,...]", 1, 2, "the instances associated with one", dataFormats, true,
     associatorDetails},
    {"ain", Verb::AssociatorNames, "PATH", 1, 1, "the paths of those", dataFormats, true, associatorDetails},
    {"ri", Verb::References, "PATH [PROPERTY,...]", 1, 2, "the associations that refer to an instance", dataFormats,
     true, referenceDetails},
    {"rin", Verb::ReferenceNames, "PATH", 1, 1, "the paths of those", dataFormats, true, referenceDetails},
    {"inventory", Verb::Inventory, "", 0, 0,
     "the inventory that the library reads; -o json writes a file for json:FILE", plainFormats, false,
     inventoryDetails},
    {"explain", Verb::Explain, "[PART [PROPERTY]]", 0, 2, "where values come from", plainFormats, false,
     explainDetails},
    {"snapshot", Verb::Snapshot, "[FILE]", 0, 1, "the files that the inventory is read from, in one", textOnly, false,
     snapshotDetails},
    {"diff", Verb::Diff, "A B", 2, 2, "what differs between two inventories", plainFormats, false, diffDetails},
    {"tree", Verb::Tree, "", 0, 0, "system, processors, cores and caches as a drawing", drawingFormats, false,
     "Caches stand above the cores that share them, as the inventory tells it.\n"},
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

std::string_view formatName(Format format) {
  switch (format) {
    case Format::Text:
      return "text";
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
