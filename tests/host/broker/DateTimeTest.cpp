#include "host/broker/DateTime.h"

#include <gtest/gtest.h>

namespace Corvcim {

TEST(DateTime, PrintsMomentsInUtcAndIntervals) {
  EXPECT_EQ((DateTime{1582977600000001, false}.text()), "20200229120000.000001+000");
  EXPECT_EQ((DateTime{(2 * 86400ULL + 3723) * 1000000 + 5, true}.text()), "00000002010203.000005:000");
}

TEST(DateTime, ReadsBackWhatItPrints) {
  for (const DateTime each : {DateTime{0, false}, DateTime{1582977600000001, false}, DateTime{86399999999, true}}) {
    const auto read = DateTime::parse(each.text());
    ASSERT_TRUE(read) << each.text();
    EXPECT_EQ(read->microseconds, each.microseconds);
    EXPECT_EQ(read->interval, each.interval);
  }
}

TEST(DateTime, TakesTheOffsetToUtcAway) {
  EXPECT_EQ(DateTime::parse("20200229130000.000000+060")->text(), "20200229120000.000000+000");
  EXPECT_EQ(DateTime::parse("20200229110000.000000-060")->text(), "20200229120000.000000+000");
}

TEST(DateTime, RefusesWhatIsNone) {
  for (const char* each : {"", "20200229120000.000001+00", "20200230120000.000001+000", "20200229240000.000001+000",
                           "2020022912x000.000001+000", "20200229120000,000001+000", "20200229120000.000001*000",
                           "00000002010203.000005:001", "19691231235959.000000+000", "19700101000000.000000+001"}) {
    EXPECT_FALSE(DateTime::parse(each)) << each;
  }
}

TEST(DateTime, NowIsAMomentOfThisCentury) {
  EXPECT_EQ(DateTime::now().text().substr(0, 2), "20");
}

}  // namespace Corvcim
