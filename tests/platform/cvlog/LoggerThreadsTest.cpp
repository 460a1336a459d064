#include <cvlog/CVMessageBuffer.h>
#include <gtest/gtest.h>

#include <latch>
#include <set>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

#include "tests/platform/cvlog/LoggerFixture.h"

namespace {

using CVLog::CVMessageBuffer;

using LoggerInThreads = LoggerProcess;

TEST_F(LoggerInThreads, FirstMessagesOfManyThreadsAllArriveWhole) {
  constexpr int threadCount = 16;
  constexpr int messageCount = 200;
  setenv("CORVANE_LOG", ("debug:file:" + path("log")).c_str(), 1);
  std::latch start(threadCount);
  std::vector<std::thread> threads;
  for (int number = 0; number < threadCount; ++number) {
    threads.emplace_back([number, &start] {
      start.arrive_and_wait();
      for (int message = 0; message < messageCount; ++message) {
        CVMessageBuffer buffer;
        buffer << "thread " << number << " message " << message;
        log(3000, CVMessageBuffer::str(buffer));
        trace(3000, "nobody wants it");
      }
    });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }

  std::multiset<std::string> expected;
  for (int number = 0; number < threadCount; ++number) {
    for (int message = 0; message < messageCount; ++message) {
      expected.insert("TIME debug Corvane.Test function file.cpp:12 thread " + std::to_string(number) + " message " +
                      std::to_string(message));
    }
  }
  std::multiset<std::string> lines;
  std::istringstream file(content("log"));
  for (std::string line; std::getline(file, line);) {
    lines.insert(line);
  }
  EXPECT_EQ(lines, expected);
}

}  // namespace
