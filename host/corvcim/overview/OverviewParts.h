#ifndef HOST_CORVCIM_OVERVIEW_OVERVIEWPARTS_H
#define HOST_CORVCIM_OVERVIEW_OVERVIEWPARTS_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "host/corvcim/overview/OverviewData.h"
#include "host/corvcim/overview/ProcessorState.h"
#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

// What the overview is made of, whatever its format.

/// A processor with its state and its node, which is nullptr where the inventory does not have it.
struct Shown {
  const OverviewProcessor* overview;
  ProcessorState state;
  const Tarn::Inventory::Node* node;
};

/// The processors, those in the worst state first.
std::vector<Shown> worstFirst(const OverviewData& data, const Tarn::Inventory::Tree& tree);

std::vector<ProcessorState> statesOf(const std::vector<Shown>& processors);

/// The model by the inventory, which the library does not report of a virtual machine; empty where there is none.
std::string kernelModel(const Shown& shown, const Tarn::Inventory::Tree& tree);

/// Whether the library takes the machine for a virtual one.
bool isVirtual(const OverviewData& data);

/// Equal caches of a processor.
struct CacheKind {
  std::string name;    ///< "L1d"; "cache" where the level is not known
  std::uint64_t size;  ///< bytes; 0 where it is not known
  std::size_t count;

  std::string label() const;  ///< "L1d 32 KiB"
};

std::vector<CacheKind> cacheKinds(const std::vector<OverviewCache>& caches);

}  // namespace Corvcim

#endif
