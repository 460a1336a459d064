#include "platform/base/Environment.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/statvfs.h>
#include <unistd.h>

#include <array>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string>

namespace {

using Tarn::Common::environmentOverride;

std::string outputOf(const std::string& command) {
  FILE* pipe = popen(command.c_str(), "r");
  std::array<char, 256> line{};
  const char* read = std::fgets(line.data(), line.size(), pipe);
  pclose(pipe);
  return read == nullptr ? "" : read;
}

TEST(EnvironmentOverride, IsTheVariablesValue) {
  setenv("CORVANE_LANGUAGE", "de_AT", 1);
  EXPECT_EQ(environmentOverride("CORVANE_LANGUAGE"), "de_AT");
}

TEST(EnvironmentOverride, IsNothingWhereTheVariableIsAbsentOrEmpty) {
  unsetenv("CORVANE_LANGUAGE");
  EXPECT_EQ(environmentOverride("CORVANE_LANGUAGE"), std::nullopt);
  setenv("CORVANE_LANGUAGE", "", 1);
  EXPECT_EQ(environmentOverride("CORVANE_LANGUAGE"), std::nullopt);
}

TEST(EnvironmentOverride, IsNothingInAProcessWithRaisedPrivileges) {
  if (geteuid() != 0) {
    GTEST_SKIP() << "only root can make a program that runs as somebody else";
  }
  struct statvfs fileSystem {};
  if (statvfs(testing::TempDir().c_str(), &fileSystem) != 0 || (fileSystem.f_flag & ST_NOSUID) != 0) {
    GTEST_SKIP() << "programs in " << testing::TempDir() << " cannot run as somebody else";
  }
  const std::string directory = testing::TempDir() + "environment_" + std::to_string(getpid());
  const std::string program = directory + "/show_override";
  std::filesystem::create_directories(directory);
  std::filesystem::copy_file(SHOW_OVERRIDE, program);
  setenv("CORVANE_LANGUAGE", "de_AT", 1);
  const std::string command = program + " CORVANE_LANGUAGE";
  EXPECT_EQ(outputOf(command), "de_AT\n");

  constexpr uid_t nobody = 65534;
  ASSERT_EQ(chown(program.c_str(), nobody, nobody), 0);
  ASSERT_EQ(chmod(program.c_str(), S_ISUID | 0755), 0);
  EXPECT_EQ(outputOf(command), "(none)\n");
  std::filesystem::remove_all(directory);
}

}  // namespace
