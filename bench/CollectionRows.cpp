// Reading the inventory tree into records, against filling the same records from constants.

#include <CPU.h>

#include <memory>
#include <vector>

#include "bench/RecordFilling.h"
#include "bench/Rows.h"
#include "platform/inventory/ProcessTree.h"

namespace Corvane::Bench {

void addCollectionRows() {
  constexpr MachineSize machine{1, 133};
  static_assert(machine.caches() == 400);

  Tarn::Inventory::setProcessTree(std::make_shared<const Tarn::Inventory::Tree>(makeMachine(machine)));
  addRow(
      {"getMemoryInstances, 400 caches", 1.5},
      [] {
        std::vector<Tarn::CPUProvider::Memory> caches;
        Tarn::CPUProvider::getMemoryInstances(caches);
        require(caches.size() == 400, "getMemoryInstances gives 400 caches");
      },
      [machine] { fillCaches(machine, 1); });
}

}  // namespace Corvane::Bench
