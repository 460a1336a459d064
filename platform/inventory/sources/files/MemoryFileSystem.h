#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_MEMORYFILESYSTEM_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_MEMORYFILESYSTEM_H

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/inventory/sources/files/FileSystem.h"

namespace Tarn::Inventory {

/// What listing a directory gives.
struct DirectoryListing {
  std::vector<std::string> names = {};
  FileError error = 0;
  bool operator==(const DirectoryListing&) const = default;
};

/// Files in memory, for tests and captures.
class MemoryFileSystem final : public FileSystem {
 public:
  using Listing = DirectoryListing;
  struct Entry {
    std::string contents = {};
    FileError error = 0;                  ///< what an attempt to read it gives
    std::optional<Listing> listing = {};  ///< of a directory whose names are known; else those of the files below it
    bool operator==(const Entry&) const = default;
  };
  using Files = std::map<std::string, Entry, std::less<>>;

  MemoryFileSystem() = default;
  explicit MemoryFileSystem(Files files) : files_(std::move(files)) {}

  void add(std::string path, std::string contents) { files_[std::move(path)] = {std::move(contents)}; }
  void fail(std::string path, FileError error) { files_[std::move(path)] = {{}, error}; }
  void remove(std::string_view prefix);  ///< every file whose path begins so

  const Files& files() const { return files_; }

  FileError read(const char* path, std::string& contents) override;
  FileError list(const char* directory, std::vector<std::string>& names) override;
  std::unique_ptr<FileSystem> below(const char* directory) override;
  std::string nameOf(std::string_view path) const override;

 private:
  Files files_;
};

}  // namespace Tarn::Inventory

#endif
