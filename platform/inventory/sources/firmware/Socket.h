#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_SOCKET_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_FIRMWARE_SOCKET_H

#include <string>
#include <vector>

#include "platform/inventory/sources/firmware/SocketMatching.h"
#include "platform/inventory/sources/smbios/Tables.h"
#include "platform/inventory/tree/Facts.h"

namespace Tarn::Inventory {

/// A processor socket as the firmware describes it.
struct Socket {
  const Smbios::Processor* structure = nullptr;
  std::string path;   ///< what its node is called where the kernel does not see a processor in it
  std::string label;  ///< "CPU 1"; where the firmware gives none "0x0043", its handle
  unsigned int status = 0;
  ProcessorIdentity identity;

  bool isPopulated() const { return structure->populated && *structure->populated; }

  /// Whether the firmware says that its processor can be at work.
  bool isEnabled() const;

  Origin statusOrigin() const;
  Origin labelOrigin() const;
};

/// The sockets of central processors by ascending handle. They look into the tables, which must outlive
/// them.
///
/// A socket's path is "S:" and its label where that is short, of letters and digits but for blanks, and
/// not given twice; else "S#" and its handle: "S:CPU2", "S#0043" (and its place in the table
/// where a broken one has the handle twice). It depends on the table alone, and no
/// path that comes from the kernel looks so.
std::vector<Socket> readSockets(const Smbios::Tables& tables);

/// What the firmware knows of the processor in the socket, or of the socket alone where it is empty.
/// `matched`, where it is not empty, says by what the socket was found for a processor of the kernel, and
/// becomes part of each rule.
Facts socketFacts(const Socket& socket, const std::string& matched);

}  // namespace Tarn::Inventory

#endif
