#include "platform/cvlog/Settings.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <map>
#include <optional>
#include <string>

namespace {

using CVLog::defaultLog;
using CVLog::Destination;
using CVLog::DestinationKind;
using CVLog::makeSettings;
using CVLog::parseDestination;
using CVLog::Rotation;
using CVLog::Settings;
using CVLog::SinkSettings;
using Tarn::Common::Configuration;
using Tarn::Common::ConfigurationProblem;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

const Destination fileX = {DestinationKind::File, "/x:y"};

Settings fromFile(const std::string& text) {
  return makeSettings(Configuration::parse(text, "corvane.conf"), std::nullopt, std::nullopt);
}

TEST(LogSettings, SendErrorsToTheSystemLogByDefault) {
  const Settings settings = fromFile("");
  EXPECT_EQ(settings.log, (SinkSettings{.level = 6000, .destination = {DestinationKind::SystemLog}, .perMinute = 60}));
  EXPECT_EQ(settings.trace, (SinkSettings{.level = 3000, .destination = {DestinationKind::None}, .perMinute = 0}));
  EXPECT_THAT(settings.problems, IsEmpty());
}

TEST(LogSettings, ComeFromTheFile) {
  const Settings settings = fromFile(
      "log.level = warning\nlog.destination = file:/x:y\nlog.rate = 5\n"
      "trace.level = 4000\ntrace.destination = stderr\n");
  EXPECT_EQ(settings.log, (SinkSettings{.level = 5000, .destination = fileX, .perMinute = 5}));
  EXPECT_EQ(settings.trace,
            (SinkSettings{.level = 4000, .destination = {DestinationKind::StandardError}, .perMinute = 0}));
  EXPECT_THAT(settings.problems, IsEmpty());
}

TEST(LogSettings, LimitTheSystemLogUnlessTheyAreToldNotTo) {
  EXPECT_EQ(fromFile("trace.destination = syslog\n").trace.perMinute, 60U);
  EXPECT_EQ(fromFile("trace.destination = syslog\ntrace.rate = 0\n").trace.perMinute, 0U);
  EXPECT_EQ(fromFile("log.destination = stderr\n").log.perMinute, 0U);
}

TEST(LogSettings, LimitFilesUnlessTheyAreToldNotTo) {
  EXPECT_EQ(fromFile("").trace.rotation, (Rotation{.size = std::uint64_t{16} << 20U, .keep = 4}));
  const Settings settings = fromFile("log.size = 0\nlog.keep = 999\ntrace.size = 2G\ntrace.keep = 1\n");
  EXPECT_EQ(settings.log.rotation, (Rotation{.size = 0, .keep = 999}));
  EXPECT_EQ(settings.trace.rotation, (Rotation{.size = std::uint64_t{2} << 30U, .keep = 1}));
  EXPECT_THAT(settings.problems, IsEmpty());
}

TEST(LogSettings, HaveSizesInBytesAndTheirMultiples) {
  const std::map<std::string, std::uint64_t> sizes = {{"4096", 4096},
                                                      {"4K", 4096},
                                                      {"5k", 5120},
                                                      {"1m", 1 << 20U},
                                                      {"8589934591G", 0x7fff'ffff'c000'0000U},
                                                      {"9223372036854775807", 0x7fff'ffff'ffff'ffffU},
                                                      {"0", 0},
                                                      {"0K", 0}};
  for (const auto& [text, size] : sizes) {
    EXPECT_EQ(fromFile("log.size = " + text + "\n").log.rotation.size, size) << text;
  }
  for (const char* broken : {"", "K", "4095", "3K", "-1", "+4096", "4 K", "4KB", "1T", "1.5M", "8589934592G",
                             "9223372036854775808", "99999999999999999999"}) {
    const Settings settings = fromFile("log.size = " + std::string(broken) + "\n");
    EXPECT_EQ(settings.log.rotation, SinkSettings().rotation) << broken;
    EXPECT_THAT(settings.problems, SizeIs(1)) << broken;
  }
}

TEST(LogSettings, NameWhatARotationCanBe) {
  EXPECT_THAT(fromFile("log.size = 10\ntrace.keep = 0\nlog.keep = 1000\n").problems,
              ElementsAre(ConfigurationProblem{"corvane.conf:1",
                                               "\"10\" is not valid: expected a size from 4K on, such as 500K, 16M "
                                               "or 1G, or 0 for no limit"},
                          ConfigurationProblem{"corvane.conf:3",
                                               "\"1000\" is not valid: expected how many old files are kept, 1 to "
                                               "999"},
                          ConfigurationProblem{"corvane.conf:2",
                                               "\"0\" is not valid: expected how many old files are kept, 1 to "
                                               "999"}));
}

TEST(LogSettings, OverridesComeBeforeTheFile) {
  const Configuration file = Configuration::parse("log.level = info\nlog.destination = none\n", "corvane.conf");
  const Settings settings = makeSettings(file, "debug:stderr", "6000:file:/x:y");
  EXPECT_EQ(settings.log,
            (SinkSettings{.level = 3000, .destination = {DestinationKind::StandardError}, .perMinute = 0}));
  EXPECT_EQ(settings.trace, (SinkSettings{.level = 6000, .destination = fileX, .perMinute = 0}));
  EXPECT_THAT(settings.problems, IsEmpty());
}

TEST(LogSettings, BrokenValuesAreNamedAndTheRestCounts) {
  const Settings settings =
      fromFile("log.level = loud\nlog.destination = file:\ntrace.rate = -1\ntrace.level = error\n");
  EXPECT_EQ(settings.log, defaultLog());
  EXPECT_EQ(settings.trace, (SinkSettings{.level = 6000}));
  EXPECT_THAT(
      settings.problems,
      ElementsAre(
          ConfigurationProblem{"corvane.conf:1",
                               "\"loud\" is not valid: expected error, warning, info, debug or a number"},
          ConfigurationProblem{"corvane.conf:2", "\"file:\" is not valid: expected none, stderr, syslog or file:PATH"},
          ConfigurationProblem{"corvane.conf:3",
                               "\"-1\" is not valid: expected a number of messages a minute, 0 for no limit"}));
}

TEST(LogSettings, BrokenOverridesLeaveTheFileInForce) {
  const Configuration file = Configuration::parse("log.level = info\n", "corvane.conf");
  for (const char* broken : {"debug", "debug:", "debug:printer", "loud:stderr", ":stderr", "stderr"}) {
    const Settings settings = makeSettings(file, broken, std::nullopt);
    EXPECT_EQ(settings.log.level, 4000) << broken;
    EXPECT_THAT(
        settings.problems,
        ElementsAre(ConfigurationProblem{
            "CORVANE_LOG", '"' + std::string(broken) +
                               "\" is not valid: expected LEVEL:DESTINATION, where LEVEL is error, warning, "
                               "info, debug or a number and DESTINATION is none, stderr, syslog or file:PATH"}));
  }
}

TEST(LogSettings, ProblemsOfTheFileAreKept) {
  EXPECT_THAT(fromFile("nonsense\n").problems,
              ElementsAre(ConfigurationProblem{"corvane.conf:1",
                                               "expected \"key = value\" but there is no \"=\"; the line is ignored"}));
}

TEST(LogSettings, LevelsAreNamesInAnyCaseOrNumbers) {
  const std::map<std::string, int> levels = {{"error", 6000}, {"Warning", 5000}, {"INFO", 4000},
                                             {"debug", 3000}, {"0", 0},          {"4500", 4500}};
  for (const auto& [text, level] : levels) {
    EXPECT_EQ(fromFile("log.level = " + text + "\n").log.level, level) << text;
  }
  for (const char* text : {"", "errors", "verbose", "-1", "+1", "3000x", "0x10", "99999999999"}) {
    EXPECT_THAT(fromFile("log.level = " + std::string(text) + "\n").problems, SizeIs(1)) << text;
  }
}

TEST(LogSettings, DestinationsAreTheseAndNoOthers) {
  EXPECT_EQ(parseDestination("none"), (Destination{DestinationKind::None}));
  EXPECT_EQ(parseDestination("stderr"), (Destination{DestinationKind::StandardError}));
  EXPECT_EQ(parseDestination("syslog"), (Destination{DestinationKind::SystemLog}));
  EXPECT_EQ(parseDestination("file:/x:y"), fileX);
  for (const char* text : {"", "stdout", "None", "file", "file:", "/x"}) {
    EXPECT_EQ(parseDestination(text), std::nullopt) << text;
  }
}

}  // namespace
