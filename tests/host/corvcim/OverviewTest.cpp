#include "host/corvcim/overview/Overview.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "host/corvcim/overview/Health.h"
#include "host/corvcim/overview/ProcessorState.h"
#include "host/corvcim/text/InventoryText.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Machines.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Tree;
using Tarn::Inventory::TreeBuilder;

Instance instanceOf(std::string_view className, std::vector<NamedValue> properties) {
  return makeInstance("root/cimv2", className, std::move(properties));
}

Instance processor(const std::string& identifier) {
  return instanceOf("HALDA_CPUProcessor", {{"DeviceID", Value::string(identifier)},
                                           {"Name", Value::string("Desk CPU 2")},
                                           {"Family", Value::uint16(179)},
                                           {"Stepping", Value::string("8")},
                                           {"CPUStatus", Value::uint16(1)},
                                           {"EnabledState", Value::uint16(2)},
                                           {"HealthState", Value::uint16(5)},
                                           {"CurrentClockSpeed", Value::uint32(800)},
                                           {"MaxClockSpeed", Value::uint32(2300)},
                                           {"DataWidth", Value::uint16(64)},
                                           {"AddressWidth", Value::uint16(64)},
                                           {"NumberOfEnabledCores", Value::uint16(2)}});
}

Instance capabilities(unsigned cores, unsigned threads) {
  return instanceOf("HALDA_CPUProcessorCapabilities",
                    {{"InstanceID", Value::string("NERITH:P0")},
                     {"NumberOfProcessorCores", Value::uint16(static_cast<std::uint16_t>(cores))},
                     {"NumberOfHardwareThreads", Value::uint16(static_cast<std::uint16_t>(threads))}});
}

OverviewCache cache(std::uint16_t level, std::uint16_t type, std::uint64_t blocks) {
  return {instanceOf("HALDA_CPUMemory", {{"BlockSize", Value::uint64(64)}, {"NumberOfBlocks", Value::uint64(blocks)}}),
          instanceOf("HALDA_CPUAssociatedCacheMemory",
                     {{"Level", Value::uint16(level)}, {"CacheType", Value::uint16(type)}})};
}

Instance systemCalled(const std::string& model, const std::string& maker) {
  return instanceOf(
      "HALDA_ComputerSystem",
      {{"Name", Value::string("desk")}, {"Model", Value::string(model)}, {"Manufacturer", Value::string(maker)}});
}

TEST(Overview, NamesTheProcessorWithAllThatPeopleAskFor) {
  OverviewData data;
  data.system = systemCalled("DeskBox 2", "Boxes Inc.");
  data.processors = {{processor("P0"),
                      capabilities(2, 4),
                      {cache(5, 4, 262144), cache(4, 4, 32768), cache(4, 4, 32768), cache(3, 2, 512), cache(3, 3, 768),
                       cache(3, 2, 512), cache(3, 3, 768), cache(1, 4, 0)}}};

  EXPECT_EQ(writeOverview(data, Tree()),
            "desk: Boxes Inc. DeskBox 2\n"
            "\n"
            "Processor P0\n"
            "  Model   Desk CPU 2\n"
            "  Family  Xeon, stepping 8\n"
            "  State   Enabled, health OK\n"
            "  Cores   2 cores, all enabled, 4 threads\n"
            "  Clocks  800 MHz now, 2.3 GHz at most\n"
            "  Caches  2 × L1d 48 KiB, 2 × L1i 32 KiB, 2 × L2 2 MiB, L3 16 MiB, cache\n"
            "  Widths  64 data bits, 64 address bits\n");
}

TEST(Overview, EqualProcessorsShareAParagraph) {
  OverviewData data;
  data.system = systemCalled("DeskBox 2", "DeskBox");
  data.processors = {{processor("P0"), capabilities(4, 4), {}},
                     {processor("P1"), capabilities(4, 4), {}},
                     {processor("P2"), capabilities(2, 2), {}}};

  EXPECT_EQ(writeOverview(data, Tree()),
            "desk: DeskBox 2\n"
            "3 processors: 10 cores, 6 enabled, 10 threads\n"
            "\n"
            "2 equal processors: P0, P1\n"
            "  Model   Desk CPU 2\n"
            "  Family  Xeon, stepping 8\n"
            "  State   Enabled, health OK\n"
            "  Cores   4 cores, 2 enabled, 4 threads\n"
            "  Clocks  800 MHz now, 2.3 GHz at most\n"
            "  Caches  not known\n"
            "  Widths  64 data bits, 64 address bits\n"
            "\n"
            "Processor P2\n"
            "  Model   Desk CPU 2\n"
            "  Family  Xeon, stepping 8\n"
            "  State   Enabled, health OK\n"
            "  Cores   2 cores, all enabled, 2 threads\n"
            "  Clocks  800 MHz now, 2.3 GHz at most\n"
            "  Caches  not known\n"
            "  Widths  64 data bits, 64 address bits\n");
}

TEST(Overview, WhatIsNotKnownIsNotInvented) {
  OverviewData data;
  data.processors = {{instanceOf("HALDA_CPUProcessor", {{"DeviceID", Value::string("P0")}}), {}, {}}};

  EXPECT_EQ(writeOverview(data, Tree()),
            "This machine\n"
            "\n"
            "Processor P0\n"
            "  Model   not known\n"
            "  Family  not known\n"
            "  State   not known, health not known\n"
            "  Cores   not known\n"
            "  Clocks  not known\n"
            "  Caches  not known\n"
            "  Widths  not known\n");
}

TEST(Overview, SaysWhatCouldNotBeReadAndWhatWouldHelp) {
  const Tree tree = TreeBuilder()
                        .unread({"/sys/a", "permission denied", "run as root"})
                        .unread({"/sys/b", "no such file", ""})
                        .build();

  EXPECT_EQ(writeOverview({}, tree),
            "This machine\n"
            "\n"
            "No processors found.\n"
            "\n"
            "Not read:\n"
            "  /sys/a: permission denied\n"
            "    run as root\n"
            "  /sys/b: no such file\n");
}

/// Two processors in use, one that failed, and a socket without one, in this order.
Tree serverWithAFailure() {
  TreeBuilder builder;
  builder.processor("P0").core("P0.C0").cpus({0}).core("P0.C1").cpus({1}).status(12);
  builder.processor("P1").core("P1.C0").cpus({2}).core("P1.C1").cpus({3});
  builder.processor("S:2").status(24).processor("S:3").status(15);
  return builder.build();
}

OverviewData overviewOfFailure() {
  OverviewData data;
  data.processors = {{processor("P0"), capabilities(2, 4), {}},
                     {processor("P1"), capabilities(2, 4), {}},
                     {processor("S:2"), capabilities(2, 4), {}}};
  assignValue(data.processors[2].processor.properties, "CPUStatus", Value::uint16(24));
  assignValue(data.processors[2].processor.properties, "HealthState", Value::uint16(25));
  assignValue(data.processors[2].processor.properties, "EnabledState", Value::uint16(5));
  return data;
}

TEST(Overview, AFailedProcessorComesFirstAndTotalsCountPartsAsTheyAre) {
  const std::string same =
      "  Clocks  800 MHz now, 2.3 GHz at most\n"
      "  Caches  not known\n"
      "  Widths  64 data bits, 64 address bits\n";

  EXPECT_EQ(writeOverview(overviewOfFailure(), serverWithAFailure()),
            "This machine\n"
            "4 sockets (1 failed, 2 in use, 1 empty socket): 6 cores, 3 enabled, 12 threads\n"
            "\n"
            "Processor S:2 (failed)\n"
            "  Model   Desk CPU 2\n"
            "  Family  Xeon, stepping 8\n"
            "  State   Not Applicable, health Critical Failure\n"
            "  Cores   2 cores, none enabled, 4 threads\n" +
                same +
                "\n"
                "Processor P0\n"
                "  Model   Desk CPU 2\n"
                "  Family  Xeon, stepping 8\n"
                "  State   Enabled, health OK\n"
                "  Cores   2 cores, 1 enabled, 4 threads\n" +
                same +
                "\n"
                "Processor P1\n"
                "  Model   Desk CPU 2\n"
                "  Family  Xeon, stepping 8\n"
                "  State   Enabled, health OK\n"
                "  Cores   2 cores, all enabled, 4 threads\n" +
                same +
                "\n"
                "Not reported to clients: S:3 (empty socket)\n");
}

TEST(Overview, CpusWithoutAKnownCoreAreCounted) {
  OverviewData data;
  data.processors = {{processor("P0"), capabilities(2, 4), {}}};
  const Tree tree =
      TreeBuilder().processor("P0").cpus({0, 1, 2, 3}).core("P0.C0").cpus({0}).core("P0.C1").cpus({1}).build();

  EXPECT_NE(writeOverview(data, tree).find("  Cores   2 cores, 2 enabled, 4 threads, 2 of them on no known core\n"),
            std::string::npos);
}

/// A virtual machine, whose processor the library reports without model and family.
OverviewData virtualData() {
  OverviewData data;
  data.system = systemCalled("Virtual Machine", "");
  data.processors = {{processor("P0"), capabilities(2, 2), {}}};
  assignValue(data.processors[0].processor.properties, "Name", Value::string("Unknown"));
  assignValue(data.processors[0].processor.properties, "Family", Value::uint16(2));
  return data;
}

TEST(Overview, OfAVirtualMachineSaysWhatTheKernelReportsAndOnceWhatIsNotThere) {
  const Tree tree =
      TreeBuilder()
          .processor("P0")
          .text(Tarn::NodeLexicon::PropProcessorName, "Intel(R) Xeon(R) Processor")
          .number(Tarn::NodeLexicon::PropFamily, 179)
          .unread({"/sys/firmware/dmi/tables/smbios_entry_point", "no such file or directory", "x"})
          .unread({"/sys/class/dmi/id/product_name", "no such file or directory", "x"})
          .unread({"/sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq", "no such file or directory", "x"})
          .unread({"/sys/other", "no such file or directory", "x"})
          .unread({"/sys/closed", "permission denied", "run as root"})
          .build();

  EXPECT_EQ(writeOverview(virtualData(), tree),
            "desk: Virtual Machine\n"
            "\n"
            "Processor P0\n"
            "  Model   Unknown to clients; the kernel reports Intel(R) Xeon(R) Processor\n"
            "  Family  Unknown to clients; the kernel reports Xeon, stepping 8\n"
            "  State   Enabled, health OK\n"
            "  Cores   2 cores, all enabled, 2 threads\n"
            "  Clocks  800 MHz now, 2.3 GHz at most\n"
            "  Caches  not known\n"
            "  Widths  64 data bits, 64 address bits\n"
            "\n"
            "This virtual machine does not provide: firmware tables, product name, maximum clock, /sys/other\n"
            "\n"
            "Not read:\n"
            "  /sys/closed: permission denied\n"
            "    run as root\n");
}

TEST(OverviewAsJson, HasNumbersInBaseUnitsAndNullForWhatIsNotKnown) {
  OverviewData data = virtualData();
  data.processors[0].caches = {cache(5, 4, 262144), cache(3, 3, 0)};
  assignValue(data.processors[0].processor.properties, "MaxClockSpeed", Value::uint32(0));
  const Tree tree =
      TreeBuilder().processor("P0").text(Tarn::NodeLexicon::PropProcessorName, "X").processor("S").status(15).build();

  EXPECT_EQ(writeOverviewAsJson(data, tree), R"({
  "system": {
    "name": "desk",
    "manufacturer": null,
    "model": "Virtual Machine",
    "virtual": true
  },
  "cores": 2,
  "enabledCores": 2,
  "threads": 2,
  "processors": [
    {
      "path": "P0",
      "severity": "OK",
      "reasons": [],
      "model": "Unknown",
      "inventoryModel": "X",
      "stepping": "8",
      "Family": 2,
      "CPUStatus": 1,
      "EnabledState": 2,
      "HealthState": 5,
      "CurrentClockSpeed": 800,
      "MaxClockSpeed": null,
      "DataWidth": 64,
      "AddressWidth": 64,
      "cores": 2,
      "enabledCores": 2,
      "threads": 2,
      "caches": [
        {
          "name": "L1d",
          "size": null,
          "count": 1
        },
        {
          "name": "L3",
          "size": 16777216,
          "count": 1
        }
      ]
    }
  ],
  "notReported": [
    {
      "path": "S",
      "status": 15
    }
  ],
  "unread": []
}
)");
}

std::string healthOf(const OverviewData& data, const Tree& tree, int status) {
  std::vector<ProcessorState> states;
  for (const OverviewProcessor& each : data.processors) {
    states.push_back(stateOf(each.processor, each.capabilities, tree));
  }
  const auto others = unreported(states, tree);
  const Outcome outcome = writeHealth(states, others);
  EXPECT_EQ(outcome.status, status);
  EXPECT_TRUE(outcome.errors.empty());
  return outcome.output;
}

TEST(Health, TheWorstProcessorIsTheFirstLineAndTheStatus) {
  EXPECT_EQ(healthOf(overviewOfFailure(), serverWithAFailure(), 2),
            "FAILED S:2: failed; health Critical Failure; 2 cores, none enabled, 4 threads\n"
            "DEGRADED P0: 2 cores, 1 enabled, 4 threads\n"
            "OK P1: 2 cores, all enabled, 4 threads\n");
}

TEST(Health, FailedPartsDegradeTheirProcessor) {
  OverviewData data;
  data.processors = {{processor("P0"), capabilities(2, 4), {}}};
  const Tree tree = TreeBuilder()
                        .processor("P0")
                        .core("P0.C0")
                        .core("P0.C1")
                        .cache("P0.L2")
                        .status(24)
                        .cache("P0.L3")
                        .status(16)
                        .cache("P0.L4")
                        .status(20)
                        .build();

  EXPECT_EQ(healthOf(data, tree, 1), "DEGRADED P0: cache P0.L2: failed; cache P0.L4: predictive failure\n");
}

TEST(Health, WithoutStateOrHealthAProcessorIsUnknown) {
  OverviewData data;
  data.processors = {{processor("P1"), capabilities(2, 4), {}},
                     {instanceOf("HALDA_CPUProcessor", {{"DeviceID", Value::string("P0")}}), {}, {}}};
  const Tree tree = TreeBuilder().processor("P2").status(0).build();

  EXPECT_EQ(healthOf(data, tree, 3),
            "UNKNOWN P0: state not known; health not known\n"
            "UNKNOWN P2: not reported to clients; status 0\n"
            "OK P1: 2 cores, all enabled, 4 threads\n");
  EXPECT_EQ(healthOf({}, Tree(), 3), "UNKNOWN: no processors\n");
}

TEST(Health, EachHealthStateHasASeverity) {
  const std::pair<std::uint16_t, std::string> expected[] = {{0, "UNKNOWN P0: health Unknown\n"},
                                                            {5, "OK P0: 2 cores, all enabled, 4 threads\n"},
                                                            {7, "UNKNOWN P0: health 7\n"},
                                                            {10, "DEGRADED P0: health Degraded\n"},
                                                            {15, "FAILED P0: health Minor Failure\n"},
                                                            {20, "FAILED P0: health Major Failure\n"},
                                                            {25, "FAILED P0: health Critical Failure\n"},
                                                            {30, "FAILED P0: health Non-recoverable Error\n"}};
  for (const auto& [health, line] : expected) {
    OverviewProcessor each = {processor("P0"), capabilities(2, 4), {}};
    assignValue(each.processor.properties, "HealthState", Value::uint16(health));
    const ProcessorState states[] = {stateOf(each.processor, each.capabilities, Tree())};

    EXPECT_EQ(writeHealth({states[0]}, {}).output, line);
  }
}

TEST(InventoryText, ShowsEveryNodeWithItsProperties) {
  EXPECT_EQ(writeInventoryText(Testing::strangeTexts()),
            "system system\n"
            "    SystemModel  A<b>&\"c\"\\n\\x1B[31m\n"
            "  processor P0\n"
            "      description        Socket P0\n"
            "      ProcessorId        0f a9\n"
            "      Stepping           8\n"
            "      ProcessorName      say \"hi\" \\ <there>\\x07 é\\n\n"
            "      DataWidth          64\n"
            "      MaxClockSpeed      1000\n"
            "      CurrentClockSpeed  2000\n"
            "      HardwareThreads    1\n"
            "      EnabledCores       1\n"
            "      ProcessorCores     1\n"
            "      Family             179\n"
            "    core P0.C0\n"
            "        description  x\\ty\n"
            "        cpus         0\n");
}

TEST(InventoryText, ShowsWhereSourcesDisagreeAfterWhatWasNotRead) {
  const auto tree = Tarn::Inventory::TreeBuilder()
                        .system()
                        .unread({"/sys/a", "permission denied", "run as root"})
                        .disagreement({"P0", "ProcessorName", "A\n", "/proc/cpuinfo", "B", "SMBIOS type 4"})
                        .build();

  EXPECT_EQ(writeInventoryText(tree),
            "system system\n"
            "\n"
            "Not read:\n"
            "  /sys/a: permission denied\n"
            "    run as root\n"
            "\n"
            "Sources disagree:\n"
            "  P0 ProcessorName\n"
            "    A\\n  taken from /proc/cpuinfo\n"
            "    B  said by SMBIOS type 4\n");
}

}  // namespace
}  // namespace Corvcim
