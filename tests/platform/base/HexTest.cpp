#include "platform/base/Hex.h"

#include <gtest/gtest.h>

namespace {

using namespace Tarn::Common;

TEST(Hex, HasTwoDigitsForAByte) {
  std::string text = "x";
  appendHex(text, 0x00);
  appendHex(text, 0x0A);
  appendHex(text, 0xA0);
  appendHex(text, 0xFF);
  appendHex(text, 0xBC, hexCapitals);
  EXPECT_EQ(text, "x000aa0ffBC");
}

TEST(Hex, HasAsManyDigitsAsTheNumberNeedsAndIsAskedFor) {
  EXPECT_EQ(hexText(0), "0");
  EXPECT_EQ(hexText(0xD08), "d08");
  EXPECT_EQ(hexText(0xFFFFFFFF, 2), "ffffffff");
  EXPECT_EQ(hexText(0x4F, 4, hexCapitals), "004F");
}

}  // namespace
