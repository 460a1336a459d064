#include "platform/cvlog/Settings.h"

#include <gmock/gmock.h>

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <utility>

namespace {

using CVLog::defaultLog;
using CVLog::Destination;
using CVLog::DestinationKind;
using CVLog::Rotation;
using CVLog::Settings;
using CVLog::SinkSettings;
using Tarn::Common::Configuration;
using Tarn::Common::ConfigurationProblem;
using testing::ElementsAre;
using testing::IsEmpty;

const Destination fileX = {DestinationKind::File, "/x:y"};

Settings settingsOf(const std::string& text, const std::optional<std::string>& logOverride = std::nullopt,
                    const std::optional<std::string>& traceOverride = std::nullopt) {
  return CVLog::makeSettings(Configuration::parse(text, "corvane.conf"), logOverride, traceOverride);
}

/// What is not valid in a file of this line, without its place.
std::string problemOf(const std::string& line) {
  const Settings settings = settingsOf(line + '\n');
  EXPECT_EQ(settings.log, defaultLog()) << line;
  return settings.problems.size() == 1 ? settings.problems.front().why : std::to_string(settings.problems.size());
}

TEST(LogSettings, ErrorsGoToTheSystemLogByDefault) {
  const Settings settings = settingsOf("");
  const Rotation rotation = {.size = 16 << 20U, .keep = 4};
  EXPECT_EQ(settings.log,
            (SinkSettings{
                .level = 6000, .destination = {DestinationKind::SystemLog}, .perMinute = 60, .rotation = rotation}));
  EXPECT_EQ(settings.trace, (SinkSettings{.level = 3000, .rotation = rotation}));
  EXPECT_THAT(settings.problems, IsEmpty());
}

TEST(LogSettings, FileGivesEachSinkItsSettings) {
  const Settings settings = settingsOf(
      "log.level = warning\nlog.destination = file:/x:y\nlog.rate = 5\nlog.size = 0\nlog.keep = 999\n"
      "trace.level = 4000\ntrace.destination = stderr\ntrace.size = 2G\ntrace.keep = 1\n");
  EXPECT_EQ(settings.log,
            (SinkSettings{.level = 5000, .destination = fileX, .perMinute = 5, .rotation = {.size = 0, .keep = 999}}));
  EXPECT_EQ(settings.trace, (SinkSettings{.level = 4000,
                                          .destination = {DestinationKind::StandardError},
                                          .rotation = {.size = std::uint64_t{2} << 30U, .keep = 1}}));
  EXPECT_THAT(settings.problems, IsEmpty());
}

TEST(LogSettings, OnlyTheSystemLogHasALimitByDefault) {
  EXPECT_EQ(settingsOf("trace.destination = syslog\n").trace.perMinute, 60U);
  EXPECT_EQ(settingsOf("trace.destination = syslog\ntrace.rate = 0\n").trace.perMinute, 0U);
  EXPECT_EQ(settingsOf("log.destination = stderr\n").log.perMinute, 0U);
}

TEST(LogSettings, ValidValues) {
  for (const auto& [text, level] : std::map<std::string, int>{
           {"error", 6000}, {"Warning", 5000}, {"INFO", 4000}, {"debug", 3000}, {"0", 0}, {"4500", 4500}}) {
    EXPECT_EQ(settingsOf("log.level = " + text + "\n").log.level, level) << text;
  }
  for (const auto& [text, size] : std::map<std::string, std::uint64_t>{{"4096", 4096},
                                                                       {"4K", 4096},
                                                                       {"5k", 5120},
                                                                       {"1m", 1 << 20U},
                                                                       {"8589934591G", 0x7fff'ffff'c000'0000U},
                                                                       {"9223372036854775807", 0x7fff'ffff'ffff'ffffU},
                                                                       {"0", 0},
                                                                       {"0K", 0}}) {
    EXPECT_EQ(settingsOf("log.size = " + text + "\n").log.rotation.size, size) << text;
  }
  EXPECT_EQ(settingsOf("log.destination = none\n").log.destination, Destination{});
}

TEST(LogSettings, InvalidValuesAreNamedWithWhatIsValid) {
  const std::map<std::string, std::pair<std::vector<std::string>, std::string>> keys = {
      {"level",
       {{"", "loud", "errors", "-1", "+1", "3000x", "0x10", "99999999999"}, "error, warning, info, debug or a number"}},
      {"destination", {{"", "stdout", "None", "file", "file:", "/x"}, "none, stderr, syslog or file:PATH"}},
      {"rate", {{"", "-1", "many", "4294967296"}, "a number of messages a minute, 0 for no limit"}},
      {"size",
       {{"", "K", "10", "4095", "3K", "-1", "+4096", "4 K", "4KB", "1T", "1.5M", "8589934592G", "9223372036854775808",
         "99999999999999999999"},
        "a size from 4K on, such as 500K, 16M or 1G, or 0 for no limit"}},
      {"keep", {{"", "0", "1000", "-1"}, "how many old files are kept, 1 to 999"}},
  };
  for (const auto& [key, texts] : keys) {
    for (const std::string& text : texts.first) {
      EXPECT_EQ(problemOf("log." + key + " = " + text), '"' + text + "\" is not valid: expected " + texts.second);
    }
  }
}

TEST(LogSettings, ProblemsHaveTheirPlacesAndOtherLinesAreInForce) {
  const Settings settings = settingsOf("nonsense\ntrace.level = error\nlog.level = loud\n");
  EXPECT_EQ(settings.trace.level, 6000);
  EXPECT_THAT(settings.problems,
              ElementsAre(ConfigurationProblem{"corvane.conf:1",
                                               "expected \"key = value\" but there is no \"=\"; the line is ignored"},
                          ConfigurationProblem{"corvane.conf:3",
                                               "\"loud\" is not valid: expected error, warning, "
                                               "info, debug or a number"}));
}

TEST(LogSettings, OverridesComeBeforeTheFileUnlessTheyAreInvalid) {
  const std::string file = "log.level = info\nlog.destination = none\n";
  const Settings settings = settingsOf(file, "debug:stderr", "6000:file:/x:y");
  EXPECT_EQ(settings.log, (SinkSettings{.level = 3000, .destination = {DestinationKind::StandardError}}));
  EXPECT_EQ(settings.trace, (SinkSettings{.level = 6000, .destination = fileX}));
  for (const char* invalid : {"debug", "debug:", "debug:printer", "loud:stderr", ":stderr", "stderr"}) {
    EXPECT_THAT(
        settingsOf(file, invalid).problems,
        ElementsAre(ConfigurationProblem{
            "CORVANE_LOG", '"' + std::string(invalid) +
                               "\" is not valid: expected LEVEL:DESTINATION, where LEVEL is error, warning, "
                               "info, debug or a number and DESTINATION is none, stderr, syslog or file:PATH"}));
    EXPECT_EQ(settingsOf(file, invalid).log.level, 4000) << invalid;
  }
}

}  // namespace
