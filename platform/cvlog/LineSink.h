#ifndef CORVANE_PLATFORM_CVLOG_LINESINK_H
#define CORVANE_PLATFORM_CVLOG_LINESINK_H

#include <string>

#include "platform/common/FileDescriptor.h"
#include "platform/cvlog/Sink.h"

namespace CVLog {

/// Standard error, one line and one write(2) for each message.
class StandardErrorSink final : public Sink {
 public:
  void write(const Message& message) override;
};

/// A regular file or a terminal, appended to, one line and one write(2) for each message: several
/// processes may share one file.
class FileSink final : public Sink {
 public:
  /// Opens the file, creates it where needed (readable for its owner and group).
  /// Throws std::runtime_error or a child of it, whose text names the file and says why.
  explicit FileSink(const std::string& path);

  void write(const Message& message) override;

 private:
  // Rotation belongs here: a size limit, and a new file under the old name once it is reached.
  Tarn::Common::FileDescriptor file_;
};

}  // namespace CVLog

#endif
