// The verb explain from outside.

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

using nlohmann::json;
using Tarn::Inventory::Tree;
using Tarn::Inventory::TreeBuilder;
using namespace Tarn::NodeLexicon;
namespace Status = Tarn::Inventory::Status;

/// Parts of every status and code, known and not.
Tree everyCode() {
  TreeBuilder tree;
  tree.system().text(PropSystemModel, "CodeBox");
  unsigned int processor = 0;
  for (const unsigned int status : {1U, 2U, 3U, 8U, 10U, 12U, 13U, 16U, 17U, 20U, 21U, 24U, 77U}) {
    tree.processor("P" + std::to_string(processor)).status(status).description(" with blanks ");
    tree.number(PropFamily, processor).number(PropUpgradeMethod, 65530 + processor);
    tree.number(PropEnabledCores, processor).number(PropProcessorCores, 70000).number(PropDataWidth, 64);
    tree.text(PropProcessorId, "0f a9").number(PropExternalClockSpeed, processor == 3 ? 0 : 100);
    tree.list(PropRequestedStatesSupported, {1, 2, 1});
    ++processor;
  }
  for (unsigned int code = 1; code < 9; ++code) {
    const std::string number = std::to_string(code);
    tree.core("P12.C" + number).status(code == 8 ? Status::failed : 3 * code);
    tree.cache("P12.L2." + number).status(3 * code).number(PropCacheAssociativity, code);
    tree.number(PropCacheType, code).number(PropCacheWritePolicy, code).number(PropCacheLevel, code);
  }
  return tree.build();
}

constexpr const char* explainedClasses[] = {"HALDA_ComputerSystem",           "HALDA_CPUProcessor",
                                            "HALDA_CPUProcessorCore",         "HALDA_CPUMemory",
                                            "HALDA_CPUProcessorCapabilities", "HALDA_CPUAssociatedCacheMemory"};

void expectValuesOfTheLibrary(const Tree& machine) {
  const Directory directory;
  const std::string source = "json:" + directory.write("machine.json", Tarn::Inventory::writeJson(machine));
  for (const char* className : explainedClasses) {
    const Finished explained = corvcim({"-i", source, "-o", "json", "explain", className});
    const Finished answered = corvcim({"-i", source, "-o", "json", "ei", className});
    ASSERT_EQ(explained.errors, "") << className;
    const json answers = json::parse(answered.output);
    std::size_t instances = 0;
    const json explanations = json::parse(explained.output);
    for (const json& instance : explanations["instances"]) {
      if (instance["path"].is_null()) {
        continue;
      }
      ++instances;
      const auto same = std::find_if(answers.begin(), answers.end(),
                                     [&](const json& answer) { return answer["path"] == instance["path"]; });
      ASSERT_NE(same, answers.end()) << instance["path"];
      EXPECT_EQ((*same)["properties"].size(), instance["properties"].size());
      for (const json& property : instance["properties"]) {
        EXPECT_EQ((*same)["properties"].at(property["name"].get<std::string>()), property["value"])
            << instance["path"] << property;
        EXPECT_EQ(property["library"].get<std::string>().find("at its own moment"), std::string::npos)
            << instance["path"] << property;
      }
    }
    EXPECT_EQ(instances, answers.size()) << className;
  }
}

TEST(ExplainCommand, ValuesAreThoseOfTheLibraryForEveryCode) {
  expectValuesOfTheLibrary(everyCode());
}

TEST(ExplainCommand, ValuesAreThoseOfTheCompanionForEveryState) {
  for (const unsigned int status : {1U, 12U, 15U, 16U, 20U, 21U, 24U, 77U}) {
    expectValuesOfTheLibrary(TreeBuilder().system().status(status).processor("P0").build());
  }
}

TEST(ExplainCommand, ValuesAreThoseOfTheLibraryForMachines) {
  expectValuesOfTheLibrary(smallBoard());
  expectValuesOfTheLibrary(virtualMachine());
}

TEST(ExplainCommand, AValueIsThatOfGetInstance) {
  const Directory directory;
  const std::string source = "json:" + directory.write("machine.json", Tarn::Inventory::writeJson(twoCoreMachine()));
  for (const std::string path :
       {"HALDA_CPUProcessor.DeviceID=\"P0\"", "HALDA_CPUProcessorCore.InstanceID=\"P0.C1\"",
        "HALDA_CPUMemory.DeviceID=\"P0.L3.0\"", "HALDA_CPUProcessorCapabilities.InstanceID=\"NERITH:P0\""}) {
    const json explained = json::parse(corvcim({"-i", source, "-o", "json", "explain", path}).output);
    const json answer = json::parse(corvcim({"-i", source, "-o", "json", "gi", path}).output);

    ASSERT_EQ(explained["instances"].size(), 1U);
    for (const json& property : explained["instances"][0]["properties"]) {
      EXPECT_EQ(property["value"], answer["properties"].at(property["name"].get<std::string>())) << path << property;
    }
  }
}

const std::string fixture = CORVANE_SOURCE_DIR "/tests/fixtures/";

/// The account of the properties, without that of what could not be read.
std::string accountOf(const std::string& machine, const std::string& properties) {
  const std::string source = "root:" + fixture + machine + "/root.txt";
  const std::string output = corvcim({"-i", source, "explain", "P0", properties}).output;
  return output.substr(0, output.find("\nNot read:"));
}

TEST(ExplainCommand, TellsFileDatumRuleAndTableRow) {
  EXPECT_EQ(accountOf("dual-socket-server", "healthstate,MaxClockSpeed"),
            "P0: HALDA_CPUProcessor\n"
            "  MaxClockSpeed  3700 MHz\n"
            "    datum      /sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq: 3700000\n"
            "    inventory  MaxClockSpeed 3700, by: kHz, rounded to whole MHz\n"
            "    library    as it is\n"
            "  HealthState    5 (OK)\n"
            "    datum      /sys/devices/system/cpu/online: 0-31\n"
            "    inventory  status 1, by: CPUs 0,2,4,6,8,10,12,14,16,18,20,22,24,26,28,30 make up the part: one at "
            "least is online, so it is in use\n"
            "    library    table HealthState of processors: any code without a row, such as 1, is 5\n");
}

TEST(ExplainCommand, PropertiesCanBeNamedByWhatTheyComeFrom) {
  EXPECT_EQ(corvcimOn(twoCoreMachine(), {"explain", "P0", "ProcessorCores"}).output.find("  NumberOfProcessorCores  2"),
            std::string("P0: HALDA_CPUProcessorCapabilities\n").size());
}

TEST(ExplainCommand, OfNothingIsShort) {
  const Finished run = corvcim({"-i", "root:" + fixture + "virtual-machine/root.txt", "explain", "",
                                "Name,Family,"
                                "MaxClockSpeed,NumberOfProcessorCores"});

  EXPECT_EQ(run.output.substr(0, run.output.find("P1")),
            "P0: HALDA_CPUProcessor\n"
            "  Name           Unknown      the machine is virtual\n"
            "  Family         2 (Unknown)  the machine is virtual\n"
            "  MaxClockSpeed  0 MHz        not known\n"
            "\n"
            "P0: HALDA_CPUProcessorCapabilities\n"
            "  NumberOfProcessorCores  2  /sys/devices/system/cpu/cpu0/topology/thread_siblings_list\n"
            "\n");
  const std::size_t notRead = run.output.find("\nNot read:\n");
  ASSERT_NE(notRead, std::string::npos) << run;
  EXPECT_NE(run.output.find("\n  /sys/devices/system/cpu/cpu{0,2}/cpufreq/cpuinfo_max_freq: ", notRead),
            std::string::npos)
      << run;
}

/// The command's output for this machine, with "FILE" for the inventory's file.
std::string explained(const Tree& machine, const std::vector<std::string>& operands) {
  const Directory directory;
  const std::string file = directory.write("machine.json", Tarn::Inventory::writeJson(machine));
  std::vector<std::string> arguments = {"-i", "json:" + file, "explain"};
  arguments.insert(arguments.end(), operands.begin(), operands.end());
  std::string output = corvcim(arguments).output;
  for (std::size_t at = output.find(file); at != std::string::npos; at = output.find(file)) {
    output.replace(at, file.size(), "FILE");
  }
  return output;
}

TEST(ExplainCommand, WhatIsNotReportedIsExplainedAllTheSame) {
  const Tree machine = TreeBuilder().processor("P1").status(Status::emptySocket).build();

  EXPECT_EQ(explained(machine, {"HALDA_CPUProcessor.P1", "EnabledState"}),
            "P1: HALDA_CPUProcessor, not reported: the library leaves out empty sockets\n"
            "  EnabledState  -\n"
            "    datum      FILE, /nodes/0/status: 15\n"
            "    inventory  status 15, by: as the file states it\n");
}

TEST(ExplainCommand, WhatCouldNotBeReadIsSaidWhereItIsMissed) {
  const Tree machine =
      TreeBuilder()
          .processor("P0")
          .unread({"/sys/firmware/dmi/tables/DMI", "permission denied", "run as root"})
          .unread({"/sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq", "no such file or directory", "load it"})
          .build();

  EXPECT_EQ(explained(machine, {"HALDA_CPUProcessor.P0", "UpgradeMethod,MaxClockSpeed,Stepping"}),
            "P0: HALDA_CPUProcessor\n"
            "  MaxClockSpeed  0 MHz\n"
            "    inventory  MaxClockSpeed is not known\n"
            "    not read   /sys/firmware/dmi/tables/DMI: permission denied; run as root\n"
            "    not read   /sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq: no such file or directory; load it\n"
            "    library    0 where it is not known\n"
            "  Stepping       \"\"\n"
            "    inventory  Stepping is not known\n"
            "    library    empty where it is not known\n"
            "  UpgradeMethod  0 (Unknown)\n"
            "    inventory  UpgradeMethod is not known\n"
            "    not read   /sys/firmware/dmi/tables/DMI: permission denied; run as root\n"
            "    library    0 where it is not known\n"
            "\n"
            "Not read:\n"
            "  /sys/firmware/dmi/tables/DMI: permission denied\n"
            "    run as root\n"
            "  /sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq: no such file or directory\n"
            "    load it\n");
}

TEST(ExplainCommand, WhatOnlyFirmwareTellsIsSaid) {
  EXPECT_EQ(explained(TreeBuilder().processor("P0").build(), {"HALDA_CPUProcessor.P0", "ExternalBusClockSpeed"}),
            "P0: HALDA_CPUProcessor\n"
            "  ExternalBusClockSpeed  3600 MHz\n"
            "    inventory  ExternalClockSpeed is not known; only the firmware's SMBIOS tables tell it\n"
            "    library    3600 where it is not known\n");
}

TEST(ExplainCommand, DisagreementsAreTold) {
  const Tree machine = TreeBuilder()
                           .processor("P0")
                           .number(PropMaxClockSpeed, 3500)
                           .disagreement({"P0", "MaxClockSpeed", "3500", "/sys/x", "3600", "SMBIOS type 4"})
                           .disagreement({"P0", "number of cores", "8", "/sys/y", "6", "SMBIOS type 4"})
                           .disagreement({"P9", "status", "1", "a", "2", "b"})
                           .build();

  EXPECT_EQ(explained(machine, {"HALDA_CPUProcessor.P0", "MaxClockSpeed"}),
            "P0: HALDA_CPUProcessor\n"
            "  MaxClockSpeed  3500 MHz\n"
            "    datum      FILE, /nodes/0/properties/MaxClockSpeed: 3500\n"
            "    inventory  MaxClockSpeed 3500, by: as the file states it\n"
            "    disputed   3500 (/sys/x) was taken, not 3600 (SMBIOS type 4)\n"
            "    library    as it is\n"
            "\n"
            "Other disagreements:\n"
            "  P0, number of cores: 8 (/sys/y) was taken, not 6 (SMBIOS type 4)\n");
}

TEST(ExplainCommand, JsonHasEverything) {
  const Directory directory;
  const Tree machine = TreeBuilder()
                           .processor("P0")
                           .number(PropMaxClockSpeed, 3500)
                           .disagreement({"P0", "MaxClockSpeed", "3500", "/sys/x", "3600", "SMBIOS type 4"})
                           .unread({"/sys/firmware/dmi/tables/DMI", "permission denied", "run as root"})
                           .build();
  const std::string file = directory.write("machine.json", Tarn::Inventory::writeJson(machine));

  const json document =
      json::parse(corvcim({"-i", "json:" + file, "-o", "json", "explain", "P0", "maxclockspeed,UpgradeMethod"}).output);

  EXPECT_EQ(document["inventory"], "json:" + file);
  ASSERT_EQ(document["instances"].size(), 1U);
  EXPECT_EQ(document["instances"][0]["class"], "HALDA_CPUProcessor");
  EXPECT_EQ(document["instances"][0]["part"], "P0");
  EXPECT_EQ(document["instances"][0]["notReported"], nullptr);
  const json& clock = document["instances"][0]["properties"][0];
  EXPECT_EQ(clock["name"], "MaxClockSpeed");
  EXPECT_EQ(clock["value"], 3500);
  EXPECT_EQ(clock["field"], "MaxClockSpeed");
  EXPECT_EQ(clock["datum"], 3500);
  EXPECT_EQ(clock["origin"]["source"], file + ", /nodes/0/properties/MaxClockSpeed");
  EXPECT_EQ(clock["library"], "as it is");
  EXPECT_EQ(clock["disagreements"][0]["other"], "3600");
  const json& upgrade = document["instances"][0]["properties"][1];
  EXPECT_EQ(upgrade["datum"], nullptr);
  EXPECT_EQ(upgrade["origin"], nullptr);
  EXPECT_EQ(upgrade["unread"][0]["remedy"], "run as root");
  EXPECT_EQ(document["disagreements"].size(), 1U);
  EXPECT_EQ(document["unread"].size(), 1U);
}

TEST(ExplainCommand, AnUnknownPropertyIsNamed) {
  const Finished run = corvcimOn(smallBoard(), {"explain", "P0.C0", "EnabledState,Colour"});

  EXPECT_EQ(run, (Finished{2, "",
                           "corvcim: explain: no property 'Colour'; there are InstanceID, Caption, Description, "
                           "ElementName, CoreEnabledState, EnabledState, RequestedState, HealthState, "
                           "OperationalStatus\n"}));
}

TEST(ExplainCommand, KernelAndFirmwareAreToldApart) {
  const std::string tables = "SMBIOS type 4, handle 0x0014, offset ";
  const std::string kernel = "root:" + fixture + "dual-socket-server/root.txt";
  const std::string source = "smbios:" + fixture + "smbios/server-with-a-failed-processor/dump.bin+" + kernel;
  const json document = json::parse(
      corvcim({"-i", source, "-o", "json", "explain", "HALDA_CPUProcessor.P0", "MaxClockSpeed,UpgradeMethod"}).output);

  const json& clock = document["instances"][0]["properties"][0];
  EXPECT_EQ(clock["origin"]["source"], "/sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq");
  EXPECT_EQ(clock["disagreements"][0]["chosen"], "3700");
  EXPECT_EQ(clock["disagreements"][0]["other"], "4000");
  EXPECT_EQ(clock["disagreements"][0]["otherSource"], tables + "0x14");
  EXPECT_EQ(document["instances"][0]["properties"][1]["origin"]["source"], tables + "0x19");
}

TEST(ExplainCommand, AClassThatCanNotBeAskedIsAFailure) {
  const Finished run =
      corvcimOn(smallBoard(), {"--library", "/nowhere/provider.so", "explain", "P0.C0", "HealthState"});

  EXPECT_EQ(run.status, 1);
  EXPECT_TRUE(run.errors.starts_with("corvcim: explain: HALDA_CPUProcessorCore: CIM_ERR_FAILED: ")) << run;
  EXPECT_NE(run.output.find("inventory  status 1"), std::string::npos) << run;
}

TEST(ExplainCommand, AnInventoryThatCanNotBeReadIsAnError) {
  EXPECT_EQ(corvcim({"-i", "json:/nowhere.json", "explain"}).errors,
            "corvcim: cannot read the inventory: /nowhere.json: no such file or directory; name a file that holds an "
            "inventory as JSON\n");
}

}  // namespace
}  // namespace Corvcim::Testing
