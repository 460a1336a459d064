#ifndef CORVANE_PLATFORM_INVENTORY_TREE_UTF8_H
#define CORVANE_PLATFORM_INVENTORY_TREE_UTF8_H

#include <string>
#include <string_view>

namespace Tarn::Inventory {

/// The text with every byte that belongs to no UTF-8 character replaced by U+FFFD. Firmware writes what
/// it likes into its texts; clients expect UTF-8.
std::string validUtf8(std::string_view text);

}  // namespace Tarn::Inventory

#endif
