#ifndef HOST_CORVCIM_OVERVIEW_OVERVIEWDATA_H
#define HOST_CORVCIM_OVERVIEW_OVERVIEWDATA_H

#include <string>
#include <vector>

#include "host/broker/Dispatcher.h"

namespace Corvcim {

/// A cache of a processor: its own instance, and the association that tells its level and type.
struct OverviewCache {
  Instance cache;
  Instance association;
};

/// A processor with what belongs to it, as the providers tell it. Instances that a provider did not
/// give are without properties.
struct OverviewProcessor {
  Instance processor;
  Instance capabilities;
  std::vector<OverviewCache> caches;
};

struct OverviewData {
  Instance system;
  std::vector<OverviewProcessor> processors;
  bool processorsAreKnown = true;     ///< false: their class could not be asked
  std::vector<std::string> failures;  ///< one line for each class that could not be asked
};

/// Asks the providers for everything that the overview shows.
OverviewData gatherOverview(Dispatcher& dispatcher, const std::string& nameSpace);

}  // namespace Corvcim

#endif
