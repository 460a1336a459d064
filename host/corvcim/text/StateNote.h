#ifndef HOST_CORVCIM_TEXT_STATENOTE_H
#define HOST_CORVCIM_TEXT_STATENOTE_H

#include <string>
#include <string_view>

namespace Corvcim {

/// How a part is, from the best to the worst.
enum class Severity { Fine, Degraded, Unknown, Failed };

/// "OK", "DEGRADED", "UNKNOWN", "FAILED".
std::string_view severityName(Severity severity);

/// How a part in that state is, by the number of its status. A state that the inventory does not define is unknown.
Severity severityOf(unsigned int status);

/// What a node's status means to people: "offline", "disabled"; empty for a part in use.
std::string stateNote(unsigned int status);

}  // namespace Corvcim

#endif
