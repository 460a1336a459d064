#include "tests/seam/Inventory.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace Scripted {

using namespace Tarn::NodeLexicon;

Inventory& inventory() {
  static Inventory theInventory;
  return theInventory;
}

std::string internalPath(const std::string& printablePath) {
  return "<internal>" + printablePath;
}

Inventory& Inventory::add(NodeType type, const std::string& path, const std::string& parentPath) {
  nodes_.push_back({.type = type,
                    .path = path,
                    .parent = parentPath,
                    .statuses = {1},
                    .description = "Element " + path,
                    .properties = {}});
  return *this;
}

Inventory& Inventory::system(const std::string& model) {
  system_ = "system";
  return add(NodeSystem, system_, "").has(PropSystemModel, model);
}

Inventory& Inventory::processor(const std::string& path) {
  processor_ = path;
  return add(NodeProcessor, path, system_);
}

Inventory& Inventory::core(const std::string& path) {
  return add(NodeProcessorCore, path, processor_);
}

Inventory& Inventory::cache(const std::string& path) {
  return add(NodeCacheMemory, path, processor_);
}

Inventory& Inventory::statuses(std::vector<unsigned int> statuses) {
  nodes_.back().statuses = std::move(statuses);
  return *this;
}

Inventory& Inventory::description(const std::string& text) {
  nodes_.back().description = text;
  return *this;
}

Inventory& Inventory::parent(const std::string& path) {
  nodes_.back().parent = path;
  return *this;
}

Inventory& Inventory::has(Properties property, PropertyValue value) {
  nodes_.back().properties[property] = std::move(value);
  return *this;
}

Inventory& Inventory::lacks(Properties property) {
  nodes_.back().properties.erase(property);
  return *this;
}

Inventory& Inventory::fullProcessor(const std::string& path) {
  return processor(path)
      .has(PropFamily, 198U)
      .has(PropProcessorName, "Model 9000")
      .has(PropCurrentClockSpeed, 2100U)
      .has(PropMaxClockSpeed, 3700U)
      .has(PropExternalClockSpeed, 100U)
      .has(PropDataWidth, 64U)
      .has(PropAddressWidth, 48U)
      .has(PropStepping, "7")
      .has(PropProcessorId, "0f a9")
      .has(PropUpgradeMethod, 54U)
      .has(PropRequestedStatesSupported, std::vector<unsigned int>{1, 3, 1})
      .has(PropProcessorCores, 16U)
      .has(PropEnabledCores, 12U)
      .has(PropHardwareThreads, 24U);
}

Inventory& Inventory::fullCache(const std::string& path) {
  return cache(path)
      .has(PropCacheBlockSize, 64U)
      .has(PropCacheConsumableBlocks, 500U)
      .has(PropCacheNumberOfBlocks, 512U)
      .has(PropCacheAssociativity, 5U)
      .has(PropCacheType, 2U)
      .has(PropCacheWritePolicy, 1U)
      .has(PropCacheLevel, 3U)
      .has(PropCacheName, "L1 Data Cache");
}

void Inventory::failNth(Operation operation, unsigned int n, Thrown thrown) {
  failures_.push_back({operation, n - 1, thrown});
}

unsigned int Inventory::count(const std::string& call) const {
  return static_cast<unsigned int>(std::count(calls_.begin(), calls_.end(), call));
}

void Inventory::reset() {
  const int living = livingCursors_;
  *this = Inventory();
  livingCursors_ = living;
}

void Inventory::enter(Operation operation, std::string call) {
  calls_.push_back(std::move(call));
  const auto failure =
      std::find_if(failures_.begin(), failures_.end(), [&](const Failure& f) { return f.operation == operation; });
  if (failure == failures_.end() || failure->callsBefore-- > 0) {
    return;
  }
  const Thrown thrown = failure->thrown;
  failures_.erase(failure);
  if (thrown == Thrown::Unusual) {
    throw UnusualException();
  }
  throw std::runtime_error(thrownText);
}

bool Inventory::isBelow(const Node& node, const std::string& path) const {
  const Node* ancestor = &node;
  while (!ancestor->parent.empty()) {
    if (ancestor->parent == path) {
      return true;
    }
    const auto next =
        std::find_if(nodes_.begin(), nodes_.end(), [&](const Node& n) { return n.path == ancestor->parent; });
    if (next == nodes_.end()) {
      return false;
    }
    ancestor = &*next;
  }
  return false;
}

}  // namespace Scripted
