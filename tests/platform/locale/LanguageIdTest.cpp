#include "platform/locale/LanguageId.h"

#include <gtest/gtest.h>

namespace {

using Tarn::Locale::normalizedLanguageId;

TEST(LanguageId, HasOneFormHoweverItIsWritten) {
  for (const char* id : {"de_AT", "de-AT", "DE_at", "de_at", "de_AT.UTF-8", "de-AT@euro", "de_AT.ISO-8859-15@euro"}) {
    EXPECT_EQ(normalizedLanguageId(id), "de_AT") << id;
  }
  EXPECT_EQ(normalizedLanguageId("fr_CA.UTF-8"), "fr_CA");
  EXPECT_EQ(normalizedLanguageId("EN"), "en");
  EXPECT_EQ(normalizedLanguageId("GSW"), "gsw");
  EXPECT_EQ(normalizedLanguageId("ZH-hANT-tw"), "zh_Hant_TW");
  EXPECT_EQ(normalizedLanguageId("es-419"), "es_419");
  EXPECT_EQ(normalizedLanguageId("ca_es_VALENCIA"), "ca_ES_valencia");
}

TEST(LanguageId, IsEmptyForWhatIsNoLanguage) {
  for (const char* id : {"", "C", "C.UTF-8", "POSIX", "_", "de_", "_AT", "de__AT", "d3", "de AT", "de/AT", "../en",
                         "de_waytoolong", ".UTF-8", "gr\xc3\xbc"}) {
    EXPECT_EQ(normalizedLanguageId(id), "") << id;
  }
}

}  // namespace
