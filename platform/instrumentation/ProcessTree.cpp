#include "platform/instrumentation/ProcessTree.h"

#include <mutex>
#include <string>
#include <utility>

#include "platform/common/Configuration.h"
#include "platform/common/Environment.h"
#include "platform/instrumentation/Source.h"

namespace Tarn::Inventory {

namespace {

// Both are ready before any code of the library runs. The tree goes when the library is unloaded.
constinit std::mutex mutex;
constinit std::shared_ptr<const Tree> current;

std::string chosenSource() {
  if (std::optional<std::string> source = Common::environmentOverride("CORVANE_INVENTORY")) {
    return *std::move(source);
  }
  const Common::Setting* setting = Common::configuration().find("inventory");
  return setting != nullptr ? setting->value : "live";
}

}  // namespace

std::shared_ptr<const Tree> processTree() {
  const std::scoped_lock lock(mutex);
  if (!current) {
    current = std::make_shared<const Tree>(loadInventory(chosenSource()));
  }
  return current;
}

void setProcessTree(std::shared_ptr<const Tree> tree) {
  const std::scoped_lock lock(mutex);
  current.swap(tree);
}

}  // namespace Tarn::Inventory
