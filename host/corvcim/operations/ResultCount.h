#ifndef HOST_CORVCIM_OPERATIONS_RESULTCOUNT_H
#define HOST_CORVCIM_OPERATIONS_RESULTCOUNT_H

#include <string>
#include <vector>

#include "host/broker/Operation.h"

namespace Corvcim {

/// The library counts its results in 16 bits: of 65,536 and more it silently delivers the remainder. Returns a line for
/// each class of which an enumeration's answer has fewer objects than the inventory, where that has so many.
std::vector<std::string> describeMissingResults(const Operation& operation, const Response& response);

}  // namespace Corvcim

#endif
