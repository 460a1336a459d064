#include "host/corvcim/drawing/PartLabels.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <vector>

#include "tests/host/corvcim/Machines.h"

namespace Corvcim {
namespace {

TEST(PartLabels, EqualCachesAreCounted) {
  const CacheUnit first = {"L2", 1U << 20U, 1};
  const CacheUnit off = {"L2", 1U << 20U, 16};

  EXPECT_EQ(labelsOf(std::vector<CacheUnit>{first, first, off}), "2 × L2 1 MiB, L2 1 MiB (disabled)");
}

TEST(PartLabels, TheSummaryCountsEmptySocketsAndDisabledCoresAsSuch) {
  EXPECT_EQ(summaryOf(readMachine(Testing::smallBoard(), "x")),
            "BoardBox · 1 processor · 1 empty socket · 4 cores, 3 enabled · 4 threads");
}

}  // namespace
}  // namespace Corvcim
