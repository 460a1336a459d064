#include "platform/locale/Catalogue.h"

#include <algorithm>
#include <iterator>

#include "platform/locale/LanguageId.h"

namespace Tarn::Locale {
namespace {

constexpr std::wstring_view lastLanguage = L"en";

/// Where the shorter id is not the next best language. Chinese is written in two scripts, and a reader of one is not
/// served by the other; without a script or region the simplified one is meant.
struct Parent {
  std::wstring_view language;
  std::wstring_view parent;
};
constexpr Parent parents[] = {
    {L"zh", L"zh_CN"}, {L"zh_CN", L""}, {L"zh_HK", L""}, {L"zh_Hant", L""}, {L"zh_MO", L""}, {L"zh_TW", L""},
};

std::wstring_view parentOf(std::wstring_view language) {
  const auto* exception =
      std::find_if(std::begin(parents), std::end(parents), [&](const Parent& row) { return row.language == language; });
  if (exception != std::end(parents)) {
    return exception->parent;
  }
  const std::size_t end = language.rfind(L'_');
  return end == std::wstring_view::npos ? std::wstring_view() : language.substr(0, end);
}

const Catalogue* findCatalogue(int number, std::wstring_view language) {
  const std::span<const Catalogue> all = catalogues();
  const auto found = std::find_if(all.begin(), all.end(), [&](const Catalogue& catalogue) {
    return catalogue.number == number && catalogue.language == language;
  });
  return found == all.end() ? nullptr : &*found;
}

std::optional<std::wstring_view> findHere(int number, std::wstring_view language, std::wstring_view id) {
  const Catalogue* catalogue = findCatalogue(number, language);
  if (catalogue == nullptr) {
    return std::nullopt;
  }
  const auto found =
      std::lower_bound(catalogue->messages.begin(), catalogue->messages.end(), id,
                       [](const Message& message, std::wstring_view wanted) { return message.id < wanted; });
  if (found == catalogue->messages.end() || found->id != id || found->text.empty()) {
    return std::nullopt;
  }
  return found->text;
}

}  // namespace

std::vector<std::string> translatedLanguages() {
  std::vector<std::string> languages;
  for (const Catalogue& catalogue : catalogues()) {
    // Language ids are ASCII.
    std::ranges::transform(catalogue.language, std::back_inserter(languages.emplace_back()),
                           [](wchar_t letter) { return static_cast<char>(letter); });
  }
  std::ranges::sort(languages);
  languages.erase(std::unique(languages.begin(), languages.end()), languages.end());
  return languages;
}

bool isTranslated(std::string_view id) {
  const std::string normalized = normalizedLanguageId(id);
  const std::wstring wide(normalized.begin(), normalized.end());
  for (std::wstring_view language = wide; !language.empty(); language = parentOf(language)) {
    if (std::ranges::find(catalogues(), language, &Catalogue::language) != catalogues().end()) {
      return true;
    }
  }
  return false;
}

std::optional<std::wstring_view> findMessage(int number, std::wstring_view language, std::wstring_view id) {
  for (; !language.empty(); language = parentOf(language)) {
    if (const auto text = findHere(number, language, id)) {
      return text;
    }
  }
  return findHere(number, lastLanguage, id);
}

}  // namespace Tarn::Locale
