#include "host/corvcim/hwloc/HwlocSource.h"

#include <array>
#include <string>

#include "host/corvcim/hwloc/HwlocConversion.h"
#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/tree/Error.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::InventoryError;
using Tarn::Inventory::Tree;

Tree readFile(const std::string& file) {
  std::string text;
  if (const Tarn::Inventory::FileError error = Tarn::Inventory::openDirectory(".")->read(file.c_str(), text)) {
    throw InventoryError("cannot read the inventory", file, Tarn::Inventory::describeError(error),
                         "name an XML file as lstopo writes it");
  }
  return treeOfXml(text, file);
}

Tree readDescription(const std::string& description) {
  return treeOfSynthetic(description, '"' + description + '"');
}

struct Scheme {
  std::string_view prefix;
  Tree (*read)(const std::string& location);
};
constexpr std::array schemes = {Scheme{"hwloc:", readFile}, Scheme{"hwloc-synthetic:", readDescription}};

}  // namespace

Tree readHwloc(std::string_view source) {
  for (const Scheme& scheme : schemes) {
    if (source.starts_with(scheme.prefix) && source.size() > scheme.prefix.size()) {
      return scheme.read(std::string(source.substr(scheme.prefix.size())));
    }
  }
  throw InventoryError("cannot convert the inventory", '"' + std::string(source) + '"',
                       "it names no description to convert", "--from takes hwloc:FILE or hwloc-synthetic:DESCRIPTION");
}

}  // namespace Corvcim
