#include "tests/platform/locale/CatalogueProblems.h"

#include <algorithm>
#include <iterator>
#include <map>
#include <regex>
#include <set>

#include "platform/inventory/tree/Utf8.h"

namespace {

/// The places of a text that a program fills in, in the forms that are usual.
std::multiset<std::string> placeholders(const std::string& text) {
  static const std::regex form(R"(%(\d+\$)?[-+ #0]*\d*(\.\d+)?(hh|h|ll|l|z)?[a-zA-Z%]|%\d+|\{[A-Za-z0-9_]*\})");
  return {std::sregex_token_iterator(text.begin(), text.end(), form), {}};
}

bool isBlank(char c) {
  return c == ' ' || c == '\t' || c == '\n';
}

bool hasBlankEnd(const std::string& text) {
  return !text.empty() && (isBlank(text.front()) || isBlank(text.back()));
}

std::vector<std::string> problemsOfText(const PoEntry& entry, const std::string& english, bool isTranslation) {
  struct Rule {
    bool isBroken;
    const char* problem;
  };
  const Rule rules[] = {
      {entry.text.empty(), "has no text"},
      {entry.isFuzzy, "is marked fuzzy"},
      {entry.hasPlural, "has a plural, which nothing asks for"},
      {Tarn::Inventory::validUtf8(entry.text) != entry.text, "is not UTF-8"},
      {hasBlankEnd(entry.text) && !hasBlankEnd(english), "begins or ends with a blank"},
      {isTranslation && entry.note != english, "does not quote the present English text as its note"},
      {placeholders(entry.text) != placeholders(english), "has other placeholders than the English text"},
  };
  std::vector<std::string> problems;
  for (const Rule& rule : rules) {
    if (rule.isBroken) {
      problems.push_back(entry.id + " in line " + std::to_string(entry.line) + ' ' + rule.problem);
    }
  }
  return problems;
}

std::vector<std::string> problemsOfHeader(const PoFile& catalogue, const std::string& language) {
  const std::map<std::string, std::string> wanted = {{"Content-Transfer-Encoding", "8bit"},
                                                     {"Content-Type", "text/plain; charset=UTF-8"},
                                                     {"Language", language},
                                                     {"MIME-Version", "1.0"}};
  std::vector<std::string> problems;
  for (const auto& [field, value] : wanted) {
    const auto found = catalogue.header.find(field);
    if (found == catalogue.header.end() || found->second != value) {
      problems.emplace_back("the header has no \"").append(field).append(": ").append(value).append("\"");
    }
  }
  return problems;
}

}  // namespace

std::vector<std::string> problemsOf(const PoFile& catalogue, const std::string& language, const PoFile& english) {
  std::vector<std::string> problems = problemsOfHeader(catalogue, language);
  std::map<std::string, std::string> missing;
  for (const PoEntry& entry : english.entries) {
    missing[entry.id] = entry.text;
  }
  std::set<std::string> seen;
  for (const PoEntry& entry : catalogue.entries) {
    if (!seen.insert(entry.id).second) {
      problems.push_back(entry.id + " in line " + std::to_string(entry.line) + " occurs twice");
      continue;
    }
    const auto found = missing.extract(entry.id);
    if (found.empty()) {
      problems.push_back(entry.id + " in line " + std::to_string(entry.line) + " is not in the English catalogue");
      continue;
    }
    std::ranges::copy(problemsOfText(entry, found.mapped(), language != "en"), std::back_inserter(problems));
  }
  for (const auto& [id, text] : missing) {
    problems.push_back(id + " is missing");
  }
  return problems;
}
