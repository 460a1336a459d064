#ifndef CORVANE_BENCH_LOADEDPRODUCT_H
#define CORVANE_BENCH_LOADEDPRODUCT_H

#include <cmpift.h>

#include <functional>
#include <string>

#include "bench/NullBroker.h"
#include "platform/inventory/tree/Tree.h"

namespace Corvane::Bench {

/// The finished library, loaded through its factory functions as a broker loads it: a copy of its own,
/// so that each collects its own inventory, and only what its requests ask for.
class LoadedProduct {
 public:
  /// The inventory is read by the first request, which must be made before another product is loaded.
  explicit LoadedProduct(const Tarn::Inventory::Tree& machine);

  CMPIInstanceMI* instances(const std::string& provider) const;
  CMPIAssociationMI* associations(const std::string& provider) const;

 private:
  void* symbol(const std::string& name) const;

  void* handle_;  // stays loaded: the rows are measured later
};

}  // namespace Corvane::Bench

#endif
