// Writes the manual page and the completions: templates with the parts that come from the tables of options and verbs.
// Called by the build as: corvcim_write_texts TEMPLATE OUTPUT

#include <algorithm>
#include <cstdlib>
#include <exception>
#include <fstream>
#include <iostream>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "host/corvcim/options/OptionTable.h"
#include "host/corvcim/options/Usage.h"
#include "host/corvcim/text/NodeFields.h"
#include "platform/base/Ascii.h"
#include "platform/locale/Catalogue.h"
#include "schema/ClassTable.h"

namespace Corvcim {
namespace {

/// Puts a new word into a list with blanks between.
void addWord(std::string& words, std::string_view word) {
  if ((' ' + words + ' ').find(' ' + std::string(word) + ' ') == std::string::npos) {
    words.append(words.empty() ? "" : " ").append(word);
  }
}

template <class List, class Name>
std::string wordsOf(const List& list, Name name) {
  std::string words;
  for (const auto& each : list) {
    addWord(words, name(each));
  }
  return words;
}

std::string joined(const std::vector<std::string>& lines) {
  std::string text;
  for (const std::string& line : lines) {
    text += (text.empty() ? "" : "\n") + line;
  }
  return text;
}

std::string lowered(std::string_view text) {
  std::string result(text);
  std::ranges::transform(result, result.begin(), Tarn::Common::lower);
  return result;
}

// The manual page

std::string itemOf(const OptionSyntax& option) {
  std::string value = lowered(option.value);
  if (const std::size_t list = value.find(",..."); list != std::string::npos) {
    value.replace(list, std::string::npos, " , Ns ...");
  }
  std::string item;
  for (const std::string_view name : {option.shortName, option.longName}) {
    if (!name.empty()) {
      item.append(item.empty() ? ".It Fl " : " , Fl ").append(name.substr(1));
      item += value.empty() ? "" : " Ar " + value;
    }
  }
  return item;
}

std::string manualOptions(bool narrowAssociations) {
  std::vector<std::string> lines;
  for (const OptionSyntax& option : optionTable()) {
    if (option.longName.empty() == narrowAssociations) {
      lines.push_back(itemOf(option));
      lines.emplace_back(option.manual.substr(0, option.manual.rfind('\n')));
    }
  }
  return joined(lines);
}

// The completions

std::string_view preferredName(const OptionSyntax& option) {
  return option.longName.empty() ? option.shortName : option.longName;
}

std::string optionsOf(const VerbSyntax& verb) {
  std::string words;
  for (const OptionSyntax& option : optionTable()) {
    if (option.scope.holds(verb)) {
      addWord(words, preferredName(option));
    }
  }
  return words;
}

std::string bashValues() {
  std::vector<std::string> lines;
  for (const OptionSyntax& option : optionTable()) {
    if (!option.kind.empty()) {
      const bool hasBoth = !option.shortName.empty() && !option.longName.empty();
      lines.push_back("    " + std::string(option.shortName) + (hasBoth ? " | " : "") + std::string(option.longName) +
                      ") _corvcim_" + std::string(option.kind) + " && return ;;");
    }
  }
  return joined(lines);
}

std::string bashVerbOptions() {
  std::vector<std::string> lines;
  for (const VerbSyntax& verb : verbs()) {
    lines.push_back("      " + std::string(verb.name) + ") options=\"" + optionsOf(verb) + "\" ;;");
  }
  return joined(lines);
}

/// Between single quotes.
std::string inShell(std::string_view text) {
  std::string result;
  for (const char letter : text) {
    result += letter == '\'' ? std::string("'\\''") : std::string(1, letter);
  }
  return result;
}

std::string zshOption(const OptionSyntax& option) {
  const std::string shortName(option.shortName);
  const std::string longName(option.longName);
  const bool endsCommand = option.longName == "--help" || option.longName == "--version";
  std::string text = "'" + std::string(preferredName(option));
  if (!shortName.empty() && !longName.empty()) {
    const std::string excluded = endsCommand ? "- *" : shortName + ' ' + longName;
    text = "'(" + excluded + ")'{" + shortName + ',' + longName + "}'";
  }
  text += '[' + inShell(option.summary) + ']';
  if (!option.value.empty()) {
    text += ':' + lowered(option.value.substr(0, option.value.find(','))) + ':' +
            (option.kind.empty() ? " " : "_corvcim_" + std::string(option.kind));
  }
  return text + "'";
}

/// The verbs that the option is for, the empty one first; empty if these are all.
std::string zshVerbsOf(const OptionSyntax& option) {
  std::string names;
  const bool isForOverview = option.scope.holds(overviewSyntax());
  bool isForAll = isForOverview;
  for (const VerbSyntax& verb : verbs()) {
    const bool holds = option.scope.holds(verb);
    isForAll = isForAll && holds;
    if (holds) {
      names.append(names.empty() && !isForOverview ? "" : "|").append(verb.name);
    }
  }
  return isForAll ? "" : names;
}

std::string zshOptions() {
  std::vector<std::string> lines;
  for (const OptionSyntax& option : optionTable()) {
    const std::string names = zshVerbsOf(option);
    lines.push_back((names.empty() ? "" : "[[ $verb == (" + names + ") ]] && ") + "options+=(" + zshOption(option) +
                    ')');
  }
  return joined(lines);
}

std::string verbSummaries() {
  std::vector<std::string> lines;
  for (const VerbSyntax& verb : verbs()) {
    lines.push_back("  '" + std::string(verb.name) + ':' + inShell(verb.summary) + "'");
  }
  return joined(lines);
}

std::string roles() {
  std::string words;
  for (const ClassDefinition& definition : classDefinitions()) {
    for (const PropertyDefinition& end : referenceEnds(definition)) {
      addWord(words, end.name);
    }
  }
  return words;
}

struct Part {
  std::string_view marker;
  std::string (*text)();
};
const Part parts[] = {
    {"@version@", [] { return std::string(CORVCIM_VERSION); }},
    {"@options@", [] { return optionsOf(overviewSyntax()); }},
    {"@manual-options@", [] { return manualOptions(false); }},
    {"@association-options@", [] { return manualOptions(true); }},
    {"@option-values@", bashValues},
    {"@verb-options@", bashVerbOptions},
    {"@zsh-options@", zshOptions},
    {"@verb-summaries@", verbSummaries},
    {"@verbs@", [] { return wordsOf(verbs(), [](const VerbSyntax& verb) { return verb.name; }); }},
    {"@formats@", [] { return wordsOf(allFormats, formatName); }},
    {"@languages@",
     [] { return wordsOf(Tarn::Locale::translatedLanguages(), [](const std::string& id) { return id; }); }},
    {"@fields@", [] { return wordsOf(fieldNames(), [](std::string_view name) { return name; }); }},
    {"@namespace@", [] { return std::string(servedNameSpace); }},
    {"@roles@", roles},
};

std::string filled(std::string text) {
  for (const Part& part : parts) {
    for (std::size_t at = text.find(part.marker); at != std::string::npos; at = text.find(part.marker, at)) {
      const std::string content = part.text();
      text.replace(at, part.marker.size(), content);
      at += content.size();
    }
  }
  return text;
}

std::string contentsOf(const std::string& file) {
  std::ifstream stream(file);
  std::ostringstream contents;
  contents << stream.rdbuf();
  if (!stream || contents.str().empty()) {
    throw std::runtime_error("cannot read " + file);
  }
  return contents.str();
}

}  // namespace
}  // namespace Corvcim

int main(int count, char** arguments) {
  try {
    if (count != 3) {
      throw std::runtime_error("usage: corvcim_write_texts TEMPLATE OUTPUT");
    }
    const std::string text = Corvcim::filled(Corvcim::contentsOf(arguments[1]));
    std::ofstream output(arguments[2], std::ios::trunc);
    output << text << std::flush;
    if (!output) {
      throw std::runtime_error(std::string("cannot write ") + arguments[2]);
    }
    return EXIT_SUCCESS;
  } catch (const std::exception& error) {
    std::cerr << "corvcim_write_texts: " << error.what() << '\n';
    return EXIT_FAILURE;
  }
}
