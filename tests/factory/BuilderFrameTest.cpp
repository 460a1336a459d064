#include "tests/factory/BuilderCases.h"

using namespace FactoryTests;
using Corvcim::ServiceCall;

// What the four builders have in common: how the instance comes about, and what is reported of it.

namespace {

using BuilderFrame = BuilderTest;

}  // namespace

TEST_P(BuilderFrame, MakesPathAndInstanceBeforeItSetsProperties) {
  make(nullptr, false);

  const std::vector<ServiceCall> calls =
      takeCallsOf({"newObjectPath", "setNameSpace", "setHostname", "newInstance", "setPropertyFilter", "getNameSpace"});
  const std::vector<ServiceCall> expected = {
      {"getNameSpace", ""},
      {"newObjectPath", GetParam().className},
      {"getNameSpace", ""},
      {"setNameSpace", "root/test"},
      {"setHostname", "scripted-host"},
      {"newInstance", GetParam().className},
      {"setPropertyFilter", "properties NULL keys " + GetParam().keyNames},
  };
  EXPECT_EQ(calls, expected);
}

TEST_P(BuilderFrame, InstallsTheFilterBeforeTheFirstProperty) {
  make(nullptr, false);

  const std::vector<ServiceCall> calls = takeCallsOf({"setPropertyFilter", "setProperty"});
  ASSERT_GE(calls.size(), 2U);
  EXPECT_EQ(calls[0].service, "setPropertyFilter");
  EXPECT_EQ(calls[1].service, "setProperty");
}

TEST_P(BuilderFrame, TheInstanceStandsInTheNamespaceOfTheReferenceAndOnThisHost) {
  ref_ = path("HALDA_Whatever", "interop/deep");

  CMPIInstance* instance = make(nullptr, false);

  ASSERT_NE(instance, nullptr);
  const Corvcim::ObjectPath made = Corvcim::valueOf(instance).path;
  EXPECT_EQ(made.className, GetParam().className);
  EXPECT_EQ(made.nameSpace, "interop/deep");
  EXPECT_EQ(made.host, "scripted-host");
}

TEST_P(BuilderFrame, APathOnlyInstanceHasItsKeysAndNoFilter) {
  CMPIInstance* instance = make(nullptr, true);

  ASSERT_NE(instance, nullptr);
  EXPECT_EQ(recording_.takeProperties(), GetParam().keySettings);
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), 0U);
  EXPECT_EQ(Corvcim::valueOf(instance).path.keys.size(), GetParam().keySettings.size());
}

TEST_P(BuilderFrame, APathOnlyInstanceTakesSelectedPropertiesAllTheSame) {
  make(names({"Caption"}), true);

  EXPECT_EQ(recording_.takeProperties(), GetParam().settings({"Caption"}));
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), 0U);
}

TEST_P(BuilderFrame, TheFilterGetsTheListOfTheRequest) {
  make(names({"Caption", "ElementName"}), false);

  const std::vector<ServiceCall> expected = {
      {"setPropertyFilter", "properties {Caption,ElementName} keys " + GetParam().keyNames}};
  EXPECT_EQ(takeCallsOf({"setPropertyFilter"}), expected);
}

TEST_P(BuilderFrame, TheFilterGetsAnEmptyListToo) {
  make(names({}), false);

  const std::vector<ServiceCall> expected = {{"setPropertyFilter", "properties {} keys " + GetParam().keyNames}};
  EXPECT_EQ(takeCallsOf({"setPropertyFilter"}), expected);
}

TEST_P(BuilderFrame, EntryAndExitAreReportedWithTheParameters) {
  make(names({"Family"}), false);

  const std::string expected = parameters(names({"Family"}), false);
  Lines reported = takeBuilderEvents();
  ASSERT_EQ(reported.size(), 2U);
  // Two lists of one request have different addresses: only their labels are comparable.
  const auto withoutList = [](std::string line) {
    const std::size_t start = line.find(" properties=") + 12;
    return line.replace(start, line.find(" isObjPath=") - start, "#");
  };
  EXPECT_EQ(withoutList(reported[0]), withoutList(events.entering(detail, GetParam().function, expected)));
  EXPECT_EQ(withoutList(reported[1]), withoutList(events.exiting(detail, GetParam().function, expected)));
}

TEST_P(BuilderFrame, ParametersShowFlagsAndMissingLists) {
  make(nullptr, true);

  const Lines expected = {events.entering(detail, GetParam().function, parameters(nullptr, true)),
                          events.exiting(detail, GetParam().function, parameters(nullptr, true))};
  EXPECT_EQ(takeBuilderEvents(), expected);
}

TEST_P(BuilderFrame, AStatusIsNotNeeded) {
  CMPIInstance* instance = GetParam().make(factory(), broker_, ref_, nullptr, false, nullptr);

  ASSERT_NE(instance, nullptr);
  EXPECT_EQ(recording_.takeProperties(), GetParam().allSettings());
}

INSTANTIATE_TEST_SUITE_P(All, BuilderFrame, ::testing::ValuesIn(builderCases()), builderName);
