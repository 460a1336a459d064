#ifndef HOST_CLI_OVERVIEW_H
#define HOST_CLI_OVERVIEW_H

#include <span>
#include <string>

#include "host/cli/Commands.h"
#include "host/cli/OverviewData.h"
#include "platform/instrumentation/tree/Tree.h"

namespace Corvcim {

/// One screen about the processors, from what the providers tell, and what could not be read.
Outcome showOverview(Dispatcher& dispatcher, const std::string& nameSpace);

/// The screen itself. Processors that differ in nothing but their identity share one paragraph.
std::string writeOverview(const OverviewData& data, std::span<const Tarn::Inventory::Unread> unread);

}  // namespace Corvcim

#endif
