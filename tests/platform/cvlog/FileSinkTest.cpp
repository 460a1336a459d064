#include "platform/cvlog/FileSink.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>
#include <optional>
#include <stdexcept>
#include <string>
#include <utility>

#include "tests/platform/cvlog/LogDirectory.h"
#include "tests/platform/cvlog/RecordedSystemLog.h"

namespace {

using CVLog::FileSink;
using testing::IsEmpty;

using LogFile = LogDirectory;

std::string errorOf(const std::string& path) {
  try {
    const FileSink sink(path);
    return "no error";
  } catch (const std::runtime_error& error) {
    return error.what();
  }
}

mode_t modeOf(const std::string& path) {
  struct stat status {};
  EXPECT_EQ(stat(path.c_str(), &status), 0) << path;
  return status.st_mode & 0777U;
}

TEST_F(LogFile, IsAppendedToInLines) {
  {
    FileSink sink(path("log"));
    sink.write(message("a"));
  }
  FileSink again(path("log"));
  again.write(message("b"));
  EXPECT_EQ(content("log"), line("a") + line("b"));
}

TEST_F(LogFile, IsMadeSoThatStrangersCannotReadIt) {
  const FileSink sink(path("log"));
  EXPECT_EQ(modeOf(path("log")) & 0137U, 0U);
}

TEST_F(LogFile, ThatCannotBeOpenedIsNamedWithTheReason) {
  EXPECT_EQ(errorOf(path("missing/log")),
            "log file " + path("missing/log") + " cannot be opened: No such file or directory");
  EXPECT_EQ(errorOf(directory_), "log file " + directory_ + " cannot be opened: Is a directory");
}

TEST_F(LogFile, DoesNotWaitForTheReaderOfAPipe) {
  const std::string pipe = path("pipe");
  ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
  EXPECT_EQ(errorOf(pipe), "log file " + pipe + " cannot be opened: No such device or address");
  const int reader = open(pipe.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
  EXPECT_EQ(errorOf(pipe), "log file " + pipe + " is not a regular file");
  close(reader);
}

TEST_F(LogFile, GoesOnWhenTheDiskIsFull) {
  FileSink sink("/dev/full", {.size = 1});
  EXPECT_NO_THROW(sink.write(message("a")));
}

TEST_F(LogFile, DoesNotKillAProcessThatMayNotWriteMore) {
  const pid_t child = fork();
  ASSERT_GE(child, 0);
  if (child == 0) {
    const rlimit limit{line("a").size(), line("a").size()};
    setrlimit(RLIMIT_FSIZE, &limit);
    FileSink sink(path("log"));
    sink.write(message("a"));
    sink.write(message("b"));
    sigset_t pending;
    sigpending(&pending);
    _exit(sigismember(&pending, SIGXFSZ));
  }
  int status = -1;
  waitpid(child, &status, 0);
  EXPECT_EQ(status, 0);
  EXPECT_EQ(content("log"), line("a"));
}

/// Lets no file of this process grow beyond a size, as a full disk does.
class FullDisk {
 public:
  explicit FullDisk(std::size_t size) {
    getrlimit(RLIMIT_FSIZE, &before_);
    const rlimit limit{size, before_.rlim_max};
    setrlimit(RLIMIT_FSIZE, &limit);
  }
  FullDisk(const FullDisk&) = delete;
  FullDisk& operator=(const FullDisk&) = delete;
  ~FullDisk() { setrlimit(RLIMIT_FSIZE, &before_); }

 private:
  rlimit before_{};
};

class TornLogFile : public LogDirectory {
 protected:
  static constexpr std::size_t partSize = 7;

  static std::string part(std::string_view text) { return line(text).substr(0, partSize); }

  /// Writes "a", and of "torn" as much as there is room for.
  void tear(FileSink& sink) const {
    sink.write(message("a"));
    sink.write(message("torn"));
    ASSERT_EQ(content("log"), line("a") + part("torn"));
  }
  static std::size_t room() { return line("a").size() + partSize; }
};

TEST_F(TornLogFile, GoesOnWithALineOfItsOwn) {
  std::optional<FullDisk> disk(std::in_place, room());
  FileSink sink(path("log"));
  tear(sink);
  disk.reset();
  sink.write(message("b"));
  sink.write(message("c"));
  EXPECT_EQ(content("log"), line("a") + part("torn") + '\n' + line("b") + line("c"));
}

TEST_F(TornLogFile, GoesOnWithALineOfItsOwnAfterARestart) {
  {
    const FullDisk disk(room());
    FileSink sink(path("log"));
    tear(sink);
  }
  FileSink sink(path("log"));
  sink.write(message("b"));
  sink.write(message("c"));
  EXPECT_EQ(content("log"), line("a") + part("torn") + '\n' + line("b") + line("c"));
}

TEST_F(TornLogFile, IsMendedOnceByThoseThatShareIt) {
  std::optional<FullDisk> disk(std::in_place, room());
  FileSink sink(path("log"));
  FileSink other(path("log"));
  tear(sink);
  other.write(message("lost"));
  disk.reset();
  other.write(message("b"));
  sink.write(message("c"));
  other.write(message("d"));
  EXPECT_EQ(content("log"), line("a") + part("torn") + '\n' + line("b") + line("c") + line("d"));
}

TEST_F(LogFile, ThatWasMovedAwayIsMadeAnewWithItsMode) {
  FileSink sink(path("log"));
  sink.write(message("a"));
  chmod(path("log").c_str(), 0666);
  std::filesystem::rename(path("log"), path("log.old"));
  sink.write(message("b"));
  sink.write(message("c"));
  EXPECT_EQ(content("log.old"), line("a"));
  EXPECT_EQ(content("log"), line("b") + line("c"));
  EXPECT_EQ(modeOf(path("log")), 0666U);
}

TEST_F(LogFile, ThatWasRemovedIsMadeAnew) {
  FileSink sink(path("log"));
  sink.write(message("a"));
  std::filesystem::remove(path("log"));
  sink.write(message("b"));
  EXPECT_EQ(content("log"), line("b"));
}

TEST_F(LogFile, ThatSomebodyElseHasMadeAnewIsFoundByItsName) {
  FileSink sink(path("log"));
  sink.write(message("a"));
  std::filesystem::rename(path("log"), path("log.old"));
  std::ofstream(path("log")) << "another's\n";
  sink.write(message("b"));
  EXPECT_EQ(content("log.old"), line("a"));
  EXPECT_EQ(content("log"), "another's\n" + line("b"));
}

TEST_F(LogFile, IsFollowedAlsoWhenTheProcessGoesToAnotherDirectory) {
  const std::filesystem::path before = std::filesystem::current_path();
  std::filesystem::create_directory(path("elsewhere"));
  std::filesystem::current_path(directory_);
  FileSink sink("log");
  std::filesystem::current_path(path("elsewhere"));
  sink.write(message("a"));
  std::filesystem::remove(path("log"));
  sink.write(message("b"));
  std::filesystem::current_path(before);
  EXPECT_EQ(content("log"), line("b"));
  EXPECT_THAT(content("elsewhere/log"), IsEmpty());
}

TEST_F(LogFile, WhoseDescriptorTheProcessHasClosedLeavesTheNextOneOfThatNumberAlone) {
  const int number = dup(STDERR_FILENO);
  close(number);
  FileSink sink(path("log"));
  const int other = open(path("other").c_str(), O_RDONLY | O_CREAT | O_CLOEXEC, 0600);
  ASSERT_EQ(dup2(other, number), number);
  close(other);
  std::filesystem::remove(path("log"));
  sink.write(message("a"));
  struct stat byNumber {};
  struct stat byName {};
  ASSERT_EQ(fstat(number, &byNumber), 0);
  ASSERT_EQ(stat(path("other").c_str(), &byName), 0);
  EXPECT_EQ(byNumber.st_ino, byName.st_ino);
}

TEST_F(LogFile, WhoseNameWasTakenBySomethingElseStaysOpen) {
  FileSink sink(path("log"));
  std::filesystem::rename(path("log"), path("log.old"));
  std::filesystem::create_directory(path("log"));
  const std::size_t reportsBefore = recordedSystemLog().size();
  sink.write(message("a"));
  sink.write(message("b"));
  EXPECT_EQ(content("log.old"), line("a") + line("b"));
  ASSERT_EQ(recordedSystemLog().size(), reportsBefore + 1);
  EXPECT_THAT(recordedSystemLog().back().text,
              testing::EndsWith(" log file " + path("log") +
                                " cannot be opened again: Is a directory; messages go to the file that is open, "
                                "however large"));
}

TEST_F(LogFile, IsNotFollowedOntoAPipe) {
  FileSink sink(path("log"));
  std::filesystem::rename(path("log"), path("log.old"));
  ASSERT_EQ(mkfifo(path("log").c_str(), 0600), 0);
  const int reader = open(path("log").c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
  sink.write(message("a"));
  close(reader);
  EXPECT_EQ(content("log.old"), line("a"));
  EXPECT_THAT(recordedSystemLog().back().text, testing::HasSubstr(" is not a regular file any more; "));
}

}  // namespace
