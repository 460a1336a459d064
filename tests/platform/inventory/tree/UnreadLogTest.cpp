#include "platform/inventory/tree/UnreadLog.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

TEST(UnreadLog, JoinsTheCpusThatFailInTheSameWay) {
  UnreadLog log;
  log.addForCpu("/cpu", 3, "/topology", "denied", "root");
  log.add("/proc/cpuinfo", "denied", "root");
  log.addForCpu("/cpu", 1, "/topology", "denied", "root");
  log.addForCpu("/cpu", 2, "/topology", "denied", "root");
  log.addForCpu("/cpu", 4, "/topology", "not there", "root");
  log.addForCpu("/cpu", 1, "/cache", "denied", "root");
  log.addForCpu("/cpu", 2, "/cache", "denied", "else");

  EXPECT_EQ(log.entries(), (std::vector<Unread>{{"/cpu{1-3}/topology", "denied", "root"},
                                                {"/proc/cpuinfo", "denied", "root"},
                                                {"/cpu4/topology", "not there", "root"},
                                                {"/cpu1/cache", "denied", "root"},
                                                {"/cpu2/cache", "denied", "else"}}));
}

TEST(UnreadLog, IsEmptyWhereAllWasRead) {
  EXPECT_TRUE(UnreadLog().entries().empty());
}

}  // namespace
}  // namespace Tarn::Inventory
