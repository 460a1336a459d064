#ifndef HOST_CORVCIM_TEXT_CRASHREPORT_H
#define HOST_CORVCIM_TEXT_CRASHREPORT_H

#include <string_view>

namespace Corvcim {

/// While it lives, a signal that means a crash (a fault, an abort) ends the program with exit status 1
/// and this text as its error, instead of the shell's word about a signal. One at a time.
class CrashReport {
 public:
  explicit CrashReport(std::string_view text);
  ~CrashReport();
  CrashReport(const CrashReport&) = delete;
  CrashReport& operator=(const CrashReport&) = delete;
};

}  // namespace Corvcim

#endif
