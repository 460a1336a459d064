#include <CPU.h>

#include <string>
#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/seam/ScriptedTest.h"

using Scripted::internalPath;
using Scripted::inventory;
using Scripted::Lines;
using Tarn::CPUProvider::getProcessorCoreInstances;
using Tarn::CPUProvider::ProcessorCore;

namespace {

class CoreCollection : public Scripted::ScriptedTest {
 protected:
  CoreCollection() { inventory().system("Model").processor("cpu0"); }

  unsigned short collect() { return getProcessorCoreInstances(cores_); }

  Lines framed(const Lines& texts) const {
    const std::string function = "getProcessorCoreInstances";
    const std::string parameters = " procCores=" + Scripted::address(&cores_);
    Lines lines = {model.entering(detail, function, parameters)};
    for (const std::string& text : texts) {
      lines.push_back(model.message(remark, function, text));
    }
    lines.push_back(model.exiting(detail, function, parameters));
    return lines;
  }

  std::vector<ProcessorCore> cores_;
};

}  // namespace

TEST_F(CoreCollection, FillsEveryField) {
  inventory().core("core0").description(" Core 1 ").status(20);

  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(cores_.size(), 1U);
  EXPECT_EQ(cores_[0].getInstanceID(), "core0");
  EXPECT_EQ(cores_[0].getElementName(), "Core 1");
  EXPECT_EQ(cores_[0].getCoreEnabledState(), 2);
  EXPECT_EQ(cores_[0].getEnabledState(), 2);
  EXPECT_EQ(cores_[0].getOperationalStatus(), std::vector<unsigned short>{5});
  EXPECT_EQ(cores_[0].getHealthState(), 5);
  EXPECT_EQ(cores_[0].getHealthString(), "OK");
  EXPECT_EQ(cores_[0].getRequestedState(), 12);
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), framed({}));
}

TEST_F(CoreCollection, AsksTheInventoryStepByStepAndForNoProperty) {
  inventory().core("core0");

  collect();

  Lines calls = inventory().calls();
  std::erase(calls, "operator bool()");
  const Lines expected = {"Instrumentation()",    "selectNode(42)",
                          "getPathToNode()",      "convertPathToString(" + internalPath("core0") + ")",
                          "getNodeDescription()", "getNodeStatus()",
                          "operator++()"};
  EXPECT_EQ(calls, expected);
}

TEST_F(CoreCollection, EmptyTextsAreReportedAndTheRecordIsKept) {
  inventory().core("").description("");

  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(cores_.size(), 1U);
  EXPECT_EQ(cores_[0].getRequestedState(), 12);
  EXPECT_EQ(Scripted::takeEventsWithoutLines(),
            framed({"Failed while setting Instance Id", "Failed while setting Processor Core Element Name"}));
}

TEST_F(CoreCollection, SkipsNoNode) {
  inventory().core("unknown").status(0).core("empty").status(15);

  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(cores_.size(), 2U);
  EXPECT_EQ(cores_[0].getInstanceID(), "unknown");
  EXPECT_EQ(cores_[1].getInstanceID(), "empty");
}

TEST_F(CoreCollection, StatusZeroGivesTheRequestedStateOnly) {
  inventory().core("core0").status(0);

  collect();

  ASSERT_EQ(cores_.size(), 1U);
  EXPECT_EQ(cores_[0].getRequestedState(), 12);
  EXPECT_EQ(cores_[0].getOperationalStatus(), std::vector<unsigned short>{0});
  EXPECT_EQ(cores_[0].getHealthState(), 0);
  EXPECT_EQ(cores_[0].getHealthString(), "Unknown");
}

TEST_F(CoreCollection, ATreeWithoutCoresFails) {
  EXPECT_EQ(collect(), 1);

  EXPECT_TRUE(cores_.empty());
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), framed({}));
}

TEST_F(CoreCollection, AppendsInTheOrderOfTheTreeToWhatIsThere) {
  inventory().core("b").core("a");

  EXPECT_EQ(collect(), 0);
  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(cores_.size(), 4U);
  EXPECT_EQ(cores_[0].getInstanceID(), "b");
  EXPECT_EQ(cores_[1].getInstanceID(), "a");
  EXPECT_EQ(cores_[2].getInstanceID(), "b");
  EXPECT_EQ(cores_[3].getInstanceID(), "a");
}
