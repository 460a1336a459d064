// What the program says where something fails: one line for each failure, and each once.

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <map>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <vector>

#include "tests/host/corvcim/Expected.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

TEST(CorvcimErrors, WhatIsNotThereIsNotFound) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"gi", "HALDA_CPUProcessorCore.InstanceID=\"P0.C9\""}),
            failed("gi HALDA_CPUProcessorCore.InstanceID=\"P0.C9\": CIM_ERR_NOT_FOUND: there is no instance "
                   "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C9\""));
}

TEST(CorvcimErrors, AssociationsOfAMissingInstanceAreNotFound) {
  const std::string core = "HALDA_CPUProcessorCore.InstanceID=\"P0.C9\"";
  for (const std::string verb : {"ai", "ain", "ri", "rin"}) {
    EXPECT_EQ(corvcimOn(twoCoreMachine(), {verb, core}).errors,
              failed(verb + ' ' + core + ": CIM_ERR_NOT_FOUND: there is no instance root/cimv2:" + core).errors);
    EXPECT_EQ(corvcimOn(twoCoreMachine(), {verb, corePath("P0.C0"), "-ar", "Antecedent"}), success(""))
        << "the instance is there, and has no such role";
  }
}

TEST(CorvcimErrors, ClassAndPathAreNotMistakenForEachOther) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"gi", "HALDA_CPUMemory"}),
            failed("gi HALDA_CPUMemory: this is a class, and gi takes the path of an instance; ein lists the paths of "
                   "a class"));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ei", "HALDA_CPUProcessorCore.InstanceID=\"P0.C0\""}),
            failed("ei HALDA_CPUProcessorCore.InstanceID=\"P0.C0\": this is the path of an instance, and ei takes a "
                   "class; ask for the instance with gi"));
}

TEST(CorvcimErrors, AnUnknownClassIsAnErrorThatNamesTheServedOnes) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ei", "HALDA_Disk"}),
            failed("ei HALDA_Disk: CIM_ERR_INVALID_CLASS: no class \"HALDA_Disk\" is served here; there are "
                   "HALDA_ComputerSystem, HALDA_CPUProcessor, HALDA_CPUProcessorCore, HALDA_CPUMemory, "
                   "HALDA_CPUProcessorCapabilities, HALDA_CPUSystemDevice, HALDA_CPUConcreteComponent, "
                   "HALDA_CPUAssociatedCacheMemory, HALDA_CPUCoreAssociatedCacheMemory, "
                   "HALDA_CPUElementCapabilities"));
}

TEST(CorvcimErrors, AWrongCommandLineIsOneLineAndStatusTwo) {
  EXPECT_EQ(corvcim({"enumerate"}), (Finished{2, "", "corvcim: unknown verb 'enumerate'; see 'corvcim --help'\n"}));
}

TEST(CorvcimErrors, AWrongPathIsOneLineThatSaysWhere) {
  const Finished run = corvcimOn(twoCoreMachine(), {"gi", "HALDA_CPUMemory.DeviceID="});

  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.errors,
            "corvcim: gi HALDA_CPUMemory.DeviceID=: object path \"HALDA_CPUMemory.DeviceID=\", column 26: expected a "
            "value: a text in double quotes, TRUE, FALSE or a number\n");
}

TEST(CorvcimErrors, OneFailingAssociationDoesNotHideTheOthers) {
  const Finished run =
      corvcimOn(twoCoreMachine(), {"--companion", "/nowhere/companion.so", "ain", processorPath("P0")});

  EXPECT_EQ(run.status, 1);
  EXPECT_TRUE(run.output.starts_with(corePath("P0.C0") + '\n')) << run;
  EXPECT_TRUE(run.output.ends_with("HALDA_CPUProcessorCapabilities.InstanceID=\"NERITH:P0\"\n")) << run;
  EXPECT_EQ(run.errors, "corvcim: ain " + processorPath("P0") +
                            ": HALDA_CPUSystemDevice: CIM_ERR_FAILED: cannot load provider library: "
                            "/nowhere/companion.so: cannot open shared object file: No such file or directory\n");
}

TEST(CorvcimErrors, ALibraryThatIsNotThereIsOneLine) {
  EXPECT_EQ(
      corvcimOn(twoCoreMachine(), {"-l", "/nowhere/provider.so", "ei", "HALDA_CPUMemory"}),
      failed("ei HALDA_CPUMemory: CIM_ERR_FAILED: cannot load provider library: /nowhere/provider.so: cannot open "
             "shared object file: No such file or directory"));
}

TEST(CorvcimErrors, TheOverviewWithoutALibraryIsItsErrorAlone) {
  EXPECT_EQ(
      corvcimOn(twoCoreMachine(), {"-l", "/nowhere/provider.so"}),
      failed("HALDA_CPUProcessor: CIM_ERR_FAILED: cannot load provider library: /nowhere/provider.so: cannot open "
             "shared object file: No such file or directory"));
}

TEST(CorvcimErrors, TheOverviewDoesWithoutTheCompanion) {
  const Finished run = corvcimOn(twoCoreMachine(), {"--companion", "/nowhere/companion.so"});

  EXPECT_EQ(run.status, 1);
  EXPECT_TRUE(run.output.starts_with("This machine\n\nProcessor P0\n")) << run;
  EXPECT_EQ(std::ranges::count(run.errors, '\n'), 1) << run;
}

/// The verbs that the program's help lists.
std::vector<std::string> verbsOfTheHelp() {
  const std::string help = corvcim({"--help"}).output;
  const std::string heading = "\nVerbs:\n";
  const std::size_t begin = help.find(heading) + heading.size();
  std::istringstream lines(help.substr(begin, help.find("\n\n", begin) - begin));
  std::vector<std::string> verbs;
  for (std::string line; std::getline(lines, line);) {
    verbs.push_back(line.substr(2, line.find(' ', 2) - 2));
  }
  return verbs;
}

const std::string whyNowhere =
    "cannot read the inventory: /nowhere: no such file or directory; name a captured root directory, or a file of "
    "captured files";

TEST(CorvcimErrors, AnInventoryThatCanNotBeReadIsSaidByEveryVerb) {
  const std::vector<std::string> sources = {"-i", "root:/nowhere"};
  std::map<std::string, std::vector<std::string>> operands = {{"", {}}, {"diff", {"root:/nowhere", "live"}}};
  std::map<std::string, std::string> prefixes;
  for (const std::string verb : {"ei", "ein"}) {
    operands[verb] = {"HALDA_CPUMemory"};
    prefixes[verb] = verb + " HALDA_CPUMemory: ";
  }
  for (const std::string verb : {"gi", "ai", "ain", "ri", "rin"}) {
    operands[verb] = {processorPath("P0")};
    prefixes[verb] = verb + ' ' + processorPath("P0") + ": ";
  }
  std::vector<std::string> verbs = verbsOfTheHelp();
  ASSERT_GE(verbs.size(), 13U);
  for (const std::string other : {"classes", "help", "health"}) {
    std::erase(verbs, other);  // the same on every machine; health says it on standard output
  }
  verbs.emplace_back();  // the overview

  for (const std::string& verb : verbs) {
    std::vector<std::string> arguments = verb == "diff" ? std::vector<std::string>() : sources;
    if (!verb.empty()) {
      arguments.push_back(verb);
    }
    std::ranges::copy(operands[verb], std::back_inserter(arguments));
    const Finished run = corvcim(arguments);

    EXPECT_EQ(run.errors, "corvcim: " + prefixes[verb] + whyNowhere + '\n') << verb;
    EXPECT_EQ(run.status, verb == "diff" ? 2 : 1) << verb;
    EXPECT_TRUE(run.output.empty() || verb == "snapshot") << verb << run;
  }
}

TEST(CorvcimErrors, AnInventoryThatCanNotBeReadIsSaidOnceForEveryClass) {
  const nlohmann::json classes = nlohmann::json::parse(corvcim({"classes", "-o", "json"}).output);
  for (const auto& definition : classes) {
    const std::string name = definition["class"];
    for (const std::string verb : {"ei", "ein"}) {
      std::string request = verb;
      request.append(" ").append(name);
      EXPECT_EQ(corvcim({"-i", "root:/nowhere", verb, name}), failed(request + ": " + whyNowhere));
    }
  }
  EXPECT_EQ(corvcim({"-i", "root:/nowhere", "ei", "CIM_ManagedElement"}),
            failed("ei CIM_ManagedElement: " + whyNowhere));
}

TEST(CorvcimErrors, AnInventoryThatCanNotBeReadHidesNoOtherMistake) {
  const Finished unknownClass = corvcim({"-i", "root:/nowhere", "ei", "HALDA_Disk"});
  const Finished noLibrary = corvcim({"-i", "root:/nowhere", "-l", "/nowhere/provider.so", "ei", "HALDA_CPUMemory"});

  EXPECT_TRUE(unknownClass.errors.starts_with("corvcim: ei HALDA_Disk: CIM_ERR_INVALID_CLASS: ")) << unknownClass;
  EXPECT_EQ(std::ranges::count(unknownClass.errors, '\n'), 1) << unknownClass;
  EXPECT_TRUE(noLibrary.errors.starts_with("corvcim: ei HALDA_CPUMemory: CIM_ERR_FAILED: cannot load ")) << noLibrary;
  EXPECT_EQ(std::ranges::count(noLibrary.errors, '\n'), 1) << noLibrary;
}

TEST(CorvcimErrors, WhatALibraryLogsToStandardErrorIsShown) {
  const Finished run = shell("CORVANE_LOG=debug:stderr \"$corvcim\" ein HALDA_CPUMemory");

  EXPECT_EQ(run.status, 0);
  EXPECT_NE(run.errors.find(" getFactoryInstance CPUObjFactory.cpp:"), std::string::npos) << run;
  EXPECT_EQ(run.errors.find("corvcim: "), std::string::npos) << run;
}

TEST(CorvcimErrors, WhatALibraryWritesToStandardErrorIsSaidOnceWhereNothingElseSaysIt) {
  const std::string program = "TEST_PROVIDER_ACTION=write \"$corvcim\" -l " TEST_PROVIDER;
  const std::string direct = program + " ein HALDA_CPUMemory";
  const std::string inProcesses = program + " ein CIM_LogicalDevice";

  EXPECT_EQ(shell(direct + " > /dev/null"), (Finished{0, "", "corvcim: the provider library wrote: strange\\x07\n"}));
  EXPECT_EQ(shell(inProcesses + " > /dev/null"),
            (Finished{0, "", "corvcim: the provider library wrote: strange\\x07\n"}));
}

TEST(CorvcimErrors, WhatALibraryWroteBeforeItCrashedIsShown) {
  const std::string program = "TEST_PROVIDER_ACTION=write-abort \"$corvcim\" -l " TEST_PROVIDER;
  const Finished direct = shell(program + " ein HALDA_CPUMemory");
  const Finished inProcess = shell(program + " ein CIM_LogicalDevice");

  EXPECT_EQ(
      direct,
      (Finished{1, "", "last words\ncorvcim: HALDA_CPUMemory: the provider library " TEST_PROVIDER " crashed\n"}));
  EXPECT_EQ(inProcess.status, 1);
  EXPECT_NE(inProcess.errors.find("was ended by signal 6 (Aborted) during EnumerateInstanceNames of "),
            std::string::npos)
      << inProcess;
  EXPECT_TRUE(inProcess.errors.ends_with("\ncorvcim: the provider library wrote: last words\n")) << inProcess;
}

TEST(CorvcimErrors, OutputThatCanNotBeWrittenIsAnError) {
  EXPECT_EQ(shell("\"$corvcim\" classes > /dev/full"), failed("standard output: No space left on device"));
  EXPECT_EQ(shell("\"$corvcim\" classes >&-").status, 1);
}

}  // namespace
}  // namespace Corvcim::Testing
