// The built program from outside: arguments in, both streams and the exit status out. ErrorsTest has what fails.

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <nlohmann/json.hpp>
#include <string>

#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Expected.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

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
                    "  UpgradeMethod            0 (Unknown)\n"
                    "  NumberOfEnabledCores     2\n"));
}

TEST(Corvcim, EnumeratesWithAPropertyListAndANamespace) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-o", "mof", "ei", "ROOT/CIMV2:HALDA_CPUProcessor", "MaxClockSpeed,Stepping"}),
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
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-n", "Root/CIMv2", "ein", "halda_cpuprocessorCORE"}),
            success("Root/CIMv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C0\"\n"
                    "Root/CIMv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C1\"\n"));
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
  EXPECT_EQ(corvcim({"ein", "--help"}),
            success("Usage: corvcim [OPTION...] ein CLASS\n"
                    "\n"
                    "Shows the paths of every instance.\n"
                    "Output: text, table, csv, mof or json.\n"
                    "\n"
                    "CLASS is a class name, with or without a namespace before it\n"
                    "(root/cimv2:HALDA_CPUMemory).\n"
                    "\n"
                    "Options:\n"
                    "      --columns PROP,...  the columns of a table or of csv, in this order\n"
                    "      --as-is             sends a request as it was typed, without a broker's\n"
                    "                          checks\n"));
}

TEST(Corvcim, InventoryReadsBackAsTheSameTree) {
  for (const auto& machine : {twoCoreMachine(), dualSocketServer(), numaServer(), smallBoard(), strangeTexts()}) {
    const Finished run = corvcimOn(machine, {"inventory", "-o", "json"});

    EXPECT_EQ(run.errors, "");
    EXPECT_EQ(Tarn::Inventory::readJson(run.output, "output"), machine);
  }
}

TEST(Corvcim, OverviewComesThroughTheProviders) {
  EXPECT_EQ(corvcimOn(smallBoard(), {}),
            success(host() + ": BoardBox\n"
                             "2 sockets (1 in use, 1 empty socket): 4 cores, 3 enabled, 4 threads\n"
                             "\n"
                             "Processor P0\n"
                             "  Model   Board CPU 4\n"
                             "  Family  Xeon, stepping 8\n"
                             "  State   Enabled, health OK\n"
                             "  Cores   4 cores, 3 enabled, 4 threads\n"
                             "  Clocks  2 GHz now, 1.5 GHz at most\n"
                             "  Caches  4 × L1d 32 KiB, 4 × L1i 48 KiB, L2 1 MiB, cache\n"
                             "  Widths  64 data bits, 64 address bits\n"
                             "\n"
                             "Not reported to clients: P1 (empty socket)\n"
                             "\n"
                             "Not read:\n"
                             "  /sys/firmware/dmi/tables/DMI: permission denied\n"
                             "    run as root to read it\n"));
}

TEST(Corvcim, OverviewOfAVirtualMachineSaysWhatTheKernelReports) {
  EXPECT_EQ(corvcimOn(virtualMachine(), {}),
            success(host() + ": Virtual Machine\n"
                             "\n"
                             "Processor P0\n"
                             "  Model   Unknown to clients; the kernel reports Host CPU\n"
                             "  Family  Unknown to clients; the kernel reports Xeon, stepping 8\n"
                             "  State   Enabled, health OK\n"
                             "  Cores   1 core, 1 enabled, 1 thread\n"
                             "  Clocks  2 GHz now\n"
                             "  Caches  not known\n"
                             "  Widths  64 data bits, 64 address bits\n"));
}

TEST(Corvcim, OverviewAsJsonHasEveryProcessor) {
  const Finished run = corvcimOn(dualSocketServer(), {"-o", "json"});
  const nlohmann::json overview = nlohmann::json::parse(run.output);

  EXPECT_EQ(run.errors, "");
  EXPECT_EQ(overview["system"]["name"], host());
  EXPECT_EQ(overview["cores"], 128);
  EXPECT_EQ(overview["processors"].size(), 2U);
  EXPECT_EQ(overview["processors"][1]["path"], "P1");
  EXPECT_EQ(overview["processors"][1]["caches"].dump(),
            R"([{"count":64,"name":"L1d","size":32768},{"count":64,"name":"L1i","size":32768},)"
            R"({"count":64,"name":"L2","size":524288},{"count":8,"name":"L3","size":33554432}])");
}

TEST(Corvcim, OverviewAsATableHasARowForEachProcessor) {
  EXPECT_EQ(corvcimOn(smallBoard(), {"-o", "table"}),
            success("Path  Severity  CPUStatus   HealthState  Cores  EnabledCores  Threads  MaxClockSpeed  Family      "
                    "Model\n"
                    "P0    DEGRADED  1 (In Use)  5 (OK)       4      3             4        1500 MHz       179 (Xeon)  "
                    "Board CPU 4\n"));
  EXPECT_EQ(corvcimOn(smallBoard(), {"-o", "csv", "--columns", "model,Path"}),
            success("model,Path\r\nBoard CPU 4,P0\r\n"));
  EXPECT_EQ(corvcimOn(smallBoard(), {"-o", "csv", "--columns", "Cors"}),
            (Finished{2, "",
                      "corvcim: the overview has no column 'Cors': there are Path, Severity, CPUStatus, HealthState, "
                      "Cores, EnabledCores, Threads, MaxClockSpeed, Family, Model\n"}));
}

TEST(Corvcim, HealthIsALineForEachProcessorAndAStatus) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"health"}), success("OK P0: 2 cores, all enabled, 2 threads\n"));
  EXPECT_EQ(corvcimOn(smallBoard(), {"health"}), (Finished{1, "DEGRADED P0: 4 cores, 3 enabled, 4 threads\n", ""}));

  Tarn::Inventory::TreeBuilder builder;
  builder.processor("P0").processor("P1").status(Tarn::Inventory::Status::failed);
  EXPECT_EQ(corvcimOn(builder.build(), {"health"}),
            (Finished{2, "FAILED P1: failed; health Critical Failure\nOK P0\n", ""}));
}

TEST(Corvcim, HealthIsUnknownIfItsSourceCannotBeRead) {
  EXPECT_EQ(corvcim({"-i", "hwloc:/nowhere.xml", "health"}).status, 3);
  EXPECT_EQ(shell("\"$corvcim\" health -i - </dev/null"),
            (Finished{3,
                      "UNKNOWN: cannot read the inventory: /dev/stdin: it is empty; name a file that holds an "
                      "inventory\n",
                      ""}));
  const Directory directory;
  const std::string pipe = directory.file("pipe");
  EXPECT_EQ(shell("mkfifo " + pipe + "; echo '{}' > " + pipe + " & \"$corvcim\" health -i " + pipe),
            (Finished{3,
                      "UNKNOWN: cannot read the inventory: " + pipe +
                          ", /format: is missing; correct the file; the format is described in docs/inventory.md\n",
                      ""}));
}

TEST(Corvcim, HealthThatCannotBeWrittenIsUnknown) {
  EXPECT_EQ(shell("\"$corvcim\" health >/dev/full"),
            (Finished{3, "", "corvcim: standard output: No space left on device\n"}));
}

TEST(Corvcim, HealthIsUnknownWhereTheProgramFails) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"health", "-l", "/nowhere/provider.so"}),
            (Finished{3,
                      "UNKNOWN: HALDA_CPUProcessor: CIM_ERR_FAILED: cannot load provider library: "
                      "/nowhere/provider.so: cannot open shared object file: No such file or directory\n",
                      ""}));
  EXPECT_EQ(corvcim({"health", "-i", "root:/nowhere"}),
            (Finished{3,
                      "UNKNOWN: cannot read the inventory: /nowhere: no such file or directory; name a captured root "
                      "directory, or a file of captured files\n",
                      ""}));
  EXPECT_EQ(corvcim({"health", "P0"}),
            (Finished{3, "UNKNOWN: health: unexpected argument 'P0'; usage: corvcim [OPTION...] health\n",
                      "corvcim: health: unexpected argument 'P0'; usage: corvcim [OPTION...] health\n"}));
}

TEST(Corvcim, AsciiLocalesGetAscii) {
  const Directory directory;
  const std::string file = directory.write("machine.json", Tarn::Inventory::writeJson(strangeTexts()));
  const std::string run = "export LC_ALL=C CORVANE_INVENTORY=json:" + file + "; \"$corvcim\" ";

  EXPECT_EQ(shell(run + "tree"), success(host() + ": A<b>&\"c\"\\n\\x1B[31m\n"
                                                  "`- processor P0: say \"hi\" \\ <there>\\x07 \\u00E9\\n; 1 core; "
                                                  "1 thread; up to 1 GHz\n"
                                                  "   `- core P0.C0: CPU 0\n"));
  EXPECT_EQ(shell(run + "-o table ei HALDA_CPUProcessor Name,DeviceID"),
            success("Name                             DeviceID\n"
                    "say \"hi\" \\ <there>\\x07 \\u00E9\\n  P0\n"));
  EXPECT_EQ(shell(run + "gi é"), failed("gi \\u00E9: this is a class, and gi takes the path of an instance; ein lists "
                                        "the paths of a class"));
  EXPECT_NE(shell(run + "inventory -o json").output.find("é"), std::string::npos);
  EXPECT_NE(shell(run + "tree -o svg").output.find("é"), std::string::npos);
}

TEST(Corvcim, TablesAndCsvHaveTheColumnsThatWereAskedFor) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-o", "table", "ei", "HALDA_CPUProcessor", "MaxClockSpeed,deviceid,UniqueId"}),
            success("MaxClockSpeed  DeviceID  UniqueId\n"
                    "2300 MHz       P0        0FA9\n"));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-o", "csv", "ei", "HALDA_CPUProcessorCore", "--columns", "HealthState"}),
            success("HealthState\r\n5\r\n5\r\n"));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-o", "csv", "ein", "HALDA_CPUProcessorCore"}),
            success("InstanceID\r\nP0.C0\r\nP0.C1\r\n"));
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"-o", "csv", "ain", "-ac", "HALDA_CPUConcreteComponent", "--columns",
                                         "InstanceID", processorPath("P0")}),
            success("InstanceID\r\nP0.C0\r\nP0.C1\r\n"));
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
  EXPECT_EQ(nlohmann::json::parse(
                corvcimOn(twoCoreMachine(), {"tree", "-o", "json"}).output)["processors"][0]["parts"][0]["cores"],
            2);
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

TEST(Corvcim, ShowsOneClassWithTypesKeysUnitsAndValueNames) {
  EXPECT_EQ(corvcim({"classes", "halda_cpuprocessorcapabilities"}),
            success("HALDA_CPUProcessorCapabilities: CIM_ProcessorCapabilities\n"
                    "  InstanceID                string    key\n"
                    "  Caption                   string\n"
                    "  Description               string\n"
                    "  NumberOfProcessorCores    uint16\n"
                    "  NumberOfHardwareThreads   uint16\n"
                    "  RequestedStatesSupported  uint16[]\n"
                    "      0 Unknown, 2 Enabled, 3 Disabled, 4 Shut Down, 5 No Change, 6 Offline,\n"
                    "      7 Test, 8 Deferred, 9 Quiesce, 10 Reboot, 11 Reset, 12 Not Applicable\n"
                    "  ElementNameEditSupported  boolean\n"));
  EXPECT_EQ(corvcim({"classes", "CIM_ConcreteComponent"}),
            success("HALDA_CPUConcreteComponent: CIM_ConcreteComponent, an association\n"
                    "  GroupComponent  ref  key, refers to HALDA_CPUProcessor\n"
                    "  PartComponent   ref  key, refers to HALDA_CPUProcessorCore\n"));
  const nlohmann::json processor =
      nlohmann::json::parse(corvcim({"classes", "HALDA_CPUProcessor", "-o", "json"}).output);
  EXPECT_EQ(processor["class"], "HALDA_CPUProcessor");
  for (const auto& property : processor["properties"]) {
    if (property["name"] == "MaxClockSpeed") {
      EXPECT_EQ(property.dump(), R"({"key":false,"name":"MaxClockSpeed","type":"uint32","unit":"MHz"})");
    }
    if (property["name"] == "HealthState") {
      EXPECT_EQ(property["values"]["25"], "Critical Failure");
    }
  }
  EXPECT_EQ(corvcim({"classes", "HALDA_CPUMemry"}),
            failed("classes: no class \"HALDA_CPUMemry\" is served here; did you mean HALDA_CPUMemory?"));
}

TEST(Corvcim, HelpOfAVerbIsThatAfterIt) {
  EXPECT_EQ(corvcim({"help"}), corvcim({"--help"}));
  EXPECT_EQ(corvcim({"help", "ein"}), corvcim({"ein", "--help"}));
  EXPECT_EQ(corvcim({"help", "enumerate"}),
            (Finished{2, "", "corvcim: unknown verb 'enumerate'; see 'corvcim --help'\n"}));
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
                thisHost() +
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
