#include "host/cli/Overview.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "host/cli/InventoryText.h"
#include "platform/instrumentation/tree/TreeBuilder.h"
#include "tests/host/cli/Machines.h"

namespace Corvcim {
namespace {

Instance instanceOf(std::string_view className, std::vector<NamedValue> properties) {
  return makeInstance("root/cimv2", className, std::move(properties));
}

Instance processor(const std::string& identifier) {
  return instanceOf("HALDA_CPUProcessor", {{"DeviceID", Value::string(identifier)},
                                           {"Name", Value::string("Desk CPU 2")},
                                           {"Family", Value::uint16(179)},
                                           {"Stepping", Value::string("8")},
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

  EXPECT_EQ(writeOverview(data, {}),
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

  EXPECT_EQ(writeOverview(data, {}),
            "desk: DeskBox 2\n"
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

  EXPECT_EQ(writeOverview(data, {}),
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
  const OverviewData data;
  const std::vector<Tarn::Inventory::Unread> unread = {{"/sys/a", "permission denied", "run as root"},
                                                       {"/sys/b", "no such file", ""}};

  EXPECT_EQ(writeOverview(data, unread),
            "This machine\n"
            "\n"
            "The library knows no processors.\n"
            "\n"
            "Not read:\n"
            "  /sys/a: permission denied\n"
            "    run as root\n"
            "  /sys/b: no such file\n");
}

TEST(Overview, ExplainsWhyAVirtualMachinesProcessorsHaveNoName) {
  OverviewData data;
  data.system = systemCalled("Virtual Machine", "");
  data.processors = {{processor("P0"), {}, {}}};

  EXPECT_TRUE(
      writeOverview(data, {}).ends_with("\nA virtual machine: its processors' model and family are not reported.\n"));
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
