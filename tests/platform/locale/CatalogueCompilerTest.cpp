#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string_view>
#include <vector>

#include "platform/locale/Catalogue.h"

namespace {

using Tarn::Locale::Catalogue;
using Tarn::Locale::catalogues;
using Tarn::Locale::findMessage;
using Tarn::Locale::Message;
using testing::ElementsAre;

std::vector<std::wstring_view> ids(const Catalogue& catalogue) {
  std::vector<std::wstring_view> all;
  for (const Message& message : catalogue.messages) {
    all.push_back(message.id);
  }
  return all;
}

TEST(CatalogueCompiler, MakesOneSortedTableForEachFile) {
  ASSERT_EQ(catalogues().size(), 2U);
  EXPECT_EQ(catalogues()[0].number, 7);
  EXPECT_EQ(catalogues()[0].language, L"de");
  EXPECT_THAT(ids(catalogues()[0]), ElementsAre(L"A", L"A_B", L"EMPTY"));
  EXPECT_EQ(catalogues()[1].number, 7);
  EXPECT_EQ(catalogues()[1].language, L"en");
  EXPECT_THAT(ids(catalogues()[1]), ElementsAre(L"A", L"A_B", L"EMPTY", L"Z_LAST"));
}

TEST(CatalogueCompiler, KeepsEveryCharacterOfAText) {
  EXPECT_EQ(findMessage(7, L"en", L"Z_LAST"), L"a \"quoted\" word; a [bracket], a back\\slash, a # and a ${DOLLAR}");
  EXPECT_EQ(findMessage(7, L"en", L"A"), L"in two parts\n");
  EXPECT_EQ(findMessage(7, L"en", L"A_B"), L"ends in a blank ");
  EXPECT_EQ(findMessage(7, L"de", L"A"), L"Gr\u00f6\u00dfe");
}

TEST(CatalogueCompiler, LeavesAnEmptyTextToTheNextLanguage) {
  EXPECT_EQ(findMessage(7, L"de", L"A_B"), L"ends in a blank ");
  EXPECT_EQ(findMessage(7, L"de", L"EMPTY"), L"nur deutsch");
  EXPECT_EQ(findMessage(7, L"en", L"EMPTY"), std::nullopt);
}

TEST(CatalogueCompiler, LeavesOutWhatIsMarkedAsAGuess) {
  EXPECT_EQ(findMessage(7, L"de", L"Z_LAST"), findMessage(7, L"en", L"Z_LAST"));
}

}  // namespace
