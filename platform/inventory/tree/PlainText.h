#ifndef CORVANE_PLATFORM_INVENTORY_TREE_PLAINTEXT_H
#define CORVANE_PLATFORM_INVENTORY_TREE_PLAINTEXT_H

#include <string>
#include <string_view>

namespace Tarn::Inventory {

/// A text of the kernel's or the firmware's without the blanks around it, and with a blank for each control
/// character: those cannot stand in the XML that brokers send.
std::string plainText(std::string_view text);

}  // namespace Tarn::Inventory

#endif
