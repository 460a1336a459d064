#include "platform/cvlog/Report.h"

#include <cvlog/CVLogger.h>

namespace Tarn::Common {

void report(const Reporter& reporter, int level, const std::string& text, const char* function, int line) {
  using CVLog::CVLogger;
  const std::string component = reporter.component;
  CVLogger::logLevelMessage(function, reporter.file, line, component, level, nullptr, 0, 0, text);
  CVLogger::traceLevelMessage(function, reporter.file, line, component, level, nullptr, 0, 0, text);
}

}  // namespace Tarn::Common
