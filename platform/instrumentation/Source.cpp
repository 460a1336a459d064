#include "platform/instrumentation/Source.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <string>

#include "platform/instrumentation/Archive.h"
#include "platform/instrumentation/Error.h"
#include "platform/instrumentation/FileSystem.h"
#include "platform/instrumentation/JsonTree.h"
#include "platform/instrumentation/LiveSource.h"
#include "platform/instrumentation/Snapshot.h"

namespace Tarn::Inventory {

namespace {

std::string readWhole(const std::string& file, FileError& error) {
  std::string contents;
  // A path from the configuration may be relative to the working directory, or absolute.
  error = openDirectory(".")->read(file.c_str(), contents);
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
    throw InventoryError("can not read the inventory", location, describeError(error),
                         "name a captured root directory, or a file of captured files");
  }
  return std::make_unique<MemoryFileSystem>(readArchive(archive, location));
}

std::unique_ptr<FileSystem> openSnapshot(const std::string& location) {
  FileError error = 0;
  const std::string text = readWhole(location, error);
  if (error != 0) {
    throw InventoryError("can not read the inventory", location, describeError(error),
                         "name a file that corvcim snapshot wrote");
  }
  return std::make_unique<MemoryFileSystem>(readSnapshot(text, location));
}

Tree loadJson(const std::string& location, Detail detail) {
  FileError error = 0;
  const std::string text = readWhole(location, error);
  if (error != 0) {
    throw InventoryError("can not read the inventory", location, describeError(error),
                         "name a file that holds an inventory as JSON");
  }
  return readJson(text, location, detail);
}

/// A kind of source: either files that the live source's readers read, or a tree as it is.
struct Scheme {
  std::string_view name;
  bool hasLocation;
  std::unique_ptr<FileSystem> (*open)(const std::string& location);
  Tree (*load)(const std::string& location, Detail detail);
};
constexpr std::array schemes = {
    Scheme{"json", true, nullptr, loadJson},
    Scheme{"live", false, openLive, nullptr},
    Scheme{"root", true, openRoot, nullptr},
    Scheme{"snapshot", true, openSnapshot, nullptr},
};

struct Choice {
  const Scheme& scheme;
  std::string location;
};

Choice choose(std::string_view specification) {
  const std::size_t colon = specification.find(':');
  const std::string_view name = specification.substr(0, colon);
  const std::string location(colon == std::string_view::npos ? std::string_view() : specification.substr(colon + 1));
  const auto* const scheme = std::ranges::find(schemes, name, &Scheme::name);
  if (scheme == schemes.end() || scheme->hasLocation != (colon != std::string_view::npos) ||
      (scheme->hasLocation && location.empty())) {
    throw InventoryError("can not read the inventory", '"' + std::string(specification) + '"',
                         "it names no source of an inventory",
                         "set CORVANE_INVENTORY, or inventory in the configuration, to live, root:DIRECTORY, "
                         "snapshot:FILE or json:FILE");
  }
  return {*scheme, location};
}

}  // namespace

Tree loadInventory(std::string_view specification, Detail detail) {
  const auto [scheme, location] = choose(specification);
  return scheme.open == nullptr ? scheme.load(location, detail) : readLiveInventory(*scheme.open(location), detail);
}

std::unique_ptr<FileSystem> openSource(std::string_view specification) {
  const auto [scheme, location] = choose(specification);
  return scheme.open == nullptr ? nullptr : scheme.open(location);
}

}  // namespace Tarn::Inventory
