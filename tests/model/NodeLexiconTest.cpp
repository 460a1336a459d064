#include <gtest/gtest.h>
#include <tarn/NodeLexicon.h>

#include <type_traits>

// Only these numbers cross the inventory interface.

namespace Tarn::NodeLexicon {

static_assert(NodeSystem == 1);
static_assert(NodeProcessor == 4);
static_assert(NodeCacheMemory == 31);
static_assert(NodeProcessorCore == 42);
static_assert(PropCacheAssociativity == 5);
static_assert(PropCacheType == 9);
static_assert(PropDataWidth == 15);
static_assert(PropExternalClockSpeed == 19);
static_assert(PropCacheLevel == 30);
static_assert(PropMaxClockSpeed == 38);
static_assert(PropSystemModel == 39);
static_assert(PropCacheName == 53);
static_assert(PropAddressWidth == 66);
static_assert(PropCacheBlockSize == 69);
static_assert(PropCacheWritePolicy == 72);
static_assert(PropCacheConsumableBlocks == 73);
static_assert(PropCurrentClockSpeed == 80);
static_assert(PropHardwareThreads == 87);
static_assert(PropProcessorId == 89);
static_assert(PropCacheNumberOfBlocks == 112);
static_assert(PropStepping == 124);
static_assert(PropRequestedStatesSupported == 125);
static_assert(PropEnabledCores == 189);
static_assert(PropProcessorCores == 190);
static_assert(PropFamily == 298);
static_assert(PropUpgradeMethod == 304);
static_assert(PropProcessorName == 307);
static_assert(PathSelf == 0);
static_assert(PathChildren == 1);

}  // namespace Tarn::NodeLexicon

TEST(NodeLexicon, EnumeratorsConvertToTheirNumbers) {
  EXPECT_TRUE((std::is_convertible_v<Tarn::NodeLexicon::NodeType, int>));
  EXPECT_TRUE((std::is_convertible_v<Tarn::NodeLexicon::Properties, int>));
  EXPECT_TRUE((std::is_convertible_v<Tarn::NodeLexicon::PathType, int>));
}
