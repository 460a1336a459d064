#include "platform/cvlog/LineSink.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

namespace {

using CVLog::FileSink;
using CVLog::formatLine;
using CVLog::Message;
using CVLog::StandardErrorSink;

const Message kMessage = {.time = {},
                          .level = 6000,
                          .component = "Corvane.Test",
                          .function = "function",
                          .file = "file.cpp",
                          .line = 1,
                          .text = "the text"};

class LineSink : public testing::Test {
 protected:
  LineSink() { std::filesystem::create_directories(directory_); }
  ~LineSink() override { std::filesystem::remove_all(directory_); }

  [[nodiscard]] std::string path(const std::string& name) const { return directory_ + "/" + name; }

  static std::string content(const std::string& path) {
    std::ifstream file(path);
    return {std::istreambuf_iterator<char>(file), {}};
  }

  std::string directory_ = testing::TempDir() + "line_sink_" + std::to_string(getpid());
};

/// Standard error leads elsewhere while this lives.
class RedirectedStandardError {
 public:
  explicit RedirectedStandardError(int target) : before_(dup(STDERR_FILENO)) { dup2(target, STDERR_FILENO); }
  RedirectedStandardError(const RedirectedStandardError&) = delete;
  RedirectedStandardError& operator=(const RedirectedStandardError&) = delete;
  ~RedirectedStandardError() {
    dup2(before_, STDERR_FILENO);
    close(before_);
  }

 private:
  int before_;
};

std::string errorOf(const std::string& path) {
  try {
    const FileSink sink(path);
    return "no error";
  } catch (const std::runtime_error& error) {
    return error.what();
  }
}

TEST_F(LineSink, AppendsLinesToAFile) {
  const std::string log = path("log");
  {
    FileSink sink(log);
    sink.write(kMessage);
  }
  FileSink again(log);
  again.write(kMessage);
  EXPECT_EQ(content(log), formatLine(kMessage) + '\n' + formatLine(kMessage) + '\n');
}

TEST_F(LineSink, MakesFilesThatStrangersCannotRead) {
  const FileSink sink(path("log"));
  struct stat status {};
  ASSERT_EQ(stat(path("log").c_str(), &status), 0);
  EXPECT_EQ(status.st_mode & 0137U, 0U);
}

TEST_F(LineSink, SaysWhyAFileCannotBeOpened) {
  EXPECT_EQ(errorOf(path("missing/log")),
            "log file " + path("missing/log") + " cannot be opened: No such file or directory");
  EXPECT_EQ(errorOf(directory_), "log file " + directory_ + " cannot be opened: Is a directory");
}

TEST_F(LineSink, DoesNotWaitForTheReaderOfAPipe) {
  const std::string pipe = path("pipe");
  ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
  EXPECT_EQ(errorOf(pipe), "log file " + pipe + " cannot be opened: No such device or address");
  const int reader = open(pipe.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
  EXPECT_EQ(errorOf(pipe), "log file " + pipe + " is not a regular file");
  close(reader);
}

TEST_F(LineSink, GoesOnWhenTheDiskIsFull) {
  FileSink sink("/dev/full");
  EXPECT_NO_THROW(sink.write(kMessage));
}

TEST_F(LineSink, WritesLinesToStandardError) {
  const std::string output = path("stderr");
  const int file = open(output.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600);
  {
    const RedirectedStandardError redirected(file);
    StandardErrorSink().write(kMessage);
  }
  close(file);
  EXPECT_EQ(content(output), formatLine(kMessage) + '\n');
}

TEST_F(LineSink, SurvivesAClosedPipeAndLeavesNoSignalBehind) {
  std::array<int, 2> ends{};
  ASSERT_EQ(pipe2(ends.data(), O_CLOEXEC), 0);
  close(ends[0]);
  ASSERT_EQ(std::signal(SIGPIPE, SIG_DFL), SIG_DFL);
  sigset_t maskBefore;
  pthread_sigmask(SIG_BLOCK, nullptr, &maskBefore);
  {
    const RedirectedStandardError redirected(ends[1]);
    StandardErrorSink().write(kMessage);
  }
  close(ends[1]);
  sigset_t pending;
  sigpending(&pending);
  sigset_t maskAfter;
  pthread_sigmask(SIG_BLOCK, nullptr, &maskAfter);
  EXPECT_EQ(sigismember(&pending, SIGPIPE), 0);
  EXPECT_EQ(sigismember(&maskBefore, SIGPIPE), sigismember(&maskAfter, SIGPIPE));
}

TEST_F(LineSink, LeavesASignalThatWasAlreadyPending) {
  sigset_t pipeSignal;
  sigemptyset(&pipeSignal);
  sigaddset(&pipeSignal, SIGPIPE);
  pthread_sigmask(SIG_BLOCK, &pipeSignal, nullptr);
  pthread_kill(pthread_self(), SIGPIPE);
  const int null = open("/dev/null", O_WRONLY | O_CLOEXEC);
  {
    const RedirectedStandardError redirected(null);
    StandardErrorSink().write(kMessage);
  }
  close(null);
  sigset_t pending;
  sigpending(&pending);
  EXPECT_EQ(sigismember(&pending, SIGPIPE), 1);
  int taken = 0;
  sigwait(&pipeSignal, &taken);
  pthread_sigmask(SIG_UNBLOCK, &pipeSignal, nullptr);
}

}  // namespace
