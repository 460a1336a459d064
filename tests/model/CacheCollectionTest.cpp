#include <CPU.h>

#include <string>
#include <vector>

#include "tests/model/ModelEvents.h"
#include "tests/seam/ScriptedTest.h"

using namespace Tarn::NodeLexicon;
using Scripted::internalPath;
using Scripted::inventory;
using Scripted::Lines;
using Tarn::CPUProvider::getMemoryInstances;
using Tarn::CPUProvider::Memory;

namespace {

class CacheCollection : public Scripted::ScriptedTest {
 protected:
  CacheCollection() { inventory().system("Virtual Model").processor("cpu0"); }

  unsigned short collect() { return getMemoryInstances(memories_); }

  Lines framed(const Lines& texts) const {
    const std::string function = "getMemoryInstances";
    const std::string parameters = " memories=" + Scripted::address(&memories_);
    Lines lines = {model.entering(detail, function, parameters)};
    for (const std::string& text : texts) {
      lines.push_back(model.message(remark, function, text));
    }
    lines.push_back(model.exiting(detail, function, parameters));
    return lines;
  }

  std::vector<Memory> memories_;
};

}  // namespace

TEST_F(CacheCollection, FillsEveryField) {
  inventory().fullCache("cache0").description(" L1 of cpu0 ");

  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(memories_.size(), 1U);
  const Memory& memory = memories_.front();
  EXPECT_EQ(memory.getMemoryDeviceID(), "cache0");
  EXPECT_EQ(memory.getElementName(), "L1 of cpu0");
  EXPECT_EQ(memory.getCacheName(), "L1 Data Cache");
  EXPECT_EQ(memory.getBlockSize(), 64U);
  EXPECT_EQ(memory.getConsumableBlocks(), 500U);
  EXPECT_EQ(memory.getNumberOfBlocks(), 512U);
  EXPECT_EQ(memory.getEnabledState(), 2);
  EXPECT_EQ(memory.getOperationalStatus(), std::vector<unsigned short>{2});
  EXPECT_EQ(memory.getHealthState(), 5);
  EXPECT_EQ(memory.getHealthString(), "OK");
  EXPECT_EQ(memory.getRequestedState(), 12);
  EXPECT_EQ(memory.getCacheAssociativity(), 6);
  EXPECT_EQ(memory.getCacheType(), 3);
  EXPECT_EQ(memory.getCacheWritePolicy(), 2);
  EXPECT_EQ(memory.getCacheLevel(), 3);
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), framed({}));
}

TEST_F(CacheCollection, AsksTheInventoryStepByStep) {
  inventory().fullCache("cache0");

  collect();

  Lines calls = inventory().calls();
  std::erase(calls, "operator bool()");
  const Lines expected = {"Instrumentation()",    "selectNode(31)",
                          "getPathToNode()",      "convertPathToString(" + internalPath("cache0") + ")",
                          "getProperty(69)",      "getProperty(73)",
                          "getProperty(112)",     "getNodeStatus()",
                          "getNodeDescription()", "getProperty(5)",
                          "getProperty(9)",       "getProperty(72)",
                          "getProperty(30)",      "getProperty(53)",
                          "operator++()"};
  EXPECT_EQ(calls, expected);
}

TEST_F(CacheCollection, MissingPropertiesAreNotMissed) {
  inventory().cache("cache0");

  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(memories_.size(), 1U);
  EXPECT_EQ(memories_[0].getBlockSize(), 0U);
  EXPECT_EQ(memories_[0].getConsumableBlocks(), 0U);
  EXPECT_EQ(memories_[0].getNumberOfBlocks(), 0U);
  EXPECT_EQ(memories_[0].getCacheLevel(), 0);
  EXPECT_EQ(memories_[0].getCacheName(), "");
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), framed({}));
}

TEST_F(CacheCollection, EmptyTextsAndLevelZeroAreReportedAndTheRecordIsKept) {
  inventory().fullCache("").description("").has(PropCacheLevel, 0U).has(PropCacheName, "");

  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(memories_.size(), 1U);
  EXPECT_EQ(memories_[0].getCacheLevel(), 0);
  EXPECT_EQ(memories_[0].getBlockSize(), 64U);
  EXPECT_EQ(Scripted::takeEventsWithoutLines(),
            framed({"Failed while setting Memory Device ID", "Failed while setting Cache Element Name",
                    "Failed while setting Cache Level"}));
}

TEST_F(CacheCollection, SkipsNoNode) {
  inventory().fullCache("unknown").status(0).fullCache("empty").status(15).fullCache("off").status(16);

  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(memories_.size(), 3U);
  EXPECT_EQ(memories_[0].getMemoryDeviceID(), "unknown");
  EXPECT_EQ(memories_[1].getMemoryDeviceID(), "empty");
  EXPECT_EQ(memories_[1].getEnabledState(), 5);
  EXPECT_EQ(memories_[2].getMemoryDeviceID(), "off");
  EXPECT_EQ(memories_[2].getEnabledState(), 3);
}

TEST_F(CacheCollection, StatusZeroGivesTheRequestedStateOnly) {
  inventory().fullCache("cache0").status(0);

  collect();

  ASSERT_EQ(memories_.size(), 1U);
  EXPECT_EQ(memories_[0].getRequestedState(), 12);
  EXPECT_EQ(memories_[0].getEnabledState(), 0);
  EXPECT_EQ(memories_[0].getOperationalStatus(), std::vector<unsigned short>{0});
  EXPECT_EQ(memories_[0].getHealthState(), 0);
  EXPECT_EQ(memories_[0].getHealthString(), "Unknown");
  EXPECT_EQ(memories_[0].getCacheType(), 3);
}

TEST_F(CacheCollection, ATreeWithoutCachesFails) {
  EXPECT_EQ(collect(), 1);

  EXPECT_TRUE(memories_.empty());
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), framed({}));
}

TEST_F(CacheCollection, AppendsInTheOrderOfTheTreeToWhatIsThere) {
  inventory().cache("b").cache("a");

  EXPECT_EQ(collect(), 0);
  EXPECT_EQ(collect(), 0);

  ASSERT_EQ(memories_.size(), 4U);
  EXPECT_EQ(memories_[0].getMemoryDeviceID(), "b");
  EXPECT_EQ(memories_[1].getMemoryDeviceID(), "a");
  EXPECT_EQ(memories_[2].getMemoryDeviceID(), "b");
  EXPECT_EQ(memories_[3].getMemoryDeviceID(), "a");
}
