#include <tarn/Locale.h>

#include <limits>
#include <optional>
#include <string_view>

#include "platform/locale/Catalogue.h"
#include "platform/locale/ResourceLibrary.h"

namespace Tarn {
namespace {

/// A catalogue number, digits only.
std::optional<int> parseNumber(std::wstring_view digits) {
  if (digits.empty() || digits.size() > std::numeric_limits<int>::digits10) {
    return std::nullopt;
  }
  int number = 0;
  for (wchar_t digit : digits) {
    if (digit < L'0' || digit > L'9') {
      return std::nullopt;
    }
    number = 10 * number + static_cast<int>(digit - L'0');
  }
  return number;
}

std::optional<std::wstring_view> find(std::wstring_view library, std::wstring_view messageId) {
  const std::size_t separator = library.find(Locale::librarySeparator);
  const std::optional<int> number = parseNumber(library.substr(0, separator));
  if (!number || separator == std::wstring_view::npos) {
    return std::nullopt;
  }
  return Locale::findMessage(*number, library.substr(separator + 1), messageId);
}

}  // namespace

ResourceString::ResourceString(const std::wstring& library, const std::wstring& messageId) {
  if (const std::optional<std::wstring_view> text = find(library, messageId)) {
    found_ = *text;
  } else {
    messageId_ = messageId;
  }
}

std::wstring ResourceString::str() const {
  return found_.data() != nullptr ? std::wstring(found_) : messageId_;
}

}  // namespace Tarn
