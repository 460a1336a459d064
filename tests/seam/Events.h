#ifndef TESTS_SEAM_EVENTS_H
#define TESTS_SEAM_EVENTS_H

#include <iosfwd>
#include <string>
#include <vector>

/// What the product told the logger.
namespace Scripted {

enum class Sink { Log, Trace };

/// One message at one sink, with all nine arguments.
struct Message {
  Sink sink;
  std::string function;
  std::string file;
  int line;
  std::string component;
  int level;
  const char* extra;
  int extraLength;
  int reserved;
  std::string text;
};

/// One event: what reached both sinks.
struct Event {
  std::string function;
  std::string file;
  int line;
  std::string component;
  int level;
  std::string text;

  friend bool operator==(const Event&, const Event&) = default;
  friend std::ostream& operator<<(std::ostream& stream, const Event& event);

  /// The event on one line, with its own line number, there and inside its text, replaced by "#". A
  /// text that names any other line keeps it and so differs.
  std::string withoutLine() const;
};

/// The messages since they were taken last.
std::vector<Message> takeMessages();

/// The same as events. Throws std::logic_error unless each event reached the log sink and then the
/// trace sink alike, with NULL, 0 and 0 as the arguments that nobody uses.
std::vector<Event> takeEvents();

/// takeEvents(), each as withoutLine() tells it.
std::vector<std::string> takeEventsWithoutLines();

/// The expected lines of one source, as withoutLine() writes them.
struct EventSource {
  std::string component;
  std::string file;

  std::string entering(int level, const std::string& function) const;
  std::string entering(int level, const std::string& function, const std::string& parameters) const;
  std::string exiting(int level, const std::string& function) const;
  std::string exiting(int level, const std::string& function, const std::string& parameters) const;
  std::string message(int level, const std::string& function, const std::string& text) const;
  std::string variable(int level, const std::string& function, const std::string& name, const std::string& value) const;

 private:
  std::string line(int level, const std::string& function, const std::string& text) const;
};

/// A pointer as a parameter list shows it.
std::string address(const void* pointer);

}  // namespace Scripted

#endif
