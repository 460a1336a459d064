#ifndef CORVANE_PLATFORM_LOCALE_LANGUAGEID_H
#define CORVANE_PLATFORM_LOCALE_LANGUAGEID_H

#include <optional>
#include <string>
#include <string_view>

#include "platform/base/Configuration.h"

namespace Tarn::Locale {

/// The id in the form that catalogues are named by: "de", "de_AT", "zh_Hant_TW". Accepts either separator,
/// any case, and the codeset and modifier of POSIX locale names ("de_AT.UTF-8", "de@euro"), which are
/// left out. Empty where the text is no language id.
std::string normalizedLanguageId(std::string_view id);

/// The language that the environment or else the configuration asks for, as it is written there.
std::optional<Common::Setting> wantedLanguage();

}  // namespace Tarn::Locale

#endif
