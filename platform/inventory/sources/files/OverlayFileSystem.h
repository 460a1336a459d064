#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_OVERLAYFILESYSTEM_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_OVERLAYFILESYSTEM_H

#include <memory>
#include <string>
#include <utility>

#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/sources/files/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// Some files of its own in front of another file system, which they hide where it has the same ones.
class OverlayFileSystem final : public FileSystem {
 public:
  /// `name` is what people see in the place of the files in front. There may be nothing behind them.
  OverlayFileSystem(MemoryFileSystem::Files front, const std::string& name, std::unique_ptr<FileSystem> behind)
      : OverlayFileSystem(std::make_shared<Front>(std::move(front), name), {}, std::move(behind)) {}

  FileError read(const char* path, std::string& contents) override;
  FileError list(const char* directory, std::vector<std::string>& names) override;
  std::unique_ptr<FileSystem> below(const char* directory) override;
  std::string nameOf(std::string_view path) const override;

 private:
  struct Front {
    Front(MemoryFileSystem::Files own, std::string shown) : files(std::move(own)), name(std::move(shown)) {}

    MemoryFileSystem files;
    std::string name;
  };

  OverlayFileSystem(std::shared_ptr<Front> front, std::string prefix, std::unique_ptr<FileSystem> behind)
      : front_(std::move(front)), prefix_(std::move(prefix)), behind_(std::move(behind)) {}

  std::shared_ptr<Front> front_;
  std::string prefix_;  // of this directory in the paths of the files in front
  std::unique_ptr<FileSystem> behind_;
};

}  // namespace Tarn::Inventory

#endif
