#include "host/cli/Usage.h"

#include "host/cli/Text.h"

namespace Corvcim {
namespace {

constexpr std::string_view introduction =
    "Usage: corvcim [OPTION...] [VERB [ARGUMENT...]]\n"
    "\n"
    "Loads the CPU provider library as a CIM broker does and asks it about this\n"
    "machine's processors. Without a verb: one screen about them.\n"
    "\n"
    "Verbs:\n";

constexpr std::string_view optionHelp =
    "\n"
    "Options:\n"
    "  -i, --inventory SOURCE  live, root:DIR (a captured /sys and /proc), snapshot:FILE,\n"
    "                          json:FILE, hwloc:FILE, or smbios:FILE (a dump of the\n"
    "                          firmware's tables), alone or over another: smbios:FILE+live;\n"
    "                          FILE without its kind, or - for standard input\n"
    "  -o, --output FORMAT     text, table, csv, mof or json; for tree: text, json, svg or dot\n"
    "      --columns PROP,...  the columns of a table or of csv, in this order\n"
    "  -n, --namespace NS      namespace of classes and paths without one (root/cimv2)\n"
    "  -l, --library FILE      the provider library\n"
    "      --companion FILE    the library with HALDA_ComputerSystem\n"
    "      --from DESCRIPTION  what inventory converts: hwloc:FILE (XML of lstopo) or\n"
    "                          hwloc-synthetic:\"package:2 core:4 pu:2\"\n"
    "      --ignore FIELD,...  what diff leaves out, such as CurrentClockSpeed\n"
    "      --as-is             sends a request as it was typed, without a broker's checks\n"
    "      --unmasked          keeps serial numbers and the like in a snapshot\n"
    "      --language ID       language of captions and descriptions, such as de_AT\n"
    "  -h, --help              this help; after a verb: the help of that verb\n"
    "  -V, --version           the version\n";

constexpr std::string_view associationHelp =
    "\n"
    "Options for ai, ain, ri and rin:\n"
    "  -ac CLASS               association class\n"
    "  -arc CLASS              class of the result\n"
    "  -ar ROLE                role of PATH in the association\n"
    "  -arr ROLE               role of the result (ai and ain)\n";

constexpr std::string_view ending =
    "\n"
    "Exit status: 0 success, 1 an operation failed, 2 the command line is wrong;\n"
    "of diff: 0 no differences, 1 differences, 2 trouble; of health: 0 OK, 1 degraded,\n"
    "2 failed, 3 unknown.\n"
    "\n"
    "Examples:\n"
    "  corvcim ei HALDA_CPUProcessor DeviceID,Name,MaxClockSpeed\n"
    "  corvcim -o json ei root/cimv2:HALDA_CPUMemory\n"
    "  corvcim -o csv ei HALDA_CPUProcessor DeviceID,Name,HealthState\n"
    "  corvcim tree -o svg > machine.svg\n";

}  // namespace

std::string programHelp() {
  std::string text(introduction);
  for (const VerbSyntax& verb : verbs()) {
    text += "  " + padRight(callOf(verb), 27) + std::string(verb.summary) + '\n';
  }
  text += optionHelp;
  text += associationHelp;
  text += ending;
  return text;
}

std::string verbHelp(const VerbSyntax& verb) {
  std::string text = "Usage: corvcim [OPTION...] " + callOf(verb);
  text += "\n\nShows " + std::string(verb.summary) + ".\n";
  text += "Output: " + formatList(verb.formats) + ".\n";
  if (!verb.details.empty()) {
    text += '\n' + std::string(verb.details);
  }
  if (verb.isAssociation) {
    text += associationHelp;
  }
  return text;
}

std::string versionText() {
  return "corvcim " CORVCIM_VERSION "\n";
}

}  // namespace Corvcim
