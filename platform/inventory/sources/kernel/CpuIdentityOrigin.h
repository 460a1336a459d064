#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CPUIDENTITYORIGIN_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CPUIDENTITYORIGIN_H

#include "platform/inventory/sources/kernel/CpuIdentity.h"
#include "platform/inventory/sources/kernel/Machine.h"

namespace Tarn::Inventory {

/// Where a property comes from that identifyCpu found for this CPU in /proc/cpuinfo: the fields, and the
/// table row or computation. The property is one that CpuIdentity holds and knows.
Origin originOfIdentity(const Machine& machine, unsigned int cpu, const CpuIdentity& identity,
                        NodeLexicon::Properties id);

}  // namespace Tarn::Inventory

#endif
