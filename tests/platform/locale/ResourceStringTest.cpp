#include <gtest/gtest.h>
#include <tarn/Locale.h>

#include <string>
#include <vector>

namespace {

using Tarn::ResourceString;
using Tarn::Locale::getResourceLibrary;

constexpr const wchar_t* caption = L"MSGID_CPU_PROCESSOR_CAPTION";

std::wstring captionIn(const std::string& language) {
  return ResourceString(getResourceLibrary(2, language), caption).str();
}

TEST(ResourceLibrary, IsNamedByNumberAndLanguage) {
  EXPECT_EQ(getResourceLibrary(2, "de_AT"), L"2/de_AT");
  EXPECT_EQ(getResourceLibrary(2, "DE-at"), L"2/de_AT");
  EXPECT_EQ(getResourceLibrary(11, "en.UTF-8"), L"11/en");
  EXPECT_EQ(getResourceLibrary(2, ""), L"2/en");
  EXPECT_EQ(getResourceLibrary(2, "POSIX"), L"2/en");
}

TEST(ResourceString, IsTheTextInTheLanguage) {
  EXPECT_EQ(captionIn("en"), L"Processor");
  EXPECT_EQ(captionIn("de"), L"Prozessor");
}

TEST(ResourceString, FallsBackToTheParentLanguageAndThenToEnglish) {
  EXPECT_EQ(captionIn("de_AT"), L"Prozessor");
  EXPECT_EQ(captionIn("de_Latn_CH_1996"), L"Prozessor");
  EXPECT_EQ(captionIn("en_GB"), L"Processor");
  EXPECT_EQ(captionIn("fr_CA"), L"Processeur");
  EXPECT_EQ(captionIn("pt_BR"), L"Processor");
  EXPECT_EQ(captionIn("den"), L"Processor");
}

TEST(ResourceString, IsChineseInTheScriptThatIsAskedFor) {
  for (const char* language : {"zh", "zh_CN", "zh_SG", "zh_Hans", "zh_Hans_CN", "zh_Hans_HK", "zh-hans-tw"}) {
    EXPECT_EQ(captionIn(language), L"\u5904\u7406\u5668") << language;
  }
  for (const char* language : {"zh_TW", "zh_HK", "zh_MO", "zh_Hant", "zh_Hant_TW", "zh_Hant_CN", "zh_TW.Big5"}) {
    EXPECT_EQ(captionIn(language), L"Processor") << language;
  }
}

TEST(ResourceString, IsTheIdWhereNothingIsKnownOfIt) {
  EXPECT_EQ(ResourceString(L"2/de", L"MSGID_UNKNOWN").str(), L"MSGID_UNKNOWN");
  EXPECT_EQ(ResourceString(L"2/de", L"").str(), L"");
  for (const wchar_t* library :
       {L"3/de", L"0/en", L"-2/en", L"2", L"", L"/", L"x/en", L"2x/en", L"99999999999999/en"}) {
    EXPECT_EQ(ResourceString(library, caption).str(), caption) << library;
  }
}

TEST(ResourceString, ReadsALibraryWithoutALanguageAsEnglish) {
  EXPECT_EQ(ResourceString(L"2/", caption).str(), L"Processor");
}

TEST(ResourceString, CanBeCopiedAndOutlivesItsArguments) {
  std::vector<ResourceString> strings;
  {
    const std::wstring library = L"2/de";
    const std::wstring known = caption;
    const std::wstring unknown = L"MSGID_UNKNOWN_BUT_LONG_ENOUGH_TO_BE_ALLOCATED";
    strings = {ResourceString(library, known), ResourceString(library, unknown)};
  }
  const std::vector<ResourceString> copies = strings;
  strings.clear();
  EXPECT_EQ(copies[0].str(), L"Prozessor");
  EXPECT_EQ(copies[1].str(), L"MSGID_UNKNOWN_BUT_LONG_ENOUGH_TO_BE_ALLOCATED");
}

}  // namespace
