#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include "platform/base/Configuration.h"

namespace {

using Tarn::Common::configuration;

TEST(ProcessConfiguration, IsTheFileThatTheEnvironmentNamesAsItIsAtTheFirstCall) {
  const std::string file = testing::TempDir() + "process_configuration_" + std::to_string(getpid());
  std::ofstream(file) << "language = de\n";
  setenv("CORVANE_CONFIG", file.c_str(), 1);
  ASSERT_NE(configuration().find("language"), nullptr);
  EXPECT_EQ(configuration().find("language")->value, "de");

  std::ofstream(file) << "language = en\n";
  EXPECT_EQ(configuration().find("language")->value, "de");
  std::filesystem::remove(file);
}

}  // namespace
