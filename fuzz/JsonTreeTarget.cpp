// The reader of trees in JSON: what it accepts is written and read back as the same tree.

#include "fuzz/Target.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace Tarn::Inventory;
  Tree tree;
  try {
    tree = readJson(Corvane::Fuzz::textOf(data, size), "input");
  } catch (const InventoryError&) {
    return 0;
  }
  Corvane::Fuzz::require(readJson(writeJson(tree), "output") == tree, "a tree is read back as it was written");
  return 0;
}
