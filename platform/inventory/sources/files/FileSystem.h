#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_FILESYSTEM_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_FILESYSTEM_H

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace Tarn::Inventory {

/// Why a file could not be read: 0 for no error, else the system's number for it (ENOENT, EACCES, ...).
using FileError = int;

/// The error in words, the same in every language environment.
std::string describeError(FileError error);

/// The one door through which the inventory sources see files: the real root, a captured root
/// directory, or files in memory. Read-only. Paths are relative to the root, without a leading slash.
class FileSystem {
 public:
  FileSystem() = default;
  FileSystem(const FileSystem&) = delete;
  FileSystem(FileSystem&&) = delete;
  FileSystem& operator=(const FileSystem&) = delete;
  FileSystem& operator=(FileSystem&&) = delete;
  virtual ~FileSystem() = default;

  /// Reads a whole file into `contents`, which is a buffer to be used again and again; it is empty
  /// after an error.
  virtual FileError read(const char* path, std::string& contents) = 0;

  /// The names in a directory, sorted, without "." and "..".
  virtual FileError list(const char* directory, std::vector<std::string>& names) = 0;

  /// The files below a directory as a file system of its own: cheaper where many of them are read.
  /// It must not outlive this one. A directory that is not there gives one in which nothing is found.
  virtual std::unique_ptr<FileSystem> below(const char* directory) = 0;

  /// The path as people should see it in a message.
  virtual std::string nameOf(std::string_view path) const = 0;
};

/// The file system below a directory: "/" for the machine's own, else a captured root.
/// Throws InventoryError if the directory cannot be opened.
std::unique_ptr<FileSystem> openDirectory(const std::string& directory);

}  // namespace Tarn::Inventory

#endif
