#include "host/corvcim/diff/Sentences.h"

#include <gtest/gtest.h>

namespace Corvcim {
namespace {

TEST(Sentences, PathsAreListedAsPeopleDo) {
  EXPECT_EQ(listPaths({"P0"}), "P0");
  EXPECT_EQ(listPaths({"P0", "P1"}), "P0 and P1");
  EXPECT_EQ(listPaths({"P0.C1", "P0.C4", "P1.C1"}), "P0.C1, P0.C4 and P1.C1");
}

TEST(Sentences, ThreePathsInARowBecomeARange) {
  EXPECT_EQ(listPaths({"P0.C1", "P0.C2", "P0.C3"}), "P0.C1 to P0.C3");
  EXPECT_EQ(listPaths({"P0.C8", "P0.C9", "P0.C10", "P0.C12"}), "P0.C8 to P0.C10 and P0.C12");
  EXPECT_EQ(listPaths({"P0.C@8", "P0.C@9", "P0.C@10"}), "P0.C@8 to P0.C@10");
}

TEST(Sentences, WhatIsNoRowIsNoRange) {
  EXPECT_EQ(listPaths({"P0.C1", "P0.C3", "P0.C5"}), "P0.C1, P0.C3 and P0.C5");
  EXPECT_EQ(listPaths({"P0.C3", "P0.C2", "P0.C1"}), "P0.C3, P0.C2 and P0.C1");
  EXPECT_EQ(listPaths({"P0.C0", "P1.C1", "P2.C2"}), "P0.C0, P1.C1 and P2.C2");
  EXPECT_EQ(listPaths({"X01", "X02", "X03"}), "X01, X02 and X03");
  EXPECT_EQ(listPaths({"a", "b", "c"}), "a, b and c");
  EXPECT_EQ(listPaths({"X99999999999", "X100000000000", "X100000000001"}),
            "X99999999999, X100000000000 and X100000000001");
}

TEST(Sentences, PathsOfWhichTheSameIsSaidShareOne) {
  Sentences sentences;
  sentences.add("core", "P0.C0", {Verbal::None, " went offline"});
  sentences.add("cache", "P0.L3.0", {Verbal::Is, "smaller"});
  sentences.add("core", "P0.C5", {Verbal::None, " went offline"});
  sentences.add("cache", "P1.L3.1", {Verbal::Is, "smaller"});
  sentences.add("processor", "P1", {Verbal::Has, "3 cores now", " each"});
  sentences.add("processor", "P2", {Verbal::Is, "new, with 2 cores", " each"});
  sentences.add("processor", "P3", {Verbal::Is, "new, with 2 cores", " each"});

  EXPECT_EQ(sentences.text(),
            "P0.C0 and P0.C5 went offline\n"
            "P0.L3.0 and P1.L3.1 are smaller\n"
            "P1 has 3 cores now\n"
            "P2 and P3 are new, with 2 cores each\n");
}

TEST(Sentences, KindsAreKeptApart) {
  Sentences sentences;
  sentences.add("core", "P0.C0", {Verbal::Is, "gone"});
  sentences.add("cache", "P0.L2.0", {Verbal::Is, "gone"});

  EXPECT_EQ(sentences.text(), "P0.C0 is gone\nP0.L2.0 is gone\n");
}

}  // namespace
}  // namespace Corvcim
