#ifndef HOST_CORVCIM_EXPLAIN_EXPLAINCOMMAND_H
#define HOST_CORVCIM_EXPLAIN_EXPLAINCOMMAND_H

#include "host/corvcim/operations/Libraries.h"
#include "host/corvcim/options/Options.h"
#include "host/corvcim/text/Outcome.h"

namespace Corvcim {

/// The verb explain: where the values of instances come from. Throws std::exception's children where
/// nothing can be explained.
Outcome explainValues(const LibraryFiles& files, const Options& options);

}  // namespace Corvcim

#endif
