#include "host/corvcim/diff/Sentences.h"

#include <algorithm>
#include <charconv>
#include <optional>
#include <utility>

namespace Corvcim {
namespace {

struct Numbered {
  std::string_view stem;
  unsigned int number;
};

/// A path apart from its last number; nothing where it does not end in one, or not as numbers are written.
std::optional<Numbered> takeApart(std::string_view path) {
  const std::size_t last = path.find_last_not_of("0123456789");
  const std::size_t start = last == std::string_view::npos ? 0 : last + 1;
  const std::string_view digits = path.substr(start);
  Numbered result{path.substr(0, start), 0};
  const auto parsed = std::from_chars(digits.data(), digits.data() + digits.size(), result.number);
  const bool isPlain = digits.size() == 1 || (!digits.empty() && digits.front() != '0');
  return isPlain && parsed.ec == std::errc() ? std::optional(result) : std::nullopt;
}

bool isNext(std::string_view path, std::string_view other) {
  const std::optional<Numbered> one = takeApart(path);
  const std::optional<Numbered> two = takeApart(other);
  return one && two && one->stem == two->stem && two->number - one->number == 1 && two->number != 0;
}

std::string_view verbOf(Verbal verbal, bool isPlural) {
  switch (verbal) {
    case Verbal::None:
      return "";
    case Verbal::Is:
      return isPlural ? " are " : " is ";
    case Verbal::Has:
      return isPlural ? " have " : " has ";
  }
  return "";
}

}  // namespace

std::string listPaths(const std::vector<std::string>& paths) {
  constexpr std::size_t shortestRun = 3;
  std::vector<std::string> items;
  for (std::size_t begin = 0; begin < paths.size();) {
    std::size_t end = begin + 1;
    while (end < paths.size() && isNext(paths[end - 1], paths[end])) {
      ++end;
    }
    end = end - begin < shortestRun ? begin + 1 : end;
    items.push_back(end - begin == 1 ? paths[begin] : paths[begin] + " to " + paths[end - 1]);
    begin = end;
  }
  std::string list;
  for (std::size_t i = 0; i < items.size(); ++i) {
    list += (i == 0 ? "" : i + 1 == items.size() ? " and " : ", ") + items[i];
  }
  return list;
}

void Sentences::add(std::string_view kind, const std::string& path, Predicate predicate) {
  const auto same = std::ranges::find_if(
      sentences_, [&](const Sentence& sentence) { return sentence.kind == kind && sentence.predicate == predicate; });
  if (same == sentences_.end()) {
    sentences_.push_back({std::string(kind), std::move(predicate), {path}});
  } else {
    same->paths.push_back(path);
  }
}

std::string Sentences::text() const {
  std::string text;
  for (const Sentence& sentence : sentences_) {
    text += listPaths(sentence.paths);
    const bool isPlural = sentence.paths.size() > 1;
    text += verbOf(sentence.predicate.verbal, isPlural);
    text += sentence.predicate.rest + (isPlural ? sentence.predicate.ifSeveral : "") + '\n';
  }
  return text;
}

}  // namespace Corvcim
