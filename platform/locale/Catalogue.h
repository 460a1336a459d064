#ifndef CORVANE_PLATFORM_LOCALE_CATALOGUE_H
#define CORVANE_PLATFORM_LOCALE_CATALOGUE_H

#include <algorithm>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace Tarn::Locale {

/// One text of a catalogue.
struct Message {
  std::wstring_view id;
  std::wstring_view text;
};

/// The texts of one catalogue number in one language, sorted by id.
struct Catalogue {
  int number;
  std::wstring_view language;
  std::span<const Message> messages;
};

/// Strictly: no id occurs twice.
constexpr bool isSorted(std::span<const Message> messages) {
  return std::adjacent_find(messages.begin(), messages.end(),
                            [](const Message& a, const Message& b) { return a.id >= b.id; }) == messages.end();
}

/// All catalogues, compiled in from the files in `locale/`.
std::span<const Catalogue> catalogues();

/// The languages that there are catalogues in, sorted.
std::vector<std::string> translatedLanguages();

/// Whether the text is a language id whose texts come from a catalogue in it or in one of its parents, as findMessage
/// knows them, and not from the English one for want of any.
bool isTranslated(std::string_view id);

/// The text in that language or, where it has none, in its parents ("de_AT", "de"; "zh_Hans_SG", "zh_Hans", "zh",
/// "zh_CN") and at last in English.
/// An empty text counts as none. The view stays valid as long as the library. Allocates nothing.
std::optional<std::wstring_view> findMessage(int number, std::wstring_view language, std::wstring_view id);

}  // namespace Tarn::Locale

#endif
