#include "host/corvcim/text/StateNote.h"

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
  EXPECT_EQ(stateNote(20), "predictive failure");
  EXPECT_EQ(stateNote(99), "status 99");
}

TEST(StateNote, EachStateHasASeverity) {
  for (const unsigned int status : {1U, 8U, 15U}) {
    EXPECT_EQ(severityOf(status), Severity::Fine) << status;
  }
  for (const unsigned int status : {2U, 3U, 10U, 12U, 16U, 20U, 21U}) {
    EXPECT_EQ(severityOf(status), Severity::Degraded) << status;
  }
  for (const unsigned int status : {0U, 13U, 17U, 99U}) {
    EXPECT_EQ(severityOf(status), Severity::Unknown) << status;
  }
  EXPECT_EQ(severityOf(24), Severity::Failed);
}

}  // namespace
}  // namespace Corvcim
