#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CIMFAMILY_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_CIMFAMILY_H

#include <span>
#include <string_view>

namespace Tarn::Inventory {

/// Codes of CIM_Processor.Family that more than one source file needs.
namespace CimFamily {
inline constexpr unsigned int other = 1;
inline constexpr unsigned int unknown = 2;
inline constexpr unsigned int arm = 280;
inline constexpr unsigned int armv7 = 256;
inline constexpr unsigned int armv8 = 257;
inline constexpr unsigned int armv9 = 258;
}  // namespace CimFamily

/// Which processors have a CIM family code. The row that says most about a processor is chosen: the longest
/// brand, then one that names a family, then one that names a model.
struct FamilyRow {
  static constexpr int any = -1;

  std::string_view vendor;  ///< the kernel's vendor name, or the architecture where it has none
  std::string_view brand;   ///< part of the name, without (R) and (TM); empty: any name
  int family;               ///< the vendor's family number, or any
  int model;                ///< the vendor's model number, or any
  unsigned int code;
};

/// The rows, sorted by vendor, brand, family and model.
std::span<const FamilyRow> familyTable();

/// The row for this processor; nullptr where none fits.
const FamilyRow* findFamilyRow(std::string_view vendor, std::string_view name, int family, int model);

/// The CIM family code; CimFamily::unknown where no row fits. `family` and `model` may be any.
unsigned int cimFamily(std::string_view vendor, std::string_view name, int family, int model);

}  // namespace Tarn::Inventory

#endif
