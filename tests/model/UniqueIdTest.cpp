#include <CPU.h>

#include <string>

#include "tests/model/ModelEvents.h"
#include "tests/seam/ScriptedTest.h"

using Tarn::CPUProvider::FormatUniqueId;

namespace {

using UniqueId = Scripted::ScriptedTest;

struct IdCase {
  const char* raw;
  const char* formatted;
};

constexpr IdCase ids[] = {
    {"ab 12-cd", "AB12-CD"},
    {" 0f a9 ", "0FA9"},
    {"   ", ""},
    {"BFEBFBFF000906EA", "BFEBFBFF000906EA"},
    {"a\tb\nc\v", "A\tB\nC\v"},
    {"`{az@[", "`{AZ@["},
    {"\xe4\xc3\xa4\xff", "\xe4\xc3\xa4\xff"},
};

}  // namespace

TEST_F(UniqueId, LosesItsBlanksAndItsSmallLetters) {
  for (const IdCase& id : ids) {
    std::string raw = id.raw;
    std::string formatted;
    FormatUniqueId(raw, formatted);
    EXPECT_EQ(formatted, id.formatted) << id.raw;
    EXPECT_EQ(raw, id.raw);
  }
}

TEST_F(UniqueId, KeepsZeroBytes) {
  std::string raw("a\0 b", 4);
  std::string formatted;
  FormatUniqueId(raw, formatted);
  EXPECT_EQ(formatted, std::string("A\0B", 3));
}

TEST_F(UniqueId, IsAppended) {
  std::string raw = "b c";
  std::string formatted = "a ";
  FormatUniqueId(raw, formatted);
  EXPECT_EQ(formatted, "a BC");
}

TEST_F(UniqueId, OfNothingAppendsNothing) {
  std::string raw;
  std::string formatted = "as it was";
  FormatUniqueId(raw, formatted);
  EXPECT_EQ(formatted, "as it was");
}

TEST_F(UniqueId, FormattingIsReported) {
  std::string raw = "a";
  std::string formatted;

  FormatUniqueId(raw, formatted);

  const Scripted::Lines expected = {model.entering(detail, "FormatUniqueId"), model.exiting(detail, "FormatUniqueId")};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
}
