#ifndef CORVANE_PLATFORM_LOCALE_RESOURCELIBRARY_H
#define CORVANE_PLATFORM_LOCALE_RESOURCELIBRARY_H

namespace Tarn::Locale {

/// Between number and language in what getResourceLibrary returns, as in L"2/de_AT".
inline constexpr wchar_t librarySeparator = L'/';

}  // namespace Tarn::Locale

#endif
