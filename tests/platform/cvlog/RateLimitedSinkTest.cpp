#include "platform/cvlog/RateLimitedSink.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace {

using CVLog::Message;
using CVLog::RateLimitedSink;
using std::chrono::seconds;
using std::chrono::system_clock;
using testing::ElementsAre;

class RecordingSink : public CVLog::Sink {
 public:
  explicit RecordingSink(std::vector<std::string>& texts) : texts_(texts) {}
  void write(const Message& message) override { texts_.emplace_back(message.text); }

 private:
  std::vector<std::string>& texts_;
};

class RateLimit : public testing::Test {
 protected:
  void writeAt(int second, std::string_view text) {
    sink_->write({.time = system_clock::time_point(seconds(1'000'000 + second)), .level = 6000, .text = text});
  }

  std::vector<std::string> texts_;
  std::optional<RateLimitedSink> sink_{std::in_place, std::make_unique<RecordingSink>(texts_), 2U};
};

TEST_F(RateLimit, PassesSoManyMessagesAMinute) {
  writeAt(0, "a");
  writeAt(30, "b");
  writeAt(59, "c");
  EXPECT_THAT(texts_, ElementsAre("a", "b"));
}

TEST_F(RateLimit, SaysInTheNextMinuteHowManyWereDropped) {
  for (const char* text : {"a", "b", "c", "d", "e"}) {
    writeAt(0, text);
  }
  writeAt(60, "f");
  writeAt(61, "g");
  EXPECT_THAT(texts_, ElementsAre("a", "b", "3 messages were dropped; the limit is 2 a minute", "f", "g"));
}

TEST_F(RateLimit, SaysAtItsEndHowManyWereDroppedSinceItSaidSo) {
  for (const char* text : {"a", "b", "c", "d", "e"}) {
    writeAt(0, text);
  }
  sink_.reset();
  EXPECT_THAT(texts_, ElementsAre("a", "b", "3 messages were dropped; the limit is 2 a minute"));
}

TEST_F(RateLimit, EndsSilentlyWhereNothingWasDropped) {
  writeAt(0, "a");
  writeAt(0, "b");
  sink_.reset();
  EXPECT_THAT(texts_, ElementsAre("a", "b"));
}

TEST_F(RateLimit, SurvivesAClockThatIsSetBack) {
  for (const char* text : {"a", "b", "c"}) {
    writeAt(100'000, text);
  }
  writeAt(5, "d");
  EXPECT_THAT(texts_, ElementsAre("a", "b", "1 message was dropped; the limit is 2 a minute", "d"));
}

}  // namespace
