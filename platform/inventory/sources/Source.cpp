#include "platform/inventory/sources/Source.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/sources/files/OverlayFileSystem.h"
#include "platform/inventory/sources/firmware/DumpFile.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/sources/snapshot/Snapshot.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"

namespace Tarn::Inventory {

namespace {

std::string readWhole(const std::string& file, FileError& error) {
  std::string contents;
  // A path from the configuration may be relative to the working directory, or absolute.
  error = openDirectory(".")->read(file.c_str(), contents);
  return contents;
}

std::string readWhole(const std::string& file, const char* remedy) {
  FileError error = 0;
  std::string contents = readWhole(file, error);
  if (error != 0) {
    throw InventoryError("cannot read the inventory", file, describeError(error), remedy);
  }
  return contents;
}

std::unique_ptr<FileSystem> openLive(const std::string& /*location*/) {
  return openDirectory("/");
}

std::unique_ptr<FileSystem> openRoot(const std::string& location) {
  FileError error = 0;
  const std::string archive = readWhole(location, error);
  if (error == EISDIR) {
    return openDirectory(location);
  }
  if (error != 0) {
    throw InventoryError("cannot read the inventory", location, describeError(error),
                         "name a captured root directory, or a file of captured files");
  }
  return std::make_unique<MemoryFileSystem>(readArchive(archive, location));
}

std::unique_ptr<FileSystem> openSnapshot(const std::string& location) {
  return std::make_unique<MemoryFileSystem>(
      readSnapshot(readWhole(location, "name a file that corvcim snapshot wrote"), location));
}

std::unique_ptr<FileSystem> openSmbios(const std::string& location);
Tree loadSmbios(const std::string& location, Detail detail);

Tree loadJson(const std::string& location, Detail detail) {
  return readJson(readWhole(location, "name a file that holds an inventory as JSON"), location, detail);
}

/// A kind of source: files, and how the tree comes of them, if it is not by the live source's readers.
struct Scheme {
  std::string_view name;
  bool hasLocation;
  std::unique_ptr<FileSystem> (*open)(const std::string& location);
  Tree (*load)(const std::string& location, Detail detail);
};
constexpr std::array schemes = {
    Scheme{"json", true, nullptr, loadJson},         Scheme{"live", false, openLive, nullptr},
    Scheme{"root", true, openRoot, nullptr},         Scheme{"smbios", true, openSmbios, loadSmbios},
    Scheme{"snapshot", true, openSnapshot, nullptr},
};

struct Choice {
  const Scheme& scheme;
  std::string location;
};

std::optional<Choice> find(std::string_view specification) {
  const std::size_t colon = specification.find(':');
  const std::string_view name = specification.substr(0, colon);
  const std::string location(colon == std::string_view::npos ? std::string_view() : specification.substr(colon + 1));
  const auto* const scheme = std::ranges::find(schemes, name, &Scheme::name);
  if (scheme == schemes.end() || scheme->hasLocation != (colon != std::string_view::npos) ||
      (scheme->hasLocation && location.empty())) {
    return std::nullopt;
  }
  return Choice{*scheme, location};
}

Choice choose(std::string_view specification) {
  const std::optional<Choice> choice = find(specification);
  if (!choice) {
    throw InventoryError("cannot read the inventory", '"' + std::string(specification) + '"',
                         "it names no source of an inventory",
                         "set CORVANE_INVENTORY, or inventory in the configuration, to " + std::string(sourceForms));
  }
  return *choice;
}

/// A dump of the firmware's tables, and the source that it stands in front of.
struct Dump {
  std::string file;
  std::optional<Choice> behind;
};

// FILE+SOURCE. The file's name may have a plus sign as well, so only one with a source of files after it
// is meant.
Dump splitDump(const std::string& location) {
  for (std::size_t plus = location.find('+'); plus != std::string::npos; plus = location.find('+', plus + 1)) {
    const std::optional<Choice> behind = find(std::string_view(location).substr(plus + 1));
    if (behind && behind->scheme.load == nullptr) {
      return {location.substr(0, plus), behind};
    }
  }
  return {location, std::nullopt};
}

std::unique_ptr<FileSystem> openDump(const Dump& dump) {
  const std::string contents = readWhole(dump.file, "name a file that dmidecode --dump-bin wrote");
  return std::make_unique<OverlayFileSystem>(filesOfDump(contents, dump.file), dump.file,
                                             dump.behind ? dump.behind->scheme.open(dump.behind->location) : nullptr);
}

std::unique_ptr<FileSystem> openSmbios(const std::string& location) {
  const Dump dump = splitDump(location);
  return dump.behind ? openDump(dump) : nullptr;
}

Tree loadSmbios(const std::string& location, Detail detail) {
  const Dump dump = splitDump(location);
  const std::unique_ptr<FileSystem> root = openDump(dump);
  return dump.behind ? readLiveInventory(*root, detail) : readFirmwareInventory(*root, detail);
}

}  // namespace

bool namesSource(std::string_view specification) {
  return find(specification).has_value();
}

std::vector<std::string_view> locationsOf(std::string_view specification) {
  const std::optional<Choice> choice = find(specification);
  if (!choice || !choice->scheme.hasLocation) {
    return {};
  }
  const std::string_view location = specification.substr(specification.size() - choice->location.size());
  const Dump dump = choice->scheme.load == loadSmbios ? splitDump(choice->location) : Dump{choice->location, {}};
  std::vector<std::string_view> locations = {location.substr(0, dump.file.size())};
  if (dump.behind && dump.behind->scheme.hasLocation) {
    locations.push_back(location.substr(location.size() - dump.behind->location.size()));
  }
  return locations;
}

Tree loadInventory(std::string_view specification, Detail detail) {
  const auto [scheme, location] = choose(specification);
  return scheme.load != nullptr ? scheme.load(location, detail) : readLiveInventory(*scheme.open(location), detail);
}

std::unique_ptr<FileSystem> openSource(std::string_view specification) {
  const auto [scheme, location] = choose(specification);
  return scheme.open == nullptr ? nullptr : scheme.open(location);
}

}  // namespace Tarn::Inventory
