#ifndef HOST_CORVCIM_OVERVIEW_OVERVIEW_H
#define HOST_CORVCIM_OVERVIEW_OVERVIEW_H

#include <string>
#include <vector>

#include "host/corvcim/overview/OverviewData.h"
#include "host/corvcim/text/Outcome.h"
#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// One screen about the processors, from what the providers tell, and what could not be read.
/// Throws UsageError for a column that a table of processors does not have.
Outcome showOverview(Dispatcher& dispatcher, const Options& options);

/// The screen itself. Processors that differ in nothing but their identity share one paragraph, those in the worst
/// state come first. What the library does not report comes from the inventory: states of parts, empty sockets, what
/// the kernel reports of a virtual machine's processors, and what could not be read.
std::string writeOverview(const OverviewData& data, const Tarn::Inventory::Tree& tree);

/// The overview as JSON: each processor separately, codes and numbers in base units, null for unknown values.
std::string writeOverviewAsJson(const OverviewData& data, const Tarn::Inventory::Tree& tree);

/// A row for each processor, with the same properties for all.
std::vector<Instance> overviewRows(const OverviewData& data, const Tarn::Inventory::Tree& tree);

}  // namespace Corvcim

#endif
