#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_SOCKETMATCHING_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_SOCKETMATCHING_H

#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace Tarn::Inventory {

/// What tells one processor from another, as far as both the kernel and the firmware know it. A text is
/// empty, a count absent, where it is not known.
struct ProcessorIdentity {
  std::string signature = {};  ///< the first four bytes of the identification register: "57 06 05 00"
  std::string name = {};       ///< as comparableName gives it
  std::optional<unsigned int> cores = {};
  std::optional<unsigned int> threads = {};
};

/// A processor's name as it can be compared: without (R) and (TM), without case, with one blank where there
/// are several. Firmware and kernel decorate the same name differently.
std::string comparableName(std::string_view name);

/// Which socket holds which of the kernel's packages.
struct SocketMatching {
  static constexpr std::size_t none = static_cast<std::size_t>(-1);

  struct Match {
    std::size_t socket = none;
    std::string rule;  ///< by what it was found, for people
  };
  std::vector<Match> packages;  ///< for each package its socket, or none

  /// Sockets for which no package is left: what the kernel does not see.
  std::vector<std::size_t> unseen;

  /// Sockets and packages that cannot be told apart and are not equally many, or whose signatures
  /// contradict each other.
  struct Contradiction {
    std::vector<std::size_t> sockets;
    std::vector<std::size_t> packages;
  };
  std::vector<Contradiction> contradictions;
};

/// Matches by identity: sockets and packages that agree in their signature, name, number of cores or
/// threads, as long as equally many agree. Those that are alike in all of it go together in their order.
/// Nothing is matched where the counts do not fit, or where signatures differ.
SocketMatching matchSockets(std::span<const ProcessorIdentity> sockets, std::span<const ProcessorIdentity> packages);

}  // namespace Tarn::Inventory

#endif
