#include "host/corvcim/options/Options.h"

#include <algorithm>
#include <iterator>
#include <optional>
#include <string_view>

#include "host/corvcim/options/OptionTable.h"
#include "platform/base/NearestName.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

[[noreturn]] void failVerb(const VerbSyntax& verb, const std::string& text) {
  throw UsageError(std::string(verb.name) + ": " + text + "; usage: corvcim [OPTION...] " + callOf(verb));
}

/// Names the valid word that the user most likely meant, if there is one.
[[noreturn]] void failNear(const std::string& text, std::string_view word, std::span<const std::string_view> valid) {
  if (const std::string_view nearest = Tarn::Common::nearestName(word, valid); !nearest.empty()) {
    throw UsageError(text + "; did you mean " + std::string(nearest) + "?");
  }
  failUsage(text);
}

/// An argument that was recognised as an option, with the value that was glued to it, if any.
struct Match {
  const OptionSyntax* option;
  std::optional<std::string> value;
};

/// wbemcli has an option -nl, which must not become the namespace "l".
bool mayBeGlued(const OptionSyntax& option, std::string_view value) {
  return option.longName != "--namespace" || value.find('/') != std::string_view::npos;
}

/// Takes --name, --name=value, -x, -xvalue and the words -ac, -arc, -ar, -arr.
Match matchOption(std::string_view argument) {
  const std::size_t equals = argument.starts_with("--") ? argument.find('=') : std::string_view::npos;
  const std::string_view name = argument.substr(0, equals);
  for (const OptionSyntax& option : optionTable()) {
    if (name != option.longName && name != option.shortName) {
      continue;
    }
    if (equals == std::string_view::npos) {
      return {&option, std::nullopt};
    }
    return {&option, std::string(argument.substr(equals + 1))};
  }
  for (const OptionSyntax& option : optionTable()) {
    if (option.shortName.size() == 2 && !option.value.empty() && argument.starts_with(option.shortName) &&
        mayBeGlued(option, argument.substr(2))) {
      return {&option, std::string(argument.substr(2))};
    }
  }
  std::vector<std::string_view> names;
  std::ranges::transform(optionTable(), std::back_inserter(names), &OptionSyntax::longName);
  failNear("unknown option " + inQuotes(argument), name, names);
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
    failNear("unknown verb " + inQuotes(name), name, names);
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
    failVerb(*verb, std::string(wordAt(verb->operands, count)) + " is missing");
  }
  if (count > verb->maximumOperands) {
    failVerb(*verb, "unexpected argument " + inQuotes(operands[verb->maximumOperands + 1]));
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
      failVerb(*verb, "'--columns' and " + inQuotes(operands[2]) + " both name the columns");
    }
    setPropertyList(options, operands[2]);
  }
}

/// An option as it was written.
struct Given {
  const OptionSyntax* option;
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
      failUsage(name + " takes no option " + inQuotes(spelling) + ": " + std::string(option->scope.explanation));
    }
  }
  const auto isColumns = [](const Given& each) { return each.option->longName == "--columns"; };
  if (std::ranges::any_of(given, isColumns) && !hasColumns(options.format)) {
    failUsage("'--columns' is for '-o table' and '-o csv'");
  }
  if (!options.asIs && !sameName(options.nameSpace, servedNameSpace)) {
    failUsage("no class is served in the namespace " + inQuotes(options.nameSpace) + ": it can be " +
              std::string(servedNameSpace));
  }
  if (!options.convertFrom.empty() && !options.inventory.empty()) {
    failUsage("'--from' and '--inventory' both name a source");
  }
  if (!options.language.empty() && isForPrograms(options.format)) {
    failUsage("'--language' is for text: csv, mof and json are the same in every language");
  }
  if (std::ranges::find(verb.formats, options.format) == verb.formats.end()) {
    failUsage(name + " has no output format " + inQuotes(formatName(options.format)) + ": it can be " +
              formatList(verb.formats));
  }
}

/// wbemcli narrows references by -arc; here -ac says the same, for it is the association's class.
void settleReferenceOptions(Options& options) {
  if (options.verb->verb != Verb::References && options.verb->verb != Verb::ReferenceNames) {
    return;
  }
  AssociationOptions& association = options.association;
  if (association.associationClass && association.resultClass) {
    failVerb(*options.verb, "'-ac' and '-arc' both name the association class");
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
    if (!match.option->value.empty() && !match.value) {
      if (i + 1 == arguments.size()) {
        failUsage("option " + inQuotes(argument) + " needs a value");
      }
      match.value = arguments[++i];
    }
    if (match.option->value.empty() && match.value) {
      failUsage("option " + inQuotes(match.option->longName) + " takes no value");
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
