#ifndef TESTS_SUPPORT_EVENTLIST_H
#define TESTS_SUPPORT_EVENTLIST_H

#include <optional>
#include <string>
#include <vector>

#include "tests/seam/Events.h"
#include "tests/support/ProviderFunctions.h"

namespace Support {

/// The whole list of events that one provider reports for a request, in the order in which they come:
///
///     events("EnumInstances").entering().error("Failed To get CMPIInstances", 151)
///
/// Where no line is given any will do, as long as the event and its text name the same one.
class EventList {
 public:
  /// Of an operation: the provider's prefix, an underscore and the operation's name.
  EventList(const ProviderFunctions& provider, const std::string& operation);

  /// Further events come from this function, by its full name.
  EventList& in(const std::string& function);

  EventList& entering();                             ///< the frame: banner and ENTERING
  EventList& exiting(std::optional<int> line = {});  ///< the frame: EXITING and banner
  EventList& error(const std::string& text, std::optional<int> line = {});
  EventList& variable(const std::string& name, const std::string& value, std::optional<int> line = {});

  /// The events on one line each.
  std::vector<std::string> lines() const;

  /// `events` likewise, with "#" for what this list leaves open.
  std::vector<std::string> linesOf(const std::vector<Scripted::Event>& events) const;

 private:
  struct Expected {
    std::string function;
    std::string file;
    std::optional<int> line;
    int level;
    std::string text;
    bool framesOperation;
  };

  EventList& own(int level, const std::string& text, std::optional<int> line);
  EventList& frame(const std::string& mark, int line, const std::string& text);
  std::string shown(const Expected& event) const;

  std::string component_;
  std::string file_;
  std::string function_;
  std::vector<Expected> expected_;
};

/// Takes what was logged and leaves the provider's own events. The rest must be of the library's core.
std::vector<Scripted::Event> takeEventsOf(const ProviderFunctions& provider);

/// Compares all events of the provider, whole and in order.
void expectEvents(const ProviderFunctions& provider, const EventList& expected);

}  // namespace Support

#endif
