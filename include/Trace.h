#ifndef TARN_TRACE_H
#define TARN_TRACE_H

#include <cvlog/CVLogger.h>
#include <cvlog/CVMessageBuffer.h>

#include <cstddef>
#include <cstring>
#include <initializer_list>
#include <string>

/// What the library tells the agent's logger: message forms, entry and exit marks, and the one helper
/// that delivers an event to both sinks.
///
/// The message helpers format into static buffers, one for each helper, which the next call of the
/// same helper overwrites. Nothing here is locked.
namespace Tarn {

/// The form of a message. Any value that is not listed reads as ENTERING.
enum MessageType : int { ENTERING = 0, EXITING = 1, METHOD = 2, MESSAGE = 3 };

/// Levels that events are reported at.
enum EventLevel : int {
  LevelDetail = 3000,   ///< entry, exit and variables of the model and the factory
  LevelInfo = 4000,     ///< entry, exit and variables of the providers, remarks on the way
  LevelWarning = 5000,  ///< a single field that could not be set, remarks of the collections
  LevelError = 6000     ///< what ends an operation
};

namespace detail {

inline constexpr std::size_t messageSize = 512;

/// Writes one message into a zeroed buffer; what does not fit is cut, the last byte stays zero.
class MessageWriter {
 public:
  explicit MessageWriter(char (&buffer)[messageSize]) : next_(buffer), end_(buffer + messageSize - 1) {
    std::memset(buffer, 0, messageSize);
  }

  MessageWriter& operator<<(const char* text) { return append(text != nullptr ? text : "(null)"); }

  /// The number as "%d" prints it, so a value above INT_MAX comes out negative.
  MessageWriter& operator<<(unsigned int number) {
    char digits[11];
    char* first = digits + sizeof digits;
    const bool negative = static_cast<int>(number) < 0;
    unsigned int rest = negative ? 0U - number : number;
    do {
      *--first = static_cast<char>('0' + rest % 10);
      rest /= 10;
    } while (rest != 0);
    if (negative) {
      *--first = '-';
    }
    return append(first, static_cast<std::size_t>(digits + sizeof digits - first));
  }

 private:
  MessageWriter& append(const char* text) { return append(text, std::strlen(text)); }

  MessageWriter& append(const char* text, std::size_t length) {
    const auto room = static_cast<std::size_t>(end_ - next_);
    const std::size_t taken = length < room ? length : room;
    std::memcpy(next_, text, taken);
    next_ += taken;
    return *this;
  }

  char* next_;
  char* end_;
};

inline void writeMessage(MessageWriter& out, const char* text, const char* file, unsigned int line, MessageType type) {
  switch (type) {
    case EXITING:
      out << "EXITING: " << text << "() in " << file << " [Line: " << line << "]";
      return;
    case METHOD:
      out << "METHOD: " << text << "() was invoked in " << file << " [Line: " << line << "]";
      return;
    case MESSAGE:
      out << "MESSAGE [File: " << file << ", Line: " << line << "]: " << text;
      return;
    case ENTERING:
    default:
      out << "ENTERING: " << text << "() in " << file << " [Line: " << line << "]";
  }
}

}  // namespace detail

/// A function's entry, exit or call, or a plain message.
inline char* trace(const char* text, const char* file, unsigned int line, MessageType type) {
  static char buffer[detail::messageSize];
  detail::MessageWriter out(buffer);
  detail::writeMessage(out, text, file, line, type);
  return buffer;
}

/// The same with a parameter list.
inline char* tracepara(const char* text, const char* file, unsigned int line, const char* parameters,
                       MessageType type) {
  static char buffer[detail::messageSize];
  detail::MessageWriter out(buffer);
  detail::writeMessage(out, text, file, line, type);
  out << ",Parameters List: " << parameters;
  return buffer;
}

/// A variable that holds text; NULL shows as "(null)".
inline char* trace(const char* variable, const char* file, unsigned int line, const char* value) {
  static char buffer[detail::messageSize];
  detail::MessageWriter out(buffer);
  out << "VARIABLE: '" << variable << "' has Value '" << value << "' at line " << line << " in " << file;
  return buffer;
}

/// A variable that holds a number.
inline char* trace(const char* variable, const char* file, unsigned int line, unsigned int value) {
  static char buffer[detail::messageSize];
  detail::MessageWriter out(buffer);
  out << "VARIABLE: '" << variable << "' has Value '" << value << "' at line " << line << " in " << file;
  return buffer;
}

/// Where an event is reported from.
struct EventOrigin {
  const char* function;
  const char* file;
  unsigned int line;
};

/// Delivers one event: to the log sink, then to the trace sink, formatted anew for each.
/// `format` returns the text of the event.
template <class Format>
void logEvent(const std::string& component, int level, const EventOrigin& origin, Format format) {
  CVLog::CVMessageBuffer buffer;
  const auto line = static_cast<int>(origin.line);
  buffer << static_cast<const char*>(format());
  CVLog::CVLogger::logLevelMessage(origin.function, origin.file, line, component, level, nullptr, 0, 0,
                                   CVLog::CVMessageBuffer::str(buffer));
  buffer << static_cast<const char*>(format());
  CVLog::CVLogger::traceLevelMessage(origin.function, origin.file, line, component, level, nullptr, 0, 0,
                                     CVLog::CVMessageBuffer::str(buffer));
}

namespace detail {

inline constexpr const char* traceHeader = "include/Trace.h";
inline constexpr const char* banner = "==============================================================================";
static_assert(std::char_traits<char>::length(banner) == 78);

inline void logBanner(const std::string& component, const char* mark, unsigned int line) {
  logEvent(component, LevelInfo, {mark, traceHeader, line}, [] { return banner; });
}

}  // namespace detail

/// Frames the beginning of a provider operation in the log: a banner, then its entry. The line
/// numbers of the marks are fixed, so that log filters written for them keep working.
inline void markProviderEntry(const std::string& component, const char* function, const char* file, unsigned int line) {
  detail::logBanner(component, "markProviderEntry", 336);
  logEvent(component, LevelInfo, {"markProviderEntry", detail::traceHeader, 337},
           [&] { return trace(function, file, line, ENTERING); });
}

/// Frames the end of a provider operation: its exit, then a banner.
inline void markProviderExit(const std::string& component, const char* function, const char* file, unsigned int line) {
  logEvent(component, LevelInfo, {"markProviderExit", detail::traceHeader, 348},
           [&] { return trace(function, file, line, EXITING); });
  detail::logBanner(component, "markProviderExit", 349);
}

/// One labelled value of a parameter list. Labels begin with a blank and end with "=".
class Parameter {
 public:
  Parameter(const char* label, bool flag) : label_(label), kind_(Kind::Flag), flag_(flag) {}
  /// NULL shows as nothing.
  Parameter(const char* label, const char* text) : label_(label), kind_(Kind::Text), text_(text) {}
  template <class T>
  Parameter(const char* label, const T* pointer) : label_(label), kind_(Kind::Pointer), pointer_(pointer) {}

  /// A flag that begins the list is shown as the message buffer shows one; behind another value it goes
  /// to a plain stream, as a digit.
  void appendTo(CVLog::CVMessageBuffer& list, bool isFirst) const {
    list << label_;
    switch (kind_) {
      case Kind::Flag:
        if (isFirst) {
          list << flag_;
        } else {
          list << (flag_ ? "1" : "0");
        }
        break;
      case Kind::Text:
        list << (text_ != nullptr ? text_ : "");
        break;
      case Kind::Pointer:
        list << pointer_;
        break;
    }
  }

 private:
  enum class Kind { Flag, Text, Pointer };

  const char* label_;
  Kind kind_;
  union {
    bool flag_;
    const char* text_;
    const void* pointer_;
  };
};

using ParameterList = std::initializer_list<Parameter>;

/// Reports the events of one source file under its component name. The reporting function and line
/// are the caller's unless given.
class EventLog {
 public:
  /// Keeps references: both live as long as the library.
  constexpr EventLog(const std::string& component, const char* file, int level)
      : component_(component), file_(file), level_(level) {}

  void entering(unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) const {
    log(level_, {function, file_, line}, [&] { return trace(function, file_, line, ENTERING); });
  }

  void exiting(unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) const {
    log(level_, {function, file_, line}, [&] { return trace(function, file_, line, EXITING); });
  }

  void entering(ParameterList parameters, unsigned int line = __builtin_LINE(),
                const char* function = __builtin_FUNCTION()) const {
    logParameters(parameters, {function, file_, line}, ENTERING);
  }

  void exiting(ParameterList parameters, unsigned int line = __builtin_LINE(),
               const char* function = __builtin_FUNCTION()) const {
    logParameters(parameters, {function, file_, line}, EXITING);
  }

  void message(int level, const char* text, unsigned int line = __builtin_LINE(),
               const char* function = __builtin_FUNCTION()) const {
    log(level, {function, file_, line}, [&] { return trace(text, file_, line, MESSAGE); });
  }

  void variable(const char* name, const char* value, unsigned int line = __builtin_LINE(),
                const char* function = __builtin_FUNCTION()) const {
    variable(level_, name, value, line, function);
  }

  void variable(int level, const char* name, const char* value, unsigned int line = __builtin_LINE(),
                const char* function = __builtin_FUNCTION()) const {
    log(level, {function, file_, line}, [&] { return trace(name, file_, line, value); });
  }

  void variable(const char* name, unsigned int value, unsigned int line = __builtin_LINE(),
                const char* function = __builtin_FUNCTION()) const {
    log(level_, {function, file_, line}, [&] { return trace(name, file_, line, value); });
  }

  void providerEntry(unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) const {
    markProviderEntry(component_, function, file_, line);
  }

  void providerExit(unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) const {
    markProviderExit(component_, function, file_, line);
  }

 private:
  template <class Format>
  void log(int level, const EventOrigin& origin, Format format) const {
    logEvent(component_, level, origin, format);
  }

  void logParameters(ParameterList parameters, const EventOrigin& origin, MessageType type) const {
    CVLog::CVMessageBuffer list;
    log(level_, origin, [&] {
      for (const Parameter& parameter : parameters) {
        parameter.appendTo(list, &parameter == parameters.begin());
      }
      const std::string text = CVLog::CVMessageBuffer::str(list);
      return tracepara(origin.function, origin.file, origin.line, text.c_str(), type);
    });
  }

  const std::string& component_;
  const char* file_;
  int level_;
};

}  // namespace Tarn

#endif
