#include <Trace.h>

#include <string>
#include <vector>

#include "tests/seam/ScriptedTest.h"

using Scripted::Event;
using Scripted::Message;
using Scripted::Sink;

namespace {

class TraceEvents : public Scripted::ScriptedTest {
 protected:
  const std::string component_ = "Corvane.Test";
  const std::string banner_ = std::string(78, '=');
};

}  // namespace

TEST_F(TraceEvents, AnEventReachesTheLogSinkAndThenTheTraceSink) {
  Tarn::logEvent(component_, 4000, {"getThing", "Thing.cpp", 12},
                 [] { return Tarn::trace("remark", "Thing.cpp", 12, Tarn::MESSAGE); });

  const std::vector<Message> messages = Scripted::takeMessages();

  ASSERT_EQ(messages.size(), 2U);
  EXPECT_EQ(messages[0].sink, Sink::Log);
  EXPECT_EQ(messages[1].sink, Sink::Trace);
  for (const Message& message : messages) {
    EXPECT_EQ(message.function, "getThing");
    EXPECT_EQ(message.file, "Thing.cpp");
    EXPECT_EQ(message.line, 12);
    EXPECT_EQ(message.component, component_);
    EXPECT_EQ(message.level, 4000);
    EXPECT_EQ(message.extra, nullptr);
    EXPECT_EQ(message.extraLength, 0);
    EXPECT_EQ(message.reserved, 0);
    EXPECT_EQ(message.text, "MESSAGE [File: Thing.cpp, Line: 12]: remark");
  }
}

TEST_F(TraceEvents, TheTextIsFormattedOnceForEachSink) {
  int formatted = 0;
  Tarn::logEvent(component_, 4000, {"getThing", "Thing.cpp", 12}, [&] {
    ++formatted;
    return Tarn::trace(formatted == 1 ? "for the log" : "for the trace", "Thing.cpp", 12, Tarn::MESSAGE);
  });

  const std::vector<Message> messages = Scripted::takeMessages();

  EXPECT_EQ(formatted, 2);
  ASSERT_EQ(messages.size(), 2U);
  EXPECT_EQ(messages[0].text, "MESSAGE [File: Thing.cpp, Line: 12]: for the log");
  EXPECT_EQ(messages[1].text, "MESSAGE [File: Thing.cpp, Line: 12]: for the trace");
}

TEST_F(TraceEvents, ProviderEntryIsABannerAndTheEntry) {
  Tarn::markProviderEntry(component_, "CPUThing_GetInstance", "CPUThingProvider.cpp", 77);

  const std::vector<Event> expected = {
      {"markProviderEntry", "include/Trace.h", 336, component_, 4000, banner_},
      {"markProviderEntry", "include/Trace.h", 337, component_, 4000,
       "ENTERING: CPUThing_GetInstance() in CPUThingProvider.cpp [Line: 77]"},
  };
  EXPECT_EQ(Scripted::takeEvents(), expected);
}

TEST_F(TraceEvents, ProviderExitIsTheExitAndABanner) {
  Tarn::markProviderExit(component_, "CPUThing_GetInstance", "CPUThingProvider.cpp", 99);

  const std::vector<Event> expected = {
      {"markProviderExit", "include/Trace.h", 348, component_, 4000,
       "EXITING: CPUThing_GetInstance() in CPUThingProvider.cpp [Line: 99]"},
      {"markProviderExit", "include/Trace.h", 349, component_, 4000, banner_},
  };
  EXPECT_EQ(Scripted::takeEvents(), expected);
}

TEST_F(TraceEvents, LevelsHaveTheirNumbers) {
  EXPECT_EQ(Tarn::LevelDetail, 3000);
  EXPECT_EQ(Tarn::LevelInfo, 4000);
  EXPECT_EQ(Tarn::LevelWarning, 5000);
  EXPECT_EQ(Tarn::LevelError, 6000);
}

TEST_F(TraceEvents, ParameterListsStandTheSameAtBothSinks) {
  const Tarn::EventLog log{component_, "Thing.cpp", 3000};
  const int thing = 0;
  log.entering({{" isProc=", true}, {" isMem=", false}, {" thing=", &thing}, {" text=", "cpu0"}}, 54, "getThing");

  const std::vector<Event> expected = {
      {"getThing", "Thing.cpp", 54, component_, 3000,
       "ENTERING: getThing() in Thing.cpp [Line: 54],Parameters List:  isProc=1 isMem=0 thing=" +
           Scripted::address(&thing) + " text=cpu0"},
  };
  EXPECT_EQ(Scripted::takeEvents(), expected);
}

TEST_F(TraceEvents, NullInAParameterListPrintsNothingOrZeroAndSpoilsNothing) {
  const Tarn::EventLog log{component_, "Thing.cpp", 3000};
  const int* noThing = nullptr;
  const char* noText = nullptr;
  log.exiting({{" text=", noText}, {" thing=", noThing}, {" isMem=", true}}, 84, "getThing");

  const std::vector<Event> expected = {
      {"getThing", "Thing.cpp", 84, component_, 3000,
       "EXITING: getThing() in Thing.cpp [Line: 84],Parameters List:  text= thing=0 isMem=1"},
  };
  EXPECT_EQ(Scripted::takeEvents(), expected);
}
