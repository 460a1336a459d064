#include "platform/base/Ascii.h"

#include <gtest/gtest.h>

namespace {

using namespace Tarn::Common;

TEST(Ascii, ComparesNamesWithoutRegardToTheCaseOfAsciiLetters) {
  EXPECT_TRUE(equalIgnoringCase("HALDA_CPUMemory", "halda_cpuMEMORY"));
  EXPECT_TRUE(equalIgnoringCase("", ""));
  EXPECT_FALSE(equalIgnoringCase("a", "ab"));
  EXPECT_FALSE(equalIgnoringCase("ab", "a"));
  EXPECT_FALSE(equalIgnoringCase("@[`{", "`{@["));
  EXPECT_FALSE(equalIgnoringCase("\xc4", "\xe4"));
}

TEST(Ascii, OrdersNamesAsItComparesThem) {
  EXPECT_TRUE(lessIgnoringCase("Antecedent", "dependent"));
  EXPECT_TRUE(lessIgnoringCase("antecedent", "Dependent"));
  EXPECT_FALSE(lessIgnoringCase("NAME", "name"));
  EXPECT_TRUE(lessIgnoringCase("Name", "NameSpace"));
}

TEST(Ascii, TrimsWhatSurroundsAWord) {
  EXPECT_EQ(trimmed(" \tkey = value\r"), "key = value");
  EXPECT_EQ(trimmed(" \t\r"), "");
  EXPECT_EQ(trimmed(""), "");
  EXPECT_EQ(trimmed("\n"), "\n");
}

}  // namespace
