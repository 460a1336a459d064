#include "host/cli/StateNote.h"

#include "platform/instrumentation/tree/Tree.h"

namespace Corvcim {

std::string stateNote(unsigned int status) {
  namespace Status = Tarn::Inventory::Status;
  switch (status) {
    case Status::inUse:
      return "";
    case Status::offline:
      return "offline";
    case Status::emptySocket:
      return "empty socket";
    case Status::disabled:
      return "disabled";
    case Status::failed:
      return "failed";
    default:
      return "status " + std::to_string(status);
  }
}

}  // namespace Corvcim
