#include <dirent.h>
#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <string_view>
#include <utility>

#include "platform/base/FileDescriptor.h"
#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/tree/Error.h"

namespace Tarn::Inventory {

namespace {

using Common::FileDescriptor;

// More than any inventory is; what is larger is the wrong file.
constexpr std::size_t largestFile = std::size_t{64} << 20;

// The kernel gives an attribute of sysfs a page at a time, so what is shorter than the smallest page is the
// whole of it. Elsewhere only the read that gives nothing is the end: /proc/cpuinfo comes in pieces of any size.
constexpr std::string_view attributes = "sys/";
constexpr ssize_t smallestPage = 4096;

FileError readAll(int file, bool isAttribute, std::string& contents) {
  contents.clear();
  std::array<char, 16384> chunk;
  for (;;) {
    const ssize_t got = ::read(file, chunk.data(), chunk.size());
    if (got == 0) {
      return 0;
    }
    if (got > 0) {
      contents.append(chunk.data(), static_cast<std::size_t>(got));
      if (contents.size() > largestFile) {
        return EFBIG;
      }
      if (isAttribute && got < smallestPage) {
        return 0;
      }
    } else if (errno != EINTR) {
      return errno;
    }
  }
}

struct CloseDirectory {
  void operator()(DIR* stream) const { ::closedir(stream); }
};

class RealFileSystem final : public FileSystem {
 public:
  RealFileSystem(FileDescriptor directory, std::string name, bool isOfAttributes)
      : directory_(std::move(directory)), name_(std::move(name)), isOfAttributes_(isOfAttributes) {}

  FileError read(const char* path, std::string& contents) override {
    const FileDescriptor file(open(path, O_RDONLY));
    const FileError error = file ? readAll(file.number(), holdsAttribute(path), contents) : errno;
    if (error != 0) {
      contents.clear();
    }
    return error;
  }

  FileError list(const char* directory, std::vector<std::string>& names) override {
    names.clear();
    const int file = open(directory, O_RDONLY | O_DIRECTORY);
    const std::unique_ptr<DIR, CloseDirectory> stream(file < 0 ? nullptr : ::fdopendir(file));
    if (!stream) {
      const FileError error = errno;
      const FileDescriptor unused(file);
      return error;
    }
    errno = 0;
    while (const dirent* entry = ::readdir(stream.get())) {
      const std::string_view name = entry->d_name;
      if (name != "." && name != "..") {
        names.emplace_back(name);
      }
    }
    const FileError error = errno;
    std::ranges::sort(names);
    return error;
  }

  std::unique_ptr<FileSystem> below(const char* directory) override {
    return std::make_unique<RealFileSystem>(FileDescriptor(open(directory, O_PATH | O_DIRECTORY)), nameOf(directory),
                                            holdsAttribute(directory));
  }

  std::string nameOf(std::string_view path) const override {
    return (name_.ends_with('/') ? name_ : name_ + '/') + std::string(path);
  }

 private:
  // Without O_NONBLOCK a pipe in a file's place would hold up the whole broker.
  int open(const char* path, int flags) const {
    if (!directory_) {
      errno = ENOENT;
      return -1;
    }
    return ::openat(directory_.number(), path, flags | O_CLOEXEC | O_NOCTTY | O_NONBLOCK);
  }

  // Also of a captured root, whose regular files end with a short read, too.
  bool holdsAttribute(std::string_view path) const { return isOfAttributes_ || path.starts_with(attributes); }

  FileDescriptor directory_;
  std::string name_;
  bool isOfAttributes_;
};

}  // namespace

std::unique_ptr<FileSystem> openDirectory(const std::string& directory) {
  FileDescriptor descriptor(::open(directory.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
  if (!descriptor) {
    throw InventoryError("cannot read the inventory", directory, describeError(errno),
                         "name a directory that holds sys/ and proc/ of a machine");
  }
  return std::make_unique<RealFileSystem>(std::move(descriptor), directory, false);
}

}  // namespace Tarn::Inventory
