#include <CPU.h>

#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/seam/ScriptedTest.h"

using namespace Tarn::NodeLexicon;
using Scripted::inventory;
using Scripted::Lines;
using Tarn::CPUProvider::getProcessorInstances;
using Tarn::CPUProvider::Processor;

namespace {

class ProcessorCollectionReports : public Scripted::ScriptedTest {
 protected:
  unsigned short collect() { return getProcessorInstances(processors_); }

  /// What the collection itself reports, between its entry and its exit.
  Lines framed(const Lines& texts) const {
    const std::string parameters = " processors=" + Scripted::address(&processors_);
    Lines lines = {model.entering(detail, function_, parameters)};
    for (const std::string& text : texts) {
      lines.push_back(model.message(remark, function_, text));
    }
    lines.push_back(model.exiting(detail, function_, parameters));
    return lines;
  }

  const std::string function_ = "getProcessorInstances";
  std::vector<Processor> processors_;
};

}  // namespace

TEST_F(ProcessorCollectionReports, AProcessorWithEverythingIsWorthNoRemark) {
  inventory().system("Model").fullProcessor("cpu0");

  collect();

  const std::string parameters = " processors=" + Scripted::address(&processors_);
  const Lines expected = {model.entering(detail, "getProcessorInstances", parameters),
                          model.entering(detail, "checkIfVirtual"),
                          model.variable(detail, "checkIfVirtual", "model", "Model"),
                          model.exiting(detail, "checkIfVirtual"),
                          model.entering(detail, "FormatUniqueId"),
                          model.exiting(detail, "FormatUniqueId"),
                          model.exiting(detail, "getProcessorInstances", parameters)};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
}

TEST_F(ProcessorCollectionReports, OnlyTheThreeCountsAreMissed) {
  inventory().system("Model").processor("cpu0");

  collect();

  EXPECT_EQ(Scripted::takeEventsOf(function_), framed({"Failed while setting Number of Processor cores",
                                                       "Failed while setting Number of Enabled Processor cores",
                                                       "Failed while setting Number of Hardware Threads"}));
}

TEST_F(ProcessorCollectionReports, EachMissingCountHasItsOwnText) {
  inventory().system("Model").fullProcessor("a").lacks(PropHardwareThreads);
  inventory().fullProcessor("b").lacks(PropProcessorCores).fullProcessor("c").lacks(PropEnabledCores);

  collect();

  EXPECT_EQ(Scripted::takeEventsOf(function_),
            framed({"Failed while setting Number of Hardware Threads", "Failed while setting Number of Processor cores",
                    "Failed while setting Number of Enabled Processor cores"}));
  ASSERT_EQ(processors_.size(), 3U);
  EXPECT_EQ(processors_[0].getNumberOfHardwareThreads(), 0);
  EXPECT_EQ(processors_[1].getNumberOfProcessorCores(), 0);
  EXPECT_EQ(processors_[2].getNumberOfEnabledCores(), 0);
}

TEST_F(ProcessorCollectionReports, ACountOfZeroThatCanBeReadIsNotMissed) {
  inventory().system("Model").fullProcessor("cpu0").has(PropProcessorCores, 0U).has(PropEnabledCores, 0U);
  inventory().has(PropHardwareThreads, 0U);

  collect();

  EXPECT_EQ(Scripted::takeEventsOf(function_), framed({}));
}

TEST_F(ProcessorCollectionReports, EmptyTextsAreReportedAndTheRecordIsKept) {
  inventory().system("Model").fullProcessor("").description("").has(PropStepping, "").has(PropProcessorId, "  ");
  inventory().has(PropProcessorName, "");

  EXPECT_EQ(collect(), 0);

  EXPECT_EQ(Scripted::takeEventsOf(function_),
            framed({"Failed while setting Device ID", "Failed while setting CPU Element Name",
                    "Failed while setting CPU Stepping", "Failed while setting CPU Unique Id"}));
  ASSERT_EQ(processors_.size(), 1U);
  EXPECT_EQ(processors_[0].getProcessorDeviceID(), "");
  EXPECT_EQ(processors_[0].getInstanceId(), "NERITH:");
  EXPECT_EQ(processors_[0].getNumberOfHardwareThreads(), 24);
}

TEST_F(ProcessorCollectionReports, SkippedNodesAreCalledDummies) {
  inventory().system("Model").processor("cpu0").status(15).fullProcessor("cpu1").processor("cpu2").status(0);

  collect();

  EXPECT_EQ(Scripted::takeEventsOf(function_), framed({"Dummy CPU Instance", "Dummy CPU Instance"}));
}

TEST_F(ProcessorCollectionReports, SkippedNodesAreNotAskedWhetherTheyAreVirtual) {
  inventory().system("Model").processor("cpu0").status(15);

  collect();

  const std::string parameters = " processors=" + Scripted::address(&processors_);
  const Lines expected = {model.entering(detail, function_, parameters),
                          model.message(remark, function_, "Dummy CPU Instance"),
                          model.exiting(detail, function_, parameters)};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
}

TEST_F(ProcessorCollectionReports, ATreeWithoutProcessorsIsWorthNoRemark) {
  inventory().system("Model");

  EXPECT_EQ(collect(), 1);

  EXPECT_EQ(Scripted::takeEventsWithoutLines(), framed({}));
}

TEST_F(ProcessorCollectionReports, AVirtualMachineIsNamedTwiceForEachProcessor) {
  inventory().system("A Virtual Platform").fullProcessor("cpu0").fullProcessor("cpu1").lacks(PropProcessorName);
  inventory().fullProcessor("cpu2").lacks(PropFamily).lacks(PropProcessorName);

  collect();

  const std::string text = "Its a Virtual Machine set the Family as Unknown";
  EXPECT_EQ(Scripted::takeEventsOf(function_), framed({text, text, text}));
}
