#ifndef CORVANE_PLATFORM_CVLOG_REPORT_H
#define CORVANE_PLATFORM_CVLOG_REPORT_H

#include <string>

namespace Tarn::Common {

/// What of the platform reports something, as the log names it.
struct Reporter {
  const char* component;  ///< "Corvane.Inventory"
  const char* file;       ///< base name of the source file
};

/// Delivers the text to the log and to the trace, as an event of the calling function and line. `level` is one of
/// those in platform/cvlog/Level.h.
void report(const Reporter& reporter, int level, const std::string& text, const char* function = __builtin_FUNCTION(),
            int line = __builtin_LINE());

}  // namespace Tarn::Common

#endif
