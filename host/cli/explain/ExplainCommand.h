#ifndef HOST_CLI_EXPLAIN_EXPLAINCOMMAND_H
#define HOST_CLI_EXPLAIN_EXPLAINCOMMAND_H

#include "host/cli/Commands.h"
#include "host/cli/Libraries.h"
#include "host/cli/Options.h"

namespace Corvcim {

/// The verb explain: where the values of instances come from. Throws std::exception's children where
/// nothing can be explained.
Outcome explainValues(const LibraryFiles& files, const Options& options);

}  // namespace Corvcim

#endif
