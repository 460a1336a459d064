#include "platform/instrumentation/Archive.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <utility>

#include "platform/instrumentation/Error.h"

namespace Tarn::Inventory {

namespace {

struct ErrorName {
  std::string_view name;
  FileError error;
};
constexpr std::array errorNames = {
    ErrorName{"EACCES", EACCES}, ErrorName{"EINVAL", EINVAL}, ErrorName{"EIO", EIO},
    ErrorName{"ENOENT", ENOENT}, ErrorName{"ENXIO", ENXIO},   ErrorName{"EPERM", EPERM},
};

class ArchiveReader {
 public:
  explicit ArchiveReader(const std::string& name) : name_(name) {}

  void line(std::string_view text) {
    ++number_;
    if (text.starts_with('\t')) {
      moreOfFile(text.substr(1));
    } else if (text.starts_with('[')) {
      beginDirectory(text);
    } else if (!text.empty() && text.front() != '#') {
      beginFile(text);
    }
  }

  MemoryFileSystem::Files take() { return std::move(files_); }

 private:
  [[noreturn]] void refuse(const std::string& why, const std::string& remedy) const {
    throw InventoryError("can not read the captured files", name_ + ", line " + std::to_string(number_), why, remedy);
  }

  void beginDirectory(std::string_view text) {
    if (text.size() < 3 || text.back() != ']') {
      refuse("a directory without its closing bracket", "write [sys/devices/system/cpu]");
    }
    directory_ = std::string(text.substr(1, text.size() - 2)) + '/';
    open_ = nullptr;
  }

  void beginFile(std::string_view text) {
    const std::size_t end = text.find_first_of(":!");
    if (end == 0 || end == std::string_view::npos) {
      refuse("no file name with a colon behind it", "write name: contents");
    }
    if (directory_.empty()) {
      refuse("a file before the first directory", "begin with a line such as [sys/devices/system/cpu]");
    }
    const auto [file, added] = files_.try_emplace(directory_ + std::string(text.substr(0, end)));
    if (!added) {
      refuse(file->first + " is there twice", "remove one of the two");
    }
    open_ = &file->second;
    std::string_view rest = text.substr(end + 1);
    rest.remove_prefix(rest.starts_with(' ') ? 1 : 0);
    if (text[end] == '!') {
      open_->error = errorOf(rest);
      open_ = nullptr;
    } else if (!rest.empty()) {
      open_->contents = std::string(rest) + '\n';
    }
  }

  void moreOfFile(std::string_view text) {
    if (open_ == nullptr) {
      refuse("a line of contents that belongs to no file", "begin with a line name: above it");
    }
    open_->contents += std::string(text) + '\n';
  }

  FileError errorOf(std::string_view name) const {
    const auto* const found = std::ranges::find(errorNames, name, &ErrorName::name);
    if (found == errorNames.end()) {
      refuse("unknown error " + std::string(name), "use EACCES, EINVAL, EIO, ENOENT, ENXIO or EPERM");
    }
    return found->error;
  }

  const std::string& name_;
  unsigned int number_ = 0;
  std::string directory_;
  MemoryFileSystem::Entry* open_ = nullptr;
  MemoryFileSystem::Files files_;
};

std::string_view nameOfError(FileError error) {
  const auto* const found = std::ranges::find(errorNames, error, &ErrorName::error);
  return found == errorNames.end() ? "EIO" : found->name;
}

void writeContents(std::string& text, std::string_view contents) {
  const std::size_t end = contents.find('\n');
  if (end != 0 && end != std::string_view::npos && end + 1 == contents.size()) {
    text += ": ";
    text += contents.substr(0, end);
    text += '\n';
    return;
  }
  text += ":\n";
  while (!contents.empty()) {
    const std::size_t length = std::min(contents.find('\n'), contents.size());
    text += '\t';
    text += contents.substr(0, length);
    text += '\n';
    contents.remove_prefix(std::min(length + 1, contents.size()));
  }
}

}  // namespace

MemoryFileSystem::Files readArchive(std::string_view text, const std::string& name) {
  ArchiveReader reader(name);
  while (!text.empty()) {
    const std::size_t length = std::min(text.find('\n'), text.size());
    reader.line(text.substr(0, length));
    text.remove_prefix(std::min(length + 1, text.size()));
  }
  return reader.take();
}

std::string writeArchive(const MemoryFileSystem::Files& files) {
  // By directory, so that each is named once: a directory's own files first, then those below it.
  const auto split = [](std::string_view path) {
    const std::size_t slash = path.rfind('/');
    return slash == std::string_view::npos ? std::pair(std::string_view("."), path)
                                           : std::pair(path.substr(0, slash), path.substr(slash + 1));
  };
  std::map<std::pair<std::string_view, std::string_view>, const MemoryFileSystem::Entry*> sorted;
  for (const auto& [path, entry] : files) {
    sorted.emplace(split(path), &entry);
  }
  std::string text;
  std::string_view current;
  for (const auto& [place, entry] : sorted) {
    if (place.first != current) {
      current = place.first;
      text += '[' + std::string(current) + "]\n";
    }
    text += place.second;
    if (entry->error != 0) {
      text += "! " + std::string(nameOfError(entry->error)) + '\n';
    } else {
      writeContents(text, entry->contents);
    }
  }
  return text;
}

}  // namespace Tarn::Inventory
