#include "platform/inventory/ProcessTree.h"

#include <tarn/Common.h>
#include <unistd.h>

#include <array>
#include <climits>
#include <exception>
#include <mutex>
#include <span>
#include <string>
#include <string_view>
#include <utility>

#include "platform/base/Configuration.h"
#include "platform/base/Environment.h"
#include "platform/cvlog/Level.h"
#include "platform/cvlog/Report.h"
#include "platform/inventory/sources/Source.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {

namespace {

// All are ready before any code of the library runs. The tree goes when the library is unloaded.
constinit std::mutex mutex;
constinit std::shared_ptr<const Tree> current;
constinit bool currentIsLive = false;

constexpr std::string_view liveSource = "live";

std::string hostName() {
  std::array<char, HOST_NAME_MAX + 1> name{};
  if (gethostname(name.data(), name.size()) != 0) {
    return {};
  }
  name.back() = '\0';  // a name that was cut need not be terminated
  return name.data();
}

// Whoever asks for the tree may say no more than that it failed. Every request asks again, so what is
// known is not said twice.
void reportOnce(const std::string& text) {
  static std::string reported;
  if (std::exchange(reported, text) != text) {
    Common::report({"Corvane.Inventory", "ProcessTree.cpp"}, CVLog::levelError, text);
  }
}

// The caller holds the mutex.
void loadChosen() {
  try {
    const std::string source = chosenSource();
    current = std::make_shared<const Tree>(loadInventory(source));
    currentIsLive = source == liveSource;
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
  return setting != nullptr ? setting->value : std::string(liveSource);
}

std::shared_ptr<const Tree> processTree() {
  const std::scoped_lock lock(mutex);
  if (!current) {
    loadChosen();
  }
  return current;
}

void setProcessTree(std::shared_ptr<const Tree> tree) {
  const std::scoped_lock lock(mutex);
  current.swap(tree);
  currentIsLive = false;
}

}  // namespace Tarn::Inventory

namespace Tarn {

std::string getSystemName() {
  using namespace Inventory;
  const std::scoped_lock lock(mutex);
  if (current ? currentIsLive : chosenSource() == liveSource) {
    return hostName();
  }
  try {
    if (!current) {
      loadChosen();
    }
  } catch (const std::exception&) {
    return unnamedSystem;  // the reason is reported
  }
  const std::span<const NodeIndex> systems = current->ofType(NodeLexicon::NodeSystem);
  const std::string* name = systems.empty() ? nullptr : current->text(current->node(systems.front()), PropSystemName);
  return name == nullptr || name->empty() ? unnamedSystem : *name;
}

}  // namespace Tarn
