#ifndef CORVANE_PLATFORM_LOCALE_LANGUAGEID_H
#define CORVANE_PLATFORM_LOCALE_LANGUAGEID_H

#include <string>
#include <string_view>

namespace Tarn::Locale {

/// The id in the form that catalogues are named by: "de", "de_AT", "zh_Hant_TW". Accepts either separator,
/// any case, and the codeset and modifier of POSIX locale names ("de_AT.UTF-8", "de@euro"), which are
/// left out. Empty where the text is no language id.
std::string normalizedLanguageId(std::string_view id);

}  // namespace Tarn::Locale

#endif
