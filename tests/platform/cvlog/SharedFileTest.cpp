#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <map>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

#include "platform/cvlog/FileSink.h"
#include "tests/platform/cvlog/LogDirectory.h"

namespace {

using CVLog::FileSink;
using CVLog::Rotation;

constexpr int writerCount = 6;
constexpr int messageCount = 400;
// Some ten lines in a file, and room for all files.
constexpr Rotation smallFiles = {.size = 1000, .keep = 999};

class SharedLogFile : public LogDirectory {
 protected:
  static std::string textOf(int writer, int number) {
    return "writer " + std::to_string(writer) + " message " + std::to_string(number);
  }
  static void writeAll(FileSink& sink, int writer) {
    for (int number = 0; number < messageCount; ++number) {
      sink.write(message(textOf(writer, number)));
    }
  }

  /// How often each line stands in the file and its old files.
  [[nodiscard]] std::map<std::string, int> lines() const {
    std::map<std::string, int> counts;
    for (const std::string& name : names()) {
      std::istringstream file(content(name));
      for (std::string line; std::getline(file, line);) {
        ++counts[line + '\n'];
      }
    }
    return counts;
  }
  static std::map<std::string, int> everyLineOnce() {
    std::map<std::string, int> counts;
    for (int writer = 0; writer < writerCount; ++writer) {
      for (int number = 0; number < messageCount; ++number) {
        counts[line(textOf(writer, number))] = 1;
      }
    }
    return counts;
  }
};

TEST_F(SharedLogFile, LosesNoLineOfManyProcessesWhileItIsRotated) {
  std::vector<pid_t> children;
  for (int writer = 0; writer < writerCount; ++writer) {
    const pid_t child = fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
      FileSink sink(path("log"), smallFiles);
      writeAll(sink, writer);
      _exit(0);
    }
    children.push_back(child);
  }
  for (pid_t child : children) {
    int status = -1;
    waitpid(child, &status, 0);
    EXPECT_EQ(status, 0);
  }
  EXPECT_GT(names().size(), 10U);
  EXPECT_EQ(lines(), everyLineOnce());
}

TEST_F(SharedLogFile, LosesNoLineOfProcessesThatShareWhatWasOpenBeforeTheFork) {
  FileSink sink(path("log"), smallFiles);
  std::vector<pid_t> children;
  for (int writer = 1; writer < writerCount; ++writer) {
    const pid_t child = fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
      writeAll(sink, writer);
      _exit(0);
    }
    children.push_back(child);
  }
  writeAll(sink, 0);
  for (pid_t child : children) {
    waitpid(child, nullptr, 0);
  }
  EXPECT_GT(names().size(), 10U);
  EXPECT_EQ(lines(), everyLineOnce());
}

TEST_F(SharedLogFile, LosesNoLineOfManyThreadsWhileItIsRotated) {
  FileSink sink(path("log"), smallFiles);
  std::vector<std::thread> threads;
  threads.reserve(writerCount);
  for (int writer = 0; writer < writerCount; ++writer) {
    threads.emplace_back([&sink, writer] { writeAll(sink, writer); });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  EXPECT_GT(names().size(), 10U);
  EXPECT_EQ(lines(), everyLineOnce());
}

}  // namespace
