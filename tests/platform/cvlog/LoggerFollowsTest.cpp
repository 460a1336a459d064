// What the logger does when its configuration file changes.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <filesystem>
#include <iterator>
#include <optional>
#include <string>
#include <thread>
#include <vector>

#include "platform/cvlog/Logger.h"
#include "tests/platform/cvlog/LoggerFixture.h"
#include "tests/platform/cvlog/RecordedSystemLog.h"

namespace {

using CVLog::CVLogger;
using testing::ElementsAre;
using testing::EndsWith;
using testing::Field;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::SizeIs;

constexpr const char* readAgain = " was read again\n";

/// A logger that is told when to look at its file.
class FollowingLogger : public LoggerProcess {
 protected:
  CVLog::Logger makeLogger(const std::optional<std::string>& logOverride = std::nullopt) {
    return {{path("corvane.conf"), Tarn::Common::ConfigurationFile::Absence::IsFine}, logOverride, std::nullopt};
  }

  static CVLog::Message message(int level, std::string_view text) {
    return {.time = std::chrono::system_clock::now(),
            .level = level,
            .component = "Corvane.Test",
            .function = "function",
            .file = "file.cpp",
            .line = 12,
            .text = text};
  }
  static std::string line(const std::string& text) {
    return "TIME error Corvane.Test function file.cpp:12 " + text + "\n";
  }

  [[nodiscard]] std::string to(const std::string& name) const { return "log.destination = file:" + path(name) + "\n"; }

  static std::ptrdiff_t openDescriptors() {
    const std::filesystem::directory_iterator descriptors("/proc/self/fd");
    return std::distance(begin(descriptors), end(descriptors));
  }
};

TEST_F(FollowingLogger, GoesToAnotherDestination) {
  configure(to("a"));
  CVLog::Logger logger = makeLogger();
  logger.log(message(6000, "one"));
  reconfigure(to("b"));
  logger.log(message(6000, "two"));
  logger.followConfiguration();
  logger.log(message(6000, "three"));
  EXPECT_EQ(content("a"), line("one") + line("two"));
  EXPECT_EQ(content("b"), line("three"));
}

TEST_F(FollowingLogger, TakesOtherLevels) {
  configure(to("log"));
  CVLog::Logger logger = makeLogger();
  EXPECT_FALSE(CVLogger::logTakes(3000));
  EXPECT_FALSE(CVLogger::traceTakes(6000));
  reconfigure("log.level = debug\n" + to("log") + "trace.level = info\ntrace.destination = file:" + path("trace") +
              "\n");
  logger.followConfiguration();
  EXPECT_TRUE(CVLogger::logTakes(3000));
  EXPECT_TRUE(CVLogger::traceTakes(4000));
  EXPECT_FALSE(CVLogger::traceTakes(3999));
  reconfigure("log.destination = none\n");
  logger.followConfiguration();
  EXPECT_FALSE(CVLogger::logTakes(6000));
  EXPECT_FALSE(CVLogger::traceTakes(6000));
}

TEST_F(FollowingLogger, KeepsTheFileThatIsOpenWhereOnlyTheLevelChanges) {
  configure(to("log"));
  CVLog::Logger logger = makeLogger();
  std::filesystem::rename(path("log"), path("moved"));
  std::filesystem::create_directory(path("log"));  // it could not be opened again
  reconfigure(to("log") + "log.level = info\n");
  logger.followConfiguration();
  EXPECT_TRUE(CVLogger::logTakes(4000));
  EXPECT_THAT(content("moved"), EndsWith(readAgain));
}

TEST_F(FollowingLogger, SaysThatItHasReadItsFileAgain) {
  configure("log.level = info\n" + to("log"));
  CVLog::Logger logger = makeLogger();
  reconfigure("language = de\nlog.level = info\n" + to("log"));
  logger.followConfiguration();
  logger.followConfiguration();
  EXPECT_THAT(content("log"),
              MatchesRegex("TIME info Corvane.Logger noteThatFileWasRead Logger.cpp:[0-9]+ Configuration: " +
                           path("corvane.conf") + readAgain));
}

TEST_F(FollowingLogger, DoesWhatItDoesByDefaultWithoutItsFile) {
  configure(to("log"));
  CVLog::Logger logger = makeLogger();
  std::filesystem::remove(path("corvane.conf"));
  logger.followConfiguration();
  logger.log(message(6000, "to the system log"));
  EXPECT_THAT(content("log"), IsEmpty());
  EXPECT_THAT(recordedSystemLog(),
              ElementsAre(SystemLogRecord{3, "Corvane.Test function file.cpp:12 to the system log"}));
}

TEST_F(FollowingLogger, FindsAFileThatWasNotThereAtFirst) {
  std::filesystem::remove(path("corvane.conf"));
  CVLog::Logger logger = makeLogger();
  configure(to("log"));
  logger.followConfiguration();
  logger.log(message(6000, "one"));
  EXPECT_EQ(content("log"), line("one"));
}

TEST_F(FollowingLogger, KeepsItsOverrides) {
  configure(to("a"));
  CVLog::Logger logger = makeLogger("error:file:" + path("override"));
  reconfigure(to("b") + "log.level = debug\n");
  logger.followConfiguration();
  logger.log(message(6000, "one"));
  logger.log(message(3000, "not wanted"));
  EXPECT_EQ(content("override"), line("one"));
}

TEST_F(FollowingLogger, ReportsWhatIsWrongInTheChangedFile) {
  CVLog::Logger logger = makeLogger();
  reconfigure("log.level = loud\n");
  logger.followConfiguration();
  logger.followConfiguration();
  EXPECT_THAT(recordedSystemLog(),
              ElementsAre(Field(&SystemLogRecord::text,
                                EndsWith(path("corvane.conf") + ":1: \"loud\" is not valid: expected error, "
                                                                "warning, info, debug or a number"))));
}

TEST_F(FollowingLogger, TriesAFileThatCouldNotBeOpenedAgain) {
  configure(to("later/log"));
  CVLog::Logger logger = makeLogger();
  logger.log(message(6000, "to the system log"));
  EXPECT_THAT(recordedSystemLog(), SizeIs(2));
  std::filesystem::create_directory(path("later"));
  reconfigure(to("later/log"));
  logger.followConfiguration();
  logger.log(message(6000, "to the file"));
  EXPECT_EQ(content("later/log"), line("to the file"));
  EXPECT_THAT(recordedSystemLog(), SizeIs(2));
}

TEST_F(FollowingLogger, GoesOnCountingWhereALimitStaysTheSame) {
  configure(to("log") + "log.rate = 2\n");
  CVLog::Logger logger = makeLogger();
  logger.log(message(6000, "one"));
  reconfigure("language = de\n" + to("log") + "log.rate = 2\n");
  logger.followConfiguration();
  logger.log(message(6000, "two"));
  logger.log(message(6000, "three"));
  EXPECT_EQ(content("log"), line("one") + line("two"));
}

TEST_F(FollowingLogger, LeavesNoFileOpenThatItDoesNotUseAnyMore) {
  configure(to("log"));
  CVLog::Logger logger = makeLogger();
  const std::ptrdiff_t before = openDescriptors();
  for (int round = 0; round < 50; ++round) {
    reconfigure(to("log" + std::to_string(round)));
    logger.followConfiguration();
    logger.log(message(6000, "one"));
  }
  EXPECT_EQ(openDescriptors(), before);
}

TEST_F(FollowingLogger, LosesNoMessageOfAThreadThatLogsMeanwhile) {
  constexpr std::size_t threadCount = 3;
  constexpr std::size_t messageCount = 2000;
  configure(to("a"));
  CVLog::Logger logger = makeLogger();
  std::atomic<std::size_t> running = threadCount;
  std::vector<std::thread> threads;
  threads.reserve(threadCount);
  for (std::size_t number = 0; number < threadCount; ++number) {
    threads.emplace_back([&] {
      for (std::size_t count = 0; count < messageCount; ++count) {
        logger.log(message(6000, "one"));
      }
      --running;
    });
  }
  bool isA = true;
  while (running > 0) {
    isA = !isA;
    reconfigure(to(isA ? "a" : "b"));
    logger.followConfiguration();
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  const std::string all = content("a") + content("b");
  EXPECT_EQ(all.size(), threadCount * messageCount * line("one").size());
  EXPECT_THAT(content("b"), Not(IsEmpty()));
}

using FollowingProcess = LoggerProcess;

TEST_F(FollowingProcess, NoticesWithTheFirstMessageOfALaterSecondThoughNobodyWantsIt) {
  configure("log.destination = none\n");
  log(4000, "lost");
  reconfigure("log.level = debug\nlog.destination = file:" + path("log") + "\n");
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  log(4000, "kept");
  EXPECT_THAT(content("log"), EndsWith(readAgain + std::string("TIME info Corvane.Test function file.cpp:12 kept\n")));
}

TEST_F(FollowingProcess, LooksOnlyOnceASecond) {
  configure("log.destination = none\n");
  log(4000, "lost");
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  log(4000, "looks");
  reconfigure("log.level = debug\nlog.destination = file:" + path("log") + "\n");
  const auto before = std::chrono::steady_clock::now();
  int messages = 0;
  while (content("log").empty() && std::chrono::steady_clock::now() < before + std::chrono::seconds(10)) {
    log(4000, "one");
    ++messages;
  }
  EXPECT_GT(messages, 1);
  EXPECT_LT(std::chrono::steady_clock::now(), before + std::chrono::seconds(3));
}

TEST_F(FollowingProcess, DoesNotLookForTheSakeOfDetails) {
  configure("log.destination = none\n");
  log(3000, "lost");
  reconfigure("log.level = debug\nlog.destination = file:" + path("log") + "\n");
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  log(3999, "lost, too");
  EXPECT_FALSE(std::filesystem::exists(path("log")));
}

// A thread may still log while the process ends.
TEST_F(FollowingLogger, IsNotLookedAfterOnceItIsGone) {
  configure(to("log"));
  { const CVLog::Logger logger = makeLogger(); }
  std::filesystem::remove(path("log"));
  log(6000, "nobody is there");
  EXPECT_FALSE(std::filesystem::exists(path("log")));
}

}  // namespace
