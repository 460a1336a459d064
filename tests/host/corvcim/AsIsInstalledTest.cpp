// Requests that --as-is sends to the library as the packages have it, with CORVANE_STANDARD_REQUESTS.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/host/corvcim/Expected.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

using Arguments = std::vector<std::string>;

Finished askInstalled(Arguments request) {
  request.insert(request.begin(), {"-l", INSTALLED_LIBRARY, "--as-is"});
  return corvcimOn(twoCoreMachine(), request);
}

TEST(AsIsInstalled, ObjectsOfAnotherAgentFindNothing) {
  for (const char* verb : {"ai", "ain", "ri", "rin"}) {
    EXPECT_EQ(askInstalled({verb, "X_Fan.Name=\"f\""}), success("")) << verb;
    EXPECT_EQ(askInstalled({verb, "-ac", "HALDA_CPUAssociatedCacheMemory", "X_Fan.Name=\"f\""}), success("")) << verb;
  }
}

TEST(AsIsInstalled, ClassesMayBeParentsOrInAnotherCase) {
  const std::string core = "halda_CPUProcessorCORE.InstanceID=\"P0.C1\"";
  for (const Arguments& filter : std::vector<Arguments>{{"-ac", "HALDA_CPUConcreteComponent"},
                                                        {"-ac", "halda_cpuconcretecomponent"},
                                                        {"-ac", "CIM_Component", "-arc", "cim_logicaldevice"},
                                                        {"-arc", "CIM_Processor", "-ar", "partcomponent"}}) {
    Arguments request{"ain"};
    request.insert(request.end(), filter.begin(), filter.end());
    request.push_back(core);
    EXPECT_EQ(askInstalled(request), success(processorPath("P0") + '\n')) << filter[1];
  }
}

TEST(AsIsInstalled, OtherClassesAndRolesFindNothing) {
  for (const Arguments& filter : std::vector<Arguments>{{"-ac", "HALDA_CPUSystemDevice"},
                                                        {"-ac", "HALDA_CPUConcreteComponent", "-arc", "CIM_Memory"},
                                                        {"-ac", "HALDA_CPUConcreteComponent", "-ar", "GroupComponent"},
                                                        {"-ac", "HALDA_CPUConcreteComponent", "-arr", "X_None"}}) {
    Arguments request{"ain"};
    request.insert(request.end(), filter.begin(), filter.end());
    request.push_back(corePath("P0.C1"));
    EXPECT_EQ(askInstalled(request), success("")) << filter.back();
  }
}

TEST(AsIsInstalled, PropertyListMayBeInAnotherCase) {
  EXPECT_EQ(askInstalled({"ei", "HALDA_CPUProcessorCore", "HEALTHSTATE"}),
            success(corePath("P0.C0") + "\n  InstanceID   P0.C0\n  HealthState  5 (OK)\n\n" + corePath("P0.C1") +
                    "\n  InstanceID   P0.C1\n  HealthState  5 (OK)\n"));
}

TEST(AsIsInstalled, UniqueIdIsSelectedByTheNameThatItArrivesUnder) {
  for (const char* name : {"UniqueId", "UniqueID"}) {
    const Finished run = askInstalled({"ei", "HALDA_CPUProcessor", name});
    EXPECT_EQ(run.status, 0) << run;
    EXPECT_NE(run.output.find("UniqueId"), std::string::npos) << run;
  }
}

}  // namespace
}  // namespace Corvcim::Testing
