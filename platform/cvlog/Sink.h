#ifndef CORVANE_PLATFORM_CVLOG_SINK_H
#define CORVANE_PLATFORM_CVLOG_SINK_H

#include "platform/cvlog/Message.h"

namespace CVLog {

/// Where messages end up. Safe from several threads at once.
class Sink {
 public:
  Sink() = default;
  Sink(const Sink&) = delete;
  Sink& operator=(const Sink&) = delete;
  virtual ~Sink() = default;

  /// Delivers the message as a whole or, where the destination does not take it, not at all: there is
  /// nobody to tell, and logging must not disturb what is logged.
  virtual void write(const Message& message) = 0;
};

}  // namespace CVLog

#endif
