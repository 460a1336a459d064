#include "platform/inventory/sources/files/Archive.h"

#include <algorithm>
#include <cerrno>
#include <set>
#include <utility>

#include "platform/base/Hex.h"
#include "platform/inventory/sources/files/ErrorNames.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/Utf8.h"

namespace Tarn::Inventory {

namespace {

using Entry = MemoryFileSystem::Entry;
using Listing = MemoryFileSystem::Listing;

/// The name of a directory itself, below which its names stand.
constexpr std::string_view ownName = "./";

/// What reading a directory gives that could, or could not, be listed.
FileError errorOfReading(const Listing& listing) {
  return listing.error == 0 ? EISDIR : listing.error;
}

constexpr std::size_t bytesInLine = 32;

class ArchiveReader {
 public:
  explicit ArchiveReader(const std::string& name) : name_(name) {}

  void line(std::string_view text) {
    ++number_;
    if (text.starts_with('\t')) {
      if (more_ == nullptr) {
        refuse("a line of contents that belongs to no file", "begin with a line name: above it");
      }
      (this->*more_)(text.substr(1));
    } else if (text.starts_with('[')) {
      beginDirectory(text);
    } else if (!text.empty() && text.front() != '#') {
      beginEntry(text);
    }
  }

  MemoryFileSystem::Files take() { return std::move(files_); }

 private:
  [[noreturn]] void refuse(const std::string& why, const std::string& remedy) const {
    throw InventoryError("cannot read the captured files", name_ + ", line " + std::to_string(number_), why, remedy);
  }

  void beginDirectory(std::string_view text) {
    if (text.size() < 3 || text.back() != ']') {
      refuse("a directory without its closing bracket", "write [sys/devices/system/cpu]");
    }
    directory_ = text.substr(1, text.size() - 2);
    more_ = nullptr;
  }

  void beginEntry(std::string_view text) {
    const std::size_t end = text.find_first_of(":!#");
    if (end == 0 || end == std::string_view::npos) {
      refuse("no file name with a colon after it", "write name: contents");
    }
    if (directory_.empty()) {
      refuse("a file before the first directory", "begin with a line such as [sys/devices/system/cpu]");
    }
    const std::string_view name = text.substr(0, end);
    if (name != ownName && name.find('/') != std::string_view::npos) {
      refuse("a file name with a slash", "write the directory in brackets on a line above");
    }
    const std::string path = directory_ + '/' + std::string(name);
    if (!seen_.insert(path).second) {
      refuse(path + " is there twice", "remove one of the two");
    }
    std::string_view rest = text.substr(end + 1);
    rest.remove_prefix(rest.starts_with(' ') ? 1 : 0);
    if (name == ownName) {
      beginListing(text[end], rest);
    } else {
      beginFile(path, text[end], rest);
    }
  }

  void beginFile(const std::string& path, char mark, std::string_view rest) {
    open_ = &files_[path];
    open_->error = 0;  // also where listing it as a directory came first
    more_ = nullptr;
    if (mark == '!') {
      open_->error = errorOf(rest);
      return;
    }
    more_ = mark == '#' ? &ArchiveReader::moreBytes : &ArchiveReader::moreText;
    if (!rest.empty()) {
      (this->*more_)(rest);
    }
  }

  void beginListing(char mark, std::string_view rest) {
    const bool wasRead = seen_.contains(directory_);
    open_ = &files_[directory_];
    open_->listing.emplace();
    more_ = nullptr;
    if (mark == '!') {
      open_->listing->error = errorOf(rest);
    } else if (mark == ':' && rest.empty()) {
      more_ = &ArchiveReader::moreNames;
    } else {
      refuse("a directory's names beside its own", "write them below, one on each line, after a tab");
    }
    if (!wasRead) {
      open_->error = errorOfReading(*open_->listing);
    }
  }

  void moreText(std::string_view text) { open_->contents.append(text) += '\n'; }

  void moreNames(std::string_view text) { open_->listing->names.emplace_back(text); }

  void moreBytes(std::string_view text) {
    for (std::size_t i = 0; i < text.size(); i += 2) {
      const std::size_t high = Common::hexDigits.find(text[i]);
      const std::size_t low = i + 1 < text.size() ? Common::hexDigits.find(text[i + 1]) : std::string_view::npos;
      if (high == std::string_view::npos || low == std::string_view::npos) {
        refuse("bytes that are not pairs of the digits 0 to 9 and a to f", "write two digits for each byte");
      }
      open_->contents += static_cast<char>(static_cast<unsigned char>(high << 4U | low));
    }
  }

  FileError errorOf(std::string_view name) const {
    const std::optional<FileError> error = errorOfName(name);
    if (!error) {
      refuse("unknown error " + std::string(name), "use a name such as EACCES, EIO or ENOENT, or the error's number");
    }
    return *error;
  }

  const std::string& name_;
  unsigned int number_ = 0;
  std::string directory_;
  std::set<std::string, std::less<>> seen_;  // what has had a line of its own
  Entry* open_ = nullptr;
  void (ArchiveReader::*more_)(std::string_view text) = nullptr;  // what takes the lines after a tab
  MemoryFileSystem::Files files_;
};

/// Whether the contents survive as lines of text, in an editor as well: whole lines of UTF-8, without control
/// characters but the tab.
bool isText(std::string_view contents) {
  const auto isControl = [](char c) {
    const auto code = static_cast<unsigned char>(c);
    return (code < 0x20 && c != '\n' && c != '\t') || code == 0x7F;
  };
  return contents.empty() ||
         (contents.back() == '\n' && std::ranges::none_of(contents, isControl) && validUtf8(contents) == contents);
}

void writeText(std::string& text, std::string_view contents) {
  const std::size_t end = contents.find('\n');
  if (end != 0 && end != std::string_view::npos && end + 1 == contents.size()) {
    text.append(": ").append(contents);
    return;
  }
  text += ":\n";
  while (!contents.empty()) {
    const std::size_t length = std::min(contents.find('\n'), contents.size());
    text.append("\t").append(contents.substr(0, length)) += '\n';
    contents.remove_prefix(std::min(length + 1, contents.size()));
  }
}

void writeBytes(std::string& text, std::string_view contents) {
  text += contents.size() <= bytesInLine ? "# " : "#\n";
  for (; !contents.empty(); contents.remove_prefix(std::min(bytesInLine, contents.size()))) {
    text += text.back() == '\n' ? "\t" : "";
    for (const char c : contents.substr(0, bytesInLine)) {
      Common::appendHex(text, static_cast<unsigned char>(c));
    }
    text += '\n';
  }
}

void writeFile(std::string& text, const Entry& entry) {
  if (entry.error != 0) {
    text += "! " + nameOfError(entry.error) + '\n';
  } else if (isText(entry.contents)) {
    writeText(text, entry.contents);
  } else {
    writeBytes(text, entry.contents);
  }
}

void writeListing(std::string& text, const Listing& listing) {
  text += ownName;
  if (listing.error != 0) {
    text += "! " + nameOfError(listing.error) + '\n';
    return;
  }
  text += ":\n";
  for (const std::string& name : listing.names) {
    text.append("\t").append(name) += '\n';
  }
}

/// Whether reading the entry gives more than that it is a directory, so that it needs a line of its own.
bool isRead(const Entry& entry) {
  return !entry.listing || entry.error != errorOfReading(*entry.listing) || !entry.contents.empty();
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
  std::map<std::pair<std::string_view, std::string_view>, const Entry*> sorted;
  for (const auto& [path, entry] : files) {
    const std::string_view whole = path;
    const std::size_t slash = whole.rfind('/');
    if (entry.listing) {
      sorted.emplace(std::pair(whole, ownName), &entry);
    }
    if (isRead(entry)) {
      sorted.emplace(slash == std::string_view::npos ? std::pair(std::string_view("."), whole)
                                                     : std::pair(whole.substr(0, slash), whole.substr(slash + 1)),
                     &entry);
    }
  }
  std::string text;
  std::string_view current;
  for (const auto& [place, entry] : sorted) {
    if (place.first != current) {
      current = place.first;
      text.append("[").append(current) += "]\n";
    }
    if (place.second == ownName) {
      writeListing(text, *entry->listing);
    } else {
      text += place.second;
      writeFile(text, *entry);
    }
  }
  return text;
}

}  // namespace Tarn::Inventory
