#include <CPU.h>

#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/seam/ScriptedTest.h"

using namespace Tarn::NodeLexicon;
using Scripted::inventory;
using Scripted::Lines;
using Tarn::CPUProvider::checkIfVirtual;
using Tarn::CPUProvider::getProcessorInstances;
using Tarn::CPUProvider::Processor;

namespace {

using VirtualMachine = Scripted::ScriptedTest;

struct ModelCase {
  const char* model;
  bool isVirtual;
};

constexpr ModelCase models[] = {
    {"Virtual", true},        {"Some Virtual Platform", true},
    {"xVirtualx", true},      {"HyperVirtual", true},
    {"Virtualization", true}, {"virtual", false},
    {"A virtual one", false}, {"VIRTUAL", false},
    {"Virtua", false},        {"Virtu al", false},
    {"Rack server", false},   {"", false},
};

}  // namespace

TEST_F(VirtualMachine, IsRecognizedByTheWordVirtualInTheModel) {
  for (const ModelCase& modelCase : models) {
    inventory().reset();
    inventory().system(modelCase.model);
    EXPECT_EQ(checkIfVirtual(), modelCase.isVirtual) << modelCase.model;
  }
}

TEST_F(VirtualMachine, NeedsASystemWithAModel) {
  EXPECT_FALSE(checkIfVirtual());
  inventory().system("Virtual").lacks(PropSystemModel);
  EXPECT_FALSE(checkIfVirtual());
  inventory().has(PropSystemModel, 7U);
  EXPECT_FALSE(checkIfVirtual());
}

TEST_F(VirtualMachine, TheFirstSystemCounts) {
  inventory().system("Metal").system("Virtual");
  EXPECT_FALSE(checkIfVirtual());
}

TEST_F(VirtualMachine, TellsTheModelAndTheFinding) {
  inventory().system("A Virtual Platform");

  checkIfVirtual();

  const Lines expected = {
      model.entering(detail, "checkIfVirtual"), model.variable(detail, "checkIfVirtual", "model", "A Virtual Platform"),
      model.message(remark, "checkIfVirtual", "VMWARE MACHINE"), model.exiting(detail, "checkIfVirtual")};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
}

TEST_F(VirtualMachine, TellsAnUnreadModelAsEmpty) {
  inventory().system("").lacks(PropSystemModel);

  checkIfVirtual();

  const Lines expected = {model.entering(detail, "checkIfVirtual"),
                          model.variable(detail, "checkIfVirtual", "model", ""),
                          model.exiting(detail, "checkIfVirtual")};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
}

TEST_F(VirtualMachine, TellsNoModelWithoutASystem) {
  checkIfVirtual();

  const Lines expected = {model.entering(detail, "checkIfVirtual"), model.exiting(detail, "checkIfVirtual")};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
}

TEST_F(VirtualMachine, ReportsFamilyAndNameOfItsProcessorsAsUnknown) {
  inventory().system("Virtual").fullProcessor("cpu0").fullProcessor("cpu1").has(PropFamily, 1U);
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 0);

  ASSERT_EQ(processors.size(), 2U);
  for (const Processor& processor : processors) {
    EXPECT_EQ(processor.getFamily(), 2);
    EXPECT_EQ(processor.getName(), "Unknown");
    EXPECT_EQ(processor.getOtherFamilyDescription(), "Other");
    EXPECT_EQ(processor.getCurrentClockSpeed(), 2100U);
  }
}

TEST_F(VirtualMachine, LeavesFamilyAndNameAloneThatCannotBeRead) {
  inventory().system("Virtual").processor("cpu0");
  std::vector<Processor> processors;

  EXPECT_EQ(getProcessorInstances(processors), 0);

  ASSERT_EQ(processors.size(), 1U);
  EXPECT_EQ(processors[0].getFamily(), 0);
  EXPECT_EQ(processors[0].getName(), "");
}

TEST_F(VirtualMachine, IsLookedForAtEveryProcessor) {
  inventory().system("Metal").processor("cpu0").processor("cpu1").processor("cpu2").processor("cpu3").status(15);
  std::vector<Processor> processors;

  getProcessorInstances(processors);

  EXPECT_EQ(inventory().count("selectNode(1)"), 3U);
}
