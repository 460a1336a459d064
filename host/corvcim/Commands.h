#ifndef HOST_CORVCIM_COMMANDS_H
#define HOST_CORVCIM_COMMANDS_H

#include <cstddef>

#include "host/corvcim/options/Options.h"
#include "host/corvcim/text/Outcome.h"

namespace Corvcim {

/// Runs the command. Sets CORVANE_INVENTORY and CORVANE_LANGUAGE in this process as the options ask.
/// `width` is the terminal's, 0 where output goes elsewhere. Throws std::exception's children with a
/// one-line text where nothing could be done at all.
Outcome runCommand(const Options& options, std::size_t width);

}  // namespace Corvcim

#endif
