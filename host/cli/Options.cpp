#include "host/cli/Options.h"

#include <algorithm>
#include <iterator>
#include <optional>
#include <string_view>

#include "host/broker/Names.h"
#include "host/cli/SourceArgument.h"
#include "platform/common/NearestName.h"
#include "platform/locale/Catalogue.h"
#include "platform/locale/LanguageId.h"

namespace Corvcim {
namespace {

std::string quoted(std::string_view text) {
  return "'" + std::string(text) + "'";
}

/// Preferred to std::quoted, which argument-dependent lookup finds.
std::string quoted(const std::string& text) {
  return quoted(std::string_view(text));
}

[[noreturn]] void fail(const std::string& text) {
  throw UsageError(text + "; see 'corvcim --help'");
}

[[noreturn]] void fail(const VerbSyntax& verb, const std::string& text) {
  throw UsageError(std::string(verb.name) + ": " + text + "; usage: corvcim [OPTION...] " + callOf(verb));
}

/// Names the valid word that the user most likely meant, if there is one.
[[noreturn]] void failNear(const std::string& text, std::string_view word, std::span<const std::string_view> valid) {
  if (const std::string_view nearest = Tarn::Common::nearestName(word, valid); !nearest.empty()) {
    throw UsageError(text + "; did you mean " + std::string(nearest) + "?");
  }
  fail(text);
}

/// The verbs that an option is for, and what the others answer.
struct Scope {
  bool (*holds)(const VerbSyntax& verb);
  std::string_view explanation;
};

constexpr Scope everyVerb = {[](const VerbSyntax&) { return true; }, ""};
constexpr Scope associationVerbs = {[](const VerbSyntax& verb) { return verb.isAssociation; },
                                    "it belongs to ai, ain, ri and rin"};
constexpr Scope oneInventory = {[](const VerbSyntax& verb) { return verb.verb != Verb::Diff; },
                                "A and B say which inventories"};
constexpr Scope onlyInventory = {[](const VerbSyntax& verb) { return verb.verb == Verb::Inventory; },
                                 "it belongs to inventory"};
constexpr Scope columnVerbs = {[](const VerbSyntax& verb) { return std::ranges::any_of(verb.formats, hasColumns); },
                               "its output has no columns"};
constexpr Scope onlyDiff = {[](const VerbSyntax& verb) { return verb.verb == Verb::Diff; }, "it belongs to diff"};
constexpr Scope requests = {[](const VerbSyntax& verb) { return verb.isRequest; },
                            "it belongs to ei, ein, gi, ai, ain, ri and rin"};
constexpr Scope onlySnapshot = {[](const VerbSyntax& verb) { return verb.verb == Verb::Snapshot; },
                                "it belongs to snapshot"};

/// An option: its spellings, and what it does with its value. An option without a value is given "".
struct Option {
  std::string_view longName;
  std::string_view shortName;
  bool hasValue;
  const Scope& scope;
  void (*apply)(Options& options, const std::string& value);
};

void setFormat(Options& options, const std::string& name) {
  const auto* const found = std::ranges::find(allFormats, std::string_view(name), formatName);
  if (found == std::end(allFormats)) {
    fail("unknown output format " + quoted(name) + ": it can be " + formatList(allFormats));
  }
  options.format = *found;
}

void setNameSpace(Options& options, const std::string& name) {
  if (name.empty()) {
    fail("the namespace is empty");
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

/// The command line is at fault here, so the message does not mention the configuration, which names a source as well.
void checkSource(std::string_view said, std::string_view source) {
  if (!isSourceArgument(source)) {
    fail(std::string(said) + ": " + quoted(source) +
         " is neither a file nor another source of an inventory: it can be " + std::string(sourceArgumentForms));
  }
}

/// A list of properties, as it stands after the operand of ei.
void setColumns(Options& options, const std::string& list) {
  options.hasPropertyList = true;
  options.properties = splitAtCommas(list);
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
    fail("unknown language " + quoted(id) + ": it can be " + known);
  }
  options.language = id;
}

constexpr Option optionTable[] = {
    {"--library", "-l", true, everyVerb, [](Options& o, const std::string& value) { o.library = value; }},
    {"--companion", "", true, everyVerb, [](Options& o, const std::string& value) { o.companion = value; }},
    {"--inventory", "-i", true, oneInventory, setInventory},
    {"--language", "", true, everyVerb, setLanguage},
    {"--namespace", "-n", true, everyVerb, setNameSpace},
    {"--output", "-o", true, everyVerb, setFormat},
    {"--columns", "", true, columnVerbs, setColumns},
    {"--from", "", true, onlyInventory, [](Options& o, const std::string& value) { o.convertFrom = value; }},
    {"--ignore", "", true, onlyDiff,
     [](Options& o, const std::string& value) { o.ignoredFields = splitAtCommas(value); }},
    {"--as-is", "", false, requests, [](Options& o, const std::string&) { o.asIs = true; }},
    {"--unmasked", "", false, onlySnapshot, [](Options& o, const std::string&) { o.unmasked = true; }},
    {"--help", "-h", false, everyVerb, [](Options& o, const std::string&) { o.wantsHelp = true; }},
    {"--version", "-V", false, everyVerb, [](Options& o, const std::string&) { o.wantsVersion = true; }},
    {"", "-ac", true, associationVerbs,
     [](Options& o, const std::string& value) { o.association.associationClass = value; }},
    {"", "-arc", true, associationVerbs,
     [](Options& o, const std::string& value) { o.association.resultClass = value; }},
    {"", "-ar", true, associationVerbs, [](Options& o, const std::string& value) { o.association.role = value; }},
    {"", "-arr", true, associationVerbs,
     [](Options& o, const std::string& value) { o.association.resultRole = value; }},
};

/// An argument that was recognised as an option, with the value that was glued to it, if any.
struct Match {
  const Option* option;
  std::optional<std::string> value;
};

/// wbemcli has an option -nl, which must not become the namespace "l".
bool mayBeGlued(const Option& option, std::string_view value) {
  return option.apply != setNameSpace || value.find('/') != std::string_view::npos;
}

/// Takes --name, --name=value, -x, -xvalue and the words -ac, -arc, -ar, -arr.
Match matchOption(std::string_view argument) {
  const std::size_t equals = argument.starts_with("--") ? argument.find('=') : std::string_view::npos;
  const std::string_view name = argument.substr(0, equals);
  for (const Option& option : optionTable) {
    if (name != option.longName && name != option.shortName) {
      continue;
    }
    if (equals == std::string_view::npos) {
      return {&option, std::nullopt};
    }
    return {&option, std::string(argument.substr(equals + 1))};
  }
  for (const Option& option : optionTable) {
    if (option.shortName.size() == 2 && option.hasValue && argument.starts_with(option.shortName) &&
        mayBeGlued(option, argument.substr(2))) {
      return {&option, std::string(argument.substr(2))};
    }
  }
  std::vector<std::string_view> names;
  std::ranges::transform(optionTable, std::back_inserter(names), &Option::longName);
  failNear("unknown option " + quoted(argument), name, names);
}

bool isOption(std::string_view argument) {
  return argument.size() > 1 && argument.front() == '-';
}

/// One of several words with a blank between them.
std::string_view wordAt(std::string_view words, std::size_t index) {
  for (; index != 0; --index) {
    words.remove_prefix(words.find(' ') + 1);
  }
  return words.substr(0, words.find(' '));
}

const VerbSyntax& verbNamed(const std::string& name) {
  const VerbSyntax* verb = findVerb(name);
  if (verb == nullptr) {
    std::vector<std::string_view> names;
    std::ranges::transform(verbs(), std::back_inserter(names), &VerbSyntax::name);
    failNear("unknown verb " + quoted(name), name, names);
  }
  return *verb;
}

/// The words that are no options: the verb and its operands.
void takeOperands(Options& options, const std::vector<std::string>& operands) {
  if (operands.empty()) {
    return;
  }
  const VerbSyntax* verb = &verbNamed(operands.front());
  options.verb = verb;
  const std::size_t count = operands.size() - 1;
  if (options.wantsHelp) {
    return;
  }
  if (count < verb->minimumOperands) {
    fail(*verb, std::string(wordAt(verb->operands, count)) + " is missing");
  }
  if (count > verb->maximumOperands) {
    fail(*verb, "unexpected argument " + quoted(operands[verb->maximumOperands + 1]));
  }
  if (verb->verb == Verb::Help) {
    options.wantsHelp = true;
    options.verb = count == 0 ? &overviewSyntax() : &verbNamed(operands[1]);
    return;
  }
  options.operands.assign(operands.begin() + 1, operands.end());
  if (verb->verb == Verb::Diff) {
    for (const std::string& source : options.operands) {
      checkSource("diff", source);
    }
  } else if (count >= 2) {
    if (options.hasPropertyList) {
      fail(*verb, "'--columns' and " + quoted(operands[2]) + " both name the columns");
    }
    setColumns(options, operands[2]);
  }
}

/// An option as it was written.
struct Given {
  const Option* option;
  std::string spelling;
};

void checkCombination(const Options& options, const std::vector<Given>& given) {
  if (options.wantsHelp || options.wantsVersion) {
    return;
  }
  const VerbSyntax& verb = *options.verb;
  const std::string name = verb.name.empty() ? "the overview" : std::string(verb.name);
  for (const auto& [option, spelling] : given) {
    if (!option->scope.holds(verb)) {
      fail(name + " takes no option " + quoted(spelling) + ": " + std::string(option->scope.explanation));
    }
  }
  const auto isColumns = [](const Given& each) { return each.option->apply == setColumns; };
  if (std::ranges::any_of(given, isColumns) && !hasColumns(options.format)) {
    fail("'--columns' is for '-o table' and '-o csv'");
  }
  if (!options.asIs && !sameName(options.nameSpace, servedNameSpace)) {
    fail("no class is served in the namespace " + quoted(options.nameSpace) + ": it can be " +
         std::string(servedNameSpace));
  }
  if (!options.convertFrom.empty() && !options.inventory.empty()) {
    fail("'--from' and '--inventory' both name a source");
  }
  if (!options.language.empty() && isForPrograms(options.format)) {
    fail("'--language' is for text: csv, mof and json are the same in every language");
  }
  if (std::ranges::find(verb.formats, options.format) == verb.formats.end()) {
    fail(name + " has no output format " + quoted(formatName(options.format)) + ": it can be " +
         formatList(verb.formats));
  }
}

/// wbemcli narrows references by -arc; here -ac says the same, for it is the association's class.
void settleReferenceOptions(Options& options) {
  if (options.verb->verb != Verb::References && options.verb->verb != Verb::ReferenceNames) {
    return;
  }
  AssociationOptions& association = options.association;
  if (association.resultRole) {
    fail(*options.verb, "no option '-arr': a reference has no far end");
  }
  if (association.associationClass && association.resultClass) {
    fail(*options.verb, "'-ac' and '-arc' both name the association class");
  }
  if (!association.associationClass) {
    association.associationClass.swap(association.resultClass);
  }
}

}  // namespace

Options parseOptions(std::span<const char* const> arguments) {
  Options options;
  std::vector<std::string> operands;
  std::vector<Given> given;
  for (std::size_t i = 0; i < arguments.size(); ++i) {
    const std::string_view argument = arguments[i];
    if (argument == "--") {
      operands.insert(operands.end(), arguments.begin() + static_cast<std::ptrdiff_t>(i) + 1, arguments.end());
      break;
    }
    if (!isOption(argument)) {
      operands.emplace_back(argument);
      continue;
    }
    Match match = matchOption(argument);
    if (match.option->hasValue && !match.value) {
      if (i + 1 == arguments.size()) {
        fail("option " + quoted(argument) + " needs a value");
      }
      match.value = arguments[++i];
    }
    if (!match.option->hasValue && match.value) {
      fail("option " + quoted(match.option->longName) + " takes no value");
    }
    given.push_back({match.option, std::string(argument.substr(0, argument.find('=')))});
    match.option->apply(options, match.value.value_or(""));
  }
  takeOperands(options, operands);
  checkCombination(options, given);
  settleReferenceOptions(options);
  return options;
}

}  // namespace Corvcim
