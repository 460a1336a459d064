#include "platform/inventory/sources/files/RecordingFileSystem.h"

#include <cerrno>

namespace Tarn::Inventory {

FileError RecordingFileSystem::read(const char* path, std::string& contents) {
  const FileError error = target_.read(path, contents);
  std::string whole = prefix_ + path;
  record_.opened.push_back(whole);
  if (error != ENOENT) {
    MemoryFileSystem::Entry& entry = record_.files[std::move(whole)];
    entry.contents = contents;
    entry.error = error;
  }
  return error;
}

FileError RecordingFileSystem::list(const char* directory, std::vector<std::string>& names) {
  const FileError error = target_.list(directory, names);
  if (error != ENOENT) {
    MemoryFileSystem::Entry& entry = record_.files[prefix_ + directory];
    entry.listing = {error == 0 ? names : std::vector<std::string>(), error};
    entry.error = error == 0 ? EISDIR : error;
  }
  return error;
}

std::unique_ptr<FileSystem> RecordingFileSystem::below(const char* directory) {
  std::unique_ptr<FileSystem> target = target_.below(directory);
  std::unique_ptr<RecordingFileSystem> recording(new RecordingFileSystem(*target, record_, prefix_ + directory + '/'));
  recording->owned_ = std::move(target);
  return recording;
}

std::string RecordingFileSystem::nameOf(std::string_view path) const {
  return target_.nameOf(path);
}

}  // namespace Tarn::Inventory
