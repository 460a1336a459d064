#include "host/corvcim/options/SourceArgument.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <charconv>
#include <optional>
#include <ranges>
#include <utility>
#include <vector>

#include "host/corvcim/hwloc/HwlocSource.h"
#include "host/corvcim/text/CrashReport.h"
#include "platform/base/Ascii.h"
#include "platform/base/FileDescriptor.h"
#include "platform/inventory/sources/Source.h"
#include "platform/inventory/sources/snapshot/Snapshot.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"

namespace Corvcim {
namespace {

using Tarn::Common::FileDescriptor;
using Tarn::Inventory::InventoryError;

constexpr std::string_view standardInput = "/dev/stdin";
constexpr std::string_view hwlocFile = "hwloc:";
constexpr std::string_view hwlocText = "hwloc-synthetic:";

/// A one-time source in memory, kept until the program ends, with the name that the user gave.
struct KeptFile {
  FileDescriptor file;
  std::string name;
  std::string given;
};
std::vector<KeptFile> keptFiles;

[[noreturn]] void failToRead(const std::string& location, int error) {
  throw InventoryError("cannot read the inventory", location, Tarn::Inventory::describeError(error),
                       "name a file, or a pipe that an inventory comes through");
}

/// The descriptor of this process that the name stands for. Opening such a name again fails for sockets, and may be
/// forbidden.
std::optional<int> descriptorNamed(std::string_view name) {
  if (name == standardInput) {
    return STDIN_FILENO;
  }
  for (const std::string_view directory : {"/dev/fd/", "/proc/self/fd/"}) {
    int number = 0;
    const char* const end = name.data() + name.size();
    if (name.starts_with(directory) && std::from_chars(name.data() + directory.size(), end, number).ptr == end) {
      return number;
    }
  }
  return std::nullopt;
}

std::string readToEnd(int descriptor, const std::string& name) {
  constexpr std::size_t largestInventory = std::size_t{64} << 20;
  std::string contents;
  std::array<char, 16384> piece;
  for (;;) {
    const ssize_t size = ::read(descriptor, piece.data(), piece.size());
    if (size == 0) {
      return contents;
    }
    if (size < 0 && errno != EINTR) {
      failToRead(name, errno);
    }
    contents.append(piece.data(), size < 0 ? 0 : static_cast<std::size_t>(size));
    if (contents.size() > largestInventory) {
      failToRead(name, EFBIG);
    }
  }
}

/// A file in memory that children inherit.
FileDescriptor fileInMemory(std::string_view contents, const std::string& name) {
  FileDescriptor file(memfd_create("corvcim-inventory", 0));
  if (!file) {
    failToRead(name, errno);
  }
  while (!contents.empty()) {
    const ssize_t written = ::write(file.number(), contents.data(), contents.size());
    if (written < 0 && errno != EINTR) {
      failToRead(name, errno);
    }
    contents.remove_prefix(written < 0 ? 0 : static_cast<std::size_t>(written));
  }
  return file;
}

/// Keeps the contents and returns the source that names them, beginning with the scheme.
std::string keep(std::string_view scheme, std::string_view contents, const std::string& given) {
  FileDescriptor file = fileInMemory(contents, given);
  std::string name = std::string(scheme) + "/dev/fd/" + std::to_string(file.number());
  keptFiles.push_back({std::move(file), name, given});
  return name;
}

/// A name under which a file can be read again: its own, if it is one that can. A descriptor keeps its name, as what
/// was read from it takes its place.
std::string readableAgain(std::string_view location) {
  std::string name(location == "-" ? standardInput : location);
  const auto known = std::ranges::find(keptFiles, name, &KeptFile::given);
  if (known != keptFiles.end()) {
    return known->name;
  }
  const std::optional<int> descriptor = descriptorNamed(name);
  struct stat status {};
  const bool isThere = (descriptor ? ::fstat(*descriptor, &status) : ::stat(name.c_str(), &status)) == 0;
  if (!isThere || !(S_ISFIFO(status.st_mode) || S_ISSOCK(status.st_mode) || S_ISCHR(status.st_mode))) {
    return name;
  }
  if (descriptor) {
    const FileDescriptor copy = fileInMemory(readToEnd(*descriptor, name), name);
    if (::dup2(copy.number(), *descriptor) < 0) {
      failToRead(name, errno);
    }
    return name;
  }
  const FileDescriptor opened(::open(name.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY));
  if (!opened) {
    failToRead(name, errno);
  }
  return keep("", readToEnd(opened.number(), name), name);
}

bool isHwlocSource(std::string_view text) {
  return text.starts_with(hwlocFile) || text.starts_with(hwlocText);
}

/// The source of a description's inventory; `given` is its name for messages.
std::string settleDescription(std::string_view description, std::string_view given) {
  return keep("json:", Tarn::Inventory::writeJson(convertDescription(description)), std::string(given));
}

/// How the files of a kind begin.
struct Beginning {
  std::string_view text;
  std::string_view scheme;
};
constexpr Beginning beginnings[] = {
    {Tarn::Inventory::snapshotFirstLine, "snapshot:"},
    {"#", "root:"},  // captured files, after remarks
    {"[", "root:"},
    {"_SM", "smbios:"},
    {"{", "json:"},
    {"<", hwlocFile},
};

std::string_view schemeOf(const std::string& location, const std::string& given) {
  const FileDescriptor file(::open(location.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
  std::array<char, 256> start;
  const ssize_t size = file ? ::read(file.number(), start.data(), start.size()) : -1;
  if (size < 0 && errno == EISDIR) {
    return "root:";
  }
  if (size < 0) {
    failToRead(given, errno);
  }
  constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
  std::string_view text(start.data(), static_cast<std::size_t>(size));
  text.remove_prefix(text.starts_with(byteOrderMark) ? byteOrderMark.size() : 0);
  text = Tarn::Common::trimmed(text, " \t\r\n");
  for (const Beginning& each : beginnings) {
    if (text.starts_with(each.text)) {
      return each.scheme;
    }
  }
  if (text.empty()) {
    throw InventoryError("cannot read the inventory", given, "it is empty", "name a file that holds an inventory");
  }
  throw InventoryError("cannot read the inventory", given, "its first bytes are those of no inventory",
                       "name its kind as well: snapshot:FILE, json:FILE, root:FILE, smbios:FILE or hwloc:FILE");
}

}  // namespace

bool isSourceArgument(std::string_view text) {
  return text == "-" || isHwlocSource(text) || Tarn::Inventory::namesSource(text) ||
         (!text.empty() && ::access(std::string(text).c_str(), F_OK) == 0);
}

std::string settleSource(std::string_view text) {
  if (isHwlocSource(text)) {
    return settleDescription(text, text);
  }
  if (Tarn::Inventory::namesSource(text)) {
    std::string settled(text);
    // From the last on, so that the places of the others stay.
    for (const std::string_view location : std::views::reverse(Tarn::Inventory::locationsOf(text))) {
      settled.replace(static_cast<std::size_t>(location.data() - text.data()), location.size(),
                      readableAgain(location));
    }
    return settled;
  }
  if (!isSourceArgument(text)) {
    return std::string(text);
  }
  const std::string given(text == "-" ? standardInput : text);
  const std::string location = readableAgain(given);
  const std::string source = std::string(schemeOf(location, given)).append(location);
  return isHwlocSource(source) ? settleDescription(source, given) : source;
}

Tarn::Inventory::Tree convertDescription(std::string_view description) {
  std::string settled(description);
  if (description.starts_with(hwlocFile)) {
    settled = std::string(hwlocFile) + readableAgain(description.substr(hwlocFile.size()));
  }
  // hwloc trusts that a description is complete.
  const CrashReport report("cannot read the inventory: " + std::string(description) +
                           ": hwloc crashed on it; correct the description");
  return readHwloc(settled);
}

std::string withGivenNames(std::string text) {
  for (const KeptFile& each : keptFiles) {
    for (std::size_t at = text.find(each.name); at != std::string::npos; at = text.find(each.name, at)) {
      text.replace(at, each.name.size(), each.given);
      at += each.given.size();
    }
  }
  return text;
}

}  // namespace Corvcim
