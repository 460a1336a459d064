#include "host/corvcim/text/Text.h"

#include <gtest/gtest.h>

#include <clocale>
#include <string>

#include "host/corvcim/text/Quantities.h"

namespace Corvcim {
namespace {

TEST(Text, BytesThatAreNoCharactersAreReplaced) {
  EXPECT_EQ(toValidUtf8("caf\xC3\xA9"), "café");
  EXPECT_EQ(toValidUtf8("a\xFFz"), "a\uFFFDz");
  EXPECT_EQ(toValidUtf8("cut \xE2\x82"), "cut \uFFFD\uFFFD");
}

TEST(Text, ControlCharactersStandAsEscapes) {
  EXPECT_EQ(toPrintable("a\nb\tc\rd"), "a\\nb\\tc\\rd");
  EXPECT_EQ(toPrintable("\x1B[31mred\x7F"), "\\x1B[31mred\\x7F");
  EXPECT_EQ(toPrintable("\xC2\x9B"
                        "31m"),
            "\\x9B31m");
  EXPECT_EQ(toPrintable(std::string_view("a\0b", 3)), "a\\x00b");
  EXPECT_EQ(toPrintable("é ü 漢 \xF0\x9F\x98\x80"), "é ü 漢 \xF0\x9F\x98\x80");
  EXPECT_EQ(toPrintable("\xC3"), "\uFFFD");
}

TEST(Text, WidthsCountCharacters) {
  EXPECT_EQ(columns(""), 0U);
  EXPECT_EQ(columns("é×└─"), 4U);
  EXPECT_EQ(padRight("é", 3), "é  ");
  EXPECT_EQ(padRight("long", 2), "long");
}

TEST(Text, LongTextsAreCutAtAWholeCharacter) {
  EXPECT_EQ(shorten("abcdef", 6), "abcdef");
  EXPECT_EQ(shorten("abcdef", 4), "abc…");
  EXPECT_EQ(shorten("ééééé", 3), "éé…");
  EXPECT_EQ(shorten("abc", 1), "…");
  EXPECT_EQ(shorten("abc", 0), "");
}

/// A locale's characters, as long as this object lives.
class CharacterLocale {
 public:
  explicit CharacterLocale(const char* name) : before_(std::setlocale(LC_CTYPE, nullptr)) {
    isThere_ = std::setlocale(LC_CTYPE, name) != nullptr;
  }
  ~CharacterLocale() {
    std::setlocale(LC_CTYPE, before_.c_str());
    useCharset(Charset::Utf8);
  }
  CharacterLocale(const CharacterLocale&) = delete;
  CharacterLocale& operator=(const CharacterLocale&) = delete;

  bool isThere() const { return isThere_; }

 private:
  std::string before_;
  bool isThere_ = false;
};

TEST(Text, WidthsAreThoseOfTheTerminal) {
  const CharacterLocale locale("C.UTF-8");
  ASSERT_TRUE(locale.isThere());

  EXPECT_EQ(columns("漢字"), 4U);
  EXPECT_EQ(columns("e\u0301"), 1U);
  EXPECT_EQ(padRight("漢", 4), "漢  ");
  EXPECT_EQ(shorten("漢字漢字", 6), "漢字…");
  EXPECT_EQ(shorten("漢字漢字", 5), "漢字…");
  EXPECT_EQ(shorten("漢字漢字", 4), "漢…");
}

TEST(Text, AsciiHasASignForEachSignOfTheDrawings) {
  const CharacterLocale locale("C");
  useCharset(Charset::Ascii);

  EXPECT_EQ(inCharset("├─ 4 × L2 · a…\n│  └─ b"), "|- 4 x L2 - a~\n|  `- b");
  EXPECT_EQ(toPrintable("é\n漢\U0001F600\xFF"), "\\u00E9\\n\\u6F22\\U0001F600\\uFFFD");
  EXPECT_EQ(columns(toPrintable("漢×")), 7U);
  EXPECT_EQ(inCharset(shorten("abcdef", 4)), "abc~");
}

TEST(Text, CountsHaveThePluralThatTheyNeed) {
  EXPECT_EQ(counted(0, "core"), "0 cores");
  EXPECT_EQ(counted(1, "core"), "1 core");
  EXPECT_EQ(counted(2, "core"), "2 cores");
}

TEST(Quantities, BytesTakeTheLargestUnitThatGivesAtLeastOne) {
  EXPECT_EQ(formatBytes(0), "0 bytes");
  EXPECT_EQ(formatBytes(1), "1 byte");
  EXPECT_EQ(formatBytes(1023), "1023 bytes");
  EXPECT_EQ(formatBytes(1024), "1 KiB");
  EXPECT_EQ(formatBytes(48 * 1024), "48 KiB");
  EXPECT_EQ(formatBytes(1280 * 1024), "1.25 MiB");
  EXPECT_EQ(formatBytes(260ULL << 20U), "260 MiB");
  EXPECT_EQ(formatBytes(3ULL << 29U), "1.5 GiB");
  EXPECT_EQ(formatBytes(7ULL << 40U), "7 TiB");
  EXPECT_EQ(formatBytes((1ULL << 20U) - 1), "1024 KiB");
}

TEST(Quantities, ClocksHaveAtMostTwoDecimals) {
  EXPECT_EQ(formatMegahertz(0), "0 MHz");
  EXPECT_EQ(formatMegahertz(800), "800 MHz");
  EXPECT_EQ(formatMegahertz(1000), "1 GHz");
  EXPECT_EQ(formatMegahertz(2300), "2.3 GHz");
  EXPECT_EQ(formatMegahertz(3529), "3.53 GHz");
  EXPECT_EQ(formatMegahertz(3999), "4 GHz");
  EXPECT_EQ(formatMegahertz(2040), "2.04 GHz");
}

}  // namespace
}  // namespace Corvcim
