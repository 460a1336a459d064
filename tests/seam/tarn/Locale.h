#ifndef TESTS_SEAM_LOCALE_H
#define TESTS_SEAM_LOCALE_H

#include <string>

namespace Tarn::Locale {

std::string getLanguageId();
std::wstring getResourceLibrary(int number, const std::string& languageId);

}  // namespace Tarn::Locale

namespace Tarn {

class ResourceString {
 public:
  ResourceString(const std::wstring& library, const std::wstring& messageId);
  std::wstring str() const;

 private:
  std::wstring text_;
};

}  // namespace Tarn

#endif
