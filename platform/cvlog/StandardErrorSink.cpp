#include "platform/cvlog/StandardErrorSink.h"

#include <unistd.h>

#include <csignal>

#include "platform/cvlog/HeldBackSignal.h"
#include "platform/cvlog/WriteLine.h"

namespace CVLog {

void StandardErrorSink::write(const Message& message) {
  const HeldBackSignal held(SIGPIPE);
  writeLine(STDERR_FILENO, formatLine(message) + '\n');
}

}  // namespace CVLog
