#include <CPU.h>
#include <gtest/gtest.h>

#include <map>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "model/StateCodes.h"
#include "tests/model/CodeTables.h"

using CodeTables::codesToTry;
using Tarn::CPUProvider::ProcessorCore;

namespace {}  // namespace

TEST(ProcessorCore, IsAPlainValue) {
  EXPECT_FALSE(std::is_polymorphic_v<ProcessorCore>);
  EXPECT_TRUE(std::is_copy_constructible_v<ProcessorCore>);
  EXPECT_TRUE(std::is_copy_assignable_v<ProcessorCore>);
}

TEST(ProcessorCore, StartsWithItsDefaults) {
  const ProcessorCore core;

  EXPECT_EQ(core.getInstanceID(), "");
  EXPECT_EQ(core.getElementName(), "");
  EXPECT_EQ(core.getRequestedState(), 0);
  EXPECT_EQ(core.getHealthState(), 0);
  EXPECT_EQ(core.getHealthString(), "Unknown");
  EXPECT_EQ(core.getOperationalStatus(), std::vector<unsigned short>{0});
}

TEST(ProcessorCore, IdentifierAndElementNameAreReadWithoutBlanksAtTheEnds) {
  ProcessorCore core;

  EXPECT_TRUE(core.setInstanceID("  core 0 "));
  EXPECT_TRUE(core.setElementName(" a  name "));

  EXPECT_EQ(core.getInstanceID(), "core 0");
  EXPECT_EQ(core.getElementName(), "a  name");
}

TEST(ProcessorCore, EmptyTextsAreStoredAndReported) {
  ProcessorCore core;
  core.setInstanceID("core0");
  core.setElementName("name");

  EXPECT_FALSE(core.setInstanceID(""));
  EXPECT_FALSE(core.setElementName(""));

  EXPECT_EQ(core.getInstanceID(), "");
  EXPECT_EQ(core.getElementName(), "");
  EXPECT_TRUE(core.setElementName(" "));
}

TEST(ProcessorCore, ReadsEnabledWhateverWasStored) {
  for (const unsigned int code : codesToTry()) {
    ProcessorCore core;
    EXPECT_TRUE(core.setCoreEnabledState(code));
    EXPECT_TRUE(core.setEnabledState(code));
    EXPECT_EQ(core.getCoreEnabledState(), 2) << code;
    EXPECT_EQ(core.getEnabledState(), 2) << code;
    EXPECT_EQ(core.getCoreEnabledState(), 2) << code;
    EXPECT_EQ(core.getEnabledState(), 2) << code;
  }
}

// Since cores read enabled, no getter shows what was stored: only the table does.
TEST(ProcessorCore, CoreEnabledStateByNodeStatus) {
  using namespace Tarn::CPUProvider;
  const CodeTables::Table expected = {{0, 0}, {1, 2}, {2, 4}, {3, 5}};
  for (const unsigned int code : codesToTry()) {
    EXPECT_EQ(translate(coreEnabledStates, code, coreEnabledStateUnknown), CodeTables::find(expected, code).value_or(0))
        << code;
  }
}

TEST(ProcessorCore, RequestedStateIsNeverApplicable) {
  for (const unsigned int code : codesToTry()) {
    ProcessorCore core;
    EXPECT_TRUE(core.setRequestedState(code));
    EXPECT_EQ(core.getRequestedState(), 12) << code;
  }
}

TEST(ProcessorCore, HealthStateAndItsTextByNodeStatus) {
  for (const unsigned int code : codesToTry()) {
    ProcessorCore core;
    EXPECT_TRUE(core.setHealthState(code));
    const auto row = CodeTables::partHealth.find(code);
    const auto expected =
        row != CodeTables::partHealth.end() ? row->second : std::pair<unsigned short, std::string>(5, "OK");
    EXPECT_EQ(core.getHealthState(), expected.first) << code;
    EXPECT_EQ(core.getHealthString(), expected.second) << code;
  }
}

TEST(ProcessorCore, OperationalStatusByNodeStatus) {
  constexpr unsigned short before = 15;
  for (const unsigned int code : codesToTry()) {
    ProcessorCore core;
    core.setOperationalStatus(8);
    EXPECT_TRUE(core.setOperationalStatus(code));
    const std::vector<unsigned short> expected = {
        CodeTables::find(CodeTables::operationalStatus, code).value_or(before)};
    EXPECT_EQ(core.getOperationalStatus(), expected) << code;
  }
}

TEST(ProcessorCore, ACopyHasEveryField) {
  ProcessorCore original;
  original.setInstanceID("core0");
  original.setElementName("name");
  original.setRequestedState(0);
  original.setHealthState(24);
  original.setOperationalStatus(20);

  ProcessorCore copy(original);

  EXPECT_EQ(copy.getInstanceID(), "core0");
  EXPECT_EQ(copy.getElementName(), "name");
  EXPECT_EQ(copy.getRequestedState(), 12);
  EXPECT_EQ(copy.getHealthState(), 25);
  EXPECT_EQ(copy.getHealthString(), "Error");
  EXPECT_EQ(copy.getOperationalStatus(), std::vector<unsigned short>{5});
}
