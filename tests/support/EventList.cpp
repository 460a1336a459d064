#include "tests/support/EventList.h"

#include <gtest/gtest.h>

#include <regex>

namespace Support {

namespace {

constexpr int infoLevel = 4000;
constexpr int errorLevel = 6000;
const std::string traceHeader = "include/Trace.h";

std::string lineText(std::optional<int> line) {
  return line ? std::to_string(*line) : "#";
}

// The operation's own line, which the frame's events name in their texts only.
std::string withoutOperationLine(const std::string& text) {
  static const std::regex line("\\[Line: [0-9]+\\]$");
  return std::regex_replace(text, line, "[Line: #]");
}

std::string shownEvent(const std::string& component, int level, const std::string& function, const std::string& file,
                       const std::string& line, const std::string& text) {
  return std::to_string(level) + ' ' + component + ' ' + function + ' ' + file + ':' + line + " |" + text + '|';
}

std::string replaceOwnLine(const Scripted::Event& event) {
  const std::string number = std::to_string(event.line);
  std::string text = event.text;
  for (const auto& [shown, hidden] :
       {std::pair("[Line: " + number + "]", "[Line: #]"), std::pair(", Line: " + number + "]", ", Line: #]"),
        std::pair("' at line " + number + " in ", "' at line # in ")}) {
    if (const std::size_t place = text.find(shown); place != std::string::npos) {
      text.replace(place, shown.size(), hidden);
    }
  }
  return text;
}

}  // namespace

EventList::EventList(const ProviderFunctions& provider, const std::string& operation)
    : component_(provider.component), file_(provider.file), function_(provider.prefix + "_" + operation) {}

EventList& EventList::in(const std::string& function) {
  function_ = function;
  return *this;
}

EventList& EventList::frame(const std::string& mark, int line, const std::string& text) {
  expected_.push_back({mark, traceHeader, line, infoLevel, text, true});
  return *this;
}

EventList& EventList::entering() {
  const std::string text = "ENTERING: " + function_ + "() in " + file_ + " [Line: #]";
  return frame("markProviderEntry", 336, std::string(78, '=')).frame("markProviderEntry", 337, text);
}

EventList& EventList::exiting(std::optional<int> line) {
  const std::string text = "EXITING: " + function_ + "() in " + file_ + " [Line: " + lineText(line) + "]";
  return frame("markProviderExit", 348, text).frame("markProviderExit", 349, std::string(78, '='));
}

EventList& EventList::own(int level, const std::string& text, std::optional<int> line) {
  expected_.push_back({function_, file_, line, level, text, false});
  return *this;
}

EventList& EventList::error(const std::string& text, std::optional<int> line) {
  return own(errorLevel, "MESSAGE [File: " + file_ + ", Line: " + lineText(line) + "]: " + text, line);
}

EventList& EventList::variable(const std::string& name, const std::string& value, std::optional<int> line) {
  return own(infoLevel, "VARIABLE: '" + name + "' has Value '" + value + "' at line " + lineText(line) + " in " + file_,
             line);
}

std::string EventList::shown(const Expected& event) const {
  return shownEvent(component_, event.level, event.function, event.file, lineText(event.line), event.text);
}

std::vector<std::string> EventList::lines() const {
  std::vector<std::string> result;
  for (const Expected& event : expected_) {
    result.push_back(shown(event));
  }
  return result;
}

std::vector<std::string> EventList::linesOf(const std::vector<Scripted::Event>& events) const {
  std::vector<std::string> result;
  for (std::size_t i = 0; i < events.size(); ++i) {
    const Scripted::Event& event = events[i];
    const Expected* expected = i < expected_.size() ? &expected_[i] : nullptr;
    std::string line = std::to_string(event.line);
    std::string text = event.text;
    if (expected != nullptr && expected->framesOperation && expected->text.find("[Line: #]") != std::string::npos) {
      text = withoutOperationLine(text);
    } else if (expected != nullptr && !expected->line) {
      text = replaceOwnLine(event);
      line = "#";
    }
    result.push_back(shownEvent(event.component, event.level, event.function, event.file, line, text));
  }
  return result;
}

std::vector<Scripted::Event> takeEventsOf(const ProviderFunctions& provider) {
  std::vector<Scripted::Event> own;
  for (Scripted::Event& event : Scripted::takeEvents()) {
    if (event.component == provider.component) {
      own.push_back(std::move(event));
    } else {
      EXPECT_EQ(event.component, "Corvane.CPUProvider") << event;
    }
  }
  return own;
}

void expectEvents(const ProviderFunctions& provider, const EventList& expected) {
  EXPECT_EQ(expected.linesOf(takeEventsOf(provider)), expected.lines());
}

}  // namespace Support
