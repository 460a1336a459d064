#ifndef HOST_CORVCIM_DIFF_DIFFCOMMAND_H
#define HOST_CORVCIM_DIFF_DIFFCOMMAND_H

#include "host/corvcim/options/Options.h"
#include "host/corvcim/text/Outcome.h"

namespace Corvcim {

/// The verb diff: what differs between the two sources that the options name. Throws InventoryError where a source
/// cannot be read, and UsageError for a field to ignore that there is not.
Outcome diffInventories(const Options& options);

}  // namespace Corvcim

#endif
