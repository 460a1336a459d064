#include "tests/platform/locale/CatalogueProblems.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const std::string header =
    "msgid \"\"\nmsgstr \"\"\n\"Language: fr\\n\"\n\"MIME-Version: 1.0\\n\"\n\"Content-Type: text/plain; charset=UTF-8\\n\"\n"
    "\"Content-Transfer-Encoding: 8bit\\n\"\n";
const PoFile englishCatalogue = parsePoFile("msgid \"A\"\nmsgstr \"all %s\"\nmsgid \"B\"\nmsgstr \"both\"\n");

std::vector<std::string> problemsOfFrench(const std::string& entries) {
  return problemsOf(parsePoFile(header + entries), "fr", englishCatalogue);
}

constexpr const char* goodB = "#. both\nmsgid \"B\"\nmsgstr \"deux\"\n";

TEST(CatalogueProblems, AreNoneInACompleteCatalogue) {
  EXPECT_THAT(problemsOfFrench(std::string("#. all %s\nmsgid \"A\"\nmsgstr \"\"\n\"tout \"\n\"%s\"\n") + goodB),
              IsEmpty());
}

TEST(CatalogueProblems, AreTextsThatAreMissingOrUnknown) {
  EXPECT_THAT(problemsOfFrench("msgid \"C\"\nmsgstr \"cent\"\n"),
              ElementsAre("C in line 7 is not in the English catalogue", "A is missing", "B is missing"));
}

TEST(CatalogueProblems, AreTextsThatOccurTwice) {
  EXPECT_THAT(problemsOfFrench(std::string("#. all %s\nmsgid \"A\"\nmsgstr \"tout %s\"\n") + goodB + goodB),
              ElementsAre("B in line 14 occurs twice"));
}

TEST(CatalogueProblems, AreTextsThatSayNothingOrAreUnsure) {
  EXPECT_THAT(problemsOfFrench("#. all %s\nmsgid \"A\"\nmsgstr \"tout %s\"\n#. both\nmsgid \"B\"\nmsgstr \"\"\n"),
              ElementsAre("B in line 11 has no text"));
  EXPECT_THAT(problemsOfFrench(std::string("#, fuzzy\n#. all %s\nmsgid \"A\"\nmsgstr \"tout %s\"\n") + goodB),
              ElementsAre("A in line 9 is marked fuzzy"));
}

TEST(CatalogueProblems, AreTranslationsOfAnEnglishTextThatHasChangedSince) {
  EXPECT_THAT(problemsOfFrench(std::string("#. every %s\nmsgid \"A\"\nmsgstr \"tout %s\"\n") + goodB),
              ElementsAre("A in line 8 does not quote the present English text as its note"));
  EXPECT_THAT(problemsOfFrench(std::string("msgid \"A\"\nmsgstr \"tout %s\"\n") + goodB),
              ElementsAre("A in line 7 does not quote the present English text as its note"));
}

TEST(CatalogueProblems, ArePluralsThatNothingAsksFor) {
  EXPECT_THAT(
      problemsOfFrench(
          "#. all %s\nmsgid \"A\"\nmsgstr \"tout %s\"\n#. both\nmsgid \"B\"\nmsgid_plural \"Bs\"\nmsgstr[0] \"deux\"\n"),
      ElementsAre("B in line 11 has a plural, which nothing asks for"));
}

TEST(CatalogueProblems, ArePlaceholdersThatDiffer) {
  for (const char* text : {"tout", "tout %d", "tout %s %s", "tout {0}", "tout %1", "tout {}"}) {
    EXPECT_THAT(problemsOfFrench("#. all %s\nmsgid \"A\"\nmsgstr \"" + std::string(text) + "\"\n" + goodB),
                ElementsAre("A in line 8 has other placeholders than the English text"))
        << text;
  }
}

TEST(CatalogueProblems, AreBytesThatAreNoCharacters) {
  EXPECT_THAT(problemsOfFrench("#. all %s\nmsgid \"A\"\nmsgstr \"caf\xe9 %s\"\n" + std::string(goodB)),
              ElementsAre("A in line 8 is not UTF-8"));
}

TEST(CatalogueProblems, AreBlanksAtTheEnds) {
  EXPECT_THAT(problemsOfFrench("#. all %s\nmsgid \"A\"\nmsgstr \"tout %s \"\n" + std::string(goodB)),
              ElementsAre("A in line 8 begins or ends with a blank"));
}

TEST(CatalogueProblems, AreHeadersOfAnotherLanguageOrEncoding) {
  const std::string entries = std::string("#. all %s\nmsgid \"A\"\nmsgstr \"tout %s\"\n") + goodB;
  EXPECT_THAT(problemsOf(parsePoFile(header + entries), "de", englishCatalogue),
              ElementsAre("the header has no \"Language: de\""));
  EXPECT_THAT(problemsOf(parsePoFile(entries), "fr", englishCatalogue),
              ElementsAre("the header has no \"Content-Transfer-Encoding: 8bit\"",
                          "the header has no \"Content-Type: text/plain; charset=UTF-8\"",
                          "the header has no \"Language: fr\"", "the header has no \"MIME-Version: 1.0\""));
}

}  // namespace
