#include <fcntl.h>
#include <sys/file.h>
#include <sys/resource.h>
#include <sys/stat.h>

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <filesystem>
#include <optional>
#include <stdexcept>
#include <string_view>
#include <system_error>
#include <utility>

#include "platform/base/FileDescriptor.h"
#include "platform/cvlog/Sink.h"

namespace CVLog {
namespace {

using std::chrono::system_clock;
using Tarn::Common::FileDescriptor;
using Status = struct stat;

// Non-blocking: a pipe without a reader must not stop the broker.
constexpr int appending = O_WRONLY | O_APPEND | O_CLOEXEC | O_NOCTTY | O_NONBLOCK;
constexpr mode_t modeOfNew = S_IRUSR | S_IWUSR | S_IRGRP;

[[noreturn]] void fail(const std::string& what) {
  throw std::system_error(errno, std::generic_category(), what);
}

/// All zero if there is no such file.
Status statusOf(int descriptor) {
  Status status{};
  return fstat(descriptor, &status) == 0 ? status : Status{};
}

Status statusOf(const std::string& path) {
  Status status{};
  return stat(path.c_str(), &status) == 0 ? status : Status{};
}

bool isSameFile(const Status& a, const Status& b) {
  return a.st_ino != 0 && a.st_dev == b.st_dev && a.st_ino == b.st_ino;
}

FileDescriptor openLog(const std::string& path) {
  FileDescriptor file(open(path.c_str(), appending | O_CREAT, modeOfNew));
  if (!file) {
    fail("log file " + path + " cannot be opened");
  }
  const mode_t mode = statusOf(file.number()).st_mode;
  if (!S_ISREG(mode) && !S_ISCHR(mode)) {
    throw std::runtime_error("log file " + path + " is not a regular file");
  }
  return file;
}

/// Whether the path is a second name for something that is open or has a name elsewhere, such as /dev/stderr.
bool isAnotherName(std::string_view path) {
  return path.starts_with("/dev/") || path.starts_with("/proc/");
}

bool hasSizeLimit() {
  rlimit limit{};
  return getrlimit(RLIMIT_FSIZE, &limit) != 0 || limit.rlim_cur != RLIM_INFINITY;
}

/// Gives the file the owner, group and mode of another, so that whoever could write to that one can write to this.
void takeAccessOf(const Status& before, int descriptor) {
  constexpr uid_t unchanged = -1;
  constexpr mode_t permissions = S_IRWXU | S_IRWXG | S_IRWXO;
  // Only a privileged process may change the owner; the group may be one of the owner's.
  if (fchown(descriptor, before.st_uid, before.st_gid) == 0 || fchown(descriptor, unchanged, before.st_gid) == 0) {
    fchmod(descriptor, before.st_mode & permissions);
  }
}

std::string oldFile(const std::string& path, unsigned number) {
  return path + '.' + std::to_string(number);
}

bool isTaken(const std::string& path) {
  Status status{};
  return lstat(path.c_str(), &status) == 0 || errno != ENOENT;
}

/// Renames FILE to FILE.1, FILE.1 to FILE.2 before that, and so on up to FILE.keep, which is dropped.
void makeOld(const std::string& path, unsigned keep) {
  // Only up to the first gap: a failed attempt leaves one, and the next must not drop the oldest file for it.
  unsigned last = 1;
  while (last < keep && isTaken(oldFile(path, last))) {
    ++last;
  }
  for (unsigned number = last; number != 0; --number) {
    const std::string from = number == 1 ? path : oldFile(path, number - 1);
    if (std::rename(from.c_str(), oldFile(path, number).c_str()) != 0) {
      fail("cannot be rotated: " + from + " cannot be renamed to " + oldFile(path, number));
    }
  }
}

/// The path without symbolic links: the file is rotated, not a link to it.
std::string realPath(const std::string& path) {
  std::error_code error;
  const std::filesystem::path real = std::filesystem::canonical(path, error);
  return error ? path : real.string();
}

/// Closing is not enough: a child that was forked in the meantime has the descriptor, too.
struct Unlock {
  int descriptor;
  ~Unlock() { flock(descriptor, LOCK_UN); }
};

class FileSink final : public Sink {
 public:
  FileSink(const std::string& path, const Rotation& rotation)
      : path_(std::filesystem::absolute(path).string()),
        rotation_(rotation),
        file_(openLog(path)),
        identity_(statusOf(file_.number())),
        isFollowed_(S_ISREG(identity_.st_mode) && !isAnotherName(path_)),
        signalOfTooLarge_(hasSizeLimit() ? SIGXFSZ : 0) {}
  FileSink(const FileSink&) = delete;
  FileSink& operator=(const FileSink&) = delete;
  ~FileSink() override { releaseIfForeign(); }

  void write(const Message& message) override {
    const std::string line = formatLine(message) + '\n';
    if (isFollowed_) {
      followName(line.size(), message.time);
    }
    writeLine(file_.number(), line, signalOfTooLarge_);
  }

 private:
  /// A process that closes descriptors it does not know may have given the number to another file.
  void releaseIfForeign() {
    if (!isSameFile(identity_, statusOf(file_.number()))) {
      file_.release();
      identity_ = {};
    }
  }

  void followName(std::size_t lineSize, system_clock::time_point now) {
    releaseIfForeign();
    const Status named = statusOf(path_);
    const bool isMoved = !isSameFile(identity_, named);
    if ((!isMoved && !wouldOutgrow(named, lineSize)) || isTooEarly(now)) {
      return;
    }
    try {
      if (isMoved) {
        openAgain(path_);
      } else {
        rotate(lineSize);
      }
      failedAt_.reset();
    } catch (const std::exception& error) {
      if (!std::exchange(failedAt_, now)) {
        const std::string text =
            "log file " + path_ + ' ' + error.what() + "; messages go to the file that is open, however large";
        writeToSystemLog(ownMessage(levelWarning, "FileSink.cpp", text));
      }
    }
  }

  /// After a failure, attempts are a minute apart. A clock that was set back allows one, too.
  [[nodiscard]] bool isTooEarly(system_clock::time_point now) const {
    return failedAt_ && now >= *failedAt_ && now < *failedAt_ + std::chrono::minutes(1);
  }

  [[nodiscard]] bool wouldOutgrow(const Status& file, std::size_t lineSize) const {
    return rotation_.size != 0 && file.st_size > 0 &&
           static_cast<std::uint64_t>(file.st_size) + lineSize > rotation_.size;
  }

  void rotate(std::size_t lineSize) {
    const std::string real = realPath(path_);
    // Never removed: without the file that others have locked, two processes could hold a lock each.
    const std::string beside = real + ".lock";
    const FileDescriptor lock(
        open(beside.c_str(), O_RDONLY | O_CREAT | O_NOFOLLOW | O_CLOEXEC | O_NOCTTY | O_NONBLOCK, modeOfNew));
    if (!lock || flock(lock.number(), LOCK_EX | LOCK_NB) != 0) {
      if (lock && errno == EWOULDBLOCK) {
        return;
      }
      fail("cannot be locked for its rotation with " + beside);
    }
    const Unlock unlock{lock.number()};
    // Another process may have rotated the file before the lock was free.
    const Status named = statusOf(path_);
    if (isSameFile(identity_, named) && wouldOutgrow(named, lineSize)) {
      makeOld(real, rotation_.keep);
    }
    openAgain(real);
  }

  void openAgain(const std::string& path) {
    FileDescriptor next(open(path.c_str(), appending | O_CREAT | O_EXCL, modeOfNew));
    if (next) {
      if (file_) {
        takeAccessOf(statusOf(file_.number()), next.number());
      }
    } else {
      // The name is taken, perhaps by a symbolic link that leads to no file yet.
      next = FileDescriptor(open(path.c_str(), appending | O_CREAT, modeOfNew));
    }
    if (!next) {
      fail("cannot be opened again");
    }
    const Status status = statusOf(next.number());
    if (!S_ISREG(status.st_mode)) {
      throw std::runtime_error("is not a regular file any more");
    }
    file_ = std::move(next);
    identity_ = status;
  }

  const std::string path_;  // absolute
  const Rotation rotation_;
  FileDescriptor file_;
  Status identity_;             // of the file that was opened
  const bool isFollowed_;       // a regular file under a name of its own
  const int signalOfTooLarge_;  // SIGXFSZ if the process has a limit for the size of files, else 0
  std::optional<system_clock::time_point> failedAt_;  // if the last attempt to open or rename a file failed
};

}  // namespace

std::unique_ptr<Sink> openFile(const std::string& path, const Rotation& rotation) {
  return std::make_unique<FileSink>(path, rotation);
}

}  // namespace CVLog
