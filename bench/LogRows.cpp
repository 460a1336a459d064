// The price of the log events that no destination wants, against formatting the same text with snprintf.

#include <Trace.h>

#include "bench/LogFloors.h"
#include "bench/Rows.h"

namespace Corvane::Bench {
namespace {

const std::string component = "Corvane.CPUProvider";
constexpr const char* file = "CPUObjFactory.cpp";
constexpr const char* function = "makeCPUProcInstance";
constexpr unsigned int line = 214;

constexpr Tarn::EventLog events{component, file, Tarn::LevelDetail};

void addPlainEvents() {
  constexpr double limit = 0.8;

  addRow(
      {"log event, entry of a function", limit}, [] { events.entering(line, function); },
      [] { formatTwice("ENTERING: %s() in %s [Line: %d]", function, file, line); });
  addRow(
      {"log event, message", limit}, [] { events.message(Tarn::LevelInfo, "Target Class is cpuProcessorClass", line); },
      [] { formatTwice("MESSAGE [File: %s, Line: %d]: %s", file, line, "Target Class is cpuProcessorClass"); });
  addRow(
      {"log event, variable", limit}, [] { events.variable("numObjPaths", 64U, line); },
      [] { formatTwice("VARIABLE: '%s' has Value '%d' at line %d in %s", "numObjPaths", 64U, line, file); });
}

void addParameterListEvent() {
  static const int object = 0;
  const void* const broker = &object;
  const void* const properties = nullptr;

  addRow(
      {"log event, entry with six parameters"},
      [=] {
        events.entering({{" broker=", broker},
                         {" ref=", broker},
                         {" proc=", broker},
                         {" properties=", properties},
                         {" isObjPath=", true},
                         {" rc=", broker}},
                        line, function);
      },
      [=] { formatEntryTwice(function, file, line, broker); });
}

}  // namespace

void addLogRows() {
  addPlainEvents();
  addParameterListEvent();
}

}  // namespace Corvane::Bench
