#include "platform/inventory/tree/CpuSet.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

TEST(CpuSet, ReadsTheKernelsLists) {
  EXPECT_EQ(CpuSet::fromList("0-3,8,10-11\n"), (CpuSet{0, 1, 2, 3, 8, 10, 11}));
  EXPECT_EQ(CpuSet::fromList("5"), CpuSet{5});
  EXPECT_EQ(CpuSet::fromList("\n"), CpuSet());
  EXPECT_EQ(CpuSet::fromList(""), CpuSet());
}

TEST(CpuSet, RefusesWhatIsNoList) {
  for (const char* text : {"a", "1-", "-1", "3-1", "1,,2", "1,", "1 2", "0-65536", "99999999999", "0x3", "(null)"}) {
    EXPECT_EQ(CpuSet::fromList(text), std::nullopt) << text;
  }
}

TEST(CpuSet, RefusesListsThatAreNotAscending) {
  for (const char* text : {"1,1", "3,1", "0-3,2", "0-3,3-5", "4-5,0-3"}) {
    EXPECT_EQ(CpuSet::fromList(text), std::nullopt) << text;
  }
  EXPECT_EQ(CpuSet::fromList("0-1,2,3-65535").value().count(), CpuSet::limit);
}

TEST(CpuSet, RefusesALongListThatRepeatsItself) {
  std::string list;
  while (list.size() < 1'000'000) {
    list += "0-65535,";
  }
  EXPECT_EQ(CpuSet::fromList(list + "0-65535"), std::nullopt);
}

TEST(CpuSet, ReadsTheKernelsMasks) {
  EXPECT_EQ(CpuSet::fromMask("f\n"), (CpuSet{0, 1, 2, 3}));
  EXPECT_EQ(CpuSet::fromMask("00000000,00000003"), (CpuSet{0, 1}));
  EXPECT_EQ(CpuSet::fromMask("1,80000000,00000000,00010001"), (CpuSet{0, 16, 95, 96}));
  EXPECT_EQ(CpuSet::fromMask("0"), CpuSet());
  EXPECT_EQ(CpuSet::fromMask("00000000,00000000"), CpuSet());
}

TEST(CpuSet, RefusesWhatIsNoMask) {
  for (const char* text : {"", "\n", "g", "0x3", "-1", "1,2", "1,,00000002", "1,0000002", "123456789", "1 00000001"}) {
    EXPECT_EQ(CpuSet::fromMask(text), std::nullopt) << text;
  }
}

TEST(CpuSet, RefusesMasksWithNumbersFromTheLimitOn) {
  std::string groups;
  for (unsigned int cpu = 0; cpu < CpuSet::limit; cpu += 32) {
    groups += ",ffffffff";
  }
  EXPECT_EQ(CpuSet::fromMask("0" + groups).value().count(), CpuSet::limit);
  EXPECT_EQ(CpuSet::fromMask("1" + groups), std::nullopt);
}

TEST(CpuSet, WritesTheKernelsLists) {
  for (const char* list : {"", "0", "0-1", "0-3,8,10-11", "63-64", "127,65535"}) {
    EXPECT_EQ(CpuSet::fromList(list).value().toList(), list);
  }
}

TEST(CpuSet, WalksItsNumbersInOrder) {
  const CpuSet set{200, 3, 64, 63};

  EXPECT_EQ(set.first(), 3U);
  EXPECT_EQ(set.next(3), 63U);
  EXPECT_EQ(set.next(63), 64U);
  EXPECT_EQ(set.next(64), 200U);
  EXPECT_EQ(set.next(200), CpuSet::limit);
  EXPECT_EQ(CpuSet().first(), CpuSet::limit);
  EXPECT_EQ(std::vector<unsigned int>(set.begin(), set.end()), (std::vector<unsigned int>{3, 63, 64, 200}));
  const CpuSet nothing;
  EXPECT_TRUE(nothing.begin() == nothing.end());
}

TEST(CpuSet, TellsItsMembers) {
  const CpuSet set{0, 64, 127};

  EXPECT_TRUE(set.contains(64));
  EXPECT_FALSE(set.contains(63));
  EXPECT_FALSE(set.contains(100000));
  EXPECT_EQ(set.count(), 3U);
  EXPECT_FALSE(set.empty());
  EXPECT_TRUE(CpuSet().empty());
}

TEST(CpuSet, JoinsAndTakesAway) {
  CpuSet set{1, 70};
  set.add(CpuSet{2, 130});
  EXPECT_EQ(set, (CpuSet{1, 2, 70, 130}));

  set.remove(CpuSet{70, 130, 500});
  EXPECT_EQ(set, (CpuSet{1, 2}));

  set.remove(set);
  EXPECT_TRUE(set.empty());
}

TEST(CpuSet, KeepsOnlyWhatIsCommon) {
  CpuSet set{1, 2, 70, 200};
  set.keepOnly(CpuSet{2, 3, 70});
  EXPECT_EQ(set, (CpuSet{2, 70}));

  set.keepOnly(CpuSet{500});
  EXPECT_TRUE(set.empty());
}

TEST(CpuSet, IntersectsWhereANumberIsCommon) {
  EXPECT_TRUE((CpuSet{1, 100}.intersects(CpuSet{100})));
  EXPECT_FALSE((CpuSet{1, 100}.intersects(CpuSet{2})));
  EXPECT_FALSE(CpuSet().intersects(CpuSet{0}));
}

TEST(CpuSet, IsASubsetOfWhatHasAllItsNumbers) {
  EXPECT_TRUE((CpuSet{1, 100}.isSubsetOf(CpuSet{1, 2, 100, 500})));
  EXPECT_TRUE((CpuSet{1, 100}.isSubsetOf(CpuSet{1, 100})));
  EXPECT_FALSE((CpuSet{1, 100}.isSubsetOf(CpuSet{1, 101})));
  EXPECT_FALSE((CpuSet{1, 100}.isSubsetOf(CpuSet{1})));
  EXPECT_TRUE(CpuSet().isSubsetOf(CpuSet()));
  EXPECT_FALSE(CpuSet{0}.isSubsetOf(CpuSet()));
}

TEST(CpuSet, IgnoresNumbersFromTheLimitOn) {
  CpuSet set;
  set.add(CpuSet::limit);
  EXPECT_TRUE(set.empty());
}

}  // namespace
}  // namespace Tarn::Inventory
