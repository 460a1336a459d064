#ifndef HOST_CORVCIM_DIFF_DIFFTEXT_H
#define HOST_CORVCIM_DIFF_DIFFTEXT_H

#include <span>
#include <string>

#include "host/corvcim/diff/InventoryDiff.h"

namespace Corvcim {

/// The differences as a person would tell them, one sentence on each line: "P0.C3 went offline". Parts
/// that changed alike share a sentence; what came or went with its processor is counted in the processor's.
std::string writeDiffText(const Tarn::Inventory::Tree& before, const Tarn::Inventory::Tree& after,
                          std::span<const NodeChange> changes);

}  // namespace Corvcim

#endif
