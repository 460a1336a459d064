#include <cvlog/CVLogger.h>
#include <cvlog/CVMessageBuffer.h>

/// Uses everything of the logger that has state: its configuration, a destination, several streams at once.
extern "C" __attribute__((visibility("default"))) void logSomething() {
  CVLog::CVMessageBuffer first;
  CVLog::CVMessageBuffer second;
  first << "number " << 1;
  second << "number " << 2;
  CVLog::CVLogger::logLevelMessage("function", "file.cpp", 1, "Corvane.Test", 3000, nullptr, 0, 0,
                                   CVLog::CVMessageBuffer::str(first));
  CVLog::CVLogger::traceLevelMessage("function", "file.cpp", 1, "Corvane.Test", 3000, nullptr, 0, 0,
                                     CVLog::CVMessageBuffer::str(second));
}
