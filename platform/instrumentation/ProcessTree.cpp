#include "platform/instrumentation/ProcessTree.h"

#include <exception>
#include <mutex>
#include <string>
#include <utility>

#include "platform/common/Configuration.h"
#include "platform/common/Environment.h"
#include "platform/common/Report.h"
#include "platform/cvlog/Level.h"
#include "platform/instrumentation/Source.h"

namespace Tarn::Inventory {

namespace {

// Both are ready before any code of the library runs. The tree goes when the library is unloaded.
constinit std::mutex mutex;
constinit std::shared_ptr<const Tree> current;

// Whoever asks for the tree may say no more than that it failed. Every request asks again, so what is
// known is not said twice.
void reportOnce(const std::string& text) {
  static std::string reported;
  if (std::exchange(reported, text) != text) {
    Common::report({"Corvane.Inventory", "ProcessTree.cpp"}, CVLog::levelError, text);
  }
}

Tree loadChosen() {
  try {
    return loadInventory(chosenSource());
  } catch (const std::exception& error) {
    reportOnce(error.what());
    throw;
  }
}

}  // namespace

std::string chosenSource() {
  if (std::optional<std::string> source = Common::environmentOverride("CORVANE_INVENTORY")) {
    return *std::move(source);
  }
  const Common::Setting* setting = Common::configuration().find("inventory");
  return setting != nullptr ? setting->value : "live";
}

std::shared_ptr<const Tree> processTree() {
  const std::scoped_lock lock(mutex);
  if (!current) {
    current = std::make_shared<const Tree>(loadChosen());
  }
  return current;
}

void setProcessTree(std::shared_ptr<const Tree> tree) {
  const std::scoped_lock lock(mutex);
  current.swap(tree);
}

}  // namespace Tarn::Inventory
