#ifndef TARN_LOCALE_H
#define TARN_LOCALE_H

#include <string>

/// Localized texts by explicit language. The process's own locale is neither read nor changed.
namespace Tarn::Locale {

/// The language that the agent answers in, such as "en" or "de_AT".
std::string getLanguageId();

/// Identifies the message catalogue `number` in the given language, for ResourceString.
/// Number 2 holds the captions and descriptions of the processor classes.
std::wstring getResourceLibrary(int number, const std::string& languageId);

}  // namespace Tarn::Locale

namespace Tarn {

/// One message of a catalogue. Where the language has no such text, the lookup falls back from a
/// regional language to its parent and then to English; an unknown message yields its identifier.
class ResourceString {
 public:
  ResourceString(const std::wstring& library, const std::wstring& messageId);
  std::wstring str() const;

 private:
  std::wstring text_;
};

}  // namespace Tarn

#endif
