// The logger of a process: its destinations, its configuration, and changes of it.

#include <cvlog/CVLogger.h>
#include <cvlog/CVMessageBuffer.h>
#include <gmock/gmock.h>
#include <sys/wait.h>
#include <syslog.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <climits>
#include <filesystem>
#include <latch>
#include <set>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

#include "tests/platform/cvlog/LogTest.h"

namespace {

using CVLog::CVLogger;
using testing::ElementsAre;
using testing::EndsWith;
using testing::Field;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::SizeIs;
namespace fs = std::filesystem;

std::string logged(const char* level, const std::string& text) {
  return "TIME " + std::string(level) + " Corvane.Test function file.cpp:12 " + text + '\n';
}

auto systemLogText(const std::string& expression) {
  return Field(&SystemLogRecord::text, MatchesRegex(expression));
}

TEST_F(LoggerTest, WithoutConfigurationErrorsGoToTheSystemLogSixtyAMinute) {
  for (const int level : {3000, 5999, 6000}) {
    log(level, "log " + std::to_string(level));
    trace(level, "trace " + std::to_string(level));
  }
  EXPECT_THAT(recordedSystemLog(), ElementsAre(SystemLogRecord{LOG_ERR, "Corvane.Test function file.cpp:12 log 6000"}));
  for (int number = 0; number < 200; ++number) {
    log(6000, "again");
  }
  EXPECT_THAT(recordedSystemLog(), SizeIs(60));
}

TEST_F(LoggerTest, EachSinkHasItsDestinationLevelAndLimits) {
  configure(to("log") + "log.level = warning\nlog.size = 4K\nlog.keep = 1\nlog.rate = 9\ntrace.destination = file:" +
            path("trace") + "\ntrace.size = 0\n");
  for (int number = 0; number < 10; ++number) {
    for (const int level : {3000, 5000}) {
      log(level, "log " + std::string(1000, 'x'));
      trace(level, "trace");
    }
  }
  const std::string nine = lines("log.1") + lines("log");
  EXPECT_EQ(nine.substr(0, 60), logged("warning", "log " + std::string(1000, 'x')).substr(0, 60));
  EXPECT_LE(fs::file_size(path("log.1")), 4096U);
  EXPECT_EQ(names(), (std::set<std::string>{"corvane.conf", "log", "log.1", "log.lock", "trace"}));
  std::string traced;
  for (int number = 0; number < 10; ++number) {
    traced += logged("debug", "trace") + logged("warning", "trace");
  }
  EXPECT_EQ(lines("trace"), traced);
  EXPECT_THAT(recordedSystemLog(), IsEmpty());
}

TEST_F(LoggerTest, EnvironmentComesBeforeTheFile) {
  configure("log.destination = syslog\n");
  setenv("CORVANE_LOG", ("4000:file:" + path("log")).c_str(), 1);
  setenv("CORVANE_TRACE", "debug:syslog", 1);
  log(4000, "one");
  trace(3000, "two");
  EXPECT_EQ(lines("log"), logged("info", "one"));
  EXPECT_THAT(recordedSystemLog(), ElementsAre(SystemLogRecord{LOG_DEBUG, "Corvane.Test function file.cpp:12 two"}));
}

TEST_F(LoggerTest, DestinationNoneKeepsNothingAndThresholdsShowIt) {
  EXPECT_TRUE(CVLogger::logTakes(3000));
  setenv("CORVANE_LOG", "debug:none", 1);
  setenv("CORVANE_TRACE", "error:stderr", 1);
  log(INT_MAX, "lost");
  EXPECT_THAT(recordedSystemLog(), IsEmpty());
  EXPECT_FALSE(CVLogger::logTakes(6000));
  EXPECT_FALSE(CVLogger::traceTakes(5999));
  EXPECT_TRUE(CVLogger::traceTakes(6000));
}

TEST_F(LoggerTest, BrokenConfigurationIsReportedOnceAndTheRestIsInForce) {
  configure("# a comment\nlog.levle = debug\nlog.level = 4000\nlog.destination = printer\n");
  log(4000, "logged");
  trace(6000, "not traced");
  const std::string start = "Corvane.Logger report Logger.cpp:[0-9]+ Configuration: " + path("corvane.conf");
  EXPECT_THAT(
      recordedSystemLog(),
      ElementsAre(
          systemLogText(start + ":2: unknown key \"log.levle\"; the line is ignored \\(did you mean log.level\\?\\)"),
          systemLogText(start + ":4: \"printer\" is not valid: expected none, stderr, syslog or "
                                "file:PATH"),
          SystemLogRecord{LOG_INFO, "Corvane.Test function file.cpp:12 logged"}));
}

TEST_F(LoggerTest, MissingConfigurationFileThatWasAskedForIsReported) {
  setenv("CORVANE_CONFIG", path("missing.conf").c_str(), 1);
  log(3000, "not logged");
  EXPECT_THAT(recordedSystemLog(),
              ElementsAre(systemLogText("Corvane.Logger .* Configuration: " + path("missing.conf") +
                                        ": the configuration file cannot be opened: No such file or directory; the "
                                        "defaults are used")));
}

TEST_F(LoggerTest, FileThatCannotBeOpenedGivesWayToTheDefaultAndIsTriedAgainAfterAChange) {
  configure(to("later/log"));
  setenv("CORVANE_TRACE", ("debug:file:" + path("later/trace")).c_str(), 1);
  log(6000, "kept");
  trace(6000, "lost");
  const std::string start = "Corvane.Logger report Logger.cpp:[0-9]+ Configuration: log file " + path("later/");
  const std::string end = " cannot be opened: No such file or directory: the default destination is used";
  EXPECT_THAT(recordedSystemLog(), ElementsAre(systemLogText(start + "log" + end), systemLogText(start + "trace" + end),
                                               SystemLogRecord{LOG_ERR, "Corvane.Test function file.cpp:12 kept"}));
  fs::create_directory(path("later"));
  reconfigure(to("later/log"));
  log(6000, "to the file");
  EXPECT_EQ(lines("later/log"), logged("error", "to the file"));
  EXPECT_THAT(recordedSystemLog(), SizeIs(3));
}

TEST_F(LoggerTest, MissingNamesAreAccepted) {
  setenv("CORVANE_LOG", "debug:syslog", 1);
  CVLogger::logLevelMessage(nullptr, nullptr, 0, "", 3000, nullptr, 0, 0, "");
  EXPECT_THAT(recordedSystemLog(), ElementsAre(SystemLogRecord{LOG_DEBUG, "- - :0 "}));
}

TEST_F(LoggerTest, ErrnoStaysAsItWas) {
  setenv("CORVANE_LOG", "debug:file:/dev/full", 1);
  errno = ERANGE;
  log(6000, "no room");
  EXPECT_EQ(errno, ERANGE);
}

TEST_F(LoggerTest, MessagesOfManyThreadsArriveWhole) {
  constexpr int threadCount = 16;
  constexpr int messageCount = 200;
  setenv("CORVANE_LOG", ("debug:file:" + path("log")).c_str(), 1);
  std::latch start(threadCount);
  std::vector<std::thread> threads;
  std::multiset<std::string> expected;
  for (int number = 0; number < threadCount; ++number) {
    for (int message = 0; message < messageCount; ++message) {
      expected.insert(logged("debug", "thread " + std::to_string(number) + " message " + std::to_string(message)));
    }
    threads.emplace_back([number, &start] {
      start.arrive_and_wait();
      for (int message = 0; message < messageCount; ++message) {
        CVLog::CVMessageBuffer buffer;
        buffer << "thread " << number << " message " << message;
        log(3000, CVLog::CVMessageBuffer::str(buffer));
        trace(3000, "nobody wants it");
      }
    });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  std::multiset<std::string> found;
  std::istringstream file(lines("log"));
  for (std::string line; std::getline(file, line);) {
    found.insert(line + '\n');
  }
  EXPECT_EQ(found, expected);
}

// Without protection, some of these children wait for ever.
TEST_F(LoggerTest, ChildrenThatAreForkedWhileAnotherThreadLogsNeverWait) {
  setenv("CORVANE_LOG", ("debug:file:" + path("log")).c_str(), 1);
  log(6000, "first");
  std::atomic<bool> isDone = false;
  std::thread other([&] {
    while (!isDone) {
      log(6000, "parent");
    }
  });
  for (int number = 0; number < 50; ++number) {
    const pid_t child = fork();
    if (child == 0) {
      alarm(20);
      log(6000, "child");
      _exit(0);
    }
    int status = -1;
    waitpid(child, &status, 0);
    EXPECT_EQ(status, 0);
  }
  isDone = true;
  other.join();
}

TEST_F(LoggerTest, ChangedConfigurationIsFollowedAndNoted) {
  configure(to("a"));
  log(6000, "one");
  const std::ptrdiff_t descriptors = countOpenDescriptors();
  reconfigure("log.level = info\n" + to("b") + "trace.destination = file:" + path("b") + "\n");
  log(4000, "two");
  reconfigure(to("c"));
  trace(6000, "not traced");
  log(4000, "not wanted");
  log(6000, "three");
  EXPECT_EQ(lines("a"), logged("error", "one"));
  const std::string note =
      "TIME info Corvane.Logger noteThatFileWasRead Logger.cpp:[0-9]+ Configuration: " + path("corvane.conf") +
      " was read again\n";
  EXPECT_THAT(lines("b"),
              MatchesRegex(note + note + "TIME info - - :0 looks after the configuration\n" + logged("info", "two")));
  EXPECT_EQ(lines("c"), logged("error", "three"));
  EXPECT_EQ(countOpenDescriptors(), descriptors);
}

TEST_F(LoggerTest, SinkWhoseSettingsStayTheSameKeepsItsFileAndItsCount) {
  const std::string settings = to("log") + "log.rate = 2\n";
  configure(settings);
  log(6000, "one");
  fs::rename(path("log"), path("moved"));
  fs::create_directory(path("log"));  // it could not be opened again
  reconfigure("language = de\n" + settings);
  log(6000, "two");
  log(6000, "three");
  EXPECT_EQ(lines("moved"), logged("error", "one") + logged("error", "two"));
}

TEST_F(LoggerTest, WithoutItsFileTheDefaultsAreInForceAndOverridesStay) {
  setenv("CORVANE_TRACE", ("error:file:" + path("trace")).c_str(), 1);
  configure(to("log"));
  log(6000, "one");
  reconfigure("log.level = loud\n");
  log(6000, "two");
  trace(6000, "traced");
  EXPECT_EQ(lines("log"), logged("error", "one"));
  EXPECT_EQ(lines("trace"), logged("error", "traced"));
  EXPECT_THAT(recordedSystemLog(),
              ElementsAre(Field(&SystemLogRecord::text, EndsWith(":1: \"loud\" is not valid: expected error, warning, "
                                                                 "info, debug or a number")),
                          SystemLogRecord{LOG_ERR, "Corvane.Test function file.cpp:12 two"}));
}

TEST_F(LoggerTest, MessagesBelowInfoDoNotLookAfterTheConfiguration) {
  configure("log.destination = none\n");
  log(3000, "lost");
  configure("log.level = debug\n" + to("log"));
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  log(3999, "lost, too");
  EXPECT_FALSE(fs::exists(path("log")));
}

TEST_F(LoggerTest, ConfigurationIsLookedAfterOnceASecond) {
  configure(to("log"));
  reconfigure(to("log"));
  configure("log.level = debug\n" + to("log"));
  const auto before = std::chrono::steady_clock::now();
  int lost = 0;
  while (lines("log").empty() && std::chrono::steady_clock::now() < before + std::chrono::seconds(10)) {
    log(4000, "one");
    ++lost;
  }
  EXPECT_GT(lost, 1);
  EXPECT_LT(std::chrono::steady_clock::now(), before + std::chrono::seconds(3));
}

TEST_F(LoggerTest, ThreadsLoseNoMessageWhileTheConfigurationChanges) {
  configure(to("a"));
  log(6000, "first");
  std::atomic<bool> isDone = false;
  std::atomic<std::size_t> count = 1;
  std::vector<std::thread> threads;
  for (int number = 0; number < 3; ++number) {
    threads.emplace_back([&] {
      while (!isDone) {
        log(6000, "again");
        ++count;
        std::this_thread::sleep_for(std::chrono::microseconds(50));
      }
    });
  }
  reconfigure(to("b"));
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  isDone = true;
  for (std::thread& thread : threads) {
    thread.join();
  }
  const std::string all = lines("a") + lines("b");
  EXPECT_EQ(static_cast<std::size_t>(std::count(all.begin(), all.end(), '\n')), count);
  EXPECT_THAT(lines("b"), Not(IsEmpty()));
}

}  // namespace
