#include "platform/cvlog/StandardErrorSink.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <array>
#include <csignal>

#include "tests/platform/cvlog/LogDirectory.h"

namespace {

using CVLog::StandardErrorSink;

using StandardError = LogDirectory;

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

TEST_F(StandardError, IsWrittenInLines) {
  const int file = open(path("stderr").c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600);
  {
    const RedirectedStandardError redirected(file);
    StandardErrorSink().write(message("the text"));
  }
  close(file);
  EXPECT_EQ(content("stderr"), line("the text"));
}

TEST_F(StandardError, SurvivesAClosedPipeAndLeavesNoSignalBehind) {
  std::array<int, 2> ends{};
  ASSERT_EQ(pipe2(ends.data(), O_CLOEXEC), 0);
  close(ends[0]);
  ASSERT_EQ(std::signal(SIGPIPE, SIG_DFL), SIG_DFL);
  sigset_t maskBefore;
  pthread_sigmask(SIG_BLOCK, nullptr, &maskBefore);
  {
    const RedirectedStandardError redirected(ends[1]);
    StandardErrorSink().write(message("the text"));
  }
  close(ends[1]);
  sigset_t pending;
  sigpending(&pending);
  sigset_t maskAfter;
  pthread_sigmask(SIG_BLOCK, nullptr, &maskAfter);
  EXPECT_EQ(sigismember(&pending, SIGPIPE), 0);
  EXPECT_EQ(sigismember(&maskBefore, SIGPIPE), sigismember(&maskAfter, SIGPIPE));
}

TEST_F(StandardError, LeavesASignalThatWasAlreadyPending) {
  sigset_t pipeSignal;
  sigemptyset(&pipeSignal);
  sigaddset(&pipeSignal, SIGPIPE);
  pthread_sigmask(SIG_BLOCK, &pipeSignal, nullptr);
  pthread_kill(pthread_self(), SIGPIPE);
  const int null = open("/dev/null", O_WRONLY | O_CLOEXEC);
  {
    const RedirectedStandardError redirected(null);
    StandardErrorSink().write(message("the text"));
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
