// Standard error, and the limit of messages a minute.

#include <fcntl.h>
#include <gmock/gmock.h>
#include <unistd.h>

#include <array>
#include <csignal>

#include "platform/base/FileDescriptor.h"
#include "tests/platform/cvlog/LogTest.h"

namespace {

using CVLog::DestinationKind;
using Tarn::Common::FileDescriptor;

class StandardError : public LogTest {
 protected:
  /// Writes a message while standard error leads to `target`.
  static void writeTo(const FileDescriptor& target) {
    const FileDescriptor before(dup(STDERR_FILENO));
    dup2(target.number(), STDERR_FILENO);
    CVLog::openSink({.destination = {DestinationKind::StandardError}})->write(message("the text"));
    dup2(before.number(), STDERR_FILENO);
  }
  static bool isPipeSignalPending() {
    sigset_t pending;
    sigpending(&pending);
    return sigismember(&pending, SIGPIPE) == 1;
  }
};

TEST_F(StandardError, GetsALine) {
  writeTo(FileDescriptor(open(path("stderr").c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600)));
  EXPECT_EQ(content("stderr"), line("the text"));
}

TEST_F(StandardError, ClosedPipeRaisesNoSignal) {
  std::array<int, 2> ends{};
  ASSERT_EQ(pipe2(ends.data(), O_CLOEXEC), 0);
  close(ends[0]);
  ASSERT_EQ(std::signal(SIGPIPE, SIG_DFL), SIG_DFL);
  writeTo(FileDescriptor(ends[1]));
  sigset_t mask;
  pthread_sigmask(SIG_BLOCK, nullptr, &mask);
  EXPECT_FALSE(isPipeSignalPending());
  EXPECT_EQ(sigismember(&mask, SIGPIPE), 0);
}

TEST_F(StandardError, SignalThatWasPendingStaysPending) {
  sigset_t pipeSignal;
  sigemptyset(&pipeSignal);
  sigaddset(&pipeSignal, SIGPIPE);
  pthread_sigmask(SIG_BLOCK, &pipeSignal, nullptr);
  pthread_kill(pthread_self(), SIGPIPE);
  writeTo(FileDescriptor(open("/dev/null", O_WRONLY | O_CLOEXEC)));
  EXPECT_TRUE(isPipeSignalPending());
  int taken = 0;
  sigwait(&pipeSignal, &taken);
  pthread_sigmask(SIG_UNBLOCK, &pipeSignal, nullptr);
}

class RateLimit : public LogTest {
 protected:
  /// The texts of the file.
  [[nodiscard]] std::vector<std::string> texts() const {
    std::vector<std::string> all;
    std::istringstream file(content("log"));
    for (std::string line; std::getline(file, line);) {
      all.push_back(line.substr(line.find(":") == std::string::npos ? 0 : line.find(' ', line.rfind(".cpp:")) + 1));
    }
    return all;
  }

  std::unique_ptr<CVLog::Sink> sink_ =
      CVLog::openSink({.destination = {DestinationKind::File, path("log")}, .perMinute = 2});
};

TEST_F(RateLimit, DroppedMessagesAreCountedInTheNextMinute) {
  writeAll(*sink_, "a", 0);
  writeAll(*sink_, "b", 30);
  writeAll(*sink_, "cde", 59);
  writeAll(*sink_, "fg", 60);
  sink_.reset();
  EXPECT_THAT(texts(), testing::ElementsAre("a", "b", "3 messages were dropped; the limit is 2 a minute", "f", "g"));
}

TEST_F(RateLimit, DroppedMessagesAreCountedAtTheEnd) {
  writeAll(*sink_, "abcde");
  sink_.reset();
  EXPECT_THAT(texts(), testing::ElementsAre("a", "b", "3 messages were dropped; the limit is 2 a minute"));
}

TEST_F(RateLimit, ClockThatIsSetBackBeginsANewMinute) {
  writeAll(*sink_, "abc", 100'000);
  writeAll(*sink_, "d", 5);
  EXPECT_THAT(texts(), testing::ElementsAre("a", "b", "1 message was dropped; the limit is 2 a minute", "d"));
}

}  // namespace
