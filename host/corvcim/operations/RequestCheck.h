#ifndef HOST_CORVCIM_OPERATIONS_REQUESTCHECK_H
#define HOST_CORVCIM_OPERATIONS_REQUESTCHECK_H

#include "host/broker/Operation.h"

namespace Corvcim {

/// Throws std::runtime_error if the request names another host, or a namespace, result class, role or property that
/// nothing here has: providers answer most of these with nothing, as if the machine had nothing. What the dispatcher
/// refuses by itself (unknown classes, keys) is left to it.
void checkRequest(const Operation& operation);

}  // namespace Corvcim

#endif
