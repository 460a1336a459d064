#ifndef HOST_CLI_STATENOTE_H
#define HOST_CLI_STATENOTE_H

#include <string>

namespace Corvcim {

/// What a node's status means to people: "offline", "disabled"; empty for a part in use.
std::string stateNote(unsigned int status);

}  // namespace Corvcim

#endif
