#include <string>

#include "tests/providers/ThreadsMachine.h"
#include "tests/seam/Inventory.h"

namespace ThreadsMachine {

void prepare() {
  unsigned int core = 0;
  unsigned int cache = 0;
  for (const std::string name : {"cpu0", "cpu1"}) {
    Scripted::inventory().fullProcessor(name);
    for (std::size_t i = 0; i < cores / processors; ++i) {
      Scripted::inventory().core("core" + std::to_string(core++));
    }
    for (std::size_t i = 0; i < caches / processors; ++i) {
      Scripted::inventory().fullCache("cache" + std::to_string(cache++));
    }
  }
}

}  // namespace ThreadsMachine
