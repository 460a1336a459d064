#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_RECORDINGFILESYSTEM_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FILES_RECORDINGFILESYSTEM_H

#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/sources/files/MemoryFileSystem.h"

namespace Tarn::Inventory {

/// Passes everything on and keeps what was asked for, in order: the list of files that a source reads,
/// and a capture of them that gives the source the same answers.
class RecordingFileSystem final : public FileSystem {
 public:
  struct Record {
    std::vector<std::string> opened;  ///< paths that were read, failed attempts included
    MemoryFileSystem::Files files;    ///< what was found in them, and in the directories that were listed
  };

  RecordingFileSystem(FileSystem& target, Record& record) : RecordingFileSystem(target, record, {}) {}

  FileError read(const char* path, std::string& contents) override;
  FileError list(const char* directory, std::vector<std::string>& names) override;
  std::unique_ptr<FileSystem> below(const char* directory) override;
  std::string nameOf(std::string_view path) const override;

 private:
  RecordingFileSystem(FileSystem& target, Record& record, std::string prefix)
      : target_(target), record_(record), prefix_(std::move(prefix)) {}

  std::unique_ptr<FileSystem> owned_;
  FileSystem& target_;
  Record& record_;
  std::string prefix_;
};

}  // namespace Tarn::Inventory

#endif
