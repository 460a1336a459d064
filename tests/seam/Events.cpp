#include "tests/seam/Events.h"

#include <cvlog/CVLogger.h>

#include <mutex>
#include <ostream>
#include <sstream>
#include <stdexcept>
#include <utility>

namespace Scripted {

namespace {

struct Recorder {
  std::mutex mutex;
  std::vector<Message> messages;
};

Recorder& recorder() {
  static Recorder theRecorder;
  return theRecorder;
}

void record(Message message) {
  const std::lock_guard lock(recorder().mutex);
  recorder().messages.push_back(std::move(message));
}

Event eventOf(const Message& message) {
  return {message.function, message.file, message.line, message.component, message.level, message.text};
}

bool usesReservedArguments(const Message& message) {
  return message.extra != nullptr || message.extraLength != 0 || message.reserved != 0;
}

void replaceFirst(std::string& text, const std::string& what, const std::string& with) {
  if (const std::size_t place = text.find(what); place != std::string::npos) {
    text.replace(place, what.size(), with);
  }
}

std::logic_error badPair(const std::string& reason, const Message& message) {
  std::ostringstream text;
  text << reason << ": " << eventOf(message);
  return std::logic_error(text.str());
}

}  // namespace

std::ostream& operator<<(std::ostream& stream, const Event& event) {
  return stream << event.level << ' ' << event.component << ' ' << event.function << ' ' << event.file << ':'
                << event.line << " |" << event.text << '|';
}

std::string Event::withoutLine() const {
  const std::string number = std::to_string(line);
  Event copy = *this;
  // The forms in which a text names its line; the first two cannot stand in one text.
  replaceFirst(copy.text, "[Line: " + number + "]", "[Line: #]");
  replaceFirst(copy.text, ", Line: " + number + "]", ", Line: #]");
  replaceFirst(copy.text, "' at line " + number + " in ", "' at line # in ");
  std::ostringstream result;
  result << copy.level << ' ' << copy.component << ' ' << copy.function << ' ' << copy.file << " |" << copy.text << '|';
  return result.str();
}

std::vector<Message> takeMessages() {
  const std::lock_guard lock(recorder().mutex);
  return std::exchange(recorder().messages, {});
}

std::vector<Event> takeEvents() {
  const std::vector<Message> messages = takeMessages();
  std::vector<Event> events;
  for (std::size_t i = 0; i < messages.size(); i += 2) {
    if (messages[i].sink != Sink::Log) {
      throw badPair("not at the log sink first", messages[i]);
    }
    if (i + 1 == messages.size() || messages[i + 1].sink != Sink::Trace) {
      throw badPair("not at the trace sink next", messages[i]);
    }
    if (eventOf(messages[i]) != eventOf(messages[i + 1])) {
      throw badPair("not alike at both sinks", messages[i]);
    }
    if (usesReservedArguments(messages[i]) || usesReservedArguments(messages[i + 1])) {
      throw badPair("with arguments that nobody uses", messages[i]);
    }
    events.push_back(eventOf(messages[i]));
  }
  return events;
}

std::vector<std::string> takeEventsWithoutLines() {
  std::vector<std::string> lines;
  for (const Event& event : takeEvents()) {
    lines.push_back(event.withoutLine());
  }
  return lines;
}

std::string EventSource::line(int level, const std::string& function, const std::string& text) const {
  return std::to_string(level) + ' ' + component + ' ' + function + ' ' + file + " |" + text + '|';
}

std::string EventSource::entering(int level, const std::string& function) const {
  return line(level, function, "ENTERING: " + function + "() in " + file + " [Line: #]");
}

std::string EventSource::entering(int level, const std::string& function, const std::string& parameters) const {
  return line(level, function, "ENTERING: " + function + "() in " + file + " [Line: #],Parameters List: " + parameters);
}

std::string EventSource::exiting(int level, const std::string& function) const {
  return line(level, function, "EXITING: " + function + "() in " + file + " [Line: #]");
}

std::string EventSource::exiting(int level, const std::string& function, const std::string& parameters) const {
  return line(level, function, "EXITING: " + function + "() in " + file + " [Line: #],Parameters List: " + parameters);
}

std::string EventSource::message(int level, const std::string& function, const std::string& text) const {
  return line(level, function, "MESSAGE [File: " + file + ", Line: #]: " + text);
}

std::string EventSource::variable(int level, const std::string& function, const std::string& name,
                                  const std::string& value) const {
  return line(level, function, "VARIABLE: '" + name + "' has Value '" + value + "' at line # in " + file);
}

std::string address(const void* pointer) {
  std::ostringstream text;
  text << pointer;
  return text.str();
}

}  // namespace Scripted

namespace CVLog {

void CVLogger::logLevelMessage(const char* function, const char* file, int line, const std::string& component,
                               int level, char* extra, int extraLength, int reserved, const std::string& text) {
  Scripted::record({Scripted::Sink::Log, function, file, line, component, level, extra, extraLength, reserved, text});
}

void CVLogger::traceLevelMessage(const char* function, const char* file, int line, const std::string& component,
                                 int level, char* extra, int extraLength, int reserved, const std::string& text) {
  Scripted::record({Scripted::Sink::Trace, function, file, line, component, level, extra, extraLength, reserved, text});
}

}  // namespace CVLog
