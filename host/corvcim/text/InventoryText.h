#ifndef HOST_CORVCIM_TEXT_INVENTORYTEXT_H
#define HOST_CORVCIM_TEXT_INVENTORYTEXT_H

#include <span>
#include <string>
#include <string_view>

#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// The inventory for people: every node with its state and its properties, what could not be read, and
/// where sources disagree.
std::string writeInventoryText(const Tarn::Inventory::Tree& tree);

/// What could not be read, why, and what would make it readable, under the heading; empty for nothing.
std::string writeUnread(std::span<const Tarn::Inventory::Unread> unread, std::string_view heading = "Not read");

/// Where sources contradict each other, what was taken and what not, under a heading; empty for nothing.
std::string writeDisagreements(std::span<const Tarn::Inventory::Disagreement> disagreements);

}  // namespace Corvcim

#endif
