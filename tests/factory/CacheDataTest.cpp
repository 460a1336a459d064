#include "tests/factory/FactoryTest.h"

using namespace FactoryTests;

// What the cache associations say of a cache.

namespace {

class CacheData : public FactoryTest {
 protected:
  unsigned short fetch(const std::string& deviceId) {
    key_ = key(deviceId);
    return factory().getAssocCacheData(broker_, key_, data_, &rc_);
  }

  std::vector<unsigned int> fetched() const {
    return {data_.level, data_.writePolicy, data_.readPolicy, data_.cacheType, data_.associativity};
  }

  std::string parameters() const {
    return " broker=" + Scripted::address(broker_) + " cpuMemDeviceid=" + Scripted::address(key_) +
           " procCache=" + Scripted::address(&data_) + " rc=" + Scripted::address(&rc_);
  }

  CMPIString* key_ = nullptr;
  CPUObjFactory::ProcCacheData data_{91, 92, 93, 94, 95};
};

using Numbers = std::vector<unsigned int>;

}  // namespace

TEST_F(CacheData, IsFiveNumbersOf16BitsInOrder) {
  EXPECT_EQ(sizeof(CPUObjFactory::ProcCacheData), 10U);
  EXPECT_EQ(offsetof(CPUObjFactory::ProcCacheData, level), 0U);
  EXPECT_EQ(offsetof(CPUObjFactory::ProcCacheData, writePolicy), 2U);
  EXPECT_EQ(offsetof(CPUObjFactory::ProcCacheData, readPolicy), 4U);
  EXPECT_EQ(offsetof(CPUObjFactory::ProcCacheData, cacheType), 6U);
  EXPECT_EQ(offsetof(CPUObjFactory::ProcCacheData, associativity), 8U);
}

TEST_F(CacheData, ComesFromTheRecord) {
  place(fullCache("cache0"));
  place(fullCache("cache1"));
  CPUObjFactory::_cpuMemoryMap["cache1"].setCacheLevel(65535);

  EXPECT_EQ(fetch("cache0"), 0);
  EXPECT_EQ(fetched(), (Numbers{4, 2, 0, 3, 6}));
  EXPECT_EQ(fetch("cache1"), 0);
  EXPECT_EQ(fetched(), (Numbers{65535, 2, 0, 3, 6}));
}

TEST_F(CacheData, BlanksAroundTheIdentifierDoNotCount) {
  place(fullCache("cache0"));

  EXPECT_EQ(fetch("  cache0 "), 0);

  EXPECT_EQ(fetched(), (Numbers{4, 2, 0, 3, 6}));
}

TEST_F(CacheData, IsReported) {
  place(fullCache("cache0"));

  fetch(" cache0");

  const Lines expected = {events.entering(detail, "getAssocCacheData", parameters()),
                          events.variable(detail, "getAssocCacheData", "deviceId", " cache0"),
                          events.exiting(detail, "getAssocCacheData", parameters())};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
}

TEST_F(CacheData, OfAnUnknownCacheIsLeftAsItWas) {
  place(fullCache("cache0"));
  for (const char* deviceId : {"cache1", "CACHE0", "", "cache0\t"}) {
    forgetTraces();

    EXPECT_EQ(fetch(deviceId), 1) << deviceId;

    EXPECT_EQ(fetched(), (Numbers{91, 92, 93, 94, 95})) << deviceId;
    const Lines reported = Scripted::takeEventsWithoutLines();
    ASSERT_GE(reported.size(), 3U);
    EXPECT_EQ(reported[2], events.message(error, "getAssocCacheData", "CPU Memory map is empty")) << deviceId;
  }
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
}

TEST_F(CacheData, WithoutRecordsThereIsNone) {
  EXPECT_EQ(fetch("cache0"), 1);
  EXPECT_EQ(fetched(), (Numbers{91, 92, 93, 94, 95}));
}
