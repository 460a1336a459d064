#include <gtest/gtest.h>
#include <tarn/Common.h>

#include <string>

namespace {

using Tarn::make_string;
using Tarn::stripSpaces;

TEST(StripSpaces, RemovesBlanksAtBothEndsOnly) {
  EXPECT_EQ(stripSpaces("  CPU  Name   "), "CPU  Name");
  EXPECT_EQ(stripSpaces("CPU"), "CPU");
  EXPECT_EQ(stripSpaces(""), "");
  EXPECT_EQ(stripSpaces("   "), "");
}

TEST(StripSpaces, KeepsEveryOtherWhiteSpace) {
  EXPECT_EQ(stripSpaces(" \t CPU\n "), "\t CPU\n");
  EXPECT_EQ(stripSpaces(std::string(" \0 ", 3)), std::string("\0", 1));
}

TEST(MakeString, WritesUtf8) {
  EXPECT_EQ(make_string(L""), "");
  EXPECT_EQ(make_string(L"Processor"), "Processor");
  EXPECT_EQ(make_string(std::wstring(1, L'\0')), std::string(1, '\0'));
  EXPECT_EQ(make_string(L"Gr\u00f6\u00dfe"),
            "Gr\xc3\xb6\xc3\x9f"
            "e");
}

TEST(MakeString, UsesTheShortestFormAtEveryLimit) {
  EXPECT_EQ(make_string(std::wstring{0x7f, 0x80}), "\x7f\xc2\x80");
  EXPECT_EQ(make_string(std::wstring{0x7ff, 0x800}), "\xdf\xbf\xe0\xa0\x80");
  EXPECT_EQ(make_string(std::wstring{0xd7ff, 0xe000}), "\xed\x9f\xbf\xee\x80\x80");
  EXPECT_EQ(make_string(std::wstring{0xffff, 0x10000}), "\xef\xbf\xbf\xf0\x90\x80\x80");
  EXPECT_EQ(make_string(std::wstring{0x10ffff}), "\xf4\x8f\xbf\xbf");
}

TEST(MakeString, ReplacesWhatIsNoCharacter) {
  const std::string replacement = "\xef\xbf\xbd";
  EXPECT_EQ(make_string(std::wstring{L'a', 0xd800, L'b', 0xdfff}), "a" + replacement + "b" + replacement);
  EXPECT_EQ(make_string(std::wstring{0x110000}), replacement);
  EXPECT_EQ(make_string(std::wstring{static_cast<wchar_t>(-1)}), replacement);
}

}  // namespace
