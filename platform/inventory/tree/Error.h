#ifndef CORVANE_PLATFORM_INVENTORY_TREE_ERROR_H
#define CORVANE_PLATFORM_INVENTORY_TREE_ERROR_H

#include <stdexcept>
#include <string>

namespace Tarn::Inventory {

/// The inventory could not be read. The text has four parts: what failed, on what (file and place in
/// it), why, and what to do about it.
class InventoryError : public std::runtime_error {
 public:
  InventoryError(const std::string& what, const std::string& where, const std::string& why, const std::string& remedy)
      : std::runtime_error(what + ": " + where + ": " + why + "; " + remedy) {}
};

}  // namespace Tarn::Inventory

#endif
