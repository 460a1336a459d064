#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <syslog.h>

#include <algorithm>
#include <cerrno>
#include <climits>
#include <filesystem>
#include <string>

#include "tests/platform/cvlog/LoggerFixture.h"
#include "tests/platform/cvlog/RecordedSystemLog.h"

namespace {

using CVLog::CVLogger;
using testing::AllOf;
using testing::ElementsAre;
using testing::Field;
using testing::Gt;
using testing::IsEmpty;
using testing::Le;
using testing::MatchesRegex;
using testing::SizeIs;

using Logger = LoggerProcess;

TEST_F(Logger, SendsErrorsToTheSystemLogAndNothingElseByDefault) {
  for (int level : {3000, 4000, 5000, 5999, 6000}) {
    log(level, "log " + std::to_string(level));
    trace(level, "trace " + std::to_string(level));
  }
  EXPECT_THAT(recordedSystemLog(), ElementsAre(SystemLogRecord{LOG_ERR, "Corvane.Test function file.cpp:12 log 6000"}));
}

TEST_F(Logger, LimitsWhatItSendsToTheSystemLog) {
  for (int number = 0; number < 200; ++number) {
    log(6000, "again");
  }
  EXPECT_THAT(recordedSystemLog(), SizeIs(60));
}

TEST_F(Logger, LimitsWhatItSendsElsewhereWhereItIsToldTo) {
  configure("log.level = debug\nlog.destination = file:" + path("log") +
            "\nlog.rate = 2\ntrace.destination = stderr\ntrace.rate = 3\n");
  testing::internal::CaptureStderr();
  for (int number = 0; number < 10; ++number) {
    log(3000, "logged");
    trace(3000, "traced");
  }
  const std::string traced = testing::internal::GetCapturedStderr();
  EXPECT_EQ(std::count(traced.begin(), traced.end(), '\n'), 3);
  EXPECT_EQ(content("log"),
            "TIME debug Corvane.Test function file.cpp:12 logged\n"
            "TIME debug Corvane.Test function file.cpp:12 logged\n");
}

TEST_F(Logger, RotatesTheFileOfEachSink) {
  configure("log.destination = file:" + path("log") +
            "\nlog.size = 4K\nlog.keep = 2\ntrace.destination = file:" + path("trace") + "\ntrace.size = 0\n");
  const std::string text(1300, 'x');
  for (int number = 0; number < 20; ++number) {
    log(6000, text);
    trace(6000, text);
  }
  for (const char* name : {"log", "log.1", "log.2"}) {
    EXPECT_THAT(std::filesystem::file_size(path(name)), AllOf(Gt(0U), Le(4096U))) << name;
  }
  EXPECT_FALSE(std::filesystem::exists(path("log.3")));
  EXPECT_GT(std::filesystem::file_size(path("trace")), 20 * text.size());
}

TEST_F(Logger, WritesEachSinkToItsFile) {
  configure("log.level = warning\nlog.destination = file:" + path("log") +
            "\ntrace.destination = file:" + path("trace") + "\n");
  for (int level : {3000, 5000, 6000}) {
    log(level, "log " + std::to_string(level));
    trace(level, "trace " + std::to_string(level));
  }
  EXPECT_EQ(content("log"),
            "TIME warning Corvane.Test function file.cpp:12 log 5000\n"
            "TIME error Corvane.Test function file.cpp:12 log 6000\n");
  EXPECT_EQ(content("trace"),
            "TIME debug Corvane.Test function file.cpp:12 trace 3000\n"
            "TIME warning Corvane.Test function file.cpp:12 trace 5000\n"
            "TIME error Corvane.Test function file.cpp:12 trace 6000\n");
  EXPECT_THAT(recordedSystemLog(), IsEmpty());
}

TEST_F(Logger, ObeysTheEnvironmentBeforeTheFile) {
  configure("log.destination = syslog\n");
  setenv("CORVANE_LOG", ("4000:file:" + path("log")).c_str(), 1);
  setenv("CORVANE_TRACE", "debug:syslog", 1);
  log(4000, "logged");
  trace(3000, "traced");
  EXPECT_EQ(content("log"), "TIME info Corvane.Test function file.cpp:12 logged\n");
  EXPECT_THAT(recordedSystemLog(), ElementsAre(SystemLogRecord{LOG_DEBUG, "Corvane.Test function file.cpp:12 traced"}));
}

TEST_F(Logger, WritesToStandardError) {
  setenv("CORVANE_LOG", "debug:stderr", 1);
  testing::internal::CaptureStderr();
  log(3000, "shown");
  EXPECT_THAT(testing::internal::GetCapturedStderr(),
              MatchesRegex("[0-9TZ:.-]+ debug Corvane.Test function file.cpp:12 shown\n"));
}

TEST_F(Logger, KeepsNothingWhereBothDestinationsAreNone) {
  setenv("CORVANE_LOG", "debug:none", 1);
  log(6000, "lost");
  trace(6000, "lost");
  log(INT_MAX, "lost");
  EXPECT_THAT(recordedSystemLog(), IsEmpty());
}

TEST_F(Logger, KnowsWhichLevelsItTakesOnceItIsConfigured) {
  EXPECT_TRUE(CVLogger::logTakes(3000));
  EXPECT_TRUE(CVLogger::traceTakes(6000));
  log(3000, "configures");
  EXPECT_FALSE(CVLogger::logTakes(5999));
  EXPECT_TRUE(CVLogger::logTakes(6000));
  EXPECT_FALSE(CVLogger::traceTakes(6000));
}

TEST_F(Logger, ReportsABrokenConfigurationOnceAndObeysTheRest) {
  configure("# a comment\nlog.levle = debug\nlog.level = 4000\nlog.destination = printer\n");
  log(4000, "logged");
  trace(6000, "not traced");
  EXPECT_THAT(
      recordedSystemLog(),
      ElementsAre(
          Field(&SystemLogRecord::text,
                MatchesRegex("Corvane.Logger report Logger.cpp:[0-9]+ Configuration: " + path("corvane.conf") +
                             ":2: unknown key \"log.levle\"; the line is ignored \\(did you mean log.level\\?\\)")),
          Field(&SystemLogRecord::text,
                MatchesRegex("Corvane.Logger report Logger.cpp:[0-9]+ Configuration: " + path("corvane.conf") +
                             ":4: \"printer\" is not valid: expected none, stderr, syslog or file:PATH")),
          SystemLogRecord{LOG_INFO, "Corvane.Test function file.cpp:12 logged"}));
}

TEST_F(Logger, FallsBackToItsDefaultWhereAFileCannotBeOpened) {
  setenv("CORVANE_LOG", ("debug:file:" + path("missing/log")).c_str(), 1);
  setenv("CORVANE_TRACE", ("debug:file:" + path("missing/trace")).c_str(), 1);
  log(3000, "lost");
  log(6000, "kept");
  trace(6000, "lost");
  const std::string start = "Corvane.Logger report Logger.cpp:[0-9]+ Configuration: log file " + path("missing/");
  const std::string end = " cannot be opened: No such file or directory: the default destination is used";
  EXPECT_THAT(recordedSystemLog(), ElementsAre(Field(&SystemLogRecord::text, MatchesRegex(start + "log" + end)),
                                               Field(&SystemLogRecord::text, MatchesRegex(start + "trace" + end)),
                                               SystemLogRecord{LOG_ERR, "Corvane.Test function file.cpp:12 kept"}));
}

TEST_F(Logger, ReportsAConfigurationFileThatIsMissingThoughAskedFor) {
  setenv("CORVANE_CONFIG", path("missing.conf").c_str(), 1);
  log(3000, "not logged");
  EXPECT_THAT(recordedSystemLog(),
              ElementsAre(Field(&SystemLogRecord::text,
                                MatchesRegex("Corvane.Logger .* Configuration: " + path("missing.conf") +
                                             ": the configuration file cannot be opened: No such file or directory; "
                                             "the defaults are used"))));
}

TEST_F(Logger, AcceptsMissingNames) {
  setenv("CORVANE_LOG", "debug:syslog", 1);
  CVLogger::logLevelMessage(nullptr, nullptr, 0, "", 3000, nullptr, 0, 0, "");
  EXPECT_THAT(recordedSystemLog(), ElementsAre(SystemLogRecord{LOG_DEBUG, "- - :0 "}));
}

TEST_F(Logger, LeavesErrnoAlone) {
  setenv("CORVANE_LOG", "debug:file:/dev/full", 1);
  errno = ERANGE;
  log(6000, "no room");
  EXPECT_EQ(errno, ERANGE);
}

}  // namespace
