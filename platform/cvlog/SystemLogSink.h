#ifndef CORVANE_PLATFORM_CVLOG_SYSTEMLOGSINK_H
#define CORVANE_PLATFORM_CVLOG_SYSTEMLOGSINK_H

#include "platform/cvlog/Sink.h"

namespace CVLog {

/// The system log by syslog(3). The connection, its name and its facility are the process's own: a
/// library that called openlog would rename its broker's messages.
class SystemLogSink final : public Sink {
 public:
  void write(const Message& message) override;
};

}  // namespace CVLog

#endif
