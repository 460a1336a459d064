#include "platform/inventory/sources/files/MemoryFileSystem.h"

#include <algorithm>
#include <cerrno>

namespace Tarn::Inventory {

namespace {

class Below final : public FileSystem {
 public:
  Below(FileSystem& root, std::string directory) : root_(root), prefix_(std::move(directory) + '/') {}

  FileError read(const char* path, std::string& contents) override {
    return root_.read((prefix_ + path).c_str(), contents);
  }
  FileError list(const char* directory, std::vector<std::string>& names) override {
    return root_.list((prefix_ + directory).c_str(), names);
  }
  std::unique_ptr<FileSystem> below(const char* directory) override {
    return root_.below((prefix_ + directory).c_str());
  }
  std::string nameOf(std::string_view path) const override { return root_.nameOf(prefix_ + std::string(path)); }

 private:
  FileSystem& root_;
  std::string prefix_;
};

}  // namespace

void MemoryFileSystem::remove(std::string_view prefix) {
  std::erase_if(files_, [prefix](const auto& file) { return file.first.starts_with(prefix); });
}

FileError MemoryFileSystem::read(const char* path, std::string& contents) {
  contents.clear();
  const auto found = files_.find(std::string_view(path));
  if (found == files_.end()) {
    return ENOENT;
  }
  contents = found->second.contents;
  return found->second.error;
}

FileError MemoryFileSystem::list(const char* directory, std::vector<std::string>& names) {
  names.clear();
  if (const auto entry = files_.find(std::string_view(directory)); entry != files_.end() && entry->second.listing) {
    names = entry->second.listing->names;
    return entry->second.listing->error;
  }
  const std::string prefix = std::string(directory) + '/';
  for (auto file = files_.lower_bound(prefix); file != files_.end() && file->first.starts_with(prefix); ++file) {
    const std::string_view rest = std::string_view(file->first).substr(prefix.size());
    const std::string_view name = rest.substr(0, rest.find('/'));
    if (names.empty() || names.back() != name) {
      names.emplace_back(name);
    }
  }
  std::ranges::sort(names);
  names.erase(std::unique(names.begin(), names.end()), names.end());
  return names.empty() ? ENOENT : 0;
}

std::unique_ptr<FileSystem> MemoryFileSystem::below(const char* directory) {
  return std::make_unique<Below>(*this, directory);
}

std::string MemoryFileSystem::nameOf(std::string_view path) const {
  return "/" + std::string(path);
}

}  // namespace Tarn::Inventory
