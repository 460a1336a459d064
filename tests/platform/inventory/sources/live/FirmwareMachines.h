#ifndef CORVANE_TESTS_PLATFORM_INVENTORY_SOURCES_LIVE_FIRMWAREMACHINES_H
#define CORVANE_TESTS_PLATFORM_INVENTORY_SOURCES_LIVE_FIRMWAREMACHINES_H

#include <ostream>
#include <span>
#include <string_view>

#include "tests/support/SmbiosEncoder.h"

namespace Tarn::Inventory {

/// A machine's firmware, and where there is one, the fixture of the machine that it belongs to.
struct FirmwareMachine {
  std::string_view name;
  std::string_view kernel;  ///< of the fixture; empty where the tables stand for themselves
  Support::SmbiosEncoder (*tables)();
};

/// Its name, for messages.
void PrintTo(const FirmwareMachine& machine, std::ostream* stream);

std::span<const FirmwareMachine> firmwareMachines();

}  // namespace Tarn::Inventory

#endif
