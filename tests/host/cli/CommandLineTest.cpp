// The built program from outside: arguments in, both streams and the exit status out. ErrorsTest has what fails.

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <nlohmann/json.hpp>
#include <string>

#include "platform/instrumentation/tree/JsonTree.h"
#include "tests/host/cli/Expected.h"
#include "tests/host/cli/Machines.h"
#include "tests/host/cli/Program.h"

namespace Corvcim::Testing {
namespace {

/// A path as it stands inside another path.
std::string nested(const std::string& path) {
  std::string text;
  for (const char c : path) {
    text += c == '"' || c == '\\' ? std::string("\\") + c : std::string(1, c);
  }
  return '"' + text + '"';
}

TEST(Corvcim, EnumeratesInstances) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ei", "HALDA_CPUProcessor"}),
            success(processorPath("P0") +
                    "\n"
                    "  CreationClassName        HALDA_CPUProcessor\n"
                    "  DeviceID                 P0\n"
                    "  SystemCreationClassName  HALDA_ComputerSystem\n"
                    "  SystemName               " +
                    host() +
                    "\n"
                    "  Caption                  Processor\n"
                    "  Description              A processor package of the computer system, with its model, clocks "
                    "and state.\n"
                    "  ElementName              Socket P0\n"
                    "  Name                     Desk CPU 2\n"
                    "  Family                   179 (Xeon)\n"
                    "  OtherFamilyDescription   Other\n"
                    "  EnabledState             2 (Enabled)\n"
                    "  RequestedState           12 (Not Applicable)\n"
                    "  CurrentClockSpeed        2000 MHz\n"
                    "  MaxClockSpeed            2300 MHz\n"
                    "  ExternalBusClockSpeed    3600 MHz\n"
                    "  CPUStatus                1 (In Use)\n"
                    "  Status                   OK\n"
                    "  HealthState              5 (OK)\n"
                    "  OperationalStatus        2 (OK)\n"
                    "  DataWidth                64 bits\n"
                    "  AddressWidth             64 bits\n"
                    "  Stepping                 8\n"
                    "  UniqueId                 0FA9\n"
                    "  UpgradeMethod            0\n"
                    "  NumberOfEnabledCores     2\n"));
}

TEST(Corvcim, EnumeratesWithAPropertyListAndANamespace) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-o", "mof", "ei", "root/test:HALDA_CPUProcessor", "MaxClockSpeed,Stepping"}),
            success("instance of HALDA_CPUProcessor {\n"
                    "  CreationClassName = \"HALDA_CPUProcessor\";\n"
                    "  DeviceID = \"P0\";\n"
                    "  SystemCreationClassName = \"HALDA_ComputerSystem\";\n"
                    "  SystemName = \"" +
                    host() +
                    "\";\n"
                    "  MaxClockSpeed = 2300;\n"
                    "  Stepping = \"8\";\n"
                    "};\n"));
}

TEST(Corvcim, EnumeratesNames) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ein", "HALDA_CPUProcessorCore"}),
            success(corePath("P0.C0") + '\n' + corePath("P0.C1") + '\n'));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-n", "root/x", "ein", "halda_cpuprocessorCORE"}),
            success("root/x:HALDA_CPUProcessorCore.InstanceID=\"P0.C0\"\n"
                    "root/x:HALDA_CPUProcessorCore.InstanceID=\"P0.C1\"\n"));
}

TEST(Corvcim, AClassOfTheSchemaStandsForThoseDerivedFromIt) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ein", "CIM_Processor"}), success(processorPath("P0") + '\n'));
}

TEST(Corvcim, GetsOneInstanceAsOneObject) {
  const Finished run = corvcimOn(twoCoreMachine(), {"-o", "json", "gi", corePath("P0.C1"), "HealthState"});

  EXPECT_EQ(run, success("{\n"
                         "  \"class\": \"HALDA_CPUProcessorCore\",\n"
                         "  \"namespace\": \"root/cimv2\",\n"
                         "  \"path\": \"root/cimv2:HALDA_CPUProcessorCore.InstanceID=\\\"P0.C1\\\"\",\n"
                         "  \"properties\": {\n"
                         "    \"InstanceID\": \"P0.C1\",\n"
                         "    \"HealthState\": 5\n"
                         "  }\n"
                         "}\n"));
}

TEST(Corvcim, APathNeedsNoNamespace) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"gi", "HALDA_CPUProcessorCore.InstanceID=\"P0.C0\"", "ElementName"}),
            success(corePath("P0.C0") + "\n  InstanceID   P0.C0\n  ElementName  Core 0\n"));
}

TEST(Corvcim, NavigatesAllAssociationsOfAClass) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ain", processorPath("P0")}),
            success(systemPath() + '\n' + corePath("P0.C0") + '\n' + corePath("P0.C1") + '\n' + cachePath("P0.L1d.0") +
                    '\n' + cachePath("P0.L1i.0") + '\n' + cachePath("P0.L2.0") + '\n' + cachePath("P0.L1d.1") + '\n' +
                    cachePath("P0.L1i.1") + '\n' + cachePath("P0.L2.1") + '\n' + cachePath("P0.L3.0") + '\n' +
                    "root/cimv2:HALDA_CPUProcessorCapabilities.InstanceID=\"NERITH:P0\"\n"));
}

TEST(Corvcim, NavigatesOneAssociation) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ain", "-ac", "HALDA_CPUConcreteComponent", processorPath("P0")}),
            success(corePath("P0.C0") + '\n' + corePath("P0.C1") + '\n'));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ain", "-arc", "HALDA_CPUProcessorCapabilities", processorPath("P0")}),
            success("root/cimv2:HALDA_CPUProcessorCapabilities.InstanceID=\"NERITH:P0\"\n"));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ain", "-ar", "PartComponent", "-arr", "GroupComponent", corePath("P0.C1")}),
            success(processorPath("P0") + '\n'));
}

TEST(Corvcim, GetsAssociatedInstancesWithAPropertyList) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ai", "-ac", "HALDA_CPUConcreteComponent", corePath("P0.C0"), "Name"}).output,
            processorPath("P0") +
                "\n"
                "  CreationClassName        HALDA_CPUProcessor\n"
                "  DeviceID                 P0\n"
                "  SystemCreationClassName  HALDA_ComputerSystem\n"
                "  SystemName               " +
                host() +
                "\n"
                "  Name                     Desk CPU 2\n");
}

TEST(Corvcim, ShowsReferences) {
  const std::string reference =
      "root/cimv2:HALDA_CPUElementCapabilities.ManagedElement=" + nested(processorPath("P0")) +
      ",Capabilities=" + nested("root/cimv2:HALDA_CPUProcessorCapabilities.InstanceID=\"NERITH:P0\"");

  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"rin", "-arc", "HALDA_CPUElementCapabilities", processorPath("P0")}),
            success(reference + '\n'));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"ri", "-ac", "HALDA_CPUElementCapabilities", processorPath("P0")}),
            success(reference + "\n  ManagedElement  " + processorPath("P0") +
                    "\n  Capabilities    root/cimv2:HALDA_CPUProcessorCapabilities.InstanceID=\"NERITH:P0\"\n"));
}

TEST(Corvcim, EveryClassAnswersFromItsOwnNames) {
  for (const std::string className :
       {"HALDA_ComputerSystem", "HALDA_CPUProcessor", "HALDA_CPUProcessorCore", "HALDA_CPUMemory",
        "HALDA_CPUProcessorCapabilities", "HALDA_CPUSystemDevice", "HALDA_CPUConcreteComponent",
        "HALDA_CPUAssociatedCacheMemory", "HALDA_CPUCoreAssociatedCacheMemory", "HALDA_CPUElementCapabilities"}) {
    const std::string names = corvcimOn(twoCoreMachine(), {"ein", className}).output;
    const std::string first = names.substr(0, names.find('\n'));
    ASSERT_NE(first, "") << className;

    const Finished run = corvcimOn(twoCoreMachine(), {"gi", first});

    EXPECT_EQ(run.status, 0) << className << ": " << run.errors;
    EXPECT_TRUE(run.output.starts_with(first + '\n')) << className;
  }
}

TEST(Corvcim, ShowsVersionAndHelp) {
  EXPECT_EQ(corvcim({"--version"}), success("corvcim " CORVCIM_VERSION "\n"));
  EXPECT_TRUE(corvcim({"--help"}).output.starts_with("Usage: corvcim [OPTION...] [VERB [ARGUMENT...]]\n"));
  EXPECT_EQ(corvcim({"ein", "--help"}), success("Usage: corvcim [OPTION...] ein CLASS\n"
                                                "\n"
                                                "Shows the paths of every instance.\n"
                                                "Output: text, mof or json.\n"
                                                "\n"
                                                "CLASS is a class name, with or without a namespace before it "
                                                "(root/cimv2:HALDA_CPUMemory).\n"));
}

TEST(Corvcim, InventoryReadsBackAsTheSameTree) {
  for (const auto& machine : {twoCoreMachine(), dualSocketServer(), smallBoard(), strangeTexts()}) {
    const Finished run = corvcimOn(machine, {"inventory", "-o", "json"});

    EXPECT_EQ(run.errors, "");
    EXPECT_EQ(Tarn::Inventory::readJson(run.output, "output"), machine);
  }
}

TEST(Corvcim, OverviewComesThroughTheProviders) {
  EXPECT_EQ(corvcimOn(smallBoard(), {}), success(host() + ": BoardBox\n"
                                                          "\n"
                                                          "Processor P0\n"
                                                          "  Model   Board CPU 4\n"
                                                          "  Family  Xeon, stepping 8\n"
                                                          "  State   Enabled, health OK\n"
                                                          "  Cores   4 cores, all enabled, 4 threads\n"
                                                          "  Clocks  2 GHz now, 1.5 GHz at most\n"
                                                          "  Caches  4 × L1d 32 KiB, 4 × L1i 48 KiB, L2 1 MiB, cache\n"
                                                          "  Widths  64 data bits, 64 address bits\n"
                                                          "\n"
                                                          "Not read:\n"
                                                          "  /sys/firmware/dmi/tables/DMI: permission denied\n"
                                                          "    run as root to read it\n"));
}

TEST(Corvcim, OverviewOfAVirtualMachineSaysWhyThereIsNoName) {
  EXPECT_EQ(corvcimOn(virtualMachine(), {}),
            success(host() + ": Virtual Machine\n"
                             "\n"
                             "Processor P0\n"
                             "  Model   Unknown\n"
                             "  Family  Unknown, stepping 8\n"
                             "  State   Enabled, health OK\n"
                             "  Cores   1 core, 1 enabled, 1 thread\n"
                             "  Clocks  2 GHz now\n"
                             "  Caches  not known\n"
                             "  Widths  64 data bits, 64 address bits\n"
                             "\n"
                             "A virtual machine: its processors' model and family are not reported.\n"));
}

TEST(Corvcim, OverviewOfABigMachineFitsAScreen) {
  const Finished run = corvcimOn(dualSocketServer(), {});

  EXPECT_EQ(run.status, 0) << run;
  EXPECT_LE(std::ranges::count(run.output, '\n'), 24) << run;
  EXPECT_NE(run.output.find("2 equal processors: P0, P1\n"), std::string::npos) << run;
}

TEST(Corvcim, DrawsTheTree) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"tree"}),
            success(host() + ": DeskBox 2\n"
                             "└─ processor P0: Desk CPU 2; 2 cores; 2 threads; up to 2.3 GHz\n"
                             "   └─ L3 16 MiB: shared by 2 cores\n"
                             "      ├─ core P0.C0: CPU 0; L2 2 MiB, L1d 48 KiB, L1i 32 KiB\n"
                             "      └─ core P0.C1: CPU 1; L2 2 MiB, L1d 48 KiB, L1i 32 KiB\n"));
  EXPECT_TRUE(corvcimOn(twoCoreMachine(), {"tree", "-o", "svg"}).output.starts_with("<svg "));
  EXPECT_TRUE(corvcimOn(twoCoreMachine(), {"tree", "-o", "dot"}).output.starts_with("digraph corvcim {\n"));
}

TEST(Corvcim, ListsTheClasses) {
  EXPECT_TRUE(corvcim({"classes"})
                  .output.starts_with(
                      "CLASS                               DERIVED FROM               KEYS\n"
                      "HALDA_ComputerSystem                CIM_ComputerSystem         CreationClassName, Name\n"));
  const nlohmann::json classes = nlohmann::json::parse(corvcim({"classes", "-o", "json"}).output);
  EXPECT_EQ(classes.size(), 10U);
  EXPECT_EQ(classes[5]["properties"][0].dump(),
            R"({"key":true,"name":"GroupComponent","referenceClass":"HALDA_ComputerSystem","type":"ref"})");
}

TEST(Corvcim, DeclaresTheClassesAsMof) {
  const Finished run = corvcim({"classes", "-o", "mof"});

  EXPECT_TRUE(
      run.output.starts_with("class HALDA_ComputerSystem : CIM_ComputerSystem {\n"
                             "  [Key] string CreationClassName;\n"
                             "  [Key] string Name;\n"
                             "  string Caption;\n"))
      << run;
  EXPECT_TRUE(
      run.output.ends_with("\n"
                           "[Association]\n"
                           "class HALDA_CPUElementCapabilities : CIM_ElementCapabilities {\n"
                           "  [Key] HALDA_CPUProcessor REF ManagedElement;\n"
                           "  [Key] HALDA_CPUProcessorCapabilities REF Capabilities;\n"
                           "};\n"))
      << run;
}

TEST(Corvcim, PropertiesAreSelectedInAnySpelling) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"gi", corePath("P0.C0"), "elementNAME"}),
            success(corePath("P0.C0") + "\n  InstanceID   P0.C0\n  ElementName  Core 0\n"));
  for (const std::string spelling : {"UniqueId", "UniqueID", "uniqueid"}) {
    const Finished run = corvcimOn(twoCoreMachine(), {"-o", "json", "ei", "CIM_Processor", spelling});
    EXPECT_EQ(nlohmann::json::parse(run.output)[0]["properties"]["UniqueId"], "0FA9") << spelling;
  }
  const Finished related = corvcimOn(
      twoCoreMachine(), {"-o", "json", "ai", "-ac", "HALDA_CPUConcreteComponent", corePath("P0.C0"), "NAME,family"});
  const nlohmann::json properties = nlohmann::json::parse(related.output)[0]["properties"];
  EXPECT_EQ(properties["Name"], "Desk CPU 2");
  EXPECT_EQ(properties["Family"], 179);
}

TEST(Corvcim, JsonHasTheSameValuesForOnePropertyAsForAll) {
  for (const auto& definition : nlohmann::json::parse(corvcim({"classes", "-o", "json"}).output)) {
    const std::string name = definition["class"];
    const nlohmann::json all = nlohmann::json::parse(corvcimOn(twoCoreMachine(), {"-o", "json", "ei", name}).output);
    for (const auto& property : definition["properties"]) {
      const std::string ownName = property["name"];
      std::string lowered = ownName;
      std::ranges::transform(lowered, lowered.begin(), [](unsigned char c) { return std::tolower(c); });

      const Finished run = corvcimOn(twoCoreMachine(), {"-o", "json", "ei", name, lowered});

      const nlohmann::json one = nlohmann::json::parse(run.output);
      EXPECT_EQ(one[0]["properties"].at(ownName), all[0]["properties"].at(ownName)) << name;
    }
  }
}

TEST(Corvcim, LanguageIsForPeopleAlone) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"--language", "de_AT", "gi", corePath("P0.C0"), "Caption"}),
            success(corePath("P0.C0") + "\n  InstanceID  P0.C0\n  Caption     Prozessorkern\n"));
  const Finished run = shell("CORVANE_LANGUAGE=de \"$corvcim\" -o mof ei HALDA_ComputerSystem Caption");
  EXPECT_EQ(run.output,
            "instance of HALDA_ComputerSystem {\n"
            "  CreationClassName = \"HALDA_ComputerSystem\";\n"
            "  Name = \"" +
                host() +
                "\";\n"
                "  Caption = \"Computer System\";\n"
                "};\n");
}

TEST(Corvcim, StrangeTextsGiveValidJson) {
  const Finished run = corvcimOn(strangeTexts(), {"-o", "json", "ei", "HALDA_CPUProcessor", "Name"});

  EXPECT_EQ(nlohmann::json::parse(run.output)[0]["properties"]["Name"], "say \"hi\" \\ <there>\x07 \xC3\xA9\n");
}

TEST(Corvcim, AReaderThatGoesAwayEndsItQuietly) {
  const Finished run = shell("\"$corvcim\" classes | true; echo ${PIPESTATUS[0]}");

  EXPECT_EQ(run.errors, "");
  EXPECT_TRUE(run.output == "141\n" || run.output == "0\n") << run;
}

TEST(Corvcim, AReaderThatGoesAwayEndsItQuietlyWhereThePipeSignalIsIgnored) {
  EXPECT_EQ(shell("trap '' PIPE; exec 3> >(exec true); wait $!; \"$corvcim\" classes >&3; echo $?"), success("141\n"));
}

}  // namespace
}  // namespace Corvcim::Testing
