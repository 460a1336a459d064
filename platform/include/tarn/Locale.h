#ifndef TARN_LOCALE_H
#define TARN_LOCALE_H

#include <string>
#include <string_view>

/// Localized texts by explicit language. The process's own locale is neither read nor changed.
namespace Tarn::Locale {

/// The language that the agent answers in, such as "en" or "de_AT": the configured one, else "en".
/// Read once in a process.
std::string getLanguageId();

/// Identifies the message catalogue `number` in the given language, for ResourceString: L"2/de_AT".
/// Number 2 holds the captions and descriptions of the processor classes. Languages are accepted as
/// people write them ("de-at", "de_AT.UTF-8"); what is no language reads as English.
std::wstring getResourceLibrary(int number, const std::string& languageId);

}  // namespace Tarn::Locale

namespace Tarn {

/// One message of a catalogue. Where the language has no such text, the lookup falls back from a
/// regional language to its parent and then to English; an unknown message, or one of an unknown
/// catalogue, yields its identifier.
class ResourceString {
 public:
  ResourceString(const std::wstring& library, const std::wstring& messageId);
  std::wstring str() const;

 private:
  std::wstring_view found_;  // in a catalogue; without data where there is none
  std::wstring messageId_;   // only where there is none
};

}  // namespace Tarn

#endif
