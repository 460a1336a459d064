#ifndef CORVANE_PLATFORM_CVLOG_SINK_H
#define CORVANE_PLATFORM_CVLOG_SINK_H

#include <memory>
#include <string>
#include <string_view>

#include "platform/cvlog/Message.h"
#include "platform/cvlog/Settings.h"

namespace CVLog {

/// A destination of messages, for one thread at a time.
class Sink {
 public:
  Sink() = default;
  Sink(const Sink&) = delete;
  Sink& operator=(const Sink&) = delete;
  virtual ~Sink() = default;

  /// Delivers the message. One that the destination does not accept is lost: logging must not disturb its caller.
  virtual void write(const Message& message) = 0;
};

/// Makes the sink of these settings, or nullptr for the destination "none". Beyond the limit of messages a minute the
/// sink drops messages. The first message of a later minute is preceded by a note of how many were dropped; if none
/// comes, the note ends the output.
/// Throws std::runtime_error if a file cannot be opened; the text names the file and the reason.
std::unique_ptr<Sink> openSink(const SinkSettings& settings);

/// A regular file or a terminal, to which each message is appended by one write(2). Several processes may share it. A
/// file that is missing is made, readable for its owner and group. A relative path starts from the current directory.
///
/// A regular file is followed by its name: if the name no longer leads to the open file, the next message goes to the
/// file of that name, which is made if there is none. A file that the next line would make larger than the limit is
/// renamed first, under a lock on FILE.lock. Nobody waits for that lock. If it is taken, or a file cannot be renamed or
/// opened, the line goes to the open file. The system log gets the reason of a failure once, and the next attempt is
/// made a minute later at the earliest.
std::unique_ptr<Sink> openFile(const std::string& path, const Rotation& rotation);

/// Writes to the system log at once. The connection, its name and its facility stay those of the process.
void writeToSystemLog(const Message& message);

/// Writes the line by one write(2), so that the lines of several writers do not mix. `signal` is the signal that a
/// failing write raises, SIGPIPE or SIGXFSZ, and is suppressed; 0 if the write raises none.
void writeLine(int descriptor, std::string_view line, int signal);

}  // namespace CVLog

#endif
