#ifndef HOST_CORVCIM_OPERATIONS_OPERATIONS_H
#define HOST_CORVCIM_OPERATIONS_OPERATIONS_H

#include <optional>
#include <string>

#include "host/broker/Operation.h"
#include "host/corvcim/operations/Libraries.h"
#include "host/corvcim/options/Options.h"
#include "host/corvcim/text/Outcome.h"

namespace Corvcim {

/// The verbs that ask providers: ei, ein, gi, ai, ain, ri, rin.
Outcome performOperation(const LibraryFiles& files, const Options& options);

/// "CIM_ERR_NOT_FOUND: no such processor", the status as users of CIM know it.
std::string describeStatus(CMPIrc rc, const std::optional<std::string>& message);

/// Why the library had nothing to tell: the text of the error if the inventory cannot be read. A
/// provider that cannot collect answers like one that has nothing.
std::optional<std::string> inventoryError();

}  // namespace Corvcim

#endif
