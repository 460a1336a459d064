#include <Trace.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <limits>
#include <set>
#include <string>

#include "tests/model/TraceFromElsewhere.h"

namespace {

constexpr std::size_t bufferSize = 512;

struct FormCase {
  Tarn::MessageType type;
  const char* text;
};

constexpr auto outOfRange = static_cast<Tarn::MessageType>(4);
constexpr auto negative = static_cast<Tarn::MessageType>(-1);

constexpr FormCase forms[] = {
    {Tarn::ENTERING, "ENTERING: getThing() in Thing.cpp [Line: 42]"},
    {Tarn::EXITING, "EXITING: getThing() in Thing.cpp [Line: 42]"},
    {Tarn::METHOD, "METHOD: getThing() was invoked in Thing.cpp [Line: 42]"},
    {Tarn::MESSAGE, "MESSAGE [File: Thing.cpp, Line: 42]: getThing"},
    {outOfRange, "ENTERING: getThing() in Thing.cpp [Line: 42]"},
    {negative, "ENTERING: getThing() in Thing.cpp [Line: 42]"},
};

/// Whether everything behind the text is zero.
bool isZeroBehindText(const char* buffer) {
  const std::size_t length = std::char_traits<char>::length(buffer);
  return std::all_of(buffer + length, buffer + bufferSize, [](char byte) { return byte == 0; });
}

}  // namespace

TEST(Trace, MessageTypesHaveTheirNumbers) {
  EXPECT_EQ(Tarn::ENTERING, 0);
  EXPECT_EQ(Tarn::EXITING, 1);
  EXPECT_EQ(Tarn::METHOD, 2);
  EXPECT_EQ(Tarn::MESSAGE, 3);
}

TEST(Trace, EachTypeHasItsForm) {
  for (const FormCase& form : forms) {
    EXPECT_STREQ(Tarn::trace("getThing", "Thing.cpp", 42, form.type), form.text) << form.type;
  }
}

TEST(Trace, EachFormTakesAParameterList) {
  for (const FormCase& form : forms) {
    EXPECT_EQ(std::string(Tarn::tracepara("getThing", "Thing.cpp", 42, " isProc=1 ref=0x10", form.type)),
              std::string(form.text) + ",Parameters List:  isProc=1 ref=0x10")
        << form.type;
  }
}

TEST(Trace, MessageFormPutsTheTextLast) {
  EXPECT_STREQ(Tarn::trace("Processor map empty", "CPUObjFactory.cpp", 2044, Tarn::MESSAGE),
               "MESSAGE [File: CPUObjFactory.cpp, Line: 2044]: Processor map empty");
}

TEST(Trace, VariableWithText) {
  EXPECT_STREQ(Tarn::trace("deviceID", "Thing.cpp", 7, "cpu0"),
               "VARIABLE: 'deviceID' has Value 'cpu0' at line 7 in Thing.cpp");
}

TEST(Trace, VariableWithNumber) {
  EXPECT_STREQ(Tarn::trace("numInstances", "Thing.cpp", 7, 0U),
               "VARIABLE: 'numInstances' has Value '0' at line 7 in Thing.cpp");
  EXPECT_STREQ(Tarn::trace("numInstances", "Thing.cpp", 7, 2147483647U),
               "VARIABLE: 'numInstances' has Value '2147483647' at line 7 in Thing.cpp");
}

TEST(Trace, NumbersPrintAsSigned) {
  EXPECT_STREQ(Tarn::trace("n", "Thing.cpp", 7, std::numeric_limits<unsigned int>::max()),
               "VARIABLE: 'n' has Value '-1' at line 7 in Thing.cpp");
  EXPECT_STREQ(Tarn::trace("n", "Thing.cpp", 7, 2147483648U),
               "VARIABLE: 'n' has Value '-2147483648' at line 7 in Thing.cpp");
}

TEST(Trace, NullTextOfAVariableShows) {
  EXPECT_STREQ(Tarn::trace("key", "Thing.cpp", 7, static_cast<const char*>(nullptr)),
               "VARIABLE: 'key' has Value '(null)' at line 7 in Thing.cpp");
}

TEST(Trace, TextsUpTo511CharactersStayWhole) {
  const std::string head = "MESSAGE [File: T.cpp, Line: 1]: ";
  const std::string text(511 - head.size(), 'x');
  EXPECT_EQ(std::string(Tarn::trace(text.c_str(), "T.cpp", 1, Tarn::MESSAGE)), head + text);
}

TEST(Trace, LongerTextsAreCutAt511Characters) {
  const std::string longText(600, 'x');
  const std::string entering = "ENTERING: " + longText;
  EXPECT_EQ(std::string(Tarn::trace(longText.c_str(), "T.cpp", 1, Tarn::ENTERING)), entering.substr(0, 511));
  EXPECT_EQ(std::string(Tarn::tracepara("f", "T.cpp", 1, longText.c_str(), Tarn::ENTERING)),
            ("ENTERING: f() in T.cpp [Line: 1],Parameters List: " + longText).substr(0, 511));
  EXPECT_EQ(std::string(Tarn::trace("v", "T.cpp", 1, longText.c_str())),
            ("VARIABLE: 'v' has Value '" + longText).substr(0, 511));
  EXPECT_EQ(std::string(Tarn::trace(longText.c_str(), "T.cpp", 1, 5U)), ("VARIABLE: '" + longText).substr(0, 511));
  EXPECT_EQ(std::string(Tarn::trace("v", longText.c_str(), 1, 5U)),
            ("VARIABLE: 'v' has Value '5' at line 1 in " + longText).substr(0, 511));
}

TEST(Trace, AShorterTextLeavesNothingOfALongerOne) {
  const std::string longText(600, 'x');
  Tarn::trace(longText.c_str(), "T.cpp", 1, Tarn::MESSAGE);
  EXPECT_TRUE(isZeroBehindText(Tarn::trace("a", "T.cpp", 1, Tarn::MESSAGE)));
  Tarn::tracepara("f", "T.cpp", 1, longText.c_str(), Tarn::MESSAGE);
  EXPECT_TRUE(isZeroBehindText(Tarn::tracepara("f", "T.cpp", 1, "", Tarn::MESSAGE)));
  Tarn::trace("v", "T.cpp", 1, longText.c_str());
  EXPECT_TRUE(isZeroBehindText(Tarn::trace("v", "T.cpp", 1, "")));
  Tarn::trace(longText.c_str(), "T.cpp", 1, 1U);
  EXPECT_TRUE(isZeroBehindText(Tarn::trace("v", "T.cpp", 1, 1U)));
}

TEST(Trace, EachHelperHasOneBufferOfItsOwn) {
  const std::set<const char*> buffers = {Tarn::trace("a", "T.cpp", 1, Tarn::MESSAGE),
                                         Tarn::tracepara("a", "T.cpp", 1, "", Tarn::MESSAGE),
                                         Tarn::trace("a", "T.cpp", 1, "text"), Tarn::trace("a", "T.cpp", 1, 1U)};
  EXPECT_EQ(buffers.size(), 4U);
}

TEST(Trace, CallsOfOneHelperShareItsBuffer) {
  const char* first = Tarn::trace("first", "T.cpp", 1, Tarn::MESSAGE);
  EXPECT_EQ(Tarn::trace("second", "T.cpp", 2, Tarn::EXITING), first);
  EXPECT_STREQ(first, "EXITING: second() in T.cpp [Line: 2]");
}

TEST(Trace, SourceFilesShareTheBuffers) {
  EXPECT_EQ(traceFromElsewhere("f"), Tarn::trace("f", "T.cpp", 1, Tarn::MESSAGE));
  EXPECT_EQ(traceparaFromElsewhere("f"), Tarn::tracepara("f", "T.cpp", 1, "", Tarn::MESSAGE));
  EXPECT_EQ(traceTextFromElsewhere("v"), Tarn::trace("v", "T.cpp", 1, "text"));
  EXPECT_EQ(traceNumberFromElsewhere(1), Tarn::trace("v", "T.cpp", 1, 1U));
}
