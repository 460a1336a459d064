#include "platform/locale/LanguageId.h"

#include <algorithm>

#include "platform/base/Ascii.h"

namespace Tarn::Locale {
namespace {

using Common::isDigit;
using Common::isLetter;
using Common::lower;
using Common::upper;

bool isLetterOrDigit(char c) {
  return isLetter(c) || isDigit(c);
}

// By the registry of language tags: a language has two or three letters, a script four, a region two
// letters or three digits; anything else of up to eight characters is a variant.
constexpr std::size_t longestPart = 8;

/// One subtag in its usual case: language "de", region "AT", script "Hant", variant "valencia".
std::string normalizedPart(std::string_view part, bool isFirst) {
  std::string text(part);
  const bool isRegion = !isFirst && part.size() == 2;
  const bool isScript = !isFirst && part.size() == 4;
  std::transform(text.begin(), text.end(), text.begin(), isRegion ? upper : lower);
  if (isScript) {
    text.front() = upper(text.front());
  }
  return text;
}

bool isPart(std::string_view part, bool isFirst) {
  if (isFirst) {
    return (part.size() == 2 || part.size() == 3) && std::all_of(part.begin(), part.end(), isLetter);
  }
  return !part.empty() && part.size() <= longestPart && std::all_of(part.begin(), part.end(), isLetterOrDigit);
}

}  // namespace

std::string normalizedLanguageId(std::string_view id) {
  std::string_view rest = id.substr(0, id.find_first_of(".@"));
  std::string normalized;
  for (bool isFirst = true;; isFirst = false) {
    const std::size_t end = rest.find_first_of("-_");
    const std::string_view part = rest.substr(0, end);
    if (!isPart(part, isFirst)) {
      return {};
    }
    normalized.append(isFirst ? "" : "_").append(normalizedPart(part, isFirst));
    if (end == std::string_view::npos) {
      return normalized;
    }
    rest.remove_prefix(end + 1);
  }
}

}  // namespace Tarn::Locale
