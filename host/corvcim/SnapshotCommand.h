#ifndef HOST_CORVCIM_SNAPSHOTCOMMAND_H
#define HOST_CORVCIM_SNAPSHOTCOMMAND_H

#include "host/corvcim/Commands.h"
#include "host/corvcim/options/Options.h"

namespace Corvcim {

/// The verb snapshot: the files that this process's source is read from, as one text, in the file that the options
/// name or as output. A snapshot of what gives no inventory is written all the same, and the outcome says why.
/// Throws InventoryError where the source is none of files, and std::runtime_error where the file cannot be written.
Outcome takeSnapshot(const Options& options);

}  // namespace Corvcim

#endif
