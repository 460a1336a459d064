#ifndef COMPANION_COMPUTERSYSTEM_H
#define COMPANION_COMPUTERSYSTEM_H

#include <cstdint>
#include <string>

namespace Tarn::ComputerSystemProvider {

/// The machine itself, in CIM terms: one record for each host.
struct ComputerSystem {
  std::string name;          ///< the host name; the key
  std::string model;         ///< the maker's model text; empty where the platform does not tell
  std::string manufacturer;  ///< the maker; empty where the platform does not tell
  std::uint16_t enabledState = 0;
  std::uint16_t healthState = 0;
  std::uint16_t operationalStatus = 0;
};

/// Reads the record from the inventory. A machine without a system node still has a name; its states
/// are then 0 (Unknown). Throws std::exception's children when the inventory cannot be read.
ComputerSystem readComputerSystem();

}  // namespace Tarn::ComputerSystemProvider

#endif
