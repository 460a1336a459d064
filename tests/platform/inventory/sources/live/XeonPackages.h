#ifndef CORVANE_TESTS_PLATFORM_INVENTORY_SOURCES_LIVE_XEONPACKAGES_H
#define CORVANE_TESTS_PLATFORM_INVENTORY_SOURCES_LIVE_XEONPACKAGES_H

#include <string>

#include "tests/platform/inventory/KernelFiles.h"
#include "tests/support/SmbiosEncoder.h"

namespace Tarn::Inventory {

/// Where origins say that the files of CPUs lie.
inline const std::string originDirectory = "/sys/devices/system/cpu";

/// Packages of one core each, with one L2 cache of 512 KiB, as x86Block describes their CPUs.
KernelFiles packages(unsigned int count);

/// The firmware's processor that is such a package.
Support::SmbiosProcessor xeon(const std::string& socket);

/// Tables of these structures.
template <class... Structures>
Support::SmbiosEncoder tablesOf(const Structures&... structures) {
  Support::SmbiosEncoder tables;
  (tables.add(structures), ...);
  tables.end();
  return tables;
}

/// The state of the node with this printable path; the test fails where there is none.
unsigned int statusAt(const Tree& tree, const std::string& path);

}  // namespace Tarn::Inventory

#endif
