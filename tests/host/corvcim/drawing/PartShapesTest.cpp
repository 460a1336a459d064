#include "host/corvcim/drawing/PartShapes.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <vector>

#include "tests/host/corvcim/Machines.h"

namespace Corvcim {
namespace {

using testing::ElementsAre;
using testing::SizeIs;

TEST(PartShapes, NeighboursOfOneShapeFormARun) {
  const Machine machine = readMachine(Testing::smallBoard(), "x");
  const MachinePart& shared = machine.processors.at(0).parts.at(0);

  std::vector<std::size_t> lengths;
  for (const PartRun run : runsOfShape(shared.parts)) {
    lengths.push_back(run.size());
  }

  EXPECT_THAT(lengths, ElementsAre(3, 1));
  EXPECT_THAT(runsOfShape(shared.parts, States::Ignored), SizeIs(1));
}

}  // namespace
}  // namespace Corvcim
