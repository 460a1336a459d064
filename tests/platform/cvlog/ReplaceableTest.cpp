#include "platform/cvlog/Replaceable.h"

#include <gtest/gtest.h>

#include <atomic>
#include <memory>
#include <thread>
#include <vector>

namespace {

using CVLog::Replaceable;

/// Counts how many of its kind are alive.
class Counted {
 public:
  Counted(int value, int& alive) : value_(value), alive_(alive) { ++alive_; }
  Counted(const Counted&) = delete;
  Counted& operator=(const Counted&) = delete;
  ~Counted() { --alive_; }

  [[nodiscard]] int value() const { return value_; }

 private:
  int value_;
  int& alive_;
};

class ReplaceableValue : public testing::Test {
 protected:
  std::unique_ptr<const Counted> make(int value) { return std::make_unique<Counted>(value, alive_); }

  [[nodiscard]] static int valueOf(const Replaceable<Counted>& replaceable) {
    int value = 0;
    replaceable.with([&](const Counted& counted) { value = counted.value(); });
    return value;
  }

  int alive_ = 0;
};

TEST_F(ReplaceableValue, IsTheLatest) {
  Replaceable<Counted> replaceable(make(1));
  EXPECT_EQ(valueOf(replaceable), 1);
  replaceable.replace(make(2));
  EXPECT_EQ(valueOf(replaceable), 2);
  EXPECT_EQ(replaceable.inForce().value(), 2);
}

TEST_F(ReplaceableValue, IsFreedWhenItWasReplacedAndNobodyUsesIt) {
  Replaceable<Counted> replaceable(make(1));
  replaceable.replace(make(2));
  replaceable.replace(make(3));
  EXPECT_EQ(alive_, 3);
  replaceable.discardUnused();
  EXPECT_EQ(alive_, 1);
  EXPECT_EQ(valueOf(replaceable), 3);
}

TEST_F(ReplaceableValue, LivesAsLongAsItIsUsed) {
  Replaceable<Counted> replaceable(make(1));
  replaceable.with([&](const Counted& used) {
    replaceable.replace(make(2));
    replaceable.discardUnused();
    EXPECT_EQ(alive_, 2);
    EXPECT_EQ(used.value(), 1);
  });
  replaceable.discardUnused();
  EXPECT_EQ(alive_, 1);
}

TEST_F(ReplaceableValue, IsNotInUseAfterAnException) {
  Replaceable<Counted> replaceable(make(1));
  EXPECT_THROW(replaceable.with([](const Counted& /*used*/) { throw 1; }), int);
  replaceable.replace(make(2));
  replaceable.discardUnused();
  EXPECT_EQ(alive_, 1);
}

TEST_F(ReplaceableValue, GoesWithItsOwner) {
  {
    Replaceable<Counted> replaceable(make(1));
    replaceable.replace(make(2));
  }
  EXPECT_EQ(alive_, 0);
}

// What is freed too early shows itself to the address sanitizer and, mostly, in the value.
TEST_F(ReplaceableValue, IsWholeForEveryThreadWhileItIsReplaced) {
  constexpr int lastValue = 20'000;
  Replaceable<std::vector<int>> replaceable(std::make_unique<std::vector<int>>(8, 0));
  std::atomic<bool> isBroken = false;
  constexpr int userCount = 3;
  std::vector<std::thread> users;
  users.reserve(userCount);
  for (int number = 0; number < userCount; ++number) {
    users.emplace_back([&] {
      for (int value = 0; value != lastValue;) {
        replaceable.with([&](const std::vector<int>& values) {
          isBroken = isBroken || values != std::vector<int>(8, values.front()) || values.front() < value;
          value = values.front();
        });
      }
    });
  }
  for (int value = 1; value <= lastValue; ++value) {
    replaceable.replace(std::make_unique<std::vector<int>>(8, value));
    replaceable.discardUnused();
  }
  for (std::thread& user : users) {
    user.join();
  }
  EXPECT_FALSE(isBroken);
}

}  // namespace
