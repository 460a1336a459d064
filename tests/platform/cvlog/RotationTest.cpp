#include "platform/cvlog/Rotation.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <string>
#include <system_error>

#include "platform/common/FileDescriptor.h"
#include "platform/cvlog/FileSink.h"
#include "tests/platform/cvlog/LogDirectory.h"
#include "tests/platform/cvlog/RecordedSystemLog.h"

namespace {

using CVLog::FileSink;
using CVLog::makeOld;
using testing::ElementsAre;
using testing::EndsWith;

class LogRotation : public LogDirectory {
 protected:
  /// A file that holds two lines of one letter.
  [[nodiscard]] static std::uint64_t twoLines() { return 2 * line("a").size(); }

  void writeAll(FileSink& sink, std::string_view letters) {
    for (std::size_t i = 0; i < letters.size(); ++i) {
      sink.write(message(letters.substr(i, 1)));
    }
  }
};

TEST_F(LogRotation, GivesEachFileItsSizeAndNumbersTheOldOnes) {
  FileSink sink(path("log"), {.size = twoLines(), .keep = 3});
  writeAll(sink, "abcdefg");
  EXPECT_THAT(names(), ElementsAre("log", "log.1", "log.2", "log.3"));
  EXPECT_EQ(content("log.3"), line("a") + line("b"));
  EXPECT_EQ(content("log.2"), line("c") + line("d"));
  EXPECT_EQ(content("log.1"), line("e") + line("f"));
  EXPECT_EQ(content("log"), line("g"));
}

TEST_F(LogRotation, DropsTheOldestBeyondWhatIsKept) {
  FileSink sink(path("log"), {.size = twoLines(), .keep = 1});
  writeAll(sink, "abcdef");
  EXPECT_THAT(names(), ElementsAre("log", "log.1"));
  EXPECT_EQ(content("log.1"), line("c") + line("d"));
  EXPECT_EQ(content("log"), line("e") + line("f"));
}

TEST_F(LogRotation, CountsWhatTheFileHeldBefore) {
  std::ofstream(path("log")) << line("a") << line("b");
  FileSink sink(path("log"), {.size = twoLines(), .keep = 1});
  writeAll(sink, "c");
  EXPECT_EQ(content("log.1"), line("a") + line("b"));
  EXPECT_EQ(content("log"), line("c"));
}

TEST_F(LogRotation, LeavesAFileAloneThatHasNoLimit) {
  FileSink sink(path("log"), {.size = 0, .keep = 1});
  writeAll(sink, "abcdefgh");
  EXPECT_THAT(names(), ElementsAre("log"));
}

TEST_F(LogRotation, WritesAMessageThatIsLargerThanTheLimitIntoAFileOfItsOwn) {
  FileSink sink(path("log"), {.size = 10, .keep = 5});
  writeAll(sink, "ab");
  EXPECT_THAT(names(), ElementsAre("log", "log.1"));
  EXPECT_EQ(content("log.1"), line("a"));
  EXPECT_EQ(content("log"), line("b"));
}

TEST_F(LogRotation, KnowsSizesThatNeedMoreThan32Bits) {
  FileSink sink(path("log"), {.size = (std::uint64_t{5} << 30U) + twoLines() - 1, .keep = 1});
  ASSERT_EQ(truncate(path("log").c_str(), off_t{5} << 30), 0);
  writeAll(sink, "a");
  EXPECT_THAT(names(), ElementsAre("log"));
  writeAll(sink, "b");
  EXPECT_THAT(names(), ElementsAre("log", "log.1"));
}

TEST_F(LogRotation, KeepsTheModeOfTheFile) {
  FileSink sink(path("log"), {.size = twoLines(), .keep = 1});
  chmod(path("log").c_str(), 0620);
  writeAll(sink, "abc");
  struct stat status {};
  ASSERT_EQ(stat(path("log").c_str(), &status), 0);
  EXPECT_EQ(status.st_mode & 0777U, 0620U);
}

TEST_F(LogRotation, RotatesTheFileThatALinkLeadsTo) {
  std::filesystem::create_directory(path("disk"));
  std::filesystem::create_symlink("disk/real", path("log"));
  FileSink sink(path("log"), {.size = twoLines(), .keep = 1});
  writeAll(sink, "abc");
  EXPECT_THAT(names(), ElementsAre("disk", "log"));
  EXPECT_TRUE(std::filesystem::is_symlink(path("log")));
  EXPECT_EQ(content("disk/real.1"), line("a") + line("b"));
  EXPECT_EQ(content("disk/real"), line("c"));
}

TEST_F(LogRotation, MakesTheFileAnewThatALinkLedTo) {
  std::filesystem::create_directory(path("disk"));
  std::filesystem::create_symlink("disk/real", path("log"));
  FileSink sink(path("log"), {.size = 0, .keep = 1});
  writeAll(sink, "a");
  std::filesystem::remove(path("disk/real"));
  writeAll(sink, "b");
  EXPECT_EQ(content("disk/real"), line("b"));
  EXPECT_TRUE(std::filesystem::is_symlink(path("log")));
}

TEST_F(LogRotation, LeavesAFileAloneThatIsOnlyKnownAsADescriptor) {
  const Tarn::Common::FileDescriptor output(open(path("output").c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
  FileSink sink("/dev/fd/" + std::to_string(output.number()), {.size = twoLines(), .keep = 1});
  writeAll(sink, "abc");
  EXPECT_THAT(names(), ElementsAre("output"));
  EXPECT_EQ(content("output"), line("a") + line("b") + line("c"));
}

TEST_F(LogRotation, IsNoticedByWhoSharesTheFile) {
  FileSink rotating(path("log"), {.size = twoLines(), .keep = 1});
  FileSink other(path("log"), {.size = 0, .keep = 1});
  writeAll(other, "a");
  writeAll(rotating, "bc");
  writeAll(other, "d");
  EXPECT_EQ(content("log.1"), line("a") + line("b"));
  EXPECT_EQ(content("log"), line("c") + line("d"));
}

TEST_F(LogRotation, DoesNotWaitForAnotherWhoIsAtIt) {
  FileSink sink(path("log"), {.size = twoLines(), .keep = 1});
  {
    const Tarn::Common::FileDescriptor other(open(path("log").c_str(), O_RDONLY | O_CLOEXEC));
    ASSERT_EQ(flock(other.number(), LOCK_EX), 0);
    writeAll(sink, "abcd");
    EXPECT_EQ(content("log"), line("a") + line("b") + line("c") + line("d"));
  }
  writeAll(sink, "e");
  EXPECT_EQ(content("log"), line("e"));
}

TEST_F(LogRotation, LosesNothingWhereFilesCannotBeRenamedAndSaysSoOnce) {
  FileSink sink(path("log"), {.size = twoLines(), .keep = 1});
  std::filesystem::create_directory(path("log.1"));
  const std::size_t reportsBefore = recordedSystemLog().size();
  writeAll(sink, "abcdef");
  EXPECT_EQ(content("log"), line("a") + line("b") + line("c") + line("d") + line("e") + line("f"));
  ASSERT_EQ(recordedSystemLog().size(), reportsBefore + 1);
  EXPECT_THAT(recordedSystemLog().back().text,
              EndsWith(" log file " + path("log") + " cannot be rotated: " + path("log") + " cannot be renamed to " +
                       path("log.1") + ": Is a directory; messages go to the file that is open, however large"));
}

TEST_F(LogRotation, IsTriedAgainAfterAWhile) {
  FileSink atOnce(path("log"), {.size = twoLines(), .keep = 1}, std::chrono::seconds(0));
  FileSink later(path("later"), {.size = twoLines(), .keep = 1}, std::chrono::hours(1));
  std::filesystem::create_directory(path("log.1"));
  std::filesystem::create_directory(path("later.1"));
  writeAll(atOnce, "abc");
  writeAll(later, "abc");
  std::filesystem::remove(path("log.1"));
  std::filesystem::remove(path("later.1"));
  writeAll(atOnce, "d");
  writeAll(later, "d");
  EXPECT_EQ(content("log"), line("d"));
  EXPECT_EQ(content("later"), line("a") + line("b") + line("c") + line("d"));
}

TEST_F(LogRotation, LeavesItsLockBehindNowhere) {
  FileSink sink(path("log"), {.size = twoLines(), .keep = 1});
  writeAll(sink, "abc");
  for (const char* name : {"log", "log.1"}) {
    const Tarn::Common::FileDescriptor file(open(path(name).c_str(), O_RDONLY | O_CLOEXEC));
    EXPECT_EQ(flock(file.number(), LOCK_EX | LOCK_NB), 0) << name;
  }
}

TEST_F(LogRotation, OfNamesStopsAtTheFirstGap) {
  for (const char* name : {"log", "log.1", "log.3", "log.4"}) {
    std::ofstream(path(name)) << name;
  }
  makeOld(path("log"), 4);
  EXPECT_THAT(names(), ElementsAre("log.1", "log.2", "log.3", "log.4"));
  EXPECT_EQ(content("log.1"), "log");
  EXPECT_EQ(content("log.2"), "log.1");
  EXPECT_EQ(content("log.3"), "log.3");
  EXPECT_EQ(content("log.4"), "log.4");
}

TEST_F(LogRotation, OfNamesLeavesTheRestWhereOneCannotBeChanged) {
  std::ofstream(path("log")) << "log";
  std::ofstream(path("log.1")) << "log.1";
  std::filesystem::create_directory(path("log.2"));
  EXPECT_THROW(makeOld(path("log"), 2), std::system_error);
  EXPECT_EQ(content("log"), "log");
  EXPECT_EQ(content("log.1"), "log.1");
}

}  // namespace
