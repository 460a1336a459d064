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

namespace Tarn::Inventory {

namespace {

Tree loadLive(const std::string& /*location*/, Detail detail) {
  return readLiveInventory(*openDirectory("/"), detail);
}

std::string readWhole(const std::string& file, FileError& error) {
  std::string contents;
  // A path from the configuration may be relative to the working directory, or absolute.
  error = openDirectory(".")->read(file.c_str(), contents);
  return contents;
}

Tree loadRoot(const std::string& location, Detail detail) {
  FileError error = 0;
  const std::string archive = readWhole(location, error);
  if (error == EISDIR) {
    return readLiveInventory(*openDirectory(location), detail);
  }
  if (error != 0) {
    throw InventoryError("can not read the inventory", location, describeError(error),
                         "name a captured root directory, or a file of captured files");
  }
  MemoryFileSystem files(readArchive(archive, location));
  return readLiveInventory(files, detail);
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

struct Scheme {
  std::string_view name;
  bool hasLocation;
  Tree (*load)(const std::string& location, Detail detail);
};
constexpr std::array schemes = {
    Scheme{"json", true, loadJson},
    Scheme{"live", false, loadLive},
    Scheme{"root", true, loadRoot},
};

}  // namespace

Tree loadInventory(std::string_view specification, Detail detail) {
  const std::size_t colon = specification.find(':');
  const std::string_view name = specification.substr(0, colon);
  const std::string location(colon == std::string_view::npos ? std::string_view() : specification.substr(colon + 1));
  const auto* const scheme = std::ranges::find(schemes, name, &Scheme::name);
  if (scheme == schemes.end() || scheme->hasLocation != (colon != std::string_view::npos) ||
      (scheme->hasLocation && location.empty())) {
    throw InventoryError(
        "can not read the inventory", '"' + std::string(specification) + '"', "it names no source of an inventory",
        "set CORVANE_INVENTORY, or inventory in the configuration, to live, root:DIRECTORY or json:FILE");
  }
  return scheme->load(location, detail);
}

}  // namespace Tarn::Inventory
