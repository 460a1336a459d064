// Requests and settings that name something which is not there.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/host/corvcim/Expected.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

/// The complaint about a request, without the words before it that repeat the request.
std::string refusal(std::vector<std::string> request) {
  const std::string verb = request.front();
  const std::string operand = request[1];
  const Finished run = corvcimOn(twoCoreMachine(), std::move(request));
  const std::string start = "corvcim: " + verb + ' ' + operand + ": ";
  EXPECT_EQ(run.status, 1) << run;
  EXPECT_EQ(run.output, "") << run;
  EXPECT_TRUE(run.errors.starts_with(start)) << run;
  return run.errors.substr(start.size());
}

TEST(Refusal, PathsOfOtherHostsAreRefused) {
  for (const std::string host : {"otherhost", "user:word@otherhost:5988"}) {
    EXPECT_EQ(refusal({"gi", "http://" + host + '/' + corePath("P0.C0")}),
              "the path is one of host 'otherhost', and this program asks the libraries of this host; leave out //" +
                  host + "/, or ask that host's broker with a WBEM client\n");
  }
  EXPECT_EQ(refusal({"ein", "//[fe80::1]:5988/root/cimv2:HALDA_CPUMemory"}).substr(0, 32),
            "the path is one of host 'fe80::1");
}

TEST(Refusal, PathsOfThisHostAreTaken) {
  for (const std::string& name : {host(), thisHost(), host() + ":5988", "user@" + host(), host() + ".some.domain",
                                  std::string("LOCALHOST"), std::string("127.0.0.1"), std::string("[::1]:5989")}) {
    EXPECT_EQ(corvcimOn(twoCoreMachine(), {"gi", "https://" + name + '/' + corePath("P0.C0"), "ElementName"}),
              success(corePath("P0.C0") + "\n  InstanceID   P0.C0\n  ElementName  Core 0\n"))
        << name;
  }
}

TEST(Refusal, NamespacesWithoutClassesAreRefused) {
  const std::string complaint = "no class is served in the namespace 'root/x': it can be root/cimv2\n";
  EXPECT_EQ(refusal({"ei", "root/x:HALDA_CPUMemory"}), complaint);
  EXPECT_EQ(refusal({"gi",
                     "HALDA_CPUElementCapabilities.Capabilities=\"root/x:HALDA_CPUProcessorCapabilities."
                     "InstanceID=\\\"NERITH:P0\\\"\""}),
            complaint);
}

TEST(Refusal, PropertiesThatNoResultCanHaveAreRefused) {
  EXPECT_EQ(refusal({"ei", "HALDA_CPUProcessor", "Name,MaxClokSpeed"}),
            "HALDA_CPUProcessor has no property 'MaxClokSpeed'; did you mean MaxClockSpeed?\n");
  EXPECT_EQ(refusal({"gi", corePath("P0.C0"), "Colour"}),
            "HALDA_CPUProcessorCore has no property 'Colour'; there are InstanceID, Caption, Description, ElementName, "
            "CoreEnabledState, EnabledState, RequestedState, HealthState, OperationalStatus\n");
  EXPECT_EQ(refusal({"ai", corePath("P0.C0"), "CoreEnabledStat"}),
            "none of the classes asked has a property 'CoreEnabledStat'; did you mean EnabledState?\n");
  EXPECT_EQ(refusal({"ri", corePath("P0.C0"), "-ac", "HALDA_CPUConcreteComponent", "Antecedent"}).substr(0, 66),
            "HALDA_CPUConcreteComponent has no property 'Antecedent'; there are");
}

TEST(Refusal, PropertiesOfTheSchemaThatAreNeverSetAreTaken) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"gi", corePath("P0.C0"), "InstallDate"}),
            success(corePath("P0.C0") + "\n  InstanceID  P0.C0\n"));
}

TEST(Refusal, RolesThatNoAssociationHasAreRefused) {
  EXPECT_EQ(refusal({"ain", corePath("P0.C0"), "-ar", "PartComponnt"}),
            "no association here has the role 'PartComponnt'; did you mean PartComponent?\n");
  EXPECT_EQ(refusal({"ain", corePath("P0.C0"), "-arr", "Owner"}),
            "no association here has the role 'Owner'; there are GroupComponent, PartComponent, Antecedent, "
            "Dependent\n");
  EXPECT_EQ(refusal({"rin", corePath("P0.C0"), "-ac", "HALDA_CPUConcreteComponent", "-ar", "Antecedent"}),
            "no association here has the role 'Antecedent'; there are GroupComponent, PartComponent\n");
}

TEST(Refusal, ClassesThatAreNotServedAreRefused) {
  EXPECT_EQ(refusal({"ain", corePath("P0.C0"), "-arc", "HALDA_CPUProcesor"}),
            "no class 'HALDA_CPUProcesor' is served here; did you mean HALDA_CPUProcessor?\n");
  EXPECT_EQ(
      refusal({"rin", corePath("P0.C0"), "-ac", "HALDA_CPUConcretComponent"}),
      "CIM_ERR_INVALID_PARAMETER: no association class \"HALDA_CPUConcretComponent\" is served here; did you mean "
      "HALDA_CPUConcreteComponent?\n");
}

TEST(Refusal, FiltersWithoutTextFilterNothing) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(),
                      {"ain", "-ac", "", "-arc", "HALDA_CPUProcessor", "-ar", "", "-arr", "", corePath("P0.C0")}),
            success(processorPath("P0") + '\n'));
}

TEST(Refusal, WhatIsWrongInTheConfigurationIsRemarked) {
  const Directory directory;
  const std::string file = directory.write("corvane.conf", "lnguage = de\nlog.level = loud\nlanguage = fi\n");

  EXPECT_EQ(shell("CORVANE_CONFIG=" + file + " \"$corvcim\" gi '" + systemPath(thisHost()) + "' Caption"),
            (Finished{0,
                      systemPath(thisHost()) + "\n  CreationClassName  HALDA_ComputerSystem\n  Name               " +
                          thisHost() + "\n  Caption            Computer System\n",
                      "corvcim: " + file +
                          ":1: unknown key \"lnguage\"; the line is ignored (did you mean language?)\n"
                          "corvcim: " +
                          file +
                          ":2: \"loud\" is not valid: expected error, warning, info, debug or a number\n"
                          "corvcim: " +
                          file + ":3: there are no texts in \"fi\"; English ones are used instead\n"}));
}

TEST(Refusal, LanguagesOfTheEnvironmentWithoutTextsAreRemarked) {
  EXPECT_EQ(
      shell("CORVANE_LANGUAGE=C.UTF-8 \"$corvcim\" ein HALDA_ComputerSystem"),
      (Finished{0, systemPath(thisHost()) + '\n',
                "corvcim: CORVANE_LANGUAGE: there are no texts in \"C.UTF-8\"; English ones are used instead\n"}));
}

}  // namespace
}  // namespace Corvcim::Testing
