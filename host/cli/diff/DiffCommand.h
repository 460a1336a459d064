#ifndef HOST_CLI_DIFF_DIFFCOMMAND_H
#define HOST_CLI_DIFF_DIFFCOMMAND_H

#include "host/cli/Commands.h"
#include "host/cli/Options.h"

namespace Corvcim {

/// The verb diff: what differs between the two sources that the options name. Throws InventoryError where a source
/// cannot be read, and UsageError for a field to ignore that there is not.
Outcome diffInventories(const Options& options);

}  // namespace Corvcim

#endif
