#include "host/corvcim/options/Usage.h"

#include <algorithm>
#include <utility>

#include "host/corvcim/options/OptionTable.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

constexpr std::string_view introduction =
    "Usage: corvcim [OPTION...] [VERB [ARGUMENT...]]\n"
    "\n"
    "Loads the CPU provider library as a CIM broker does and asks it about this\n"
    "machine's processors. Without a verb: one screen about them.\n"
    "\n"
    "Verbs:\n";

constexpr std::string_view ending =
    "\n"
    "Exit status: 0 success, 1 an operation failed, 2 the command line is wrong;\n"
    "of diff: 0 no differences, 1 differences, 2 trouble; of health: 0 OK,\n"
    "1 degraded, 2 failed, 3 unknown.\n"
    "\n"
    "Examples:\n"
    "  corvcim ei HALDA_CPUProcessor DeviceID,Name,MaxClockSpeed\n"
    "  corvcim -o json ei root/cimv2:HALDA_CPUMemory\n"
    "  corvcim -o csv ei HALDA_CPUProcessor DeviceID,Name,HealthState\n"
    "  corvcim tree -o svg > machine.svg\n";

/// The text in lines of the help's width, all but the first indented.
std::string wrapped(std::string_view text, std::size_t indent) {
  constexpr std::size_t lastColumn = 80;
  std::string lines;
  std::size_t column = indent;
  while (!text.empty()) {
    const std::string_view word = text.substr(0, text.find(' '));
    if (column != indent && column + 1 + word.size() > lastColumn) {
      lines.append("\n").append(indent, ' ');
      column = indent;
    }
    lines.append(column == indent ? "" : " ").append(word);
    column += (column == indent ? 0 : 1) + word.size();
    text.remove_prefix(std::min(text.size(), word.size() + 1));
  }
  return lines;
}

/// A heading and the options that it is about; nothing if there are none.
template <class Belongs>
std::string optionHelp(std::string_view heading, Belongs belongs) {
  constexpr std::size_t summaryColumn = 26;
  std::string text;
  for (const OptionSyntax& option : optionTable()) {
    if (!belongs(option)) {
      continue;
    }
    std::string names = option.longName.empty() ? "  " : option.shortName.empty() ? "      " : "  ";
    names.append(option.shortName).append(option.longName.empty() || option.shortName.empty() ? "" : ", ");
    names.append(option.longName).append(option.value.empty() ? "" : " ").append(option.value);
    text += padRight(std::move(names), summaryColumn) +
            wrapped(std::string(option.summary).append(option.details), summaryColumn) + '\n';
  }
  return text.empty() ? text : '\n' + std::string(heading) + ":\n" + text;
}

}  // namespace

std::string programHelp() {
  constexpr std::size_t summaryColumn = 29;
  std::string text(introduction);
  for (const VerbSyntax& verb : verbs()) {
    text += "  " + padRight(callOf(verb), summaryColumn - 2) + wrapped(verb.summary, summaryColumn) + '\n';
  }
  text += optionHelp("Options", [](const OptionSyntax& option) { return !option.longName.empty(); });
  text +=
      optionHelp("Options for ai, ain, ri and rin", [](const OptionSyntax& option) { return option.longName.empty(); });
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
  return text + optionHelp("Options", [&](const OptionSyntax& option) {
           return option.scope.holds(verb) && !option.scope.isGeneral;
         });
}

std::string versionText() {
  return "corvcim " CORVCIM_VERSION "\n";
}

}  // namespace Corvcim
