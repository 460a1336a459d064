#ifndef CORVANE_PLATFORM_CVLOG_FILESINK_H
#define CORVANE_PLATFORM_CVLOG_FILESINK_H

#include <sys/stat.h>
#include <sys/types.h>

#include <atomic>
#include <chrono>
#include <cstddef>
#include <string>
#include <string_view>

#include "platform/common/FileDescriptor.h"
#include "platform/cvlog/Rotation.h"
#include "platform/cvlog/Sink.h"

namespace CVLog {

/// A regular file or a terminal, appended to, one line and one write(2) for each message: several threads and
/// several processes may share one file.
///
/// A regular file is followed by its name: once it was renamed or removed, by another process that shares it or by a
/// tool for log files, the next message goes to a new file of that name. A file that would outgrow the limit of its
/// rotation makes way for a new one first; a lock on the file sees to it that one of the processes does so. Nobody
/// waits for that: who finds the lock taken, or cannot rename or open, writes on to the file that is open. The system
/// log hears once why a file could not be replaced, and the attempt is repeated `retryAfter` later at the earliest.
///
/// A full disk may take a part of a line. The next line that this sink, or one that found the disk full as well, or one
/// that opens the file later, writes there is preceded by a line end, so that it stands alone.
class FileSink final : public Sink {
 public:
  using Clock = std::chrono::steady_clock;

  /// Opens the file, creates it where needed (readable for its owner and group). A relative path starts from the
  /// directory that the process is in now.
  /// Throws std::runtime_error or a child of it, whose text names the file and says why.
  explicit FileSink(const std::string& path, Rotation rotation = {},
                    Clock::duration retryAfter = std::chrono::minutes(1));

  void write(const Message& message) override;

 private:
  /// Which file is open. A reader that finds half of a new identity takes the file for another one, which the thread
  /// that replaces files finds out.
  class Identity {
   public:
    [[nodiscard]] bool isThatOf(const struct stat& status) const;
    void set(const struct stat& status);

   private:
    std::atomic<dev_t> device_{0};
    std::atomic<ino_t> number_{0};
  };

  /// What is known of how the file ends.
  enum class End {
    Unknown,  ///< it was just opened, or the disk was full, for other processes as well
    OfLine,
    Torn,  ///< in a part of a line
  };
  [[nodiscard]] bool isTorn(End known) const;

  void followName(std::size_t lineSize);
  /// False where another process has the lock.
  bool rotate(std::size_t lineSize);
  void adopt(const Tarn::Common::FileDescriptor& next);
  [[nodiscard]] bool wouldOutgrow(off_t size, std::size_t lineSize) const;
  void report(std::string_view why) const;

  const std::string path_;  // absolute
  const Rotation rotation_;
  const Clock::duration retryAfter_;
  // Other files take the place of the first one under its number, so that writers need no lock.
  const Tarn::Common::FileDescriptor file_;
  const bool isFollowed_;     // a regular file under a name of its own
  const bool mayBeTooLarge_;  // for the limit that was set when it was opened
  Identity identity_;
  std::atomic<End> end_{End::Unknown};
  std::atomic_flag isBeingReplaced_;
  std::atomic<Clock::rep> retryAt_{0};  // 0: the last replacement did not fail
};

}  // namespace CVLog

#endif
