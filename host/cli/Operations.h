#ifndef HOST_CLI_OPERATIONS_H
#define HOST_CLI_OPERATIONS_H

#include <optional>
#include <string>

#include "host/broker/Operation.h"
#include "host/cli/Commands.h"
#include "host/cli/Libraries.h"
#include "host/cli/Options.h"

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
