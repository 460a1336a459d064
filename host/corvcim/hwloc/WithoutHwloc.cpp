#include "host/corvcim/hwloc/HwlocConversion.h"
#include "platform/inventory/tree/Error.h"

namespace Corvcim {
namespace {

[[noreturn]] void refuse(const std::string& name) {
  throw Tarn::Inventory::InventoryError(
      "cannot read the inventory", name, "this corvcim was built without hwloc",
      "use one that was built where libhwloc-dev is installed for its architecture, and read its JSON with json:FILE");
}

}  // namespace

Tarn::Inventory::Tree treeOfXml(const std::string& /*text*/, const std::string& name) {
  refuse(name);
}

Tarn::Inventory::Tree treeOfSynthetic(const std::string& /*description*/, const std::string& name) {
  refuse(name);
}

}  // namespace Corvcim
