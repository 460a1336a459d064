#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CPUIDENTITY_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CPUIDENTITY_H

#include <optional>
#include <string>

#include "platform/inventory/sources/kernel/ArmParts.h"
#include "platform/inventory/sources/kernel/CimFamily.h"
#include "platform/inventory/sources/kernel/CpuInfo.h"

namespace Tarn::Inventory {

enum class Architecture { Unknown, X86, Arm, Ia64, LoongArch, PowerPc, RiscV, S390, Sparc };

/// What /proc/cpuinfo says of one logical CPU, in one form for all architectures. A text is empty, and a
/// number absent, where it does not say.
struct CpuIdentity {
  Architecture architecture = Architecture::Unknown;
  std::string vendor;
  std::string name;
  std::string stepping;
  std::string processorId;  ///< the identification register, as SMBIOS writes it: bytes in memory order
  unsigned int family = CimFamily::unknown;
  const FamilyRow* familyRow = nullptr;    ///< the row that gave the family, if one did
  const ArmPart* armPart = nullptr;        ///< the design that gave name and family, if it is known
  std::optional<unsigned int> width;       ///< bits of a general register
  std::optional<unsigned int> clockSpeed;  ///< MHz at this moment
  bool hypervisor = false;                 ///< it says itself that it is virtual
};

CpuIdentity identifyCpu(const CpuInfo& info, unsigned int cpu);

}  // namespace Tarn::Inventory

#endif
