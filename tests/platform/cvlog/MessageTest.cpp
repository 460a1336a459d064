#include "platform/cvlog/Message.h"

#include <gtest/gtest.h>
#include <syslog.h>

#include <climits>
#include <string>

#include "platform/cvlog/Level.h"

namespace {

using CVLog::formatForSystemLog;
using CVLog::formatLine;
using CVLog::Message;
using std::chrono::days;
using std::chrono::milliseconds;
using std::chrono::sys_days;
using std::chrono::year;

Message sample() {
  return {.time = sys_days(year(2026) / 3 / 1) + std::chrono::hours(9) + std::chrono::minutes(5) + milliseconds(7125),
          .level = 6000,
          .component = "Corvane.CPUProvider",
          .function = "getFactoryInstance",
          .file = "CPUObjFactory.cpp",
          .line = 2044,
          .text = "Processor map empty"};
}

TEST(Message, IsOneLineWithItsFieldsInOrder) {
  EXPECT_EQ(formatLine(sample()),
            "2026-03-01T09:05:07.125Z error Corvane.CPUProvider getFactoryInstance CPUObjFactory.cpp:2044 "
            "Processor map empty");
}

TEST(Message, LeavesTimeAndLevelToTheSystemLog) {
  EXPECT_EQ(formatForSystemLog(sample()),
            "Corvane.CPUProvider getFactoryInstance CPUObjFactory.cpp:2044 Processor map empty");
}

TEST(Message, ShowsTimesBeforeTheEpochAndAtTheEndOfAYear) {
  Message message = sample();
  message.time = sys_days(year(1970) / 1 / 1) - milliseconds(1);
  EXPECT_EQ(formatLine(message).substr(0, 24), "1969-12-31T23:59:59.999Z");
  message.time = sys_days(year(2024) / 2 / 28) + days(1);
  EXPECT_EQ(formatLine(message).substr(0, 24), "2024-02-29T00:00:00.000Z");
}

TEST(Message, EscapesWhatWouldBreakTheLine) {
  Message message = sample();
  const std::string text("a\nb\rc\td\\e\x1b[31mf\x7f\0g", 18);
  message.text = text;
  EXPECT_EQ(formatForSystemLog(message),
            "Corvane.CPUProvider getFactoryInstance CPUObjFactory.cpp:2044 "
            R"(a\nb\rc\td\\e\x1b[31mf\x7f\x00g)");
}

TEST(Message, KeepsUtf8AsItIs) {
  Message message = sample();
  message.text = "Größe 大";
  EXPECT_TRUE(formatLine(message).ends_with(" Größe 大"));
}

TEST(Message, KeepsItsFieldsApart) {
  Message message = sample();
  message.component = "";
  message.function = "operator new\n";
  message.file = "a b.cpp";
  message.line = -1;
  message.text = "";
  EXPECT_EQ(formatForSystemLog(message), R"(- operator\x20new\n a\x20b.cpp:-1 )");
}

TEST(Message, LevelHasTheNameAndSeverityOfTheNamedLevelBelowIt) {
  const CVLog::NamedLevel rows[] = {{INT_MAX, "error", LOG_ERR},    {6000, "error", LOG_ERR},
                                    {5999, "warning", LOG_WARNING}, {5000, "warning", LOG_WARNING},
                                    {4999, "info", LOG_INFO},       {4000, "info", LOG_INFO},
                                    {3999, "debug", LOG_DEBUG},     {INT_MIN, "debug", LOG_DEBUG}};
  for (const CVLog::NamedLevel& row : rows) {
    EXPECT_EQ(CVLog::namedLevel(row.level).name, row.name) << row.level;
    EXPECT_EQ(CVLog::namedLevel(row.level).severity, row.severity) << row.level;
  }
}

}  // namespace
