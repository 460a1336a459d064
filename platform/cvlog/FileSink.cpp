#include "platform/cvlog/FileSink.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <filesystem>
#include <optional>
#include <stdexcept>
#include <system_error>

#include "platform/cvlog/HeldBackSignal.h"
#include "platform/cvlog/HeldFlag.h"
#include "platform/cvlog/Level.h"
#include "platform/cvlog/SystemLogSink.h"
#include "platform/cvlog/WriteLine.h"

namespace CVLog {
namespace {

using Tarn::Common::FileDescriptor;

// Non-blocking, or a pipe without a reader would hold the broker.
constexpr int appending = O_WRONLY | O_APPEND | O_CLOEXEC | O_NOCTTY | O_NONBLOCK;
constexpr mode_t modeOfNew = S_IRUSR | S_IWUSR | S_IRGRP;

[[noreturn]] void fail(const std::string& what) {
  throw std::system_error(errno, std::generic_category(), what);
}

std::optional<struct stat> statusOf(int descriptor) {
  struct stat status {};
  return fstat(descriptor, &status) == 0 ? std::optional(status) : std::nullopt;
}

std::optional<struct stat> statusOf(const std::string& path) {
  struct stat status {};
  return stat(path.c_str(), &status) == 0 ? std::optional(status) : std::nullopt;
}

/// The device, number and size of the file of that name. Who asks for the times of a file, as stat does, makes the next
/// write to it slower.
std::optional<struct stat> sizeAndIdentityOf(const std::string& path) {
  struct statx extended {};
  // What another machine may have done to a file in the meantime is not worth waiting for.
  if (statx(AT_FDCWD, path.c_str(), AT_STATX_DONT_SYNC, STATX_INO | STATX_SIZE, &extended) != 0) {
    return errno == ENOENT ? std::nullopt : statusOf(path);  // some sandboxes refuse statx
  }
  struct stat status {};
  status.st_dev = makedev(extended.stx_dev_major, extended.stx_dev_minor);
  status.st_ino = extended.stx_ino;
  status.st_size = static_cast<off_t>(extended.stx_size);
  return status;
}

bool isRegular(const std::optional<struct stat>& status) {
  return status && S_ISREG(status->st_mode);
}

bool isSameFile(const std::optional<struct stat>& a, const std::optional<struct stat>& b) {
  return a && b && a->st_dev == b->st_dev && a->st_ino == b->st_ino;
}

FileDescriptor openLog(const std::string& path) {
  FileDescriptor file(open(path.c_str(), appending | O_CREAT, modeOfNew));
  if (!file) {
    fail("log file " + path + " cannot be opened");
  }
  const std::optional<struct stat> status = statusOf(file.number());
  if (!isRegular(status) && !(status && S_ISCHR(status->st_mode))) {
    throw std::runtime_error("log file " + path + " is not a regular file");
  }
  return file;
}

/// Opens the file of that name in the place of another, or makes it with the owner, group and mode of the other, so
/// that who could write to that one can write to this.
FileDescriptor openSuccessor(const std::string& path, const struct stat& predecessor) {
  FileDescriptor next(open(path.c_str(), appending | O_CREAT | O_EXCL, modeOfNew));
  if (!next) {
    next = FileDescriptor(open(path.c_str(), appending));
    if (!next && errno == ENOENT) {  // a symbolic link that leads nowhere: O_EXCL follows none
      next = FileDescriptor(open(path.c_str(), appending | O_CREAT, modeOfNew));
    }
    if (!next) {
      fail("cannot be opened again");
    }
    return next;
  }
  constexpr uid_t asItIs = -1;
  constexpr mode_t permissions = S_IRWXU | S_IRWXG | S_IRWXO;
  // Only a privileged process gives files away; the group may be one of the owner's.
  if (fchown(next.number(), predecessor.st_uid, predecessor.st_gid) == 0 ||
      fchown(next.number(), asItIs, predecessor.st_gid) == 0) {
    fchmod(next.number(), predecessor.st_mode & permissions);
  }
  return next;
}

/// The lock of a file, where nobody else has it.
class FileLock {
 public:
  explicit FileLock(int descriptor) : descriptor_(descriptor), isHeld_(flock(descriptor, LOCK_EX | LOCK_NB) == 0) {
    if (!isHeld_ && errno != EWOULDBLOCK) {
      fail("cannot be locked for its rotation");
    }
  }
  FileLock(const FileLock&) = delete;
  FileLock& operator=(const FileLock&) = delete;
  // Closing is not enough: a child that was forked in the meantime has the descriptor, too.
  ~FileLock() { flock(descriptor_, LOCK_UN); }

  explicit operator bool() const { return isHeld_; }

 private:
  int descriptor_;
  bool isHeld_;
};

/// Whether the path stands for something that is open or has a name elsewhere, such as /dev/stderr: what it leads to is
/// not the logger's to rename.
bool isAnotherName(std::string_view path) {
  return path.starts_with("/dev/") || path.starts_with("/proc/");
}

/// Whether a write can end the process (see HeldBackSignal).
bool hasSizeLimit() {
  rlimit limit{};
  return getrlimit(RLIMIT_FSIZE, &limit) != 0 || limit.rlim_cur != RLIM_INFINITY;
}

/// The path without symbolic links: what is rotated is the file, not a link to it.
std::string realPath(const std::string& path) {
  std::error_code error;
  const std::filesystem::path real = std::filesystem::canonical(path, error);
  return error ? path : real.string();
}

}  // namespace

FileSink::FileSink(const std::string& path, Rotation rotation, Clock::duration retryAfter)
    : path_(std::filesystem::absolute(path).string()),
      rotation_(rotation),
      retryAfter_(retryAfter),
      file_(openLog(path)),
      isFollowed_(isRegular(statusOf(file_.number())) && !isAnotherName(path_)),
      mayBeTooLarge_(hasSizeLimit()) {
  if (const std::optional<struct stat> status = statusOf(file_.number())) {
    identity_.set(*status);
  }
}

void FileSink::write(const Message& message) {
  std::string line = formatLine(message) + '\n';
  if (isFollowed_) {
    followName(line.size());
  }
  std::optional<HeldBackSignal> held;
  if (mayBeTooLarge_) {
    held.emplace(SIGXFSZ);
  }
  const End before = end_.load(std::memory_order_relaxed);
  if (before != End::OfLine && isTorn(before)) {
    line.insert(line.begin(), '\n');
  }
  const std::size_t written = writeLine(file_.number(), line);
  if (written != line.size()) {
    end_.store(written == 0 ? End::Unknown : End::Torn, std::memory_order_relaxed);
  } else if (before != End::OfLine) {
    end_.store(End::OfLine, std::memory_order_relaxed);
  }
}

bool FileSink::isTorn(End known) const {
  if (isFollowed_) {
    const FileDescriptor file(open(path_.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    const std::optional<struct stat> status = statusOf(file.number());
    char last = '\n';
    if (status && identity_.isThatOf(*status) &&
        (status->st_size == 0 || pread(file.number(), &last, 1, status->st_size - 1) == 1)) {
      return last != '\n';
    }
  }
  return known == End::Torn;
}

void FileSink::followName(std::size_t lineSize) {
  const std::optional<struct stat> named = sizeAndIdentityOf(path_);
  const bool isStale = !named || !identity_.isThatOf(*named);
  if (!isStale && !wouldOutgrow(named->st_size, lineSize)) {
    return;
  }
  const Clock::rep retryAt = retryAt_.load(std::memory_order_relaxed);
  if (retryAt != 0 && Clock::now().time_since_epoch().count() < retryAt) {
    return;
  }
  const HeldFlag replacing(isBeingReplaced_);
  if (!replacing) {
    return;
  }
  const std::optional<struct stat> current = statusOf(file_.number());
  if (!current || !identity_.isThatOf(*current)) {
    return;  // the process has closed the descriptor; its number may be anything now
  }
  try {
    if (isStale) {
      adopt(openSuccessor(path_, *current));
    } else if (!rotate(lineSize)) {
      return;
    }
    retryAt_.store(0, std::memory_order_relaxed);
  } catch (const std::exception& error) {
    retryAt_.store((Clock::now() + retryAfter_).time_since_epoch().count(), std::memory_order_relaxed);
    if (retryAt == 0) {
      report(error.what());
    }
  }
}

bool FileSink::Identity::isThatOf(const struct stat& status) const {
  return device_.load(std::memory_order_relaxed) == status.st_dev &&
         number_.load(std::memory_order_relaxed) == status.st_ino;
}

void FileSink::Identity::set(const struct stat& status) {
  device_.store(status.st_dev, std::memory_order_relaxed);
  number_.store(status.st_ino, std::memory_order_relaxed);
}

bool FileSink::wouldOutgrow(off_t size, std::size_t lineSize) const {
  return rotation_.size != 0 && size > 0 && static_cast<std::uint64_t>(size) + lineSize > rotation_.size;
}

bool FileSink::rotate(std::size_t lineSize) {
  // Opened anew: a lock belongs to what open(2) made, and that of file_ may be shared with a forked process.
  const FileDescriptor locked(open(path_.c_str(), appending));
  if (!locked) {
    fail("cannot be opened for its rotation");
  }
  const FileLock lock(locked.number());
  if (!lock) {
    return false;  // somebody else is at it
  }
  const std::optional<struct stat> current = statusOf(locked.number());
  if (!current) {
    fail("cannot be rotated");
  }
  if (!isSameFile(current, statusOf(path_))) {
    adopt(openSuccessor(path_, *current));  // somebody else was faster
  } else if (!wouldOutgrow(current->st_size, lineSize)) {
    adopt(locked);  // somebody else was faster still
  } else {
    const std::string real = realPath(path_);
    makeOld(real, rotation_.keep);
    adopt(openSuccessor(real, *current));
  }
  return true;
}

void FileSink::adopt(const FileDescriptor& next) {
  const std::optional<struct stat> status = statusOf(next.number());
  if (!isRegular(status)) {
    throw std::runtime_error("is not a regular file any more");
  }
  int number = -1;
  do {
    number = dup3(next.number(), file_.number(), O_CLOEXEC);
  } while (number < 0 && errno == EINTR);
  if (number < 0) {
    fail("cannot be replaced");
  }
  identity_.set(*status);
}

void FileSink::report(std::string_view why) const {
  const std::string text =
      "log file " + path_ + ' ' + std::string(why) + "; messages go to the file that is open, however large";
  SystemLogSink().write(ownMessage(levelWarning, "FileSink.cpp", text));
}

}  // namespace CVLog
