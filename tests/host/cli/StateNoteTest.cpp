#include "host/cli/StateNote.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace Corvcim {
namespace {

TEST(StateNote, NamesWhatIsNotInUse) {
  EXPECT_EQ(stateNote(1), "");
  EXPECT_EQ(stateNote(12), "offline");
  EXPECT_EQ(stateNote(15), "empty socket");
  EXPECT_EQ(stateNote(16), "disabled");
  EXPECT_EQ(stateNote(24), "failed");
  EXPECT_EQ(stateNote(20), "status 20");
}

}  // namespace
}  // namespace Corvcim
