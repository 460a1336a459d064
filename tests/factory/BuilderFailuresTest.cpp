#include "tests/factory/BuilderCases.h"

using namespace FactoryTests;
using Corvcim::Failure;
using Corvcim::FailureResult;

// What the builders do when the broker does not.

namespace {

class BuilderFailures : public BuilderTest {
 protected:
  void fail(const std::string& service, FailureResult result, unsigned int n = 1) {
    hostBroker_.services().failNth(service, n, Failure{result, CMPI_RC_ERR_ACCESS_DENIED, "the broker says no"});
  }

  Lines expectedEventsOfFailure() const {
    Lines lines = {events.entering(detail, GetParam().function, parameters(nullptr, false))};
    if (GetParam().marksExitOfFailure) {
      lines.push_back(events.exiting(detail, GetParam().function, parameters(nullptr, false)));
    }
    return lines;
  }

  /// All settings but the array's.
  Lines settingsWithoutArray() const {
    Lines lines = GetParam().allSettings();
    std::erase_if(lines, [](const std::string& line) { return line.find(" uint16[] ") != std::string::npos; });
    return lines;
  }
};

constexpr FailureResult objectFailures[] = {FailureResult::Null, FailureResult::HandleLess};

}  // namespace

TEST_P(BuilderFailures, WithoutAnObjectPathThereIsNothing) {
  for (const FailureResult result : objectFailures) {
    forgetTraces();
    fail("newObjectPath", result);
    rc_ = {CMPI_RC_OK, nullptr};

    EXPECT_EQ(make(nullptr, false), nullptr);

    EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
    EXPECT_EQ(hostBroker_.services().count("setNameSpace"), 0U);
    EXPECT_EQ(hostBroker_.services().count("newInstance"), 0U);
    EXPECT_EQ(takeBuilderEvents(), expectedEventsOfFailure());
  }
}

TEST_P(BuilderFailures, WithoutAnInstanceThereIsNothing) {
  fail("newInstance", FailureResult::Null);

  EXPECT_EQ(make(nullptr, false), nullptr);

  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
  EXPECT_EQ(recording_.takeProperties(), Lines{});
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), 0U);
  EXPECT_EQ(takeBuilderEvents(), expectedEventsOfFailure());
}

TEST_P(BuilderFailures, AnInstanceWithoutHandleIsReturnedWithNothingSet) {
  fail("newInstance", FailureResult::HandleLess);

  CMPIInstance* instance = make(nullptr, false);

  ASSERT_NE(instance, nullptr);
  EXPECT_EQ(instance->hdl, nullptr);
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
  EXPECT_EQ(recording_.takeProperties(), Lines{});
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), 0U);
  EXPECT_EQ(takeBuilderEvents(), expectedEventsOfFailure());
}

TEST_P(BuilderFailures, AFailedArrayIsReportedAndLeftOut) {
  for (const FailureResult result : objectFailures) {
    forgetTraces();
    fail("newArray", result);

    CMPIInstance* instance = make(nullptr, false);

    ASSERT_NE(instance, nullptr);
    EXPECT_EQ(recording_.takeProperties(), settingsWithoutArray());
    const ArrayFailureCase& failure = GetParam().arrayFailure;
    // Where the builder leaves the status alone, it shows what the broker put there.
    EXPECT_EQ(shown(rc_), failure.setsStatus ? "CMPI_RC_ERR_FAILED |" + failure.text + "|"
                                             : "CMPI_RC_ERR_ACCESS_DENIED |the broker says no|");
    const Lines reported = takeBuilderEvents();
    EXPECT_EQ(
        std::count(reported.begin(), reported.end(), events.message(failure.level, GetParam().function, failure.text)),
        1);
    EXPECT_EQ(reported.back(), events.exiting(detail, GetParam().function, parameters(nullptr, false)));
  }
}

TEST_P(BuilderFailures, AFailedArrayNeedsNoStatus) {
  fail("newArray", FailureResult::Null);

  CMPIInstance* instance = GetParam().make(factory(), broker_, ref_, nullptr, false, nullptr);

  EXPECT_NE(instance, nullptr);
  EXPECT_EQ(recording_.takeProperties(), settingsWithoutArray());
  EXPECT_EQ(hostBroker_.services().count("newString"), 0U);
}

TEST_P(BuilderFailures, AFailedArrayIsNotMadeWhenItIsNotAskedFor) {
  fail("newArray", FailureResult::Null);

  make(names({"Caption"}), false);

  EXPECT_EQ(hostBroker_.services().count("newArray"), 0U);
}

TEST_P(BuilderFailures, AFailedMessageLeavesTheCodeAlone) {
  fail("newArray", FailureResult::Null);
  fail("newString", FailureResult::Null);

  make(nullptr, false);

  if (GetParam().arrayFailure.setsStatus) {
    EXPECT_EQ(shown(rc_), "CMPI_RC_ERR_FAILED");
  }
  EXPECT_EQ(hostBroker_.services().count("newString"), GetParam().arrayFailure.setsStatus ? 1U : 0U);
}

TEST_P(BuilderFailures, AReferenceWithoutNamespaceReadsAsEmpty) {
  for (const FailureResult result : objectFailures) {
    fail("getNameSpace", result, 1);
    fail("getNameSpace", result, 2);

    CMPIInstance* instance = make(nullptr, true);

    ASSERT_NE(instance, nullptr);
    EXPECT_EQ(Corvcim::valueOf(instance).path.nameSpace, "");
    hostBroker_.services().clearFailures();
  }
}

TEST_P(BuilderFailures, RefusedSettingsAreNotChecked) {
  hostBroker_.services().failNth("setProperty", 1, {}, 0);
  hostBroker_.services().failNth("setPropertyFilter", 1, {}, 0);
  hostBroker_.services().failNth("setNameSpace", 1, {}, 0);
  hostBroker_.services().failNth("setHostname", 1, {}, 0);
  hostBroker_.services().failNth("setElementAt", 1, {}, 0);

  CMPIInstance* instance = make(nullptr, false);

  EXPECT_NE(instance, nullptr);
  EXPECT_EQ(recording_.takeProperties().size(), GetParam().allSettings().size());
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
}

INSTANTIATE_TEST_SUITE_P(All, BuilderFailures, ::testing::ValuesIn(builderCases()), builderName);
