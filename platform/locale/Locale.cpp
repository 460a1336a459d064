#include <tarn/Locale.h>

#include <array>
#include <charconv>
#include <limits>
#include <optional>
#include <string_view>

#include "platform/base/Configuration.h"
#include "platform/base/Environment.h"
#include "platform/cvlog/Level.h"
#include "platform/cvlog/Report.h"
#include "platform/locale/LanguageId.h"
#include "platform/locale/ResourceLibrary.h"

namespace Tarn::Locale {
namespace {

using Common::Setting;

// The language where no other is asked for.
constexpr std::string_view defaultLanguage = "en";

void reportUnknown(const Setting& setting) {
  Common::report({"Corvane.Locale", "Locale.cpp"}, CVLog::levelError,
                 "Configuration: " + setting.where + ": \"" + setting.value +
                     "\" is not valid: expected a language id such as de or de_AT");
}

std::string languageOfThisProcess() {
  if (const std::optional<Setting> wanted = wantedLanguage()) {
    std::string id = normalizedLanguageId(wanted->value);
    if (!id.empty()) {
      return id;
    }
    reportUnknown(*wanted);
  }
  return std::string(defaultLanguage);
}

}  // namespace

std::optional<Setting> wantedLanguage() {
  constexpr const char* variable = "CORVANE_LANGUAGE";
  if (const auto value = Common::environmentOverride(variable)) {
    return Setting{*value, variable};
  }
  if (const Setting* setting = Common::configuration().find("language")) {
    return *setting;
  }
  return std::nullopt;
}

std::string getLanguageId() {
  static const std::string language = languageOfThisProcess();
  return language;
}

std::wstring getResourceLibrary(int number, const std::string& languageId) {
  const std::string language = normalizedLanguageId(languageId);
  const std::string_view wanted = language.empty() ? defaultLanguage : language;
  std::array<char, std::numeric_limits<int>::digits10 + 2> digits{};
  const auto [end, error] = std::to_chars(digits.data(), digits.data() + digits.size(), number);

  std::wstring library;
  library.reserve(digits.size() + 1 + wanted.size());
  library.append(digits.data(), end).append(1, librarySeparator).append(wanted.begin(), wanted.end());
  return library;
}

}  // namespace Tarn::Locale
