#include <string>

#include "tests/factory/BuilderCases.h"

using namespace FactoryTests;
using Scripted::texts;

// Caption and Description, looked up anew each time.

namespace {

using LocalizedTexts = BuilderTest;

std::wstring wide(const std::string& text) {
  return {text.begin(), text.end()};
}

/// The message identifier of a row, which the scripted locale shows in the text.
std::wstring messageIdOf(const PropertyRow& row) {
  const std::size_t start = row.setting.find("MSGID");
  return wide(row.setting.substr(start, row.setting.size() - start - 1));
}

}  // namespace

TEST_P(LocalizedTexts, ComeInTheLanguageOfTheMoment) {
  const std::wstring caption = messageIdOf(GetParam().properties[0]);
  const std::wstring description = messageIdOf(GetParam().properties[1]);
  texts().catalogue[{"de_AT", caption}] = L"Der Prozessor";
  texts().catalogue[{"de_AT", description}] = L"Verk\u00f6rpert \u20ac";

  texts().language = "de_AT";
  make(names({"Caption", "Description"}), false);
  Lines expected = GetParam().keySettings;
  expected.push_back("Caption chars |Der Prozessor|");
  expected.push_back("Description chars |Verk\xc3\xb6rpert \xe2\x82\xac|");
  EXPECT_EQ(recording_.takeProperties(), expected);

  texts().language = "en";
  make(names({"Caption", "Description"}), false);
  EXPECT_EQ(recording_.takeProperties(), GetParam().settings({"Caption", "Description"}));
}

TEST_P(LocalizedTexts, AreLookedUpForEachTextInCatalogueTwo) {
  make(nullptr, false);
  make(nullptr, false);

  EXPECT_EQ(texts().languageCalls, 4U);
  EXPECT_EQ(texts().libraryCalls, 4U);
  EXPECT_EQ(texts().stringCalls, 4U);
  EXPECT_EQ(texts().lastCatalogue, 2);
}

TEST_P(LocalizedTexts, AreNotLookedUpUnlessWanted) {
  make(names({"ElementName"}), false);
  make(nullptr, true);

  EXPECT_EQ(texts().languageCalls, 0U);
  EXPECT_EQ(texts().libraryCalls, 0U);
  EXPECT_EQ(texts().stringCalls, 0U);
}

TEST_P(LocalizedTexts, MayBeEmpty) {
  texts().catalogue[{"en", messageIdOf(GetParam().properties[0])}] = L"";

  make(names({"Caption"}), false);

  Lines expected = GetParam().keySettings;
  expected.push_back("Caption chars ||");
  EXPECT_EQ(recording_.takeProperties(), expected);
}

INSTANTIATE_TEST_SUITE_P(All, LocalizedTexts, ::testing::ValuesIn(builderCases()), builderName);
