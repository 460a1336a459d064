#ifndef CORVANE_PLATFORM_CVLOG_STANDARDERRORSINK_H
#define CORVANE_PLATFORM_CVLOG_STANDARDERRORSINK_H

#include "platform/cvlog/Sink.h"

namespace CVLog {

/// Standard error, one line and one write(2) for each message.
class StandardErrorSink final : public Sink {
 public:
  void write(const Message& message) override;
};

}  // namespace CVLog

#endif
