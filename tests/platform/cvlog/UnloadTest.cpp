#include <dlfcn.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <condition_variable>
#include <cstdlib>
#include <filesystem>
#include <mutex>
#include <string>
#include <thread>

#include "tests/platform/cvlog/LogTest.h"

namespace {

using LogSomething = void (*)();

class UnloadedLogger : public testing::Test {
 protected:
  UnloadedLogger() {
    setenv("CORVANE_CONFIG", "/dev/null", 1);
    setenv("CORVANE_LOG", ("debug:file:" + file_).c_str(), 1);
    setenv("CORVANE_TRACE", ("debug:file:" + file_).c_str(), 1);
  }
  ~UnloadedLogger() override { std::filesystem::remove(file_); }

  static void* load() {
    void* module = dlopen(UNLOAD_MODULE, RTLD_NOW | RTLD_LOCAL);
    EXPECT_NE(module, nullptr) << dlerror();
    return module;
  }

  static void logFrom(void* module) { reinterpret_cast<LogSomething>(dlsym(module, "logSomething"))(); }

  static bool isMapped() { return dlopen(UNLOAD_MODULE, RTLD_NOW | RTLD_NOLOAD) != nullptr; }

  std::string file_ = testing::TempDir() + "unloaded_logger_" + std::to_string(getpid());
};

TEST_F(UnloadedLogger, IsGoneAndHasClosedItsFiles) {
  const std::ptrdiff_t before = countOpenDescriptors();
  for (int round = 0; round < 100; ++round) {
    void* module = load();
    logFrom(module);
    dlclose(module);
    ASSERT_FALSE(isMapped());
  }
  EXPECT_EQ(countOpenDescriptors(), before);
  const std::string lines = contentOf(file_);
  EXPECT_EQ(std::count(lines.begin(), lines.end(), '\n'), 200);
}

TEST_F(UnloadedLogger, LeavesThreadsThatHaveLoggedAlive) {
  void* module = load();
  std::mutex mutex;
  std::condition_variable changed;
  bool hasLogged = false;
  bool mayEnd = false;
  std::thread thread([&] {
    logFrom(module);
    std::unique_lock lock(mutex);
    hasLogged = true;
    changed.notify_all();
    changed.wait(lock, [&] { return mayEnd; });
  });
  {
    std::unique_lock lock(mutex);
    changed.wait(lock, [&] { return hasLogged; });
    dlclose(module);
    EXPECT_FALSE(isMapped());
    mayEnd = true;
    changed.notify_all();
  }
  thread.join();
}

}  // namespace
