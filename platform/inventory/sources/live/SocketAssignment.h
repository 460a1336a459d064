#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_SOCKETASSIGNMENT_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_SOCKETASSIGNMENT_H

#include <string>
#include <vector>

#include "platform/inventory/sources/firmware/Socket.h"
#include "platform/inventory/sources/kernel/KernelProcessor.h"
#include "platform/inventory/sources/kernel/KernelView.h"
#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// Which of the firmware's sockets belongs to which of the kernel's packages, and which stand for
/// themselves.
struct SocketAssignment {
  struct PackageSocket {
    const Socket* socket = nullptr;  ///< none where the firmware tells of no socket that is the package's
    std::string rule;                ///< by what it was found, for people
  };
  std::vector<PackageSocket> packages;  ///< in the kernel's order

  /// The sockets that become processors of their own, by ascending handle: empty ones, and those with a
  /// processor that the kernel does not see. A socket whose package cannot be determined is not among them: its
  /// processor would be there twice.
  std::vector<const Socket*> standalone;

  std::vector<Disagreement> disagreements;
};

SocketAssignment assignSockets(const std::vector<Socket>& sockets, const KernelView& kernel,
                               const std::vector<KernelProcessor>& processors);

}  // namespace Tarn::Inventory

#endif
