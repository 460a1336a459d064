#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_KERNELPROCESSOR_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_KERNELPROCESSOR_H

#include "platform/inventory/sources/kernel/CpuIdentity.h"
#include "platform/inventory/sources/kernel/KernelView.h"
#include "platform/inventory/tree/Facts.h"

namespace Tarn::Inventory {

/// What the kernel says of a processor package: its words on the package's first online CPU, or where it
/// has several kinds of core, on the first of each kind.
struct KernelProcessor {
  CpuIdentity identity;  ///< of the first online CPU; everything unknown where all are offline
  Facts facts;           ///< its properties; the origins look into the view, which must outlive them
};

KernelProcessor readKernelProcessor(const KernelView& kernel, const Package& package);

/// The states that can be requested of a processor that works.
void addRequestedStates(Facts& facts);

/// What tells that these CPUs are one processor.
Origin originOfPackage(const KernelView& kernel, const Package& package, std::string rule);

}  // namespace Tarn::Inventory

#endif
