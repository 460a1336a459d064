#include "platform/base/NearestName.h"

#include <gtest/gtest.h>

#include <array>

namespace {

using Tarn::Common::nearestName;
using Tarn::Common::suggestNames;

constexpr std::array<std::string_view, 5> keys = {"inventory", "language", "log.level", "log.size", "ei"};

TEST(NearestName, OneEditInThreeLettersIsNear) {
  struct Row {
    std::string_view name;
    std::string_view nearest;
  };
  for (const Row& row : {Row{"lnguage", "language"}, Row{"lagnuage", "language"}, Row{"LANGUAGE", "language"},
                         Row{"langauge", "language"}, Row{"languages", "language"}, Row{"lan", ""},
                         Row{"loglevek", "log.level"}, Row{"lohlevek", ""}, Row{"log.sise", "log.size"}, Row{"xi", ""},
                         Row{"EI", "ei"}, Row{"exi", "ei"}, Row{"", ""}, Row{"colour", ""}}) {
    EXPECT_EQ(nearestName(row.name, keys), row.nearest) << row.name;
  }
}

TEST(NearestName, TheNearestOfSeveralIsTaken) {
  constexpr std::array<std::string_view, 3> roles = {"Antecedents", "Antecedent", "Dependent"};
  EXPECT_EQ(nearestName("antecedent", roles), "Antecedent");
  EXPECT_EQ(nearestName("Antecendent", roles), "Antecedent");
  constexpr std::array<std::string_view, 2> equal = {"abcd", "abce"};
  EXPECT_EQ(nearestName("abcf", equal), "abcd");
}

TEST(NearestName, WithoutANearNameAllAreListed) {
  EXPECT_EQ(suggestNames("lnguage", keys), "did you mean language?");
  EXPECT_EQ(suggestNames("colour", keys), "there are inventory, language, log.level, log.size, ei");
  EXPECT_EQ(suggestNames("colour", keys, "known keys: "), "known keys: inventory, language, log.level, log.size, ei");
}

}  // namespace
