#include "platform/inventory/sources/files/OverlayFileSystem.h"

#include <algorithm>
#include <cerrno>
#include <iterator>

namespace Tarn::Inventory {

FileError OverlayFileSystem::read(const char* path, std::string& contents) {
  const MemoryFileSystem::Files& own = front_->files.files();
  const auto found = own.find(prefix_ + path);
  if (found != own.end()) {
    contents = found->second.contents;
    return found->second.error;
  }
  contents.clear();
  return behind_ ? behind_->read(path, contents) : ENOENT;
}

FileError OverlayFileSystem::list(const char* directory, std::vector<std::string>& names) {
  std::vector<std::string> own;
  const FileError ownError = front_->files.list((prefix_ + directory).c_str(), own);
  names.clear();
  const FileError error = behind_ ? behind_->list(directory, names) : ENOENT;
  std::vector<std::string> all;
  std::ranges::set_union(own, names, std::back_inserter(all));
  names = std::move(all);
  return ownError == 0 ? 0 : error;
}

std::unique_ptr<FileSystem> OverlayFileSystem::below(const char* directory) {
  return std::unique_ptr<FileSystem>(
      new OverlayFileSystem(front_, prefix_ + directory + '/', behind_ ? behind_->below(directory) : nullptr));
}

std::string OverlayFileSystem::nameOf(std::string_view path) const {
  const std::string whole = prefix_ + std::string(path);
  if (front_->files.files().contains(whole)) {
    return front_->name;
  }
  return behind_ ? behind_->nameOf(path) : '/' + whole;
}

}  // namespace Tarn::Inventory
