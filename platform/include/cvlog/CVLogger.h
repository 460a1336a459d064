#ifndef CVLOG_CVLOGGER_H
#define CVLOG_CVLOGGER_H

#include <string>

namespace CVLog {

/// The agent's logger: two sinks, each with a level threshold and a destination of its own.
///
/// Both calls are safe from several threads and throw nothing. A message that its sink does not want
/// costs one comparison.
class CVLogger {
 public:
  /// Delivers one message to the log sink. `extra`, `extraLength` and `reserved` are kept for the
  /// agent's binary attachments and are not used.
  static void logLevelMessage(const char* function, const char* file, int line, const std::string& component, int level,
                              char* extra, int extraLength, int reserved, const std::string& text);
  /// Delivers one message to the trace sink; the arguments are those of logLevelMessage.
  static void traceLevelMessage(const char* function, const char* file, int line, const std::string& component,
                                int level, char* extra, int extraLength, int reserved, const std::string& text);
};

}  // namespace CVLog

#endif
