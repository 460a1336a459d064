#ifndef TESTS_SEAM_SCRIPTEDTEST_H
#define TESTS_SEAM_SCRIPTEDTEST_H

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/seam/Comparisons.h"
#include "tests/seam/Events.h"
#include "tests/seam/Inventory.h"
#include "tests/seam/Texts.h"

namespace Scripted {

/// Starts with an empty inventory that nobody asked and an empty event record, and checks at the end
/// that no cursor was left behind.
class ScriptedTest : public ::testing::Test {
 protected:
  ScriptedTest() {
    inventory().reset();
    texts() = Texts();
    takeMessages();
    takeComparisons();
  }
  ~ScriptedTest() override { EXPECT_EQ(inventory().livingCursors(), 0); }
};

/// The events that `function` reported, without those of what it called.
inline std::vector<std::string> takeEventsOf(const std::string& function) {
  std::vector<std::string> lines;
  for (const Event& event : takeEvents()) {
    if (event.function == function) {
      lines.push_back(event.withoutLine());
    }
  }
  return lines;
}

using Lines = std::vector<std::string>;

}  // namespace Scripted

#endif
