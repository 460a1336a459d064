#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_ARMPARTS_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_ARMPARTS_H

#include <span>
#include <string_view>

namespace Tarn::Inventory {

/// An Arm core design, as its identification register names it.
struct ArmPart {
  unsigned int implementer;
  unsigned int part;
  unsigned int family;  ///< CIM processor family code
  std::string_view name;
};

/// The designs that are known, sorted by implementer and part.
std::span<const ArmPart> armParts();

/// nullptr for a design that is not in the table.
const ArmPart* findArmPart(unsigned int implementer, unsigned int part);

}  // namespace Tarn::Inventory

#endif
