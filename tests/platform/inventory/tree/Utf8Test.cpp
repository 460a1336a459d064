#include "platform/inventory/tree/Utf8.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

const std::string bad = "\xEF\xBF\xBD";

TEST(Utf8, LeavesValidTextsAsTheyAre) {
  for (const char* text : {"", "plain", "\xC3\xA4 \xE2\x82\xAC \xF0\x9F\x96\xA5", "\xED\x9F\xBF", "\xF4\x8F\xBF\xBF"}) {
    EXPECT_EQ(validUtf8(text), text);
  }
}

TEST(Utf8, ReplacesEachByteOfNoCharacter) {
  EXPECT_EQ(validUtf8("a\xFF"
                      "b"),
            "a" + bad + "b");
  EXPECT_EQ(validUtf8("\x80"), bad);
  EXPECT_EQ(validUtf8("\xC3"), bad) << "cut off";
  EXPECT_EQ(validUtf8("\xE2\x82"), bad + bad) << "cut off";
  EXPECT_EQ(validUtf8("\xC3("), bad + "(");
  EXPECT_EQ(validUtf8("\xC0\xAF"), bad + bad) << "overlong";
  EXPECT_EQ(validUtf8("\xE0\x80\xAF"), bad + bad + bad) << "overlong";
  EXPECT_EQ(validUtf8("\xED\xA0\x80"), bad + bad + bad) << "surrogate";
  EXPECT_EQ(validUtf8("\xF4\x90\x80\x80"), bad + bad + bad + bad) << "beyond Unicode";
  EXPECT_EQ(validUtf8("\xF8\x88\x80\x80\x80"), bad + bad + bad + bad + bad);
}

}  // namespace
}  // namespace Tarn::Inventory
