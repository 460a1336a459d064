#include "platform/cvlog/Level.h"

#include <gtest/gtest.h>
#include <syslog.h>

#include <climits>

namespace {

using CVLog::levelName;
using CVLog::parseLevel;
using CVLog::syslogPriority;

struct Row {
  int level;
  const char* name;
  int priority;
};

TEST(Level, HasTheNameAndPriorityOfTheNamedLevelBelowIt) {
  for (const Row& row : {Row{INT_MAX, "error", LOG_ERR}, Row{6001, "error", LOG_ERR}, Row{6000, "error", LOG_ERR},
                         Row{5999, "warning", LOG_WARNING}, Row{5000, "warning", LOG_WARNING},
                         Row{4999, "info", LOG_INFO}, Row{4000, "info", LOG_INFO}, Row{3999, "debug", LOG_DEBUG},
                         Row{3000, "debug", LOG_DEBUG}, Row{0, "debug", LOG_DEBUG}, Row{INT_MIN, "debug", LOG_DEBUG}}) {
    EXPECT_EQ(levelName(row.level), row.name) << row.level;
    EXPECT_EQ(syslogPriority(row.level), row.priority) << row.level;
  }
}

TEST(Level, IsWrittenAsANameOrANumber) {
  EXPECT_EQ(parseLevel("error"), 6000);
  EXPECT_EQ(parseLevel("Warning"), 5000);
  EXPECT_EQ(parseLevel("INFO"), 4000);
  EXPECT_EQ(parseLevel("debug"), 3000);
  EXPECT_EQ(parseLevel("0"), 0);
  EXPECT_EQ(parseLevel("4500"), 4500);
}

TEST(Level, RejectsTextsThatAreNoLevel) {
  for (const char* text : {"", "errors", "verbose", "-1", "+1", "3000x", " 3000", "0x10", "99999999999"}) {
    EXPECT_EQ(parseLevel(text), std::nullopt) << text;
  }
}

}  // namespace
