#ifndef CORVANE_PLATFORM_BASE_FILEDESCRIPTOR_H
#define CORVANE_PLATFORM_BASE_FILEDESCRIPTOR_H

#include <unistd.h>

#include <utility>

namespace Tarn::Common {

/// Owns a file descriptor; -1 is none.
class FileDescriptor {
 public:
  explicit FileDescriptor(int number = -1) : number_(number) {}
  FileDescriptor(const FileDescriptor&) = delete;
  FileDescriptor& operator=(const FileDescriptor&) = delete;
  FileDescriptor(FileDescriptor&& other) noexcept : number_(std::exchange(other.number_, -1)) {}
  FileDescriptor& operator=(FileDescriptor&& other) noexcept {
    std::swap(number_, other.number_);
    return *this;
  }
  ~FileDescriptor() {
    if (number_ >= 0) {
      close(number_);
    }
  }

  explicit operator bool() const { return number_ >= 0; }
  [[nodiscard]] int number() const { return number_; }
  /// Leaves the descriptor open.
  void release() { number_ = -1; }

 private:
  int number_;
};

}  // namespace Tarn::Common

#endif
