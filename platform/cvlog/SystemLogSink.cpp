#include "platform/cvlog/SystemLogSink.h"

#include <syslog.h>

#include "platform/cvlog/Level.h"

namespace CVLog {

void SystemLogSink::write(const Message& message) {
  syslog(syslogPriority(message.level), "%s", formatForSystemLog(message).c_str());
}

}  // namespace CVLog
