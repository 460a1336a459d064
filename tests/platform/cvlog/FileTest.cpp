// Log files: how they are opened, followed by their name, rotated and shared.

#include <fcntl.h>
#include <gmock/gmock.h>
#include <sys/file.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include "platform/base/FileDescriptor.h"
#include "tests/platform/cvlog/LogTest.h"

namespace {

using CVLog::Sink;
using Tarn::Common::FileDescriptor;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
namespace fs = std::filesystem;

class LogFile : public LogTest {
 protected:
  [[nodiscard]] std::string errorOf(const std::string& name) const {
    try {
      (void)openFile(name);
      return "no error";
    } catch (const std::runtime_error& error) {
      return error.what();
    }
  }

  [[nodiscard]] struct stat statusOf(const std::string& name) const {
    struct stat status {};
    EXPECT_EQ(stat(path(name).c_str(), &status), 0) << name;
    return status;
  }
  [[nodiscard]] mode_t modeOf(const std::string& name) const { return statusOf(name).st_mode & 0777U; }
};

TEST_F(LogFile, MessagesAreAppendedInLines) {
  writeAll(*openFile("log"), "a");
  writeAll(*openFile("log"), "b");
  EXPECT_EQ(content("log"), line("a") + line("b"));
}

TEST_F(LogFile, NewFileIsNotReadableForOthers) {
  (void)openFile("log");
  EXPECT_EQ(modeOf("log") & 0137U, 0U);
}

TEST_F(LogFile, FileThatCannotBeOpenedIsNamedWithTheReason) {
  EXPECT_EQ(errorOf("missing/log"), "log file " + path("missing/log") + " cannot be opened: No such file or directory");
  EXPECT_EQ(errorOf(directory_), "log file " + directory_ + " cannot be opened: Is a directory");
}

TEST_F(LogFile, PipeIsRefusedWithoutWaitingForItsReader) {
  ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
  EXPECT_EQ(errorOf("pipe"), "log file " + path("pipe") + " cannot be opened: No such device or address");
  const FileDescriptor reader(open(path("pipe").c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC));
  EXPECT_EQ(errorOf("pipe"), "log file " + path("pipe") + " is not a regular file");
}

TEST_F(LogFile, FullDiskLosesTheMessage) {
  EXPECT_NO_THROW(writeAll(*openFile("/dev/full", {.size = 1}), "a"));
}

TEST_F(LogFile, LimitOfTheProcessForTheSizeOfFilesLosesTheMessageAndRaisesNoSignal) {
  const pid_t child = fork();
  ASSERT_GE(child, 0);
  if (child == 0) {
    const rlimit limit{line("a").size(), line("a").size()};
    setrlimit(RLIMIT_FSIZE, &limit);
    writeAll(*openFile("log"), "ab");
    sigset_t pending;
    sigpending(&pending);
    _exit(sigismember(&pending, SIGXFSZ));
  }
  int status = -1;
  waitpid(child, &status, 0);
  EXPECT_EQ(status, 0);
  EXPECT_EQ(content("log"), line("a"));
}

TEST_F(LogFile, MovedFileIsMadeAnewWithItsMode) {
  const auto sink = openFile("log");
  writeAll(*sink, "a");
  chmod(path("log").c_str(), 0666);
  fs::rename(path("log"), path("log.old"));
  writeAll(*sink, "bc");
  EXPECT_EQ(content("log.old"), line("a"));
  EXPECT_EQ(content("log"), line("b") + line("c"));
  EXPECT_EQ(modeOf("log"), 0666U);
}

TEST_F(LogFile, RemovedFileIsMadeAnew) {
  const auto sink = openFile("log");
  fs::remove(path("log"));
  writeAll(*sink, "b");
  EXPECT_EQ(content("log"), line("b"));
}

TEST_F(LogFile, FileThatAnotherProgramHasMadeAnewIsAppendedTo) {
  const auto sink = openFile("log");
  fs::rename(path("log"), path("log.old"));
  std::ofstream(path("log")) << "another's\n";
  writeAll(*sink, "b");
  EXPECT_THAT(content("log.old"), IsEmpty());
  EXPECT_EQ(content("log"), "another's\n" + line("b"));
}

TEST_F(LogFile, RelativePathStartsFromTheDirectoryOfTheOpening) {
  const fs::path before = fs::current_path();
  fs::create_directory(path("elsewhere"));
  fs::current_path(directory_);
  const auto sink = CVLog::openSink({.destination = {CVLog::DestinationKind::File, "log"}});
  fs::current_path(path("elsewhere"));
  fs::remove(path("log"));
  writeAll(*sink, "b");
  fs::current_path(before);
  EXPECT_EQ(content("log"), line("b"));
  EXPECT_THAT(content("elsewhere/log"), IsEmpty());
}

TEST_F(LogFile, DescriptorThatTheProcessHasGivenToAnotherFileIsLeftAlone) {
  const int number = dup(STDERR_FILENO);
  close(number);
  const FileDescriptor other(open(path("other").c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
  const int next = dup(STDERR_FILENO);
  close(next);
  auto sink = openFile("log");
  ASSERT_EQ(dup2(other.number(), next), next);
  writeAll(*sink, "a");
  ASSERT_EQ(dup2(other.number(), next), next);
  sink.reset();
  EXPECT_EQ(content("log"), line("a"));
  EXPECT_THAT(content("other"), IsEmpty());
  EXPECT_NE(fcntl(next, F_GETFD), -1);
  close(next);
}

TEST_F(LogFile, OpenFileIsKeptIfItsNameIsTakenByADirectory) {
  const auto sink = openFile("log");
  fs::rename(path("log"), path("log.old"));
  fs::create_directory(path("log"));
  writeAll(*sink, "ab");
  EXPECT_EQ(content("log.old"), line("a") + line("b"));
  ASSERT_EQ(recordedSystemLog().size(), 1U);
  EXPECT_THAT(recordedSystemLog().back().text,
              EndsWith(" log file " + path("log") +
                       " cannot be opened again: Is a directory; messages go to the file that is open, however large"));
}

TEST_F(LogFile, OpenFileIsKeptIfItsNameIsTakenByAPipe) {
  const auto sink = openFile("log");
  fs::rename(path("log"), path("log.old"));
  ASSERT_EQ(mkfifo(path("log").c_str(), 0600), 0);
  const FileDescriptor reader(open(path("log").c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC));
  writeAll(*sink, "a");
  EXPECT_EQ(content("log.old"), line("a"));
  EXPECT_THAT(recordedSystemLog().back().text, HasSubstr(" is not a regular file any more; "));
}

TEST_F(LogFile, RotationGivesEachFileItsSizeAndNumbersTheOldOnes) {
  writeAll(*openFile("log", {.size = twoLines(), .keep = 3}), "abcdefghi");
  EXPECT_THAT(names(), ElementsAre("log", "log.1", "log.2", "log.3", "log.lock"));
  EXPECT_EQ(content("log.3"), line("c") + line("d"));
  EXPECT_EQ(content("log.2"), line("e") + line("f"));
  EXPECT_EQ(content("log.1"), line("g") + line("h"));
  EXPECT_EQ(content("log"), line("i"));
  EXPECT_THAT(content("log.lock"), IsEmpty());
}

TEST_F(LogFile, RotationCountsWhatTheFileHeldBefore) {
  std::ofstream(path("log")) << line("a") << line("b");
  writeAll(*openFile("log", {.size = twoLines(), .keep = 1}), "c");
  EXPECT_EQ(content("log.1"), line("a") + line("b"));
  EXPECT_EQ(content("log"), line("c"));
}

TEST_F(LogFile, FileWithoutLimitIsNotRotated) {
  writeAll(*openFile("log", {.size = 0, .keep = 1}), "abcdefgh");
  EXPECT_THAT(names(), ElementsAre("log"));
}

TEST_F(LogFile, MessageLargerThanTheLimitGetsAFileOfItsOwn) {
  writeAll(*openFile("log", {.size = 10, .keep = 5}), "ab");
  EXPECT_EQ(content("log.1"), line("a"));
  EXPECT_EQ(content("log"), line("b"));
}

TEST_F(LogFile, LimitMayNeedMoreThan32Bits) {
  const auto sink = openFile("log", {.size = (std::uint64_t{5} << 30U) + twoLines() - 1, .keep = 1});
  ASSERT_EQ(truncate(path("log").c_str(), off_t{5} << 30), 0);
  writeAll(*sink, "a");
  EXPECT_THAT(names(), ElementsAre("log"));
  writeAll(*sink, "b");
  EXPECT_THAT(names(), ElementsAre("log", "log.1", "log.lock"));
}

TEST_F(LogFile, RotationKeepsTheMode) {
  const auto sink = openFile("log", {.size = twoLines(), .keep = 1});
  chmod(path("log").c_str(), 0620);
  writeAll(*sink, "abc");
  EXPECT_EQ(modeOf("log"), 0620U);
}

TEST_F(LogFile, FileThatALinkLeadsToIsRotatedAndMadeAnewInItsDirectory) {
  fs::create_directory(path("disk"));
  fs::create_symlink("disk/real", path("log"));
  const auto sink = openFile("log", {.size = twoLines(), .keep = 1});
  writeAll(*sink, "abc");
  EXPECT_THAT(names(), ElementsAre("disk", "log"));
  EXPECT_TRUE(fs::is_symlink(path("log")));
  EXPECT_EQ(content("disk/real.1"), line("a") + line("b"));
  EXPECT_EQ(content("disk/real"), line("c"));
  fs::remove(path("disk/real"));
  writeAll(*sink, "d");
  EXPECT_EQ(content("disk/real"), line("d"));
}

TEST_F(LogFile, FileThatIsOnlyKnownAsADescriptorIsNotRotated) {
  const FileDescriptor output(open(path("output").c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
  writeAll(*openFile("/dev/fd/" + std::to_string(output.number()), {.size = twoLines(), .keep = 1}), "abc");
  EXPECT_THAT(names(), ElementsAre("output"));
  EXPECT_EQ(content("output"), line("a") + line("b") + line("c"));
}

TEST_F(LogFile, RotationDoesNotWaitForAProcessThatHoldsTheLock) {
  const auto sink = openFile("log", {.size = twoLines(), .keep = 1});
  {
    const FileDescriptor other(open(path("log.lock").c_str(), O_RDONLY | O_CREAT | O_CLOEXEC, 0600));
    ASSERT_EQ(flock(other.number(), LOCK_EX), 0);
    writeAll(*sink, "abcd");
    EXPECT_EQ(content("log"), line("a") + line("b") + line("c") + line("d"));
  }
  writeAll(*sink, "e");
  EXPECT_EQ(content("log"), line("e"));
}

TEST_F(LogFile, FileIsFreeAfterItsRotation) {
  writeAll(*openFile("log", {.size = twoLines(), .keep = 1}), "abc");
  const FileDescriptor lock(open(path("log.lock").c_str(), O_RDONLY | O_CLOEXEC));
  EXPECT_EQ(flock(lock.number(), LOCK_EX | LOCK_NB), 0);
}

TEST_F(LogFile, FailedRotationLosesNothingIsReportedOnceAndTriedAgainAMinuteLater) {
  const auto sink = openFile("log", {.size = twoLines(), .keep = 1});
  fs::create_directory(path("log.1"));
  writeAll(*sink, "abcd");
  writeAll(*sink, "e", 60);
  EXPECT_EQ(content("log"), line("a") + line("b") + line("c") + line("d") + CVLog::formatLine(message("e", 60)) + '\n');
  ASSERT_EQ(recordedSystemLog().size(), 1U);
  EXPECT_THAT(recordedSystemLog().back().text,
              EndsWith(" log file " + path("log") + " cannot be rotated: " + path("log") + " cannot be renamed to " +
                       path("log.1") + ": Is a directory; messages go to the file that is open, however large"));
  fs::remove(path("log.1"));
  writeAll(*sink, "f", 119);
  EXPECT_FALSE(fs::exists(path("log.1")));
  writeAll(*sink, "g", 120);
  EXPECT_EQ(content("log"), CVLog::formatLine(message("g", 120)) + '\n');
}

TEST_F(LogFile, RotationWithoutALockFileIsReported) {
  fs::create_symlink("elsewhere", path("log.lock"));
  writeAll(*openFile("log", {.size = twoLines(), .keep = 1}), "abc");
  EXPECT_THAT(names(), ElementsAre("log", "log.lock"));
  EXPECT_THAT(recordedSystemLog().back().text, HasSubstr(" cannot be locked for its rotation with " + path("log.lock") +
                                                         ": Too many levels of symbolic links;"));
}

TEST_F(LogFile, RotationRenamesUpToTheFirstGap) {
  for (const char* name : {"log", "log.1", "log.3", "log.4"}) {
    std::ofstream(path(name)) << name;
  }
  writeAll(*openFile("log", {.size = 1, .keep = 4}), "a");
  EXPECT_EQ(content("log.1"), "log");
  EXPECT_EQ(content("log.2"), "log.1");
  EXPECT_EQ(content("log.3"), "log.3");
  EXPECT_EQ(content("log.4"), "log.4");
}

/// A file of some ten lines with several writers, and room for all old files.
class SharedLogFile : public LogTest {
 protected:
  static constexpr int writerCount = 6;
  static constexpr int messageCount = 400;

  [[nodiscard]] std::unique_ptr<Sink> openShared() const { return openFile("log", {.size = 1000, .keep = 999}); }

  static std::string textOf(int writer, int number) {
    return "writer " + std::to_string(writer) + " message " + std::to_string(number);
  }
  static void writeMessages(Sink& sink, int writer) {
    for (int number = 0; number < messageCount; ++number) {
      sink.write(message(textOf(writer, number)));
    }
  }
  template <class Write>
  static void writeInProcesses(Write write) {
    for (int writer = 0; writer < writerCount; ++writer) {
      if (const pid_t child = fork(); child == 0) {
        write(writer);
        _exit(0);
      }
    }
    for (int status = -1; wait(&status) > 0;) {
      EXPECT_EQ(status, 0);
    }
  }

  void expectEveryLineOnce() const {
    std::map<std::string, int> found;
    for (const std::string& name : names()) {
      std::istringstream file(content(name));
      for (std::string line; std::getline(file, line);) {
        ++found[line + '\n'];
      }
    }
    std::map<std::string, int> expected;
    for (int writer = 0; writer < writerCount; ++writer) {
      for (int number = 0; number < messageCount; ++number) {
        expected[line(textOf(writer, number))] = 1;
      }
    }
    EXPECT_GT(names().size(), 10U);
    EXPECT_EQ(found, expected);
  }
};

TEST_F(SharedLogFile, ProcessesThatRotateItLoseNoLine) {
  writeInProcesses([this](int writer) { writeMessages(*openShared(), writer); });
  expectEveryLineOnce();
}

TEST_F(SharedLogFile, ProcessesThatInheritItLoseNoLine) {
  const auto sink = openShared();
  writeInProcesses([&](int writer) { writeMessages(*sink, writer); });
  expectEveryLineOnce();
}

}  // namespace
