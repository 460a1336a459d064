#include <CPU.h>
#include <gtest/gtest.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "tests/model/CodeTables.h"

using CodeTables::codesToTry;
using Tarn::CPUProvider::Processor;

namespace {

const std::map<unsigned int, std::pair<unsigned short, std::string>> processorHealth = {
    {0, {0, "UnKnown"}}, {21, {10, "Degraded"}}, {24, {25, "Error"}}};

}  // namespace

TEST(ProcessorStates, EnabledStateByNodeStatus) {
  for (const unsigned int code : codesToTry()) {
    Processor processor;
    EXPECT_TRUE(processor.setEnabledState(code));
    EXPECT_EQ(processor.getEnabledState(),
              CodeTables::find(CodeTables::enabledState, code).value_or(CodeTables::otherEnabledState))
        << code;
  }
}

TEST(ProcessorStates, RequestedStateIsNeverApplicable) {
  for (const unsigned int code : codesToTry()) {
    Processor processor;
    EXPECT_TRUE(processor.setRequestedState(code));
    EXPECT_EQ(processor.getRequestedState(), 12) << code;
  }
}

TEST(ProcessorStates, OperationalStatusByNodeStatus) {
  constexpr unsigned short before = 15;
  for (const unsigned int code : codesToTry()) {
    Processor processor;
    processor.setOperationalStatus(8);
    EXPECT_TRUE(processor.setOperationalStatus(code));
    const std::vector<unsigned short> expected = {
        CodeTables::find(CodeTables::operationalStatus, code).value_or(before)};
    EXPECT_EQ(processor.getOperationalStatus(), expected) << code;
  }
}

TEST(ProcessorStates, AnOperationalStatusWithoutMeaningLeavesTheOneBefore) {
  Processor processor;
  processor.setOperationalStatus(1);
  processor.setOperationalStatus(5);
  EXPECT_EQ(processor.getOperationalStatus(), std::vector<unsigned short>{2});
}

TEST(ProcessorStates, HealthStateAndItsTextByNodeStatus) {
  for (const unsigned int code : codesToTry()) {
    Processor processor;
    EXPECT_TRUE(processor.setHealthState(code));
    const auto row = processorHealth.find(code);
    const auto expected = row != processorHealth.end() ? row->second : std::pair<unsigned short, std::string>(5, "OK");
    EXPECT_EQ(processor.getHealthState(), expected.first) << code;
    EXPECT_EQ(processor.getStatusString(), expected.second) << code;
  }
}

TEST(ProcessorStates, StatusIsKeptAsItIs) {
  for (const unsigned int code : codesToTry()) {
    Processor processor;
    EXPECT_TRUE(processor.setCPUStatus(code));
    EXPECT_EQ(processor.getCPUStatus(), code & 0xFFFF) << code;
  }
}
