#include <CPU.h>

#include <algorithm>
#include <string>
#include <vector>

#include "tests/seam/ScriptedTest.h"

using namespace Tarn::NodeLexicon;
using Scripted::internalPath;
using Scripted::inventory;
using Scripted::Lines;
using Tarn::CPUProvider::getProcessorInstances;
using Tarn::CPUProvider::Processor;

namespace {

using Scripted::ScriptedTest;
class ProcessorCollection : public ScriptedTest {};

std::vector<std::string> identifiersOf(const std::vector<Processor>& processors) {
  std::vector<std::string> identifiers;
  for (const Processor& processor : processors) {
    identifiers.push_back(processor.getProcessorDeviceID());
  }
  return identifiers;
}

/// The one record of the inventory.
Processor collectOne() {
  std::vector<Processor> processors;
  EXPECT_EQ(getProcessorInstances(processors), 0);
  EXPECT_EQ(processors.size(), 1U);
  return processors.empty() ? Processor() : processors.front();
}

}  // namespace

TEST_F(ProcessorCollection, FillsEveryField) {
  inventory().system("Model").fullProcessor("cpu0").status(1).description("  CPU 1 ");

  Processor processor = collectOne();

  EXPECT_EQ(processor.getProcessorDeviceID(), "cpu0");
  EXPECT_EQ(processor.getInstanceId(), "NERITH:cpu0");
  EXPECT_EQ(processor.getElementName(), "CPU 1");
  EXPECT_EQ(processor.getName(), "Model 9000");
  EXPECT_EQ(processor.getFamily(), 198);
  EXPECT_EQ(processor.getOtherFamilyDescription(), "Other");
  EXPECT_EQ(processor.getCurrentClockSpeed(), 2100U);
  EXPECT_EQ(processor.getMaxClockSpeed(), 3700U);
  EXPECT_EQ(processor.getExternalClockSpeed(), 100U);
  EXPECT_EQ(processor.getCPUStatus(), 1);
  EXPECT_EQ(processor.getEnabledState(), 2);
  EXPECT_EQ(processor.getRequestedState(), 12);
  EXPECT_EQ(processor.getOperationalStatus(), std::vector<unsigned short>{2});
  EXPECT_EQ(processor.getHealthState(), 5);
  EXPECT_EQ(processor.getStatusString(), "OK");
  EXPECT_EQ(processor.getDataWidth(), 64);
  EXPECT_EQ(processor.getAddressWidth(), 48);
  EXPECT_EQ(processor.getStepping(), "7");
  EXPECT_EQ(processor.getUniqueId(), "0FA9");
  EXPECT_EQ(processor.getUpgradeMethod(), 54);
  EXPECT_EQ(processor.getRequestedStatesSupported(), (std::vector<unsigned short>{2, 2}));
  EXPECT_EQ(processor.getNumberOfProcessorCores(), 16);
  EXPECT_EQ(processor.getNumberOfEnabledCores(), 12);
  EXPECT_EQ(processor.getNumberOfHardwareThreads(), 24);
}

TEST_F(ProcessorCollection, MissingPropertiesLeaveTheDefaultsAndCountsOfZero) {
  inventory().system("Model").processor("cpu0");

  Processor processor = collectOne();

  EXPECT_EQ(processor.getName(), "");
  EXPECT_EQ(processor.getFamily(), 0);
  EXPECT_EQ(processor.getOtherFamilyDescription(), "Other");
  EXPECT_EQ(processor.getCurrentClockSpeed(), 0U);
  EXPECT_EQ(processor.getMaxClockSpeed(), 0U);
  EXPECT_EQ(processor.getExternalClockSpeed(), 3600U);
  EXPECT_EQ(processor.getDataWidth(), 0);
  EXPECT_EQ(processor.getAddressWidth(), 0);
  EXPECT_EQ(processor.getStepping(), "");
  EXPECT_EQ(processor.getUniqueId(), "");
  EXPECT_EQ(processor.getUpgradeMethod(), 0);
  EXPECT_TRUE(processor.getRequestedStatesSupported().empty());
  EXPECT_EQ(processor.getNumberOfProcessorCores(), 0);
  EXPECT_EQ(processor.getNumberOfEnabledCores(), 0);
  EXPECT_EQ(processor.getNumberOfHardwareThreads(), 0);
}

TEST_F(ProcessorCollection, AsksTheInventoryStepByStep) {
  inventory().system("Model").fullProcessor("cpu0");

  collectOne();

  Lines calls = inventory().calls();
  std::erase(calls, "operator bool()");
  const Lines expected = {"Instrumentation()", "selectNode(4)",
                          // the node
                          "getNodeStatus()", "getPathToNode()", "convertPathToString(" + internalPath("cpu0") + ")",
                          // whether it is virtual
                          "Instrumentation()", "selectNode(1)", "getProperty(39)",
                          // its properties
                          "getProperty(298)", "getProperty(307)", "getProperty(80)", "getProperty(38)",
                          "getProperty(19)", "getNodeStatus()", "getNodeDescription()", "getProperty(15)",
                          "getProperty(66)", "getProperty(124)", "getProperty(89)", "getProperty(304)",
                          "getProperty(125)", "getProperty(190)", "getProperty(189)", "getProperty(87)",
                          // the next
                          "operator++()"};
  EXPECT_EQ(calls, expected);
}

TEST_F(ProcessorCollection, ReadsTheDataWidthAgainWhereTheAddressWidthIsMissing) {
  inventory().system("Model").fullProcessor("cpu0").lacks(PropAddressWidth);

  const Processor processor = collectOne();

  EXPECT_EQ(processor.getAddressWidth(), 64);
  const Lines& calls = inventory().calls();
  const auto addressWidth = std::find(calls.begin(), calls.end(), "getProperty(66)");
  ASSERT_NE(addressWidth, calls.end());
  EXPECT_EQ(*(addressWidth + 1), "getProperty(15)");
  EXPECT_EQ(inventory().count("getProperty(15)"), 2U);
}

TEST_F(ProcessorCollection, AnAddressWidthStandsWithoutADataWidth) {
  inventory().system("Model").fullProcessor("cpu0").lacks(PropDataWidth);

  const Processor processor = collectOne();

  EXPECT_EQ(processor.getDataWidth(), 0);
  EXPECT_EQ(processor.getAddressWidth(), 48);
}

TEST_F(ProcessorCollection, FamilyOtherBringsItsDescription) {
  inventory().system("Model").processor("cpu0").has(PropFamily, 1U);

  const Processor processor = collectOne();

  EXPECT_EQ(processor.getFamily(), 1);
  EXPECT_EQ(processor.getOtherFamilyDescription(), "Cell Blade Family");
}

TEST_F(ProcessorCollection, KeepsTheRawStatusAndTranslatesIt) {
  inventory().system("Model").processor("cpu0").status(24);

  const Processor processor = collectOne();

  EXPECT_EQ(processor.getCPUStatus(), 24);
  EXPECT_EQ(processor.getEnabledState(), 5);
  EXPECT_EQ(processor.getOperationalStatus(), std::vector<unsigned short>{0});
  EXPECT_EQ(processor.getHealthState(), 25);
  EXPECT_EQ(processor.getStatusString(), "Error");
  EXPECT_EQ(processor.getRequestedState(), 12);
}

TEST_F(ProcessorCollection, AStatusThatTurnsZeroOnTheWayGivesTheRequestedStateOnly) {
  inventory().system("Model").processor("cpu0").statuses({1, 0});

  const Processor processor = collectOne();

  EXPECT_EQ(processor.getRequestedState(), 12);
  EXPECT_EQ(processor.getCPUStatus(), 0);
  EXPECT_EQ(processor.getEnabledState(), 0);
  EXPECT_EQ(processor.getOperationalStatus(), std::vector<unsigned short>{0});
  EXPECT_EQ(processor.getHealthState(), 0);
  EXPECT_EQ(processor.getStatusString(), "Unknown");
}

TEST_F(ProcessorCollection, TheStatusOfTheSecondReadCounts) {
  inventory().system("Model").processor("cpu0").statuses({1, 15});

  EXPECT_EQ(collectOne().getCPUStatus(), 15);
}

TEST_F(ProcessorCollection, SkipsNodesThatAreUnknownOrEmpty) {
  inventory().system("Model").processor("cpu0").status(15).processor("cpu1").processor("cpu2").status(0);
  inventory().processor("cpu3").status(16);
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 0);

  EXPECT_EQ(identifiersOf(processors), (std::vector<std::string>{"cpu1", "cpu3"}));
}

TEST_F(ProcessorCollection, ATreeWithNothingButEmptySocketsIsNoFailure) {
  inventory().system("Model").processor("cpu0").status(15);
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 0);

  EXPECT_TRUE(processors.empty());
}

TEST_F(ProcessorCollection, ATreeWithoutProcessorsFails) {
  inventory().system("Model");
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 1);

  EXPECT_TRUE(processors.empty());
}

TEST_F(ProcessorCollection, AppendsInTheOrderOfTheTreeToWhatIsThere) {
  inventory().system("Model").processor("cpu2").processor("cpu10").processor("cpu1");
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 0);
  EXPECT_EQ(getProcessorInstances(processors), 0);

  EXPECT_EQ(identifiersOf(processors), (std::vector<std::string>{"cpu2", "cpu10", "cpu1", "cpu2", "cpu10", "cpu1"}));
}

TEST_F(ProcessorCollection, KeepsNodesThatShareAPath) {
  inventory().system("Model").processor("cpu0").has(PropFamily, 10U).processor("cpu0").has(PropFamily, 20U);
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 0);

  ASSERT_EQ(processors.size(), 2U);
  EXPECT_EQ(processors[0].getFamily(), 10);
  EXPECT_EQ(processors[1].getFamily(), 20);
}

TEST_F(ProcessorCollection, APathWithBlanksStaysWholeBehindThePrefix) {
  inventory().system("Model").processor(" cpu 0 ");

  const Processor processor = collectOne();

  EXPECT_EQ(processor.getProcessorDeviceID(), "cpu 0");
  EXPECT_EQ(processor.getInstanceId(), "NERITH: cpu 0");
}
