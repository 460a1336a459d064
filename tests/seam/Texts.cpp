#include "tests/seam/Texts.h"

#include <tarn/Common.h>
#include <tarn/Locale.h>

namespace Scripted {

Texts& texts() {
  static Texts theTexts;
  return theTexts;
}

}  // namespace Scripted

namespace Tarn {

using Scripted::texts;

std::string Locale::getLanguageId() {
  ++texts().languageCalls;
  return texts().language;
}

std::wstring Locale::getResourceLibrary(int number, const std::string& languageId) {
  ++texts().libraryCalls;
  texts().lastCatalogue = number;
  return {languageId.begin(), languageId.end()};
}

ResourceString::ResourceString(const std::wstring& library, const std::wstring& messageId) {
  ++texts().stringCalls;
  const auto found = texts().catalogue.find({std::string(library.begin(), library.end()), messageId});
  text_ = found != texts().catalogue.end() ? found->second : library + L":" + messageId;
}

std::wstring ResourceString::str() const {
  return text_;
}

std::string stripSpaces(std::string text) {
  const std::size_t first = text.find_first_not_of(' ');
  if (first == std::string::npos) {
    return {};
  }
  return text.substr(first, text.find_last_not_of(' ') - first + 1);
}

std::string getSystemName() {
  ++texts().systemNameCalls;
  return texts().systemName;
}

std::string make_string(const std::wstring& text) {
  std::string result;
  const auto append = [&](unsigned int byte) { result.push_back(static_cast<char>(byte)); };
  for (const wchar_t character : text) {
    const auto code = static_cast<unsigned int>(character);
    if (code < 0x80) {
      append(code);
    } else if (code < 0x800) {
      append(0xC0 | code >> 6);
      append(0x80 | (code & 0x3F));
    } else {
      append(0xE0 | code >> 12);
      append(0x80 | (code >> 6 & 0x3F));
      append(0x80 | (code & 0x3F));
    }
  }
  return result;
}

}  // namespace Tarn
