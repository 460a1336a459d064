#ifndef HOST_CORVCIM_OVERVIEW_HEALTH_H
#define HOST_CORVCIM_OVERVIEW_HEALTH_H

#include <span>
#include <string>

#include "host/corvcim/options/Options.h"
#include "host/corvcim/overview/ProcessorState.h"
#include "host/corvcim/text/Outcome.h"

namespace Corvcim {

/// The exit status and a line for anything that makes the health unknown: "UNKNOWN: no processors".
Outcome unknownHealth(const std::string& reason);

/// A line for each processor, the worst first, with the exit status for monitoring. `unreported` are the other
/// processors of the inventory; those that are no empty sockets are unknown.
Outcome writeHealth(std::vector<ProcessorState> states, std::span<const Tarn::Inventory::Node* const> unreported);

/// Asks the library and the inventory. Failures of either are unknown health.
Outcome checkHealth(const Options& options);

}  // namespace Corvcim

#endif
