#ifndef CORVANE_PLATFORM_LOCALE_LANGUAGEID_H
#define CORVANE_PLATFORM_LOCALE_LANGUAGEID_H

#include <string>
#include <string_view>

namespace Tarn::Locale {

/// The language of the messages where nothing else is asked for, and the end of every fallback chain.
inline constexpr std::string_view kBaseLanguage = "en";

/// The id in the form that catalogues are named by: "de", "de_AT", "zh_Hant_TW". Accepts either separator,
/// any case, and the codeset and modifier of POSIX locale names ("de_AT.UTF-8", "de@euro"), which do not
/// count. Empty where the text is no language id.
std::string normalizedLanguageId(std::string_view id);

/// The next more general language: "de_AT" gives "de", "de" gives "". A part of the argument.
std::string_view parentLanguage(std::string_view id);

}  // namespace Tarn::Locale

#endif
