#ifndef TESTS_SEAM_CVLOGGER_H
#define TESTS_SEAM_CVLOGGER_H

#include <string>

namespace CVLog {

/// Hands every message to the recorder of Events.h.
class CVLogger {
 public:
  static void logLevelMessage(const char* function, const char* file, int line, const std::string& component, int level,
                              char* extra, int extraLength, int reserved, const std::string& text);
  static void traceLevelMessage(const char* function, const char* file, int line, const std::string& component,
                                int level, char* extra, int extraLength, int reserved, const std::string& text);
};

}  // namespace CVLog

#endif
