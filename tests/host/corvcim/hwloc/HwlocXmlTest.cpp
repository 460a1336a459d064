#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <stdexcept>

#include "host/corvcim/hwloc/HwlocConversion.h"
#include "host/corvcim/hwloc/HwlocSource.h"
#include "host/corvcim/hwloc/HwlocTopology.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "tests/host/corvcim/hwloc/HwlocXml.h"

namespace Corvcim::Testing {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::Tree;
using namespace Tarn::NodeLexicon;
namespace Status = Tarn::Inventory::Status;

Tree treeOf(const HwlocXml& xml) {
  return treeOfXml(xml.text(), "machine.xml");
}

std::string complaintAboutXml(const std::string& text) {
  try {
    treeOfXml(text, "machine.xml");
    return "";
  } catch (const Tarn::Inventory::InventoryError& error) {
    return error.what();
  }
}

const Node& nodeAt(const Tree& tree, const std::string& path) {
  const auto index = tree.find('/' + path);
  if (index == Tarn::Inventory::noNode) {
    throw std::out_of_range("no node " + path);
  }
  return tree.node(index);
}

std::optional<unsigned int> numberAt(const Tree& tree, const std::string& path, Properties id) {
  const unsigned int* value = tree.number(nodeAt(tree, path), id);
  return value == nullptr ? std::nullopt : std::optional(*value);
}

std::string textAt(const Tree& tree, const std::string& path, Properties id) {
  const std::string* value = tree.text(nodeAt(tree, path), id);
  return value == nullptr ? "(none)" : *value;
}

/// A machine of one package with one core, about which the caller says something.
HwlocXml oneCore(const std::vector<std::pair<const char*, const char*>>& ofMachine,
                 const std::vector<std::pair<const char*, const char*>>& ofPackage) {
  HwlocXml xml("0x1");
  for (const auto& [name, value] : ofMachine) {
    xml.info(name, value);
  }
  xml.begin("Package", "0", "0x1");
  for (const auto& [name, value] : ofPackage) {
    xml.info(name, value);
  }
  xml.plainCore(0).end();
  return xml;
}

TEST(HwlocXml, AnX86ProcessorIsIdentifiedAsOnTheMachine) {
  const Tree tree = treeOf(oneCore({{"Architecture", "x86_64"}}, {{"CPUVendor", "AuthenticAMD"},
                                                                  {"CPUFamilyNumber", "25"},
                                                                  {"CPUModelNumber", "1"},
                                                                  {"CPUModel", "AMD EPYC 7763 64-Core Processor"},
                                                                  {"CPUStepping", "1"}}));

  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), "AMD EPYC 7763 64-Core Processor");
  EXPECT_EQ(textAt(tree, "P0", PropStepping), "1");
  EXPECT_EQ(textAt(tree, "P0", PropProcessorId), "11 0F A0 00");
  EXPECT_EQ(numberAt(tree, "P0", PropFamily), 107U);
  EXPECT_EQ(numberAt(tree, "P0", PropDataWidth), 64U);
  EXPECT_EQ(numberAt(tree, "P0", PropAddressWidth), 64U);
  EXPECT_EQ(numberAt(tree, "P0", PropCurrentClockSpeed), std::nullopt);
}

TEST(HwlocXml, AnArmProcessorIsIdentifiedAsOnTheMachine) {
  const Tree tree = treeOf(oneCore({{"Architecture", "aarch64"}}, {{"CPUImplementer", "0x41"},
                                                                   {"CPUArchitecture", "8"},
                                                                   {"CPUVariant", "0x1"},
                                                                   {"CPUPart", "0xd0c"},
                                                                   {"CPURevision", "2"}}));

  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), "Neoverse-N1");
  EXPECT_EQ(textAt(tree, "P0", PropStepping), "r1p2");
  EXPECT_EQ(numberAt(tree, "P0", PropDataWidth), 64U);
}

TEST(HwlocXml, AProcessorIsNamedWhereNothingElseIsSaidOfIt) {
  const Tree tree = treeOf(oneCore({}, {{"CPUModel", "Some CPU 7"}}));

  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), "Some CPU 7");
  EXPECT_EQ(numberAt(tree, "P0", PropFamily), 2U);
  EXPECT_EQ(numberAt(tree, "P0", PropDataWidth), std::nullopt);
}

TEST(HwlocXml, RemarksOnTheMachineCountWhereThePackageHasNone) {
  const Tree tree = treeOf(oneCore({{"CPUModel", "Old CPU"}}, {}));

  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), "Old CPU");
}

TEST(HwlocXml, LineEndsInTextsMakeNoFields) {
  const Tree tree = treeOf(oneCore({{"Architecture", "x86_64"}}, {{"CPUVendor", "GenuineIntel"},
                                                                  {"CPUFamilyNumber", "6"},
                                                                  {"CPUModelNumber", "85"},
                                                                  {"CPUModel", "A&#10;stepping : 9"}}));

  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), "A stepping : 9");
  EXPECT_EQ(textAt(tree, "P0", PropStepping), "(none)");
}

TEST(HwlocXml, ControlCharactersOfTextsAreBlanks) {
  const Tree tree = treeOf(oneCore({{"DMIProductName", "Power&#9;Box&#10;"}}, {{"CPUModel", "Some&#9;CPU"}}));

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "Power Box");
  EXPECT_EQ(nodeAt(tree, "system").description, "Power Box");
  EXPECT_EQ(textAt(tree, "P0", PropProcessorName), "Some CPU");
}

TEST(HwlocXml, TheMachineIsNamedByItsFirmware) {
  const Tree tree = treeOf(oneCore({{"DMIProductName", "PowerBox 300"}, {"DMISysVendor", "Box Works"}}, {}));

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "PowerBox 300");
  EXPECT_EQ(textAt(tree, "system", Tarn::Inventory::PropSystemManufacturer), "Box Works");
  EXPECT_EQ(nodeAt(tree, "system").description, "PowerBox 300");
}

TEST(HwlocXml, TheMachineHasTheNameOfItsHost) {
  const auto nameIn = [](const Tree& tree) { return textAt(tree, "system", Tarn::Inventory::PropSystemName); };

  EXPECT_EQ(nameIn(treeOf(oneCore({{"HostName", "node17.example"}}, {}))), "node17.example");
  EXPECT_EQ(nameIn(treeOf(oneCore({}, {}))), "(none)") << "not that of this host";
}

TEST(HwlocXml, WhatFirmwareVendorsLeaveInTheirFieldsIsNoName) {
  const Tree tree =
      treeOf(oneCore({{"DMIProductName", "To Be Filled By O.E.M."}, {"DMISysVendor", "Default string"}}, {}));

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "(none)");
  EXPECT_EQ(textAt(tree, "system", Tarn::Inventory::PropSystemManufacturer), "(none)");
  EXPECT_EQ(nodeAt(tree, "system").description, "Computer system");
}

TEST(HwlocXml, CachesHaveSizeLineAndWays) {
  HwlocXml xml("0x3");
  xml.begin("Package", "1", "0x3")
      .cache("L3Cache", "4", "0x3",
             R"(cache_size="18874368" depth="3" cache_linesize="64" cache_associativity="12" cache_type="0")")
      .cache("L2Cache", "2", "0x3",
             R"(cache_size="1310720" depth="2" cache_linesize="128" cache_associativity="-1" cache_type="0")")
      .cache("L1Cache", "8", "0x3",
             R"(cache_size="49152" depth="1" cache_linesize="64" cache_associativity="8" cache_type="1")")
      .cache("L1iCache", "8", "0x3",
             R"(cache_size="0" depth="1" cache_linesize="0" cache_associativity="0" cache_type="2")");
  xml.plainCore(0).plainCore(1).end().end().end().end().end();

  const Tree tree = treeOf(xml);

  EXPECT_EQ(numberAt(tree, "P1.L3.4", PropCacheNumberOfBlocks), 294912U);
  EXPECT_EQ(numberAt(tree, "P1.L3.4", PropCacheConsumableBlocks), 294912U);
  EXPECT_EQ(numberAt(tree, "P1.L3.4", PropCacheAssociativity), std::nullopt);
  EXPECT_EQ(numberAt(tree, "P1.L3.4", PropCacheLevel), 5U);
  EXPECT_EQ(numberAt(tree, "P1.L3.4", PropCacheType), 3U);
  EXPECT_EQ(numberAt(tree, "P1.L2.2", PropCacheAssociativity), 2U);
  EXPECT_EQ(numberAt(tree, "P1.L2.2", PropCacheBlockSize), 128U);
  EXPECT_EQ(numberAt(tree, "P1.L2.2", PropCacheNumberOfBlocks), 10240U);
  EXPECT_EQ(numberAt(tree, "P1.L1d.8", PropCacheAssociativity), 5U);
  EXPECT_EQ(numberAt(tree, "P1.L1d.8", PropCacheType), 2U);
  EXPECT_EQ(nodeAt(tree, "P1.L1d.8").description, "L1 data cache 8");
  EXPECT_EQ(numberAt(tree, "P1.L1i.8", PropCacheType), 1U);
  EXPECT_EQ(numberAt(tree, "P1.L1i.8", PropCacheBlockSize), std::nullopt);
  EXPECT_EQ(numberAt(tree, "P1.L1i.8", PropCacheNumberOfBlocks), std::nullopt);
  EXPECT_EQ(nodeAt(tree, "P1.L1i.8").cpus.toList(), "0-1");
}

TEST(HwlocXml, ACacheWithoutALineSizeIsCountedInBytes) {
  HwlocXml xml("0x1");
  xml.begin("Package", "0", "0x1")
      .cache("L3Cache", "0", "0x1",
             R"(cache_size="10485760" depth="3" cache_linesize="0" cache_associativity="0" cache_type="0")");
  xml.plainCore(0).end().end().end();

  const Tree tree = treeOf(xml);

  EXPECT_EQ(numberAt(tree, "P0.L3.0", PropCacheBlockSize), 1U);
  EXPECT_EQ(numberAt(tree, "P0.L3.0", PropCacheNumberOfBlocks), 10485760U);
}

TEST(HwlocXml, CoresAreNumberedByDie) {
  HwlocXml xml("0x3");
  xml.begin("Package", "0", "0x3");
  xml.begin("Die", "0", "0x1").begin("Core", "5", "0x1").thread(0).end().end();
  xml.begin("Die", "1", "0x2").begin("Core", "5", "0x2").thread(1).end().end().end();

  const Tree tree = treeOf(xml);

  EXPECT_EQ(nodeAt(tree, "P0.C5").cpus.toList(), "0");
  EXPECT_EQ(nodeAt(tree, "P0.D1.C5").cpus.toList(), "1");
  EXPECT_EQ(nodeAt(tree, "P0.D1.C5").description, "Core 5 of die 1");
}

HwlocXml twoClusters(const char* family) {
  HwlocXml xml("0x3");
  xml.begin("Package", "0", "0x3").info("CPUFamilyNumber", family);
  xml.begin("Group", "0", "0x1", {}, R"( kind="1001" subkind="0" subtype="Cluster" dont_merge="1")");
  xml.begin("Core", "0", "0x1").thread(0).end().end();
  xml.begin("Group", "1", "0x2", {}, R"( kind="1001" subkind="0" subtype="Cluster" dont_merge="1")");
  xml.begin("Core", *family == '\0' ? "0" : "1", "0x2").thread(1).end().end().end();
  return xml;
}

TEST(HwlocXml, CoresAreNumberedByClusterButNotOnX86) {
  EXPECT_EQ(nodeAt(treeOf(twoClusters("")), "P0.K1.C0").cpus.toList(), "1");
  EXPECT_EQ(nodeAt(treeOf(twoClusters("6")), "P0.C1").cpus.toList(), "1");
}

TEST(HwlocXml, KindsOfCoreAreNamedAndTellTheirClocks) {
  HwlocXml xml("0x3");
  xml.begin("Package", "0", "0x3").plainCore(0).plainCore(1).end();
  xml.kind("0x1", "CoreType", "IntelCore").kind("0x1", "FrequencyMaxMHz", "4700");
  xml.kind("0x2", "CoreType", "IntelAtom").kind("0x2", "FrequencyMaxMHz", "3500");

  const Tree tree = treeOf(xml);

  EXPECT_EQ(nodeAt(tree, "P0.C0").description, "Performance core 0");
  EXPECT_EQ(nodeAt(tree, "P0.C1").description, "Efficient core 1");
  EXPECT_EQ(numberAt(tree, "P0", PropMaxClockSpeed), 4700U);
}

TEST(HwlocXml, CpusThatTheMakerWasNotAllowedToUseAreInUse) {
  HwlocXml xml("0x3", "0x3", "0x1");
  xml.begin("Package", "0", "0x3").plainCore(0).plainCore(1).end();

  const Tree tree = treeOf(xml);

  EXPECT_EQ(nodeAt(tree, "P0.C1").status, Status::inUse);
  EXPECT_EQ(numberAt(tree, "P0", PropEnabledCores), 2U);
}

TEST(HwlocXml, OfflineThreadsOfAPackageCount) {
  HwlocXml xml("0x1", "0x3");
  xml.begin("Package", "0", "0x1", "0x3").begin("Core", "0", "0x1").thread(0).end().end();

  const Tree tree = treeOf(xml);

  EXPECT_EQ(nodeAt(tree, "P0").cpus.toList(), "0-1");
  EXPECT_EQ(numberAt(tree, "P0", PropHardwareThreads), 2U);
  EXPECT_EQ(numberAt(tree, "P0", PropProcessorCores), 1U);
  EXPECT_TRUE(tree.unread().empty());
}

TEST(HwlocXml, CpusWithoutAPackageAreReported) {
  HwlocXml xml("0x1", "0xd");
  xml.begin("Package", "0", "0x1").plainCore(0).end();

  const Tree tree = treeOf(xml);

  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_EQ(tree.unread()[0].file, "machine.xml");
  EXPECT_EQ(tree.unread()[0].reason, "nothing tells which package CPUs 2-3 belong to");
  EXPECT_EQ(tree.unread()[0].remedy, "they may have been offline; describe the machine while they are online");
}

TEST(HwlocXml, ANumberThatTwoPackagesHaveNamesNeither) {
  HwlocXml xml("0x3");
  xml.begin("Package", "0", "0x1").plainCore(0).end();
  xml.begin("Package", "0", "0x2").plainCore(1).end();

  const Tree tree = treeOf(xml);

  EXPECT_EQ(nodeAt(tree, "P@0").cpus.toList(), "0");
  EXPECT_EQ(nodeAt(tree, "P@1").cpus.toList(), "1");
}

TEST(HwlocXml, WhatIsNoTopologyIsRefused) {
  const std::string expected =
      "cannot read the inventory: machine.xml: hwloc cannot make a topology of it; it takes XML as lstopo of version "
      "2 or 1 writes it; HWLOC_XML_VERBOSE=1 lstopo -i FILE says what is wrong with it";
  const std::string whole = oneCore({}, {}).text();

  EXPECT_EQ(complaintAboutXml(whole), "");
  EXPECT_EQ(complaintAboutXml(""), expected);
  EXPECT_EQ(complaintAboutXml("no XML"), expected);
  EXPECT_EQ(complaintAboutXml("<?xml version=\"1.0\"?>\n<inventory/>\n"), expected);
  EXPECT_EQ(complaintAboutXml(whole.substr(0, whole.size() / 2)), expected);
}

std::string listOf(const char* list) {
  const std::unique_ptr<hwloc_bitmap_s, decltype(&hwloc_bitmap_free)> set(hwloc_bitmap_alloc(), hwloc_bitmap_free);
  hwloc_bitmap_list_sscanf(set.get(), list);
  try {
    return cpuSetOf(set.get()).toList();
  } catch (const std::invalid_argument& error) {
    return error.what();
  }
}

TEST(HwlocXml, SetsAreThoseOfAnInventory) {
  EXPECT_EQ(listOf(""), "");
  EXPECT_EQ(listOf("0,2-3,65535"), "0,2-3,65535");
  EXPECT_EQ(listOf("0,65536"), "CPU 65536 has a number above 65535");
  EXPECT_EQ(listOf("3-"), "a set of CPUs has no end");
  EXPECT_EQ(cpuSetOf(nullptr), Tarn::Inventory::CpuSet());
}

TEST(HwlocXml, SetsThatNoInventoryCanHoldAreRefused) {
  HwlocXml endless("0xf...f");
  endless.begin("Package", "0", "0xf...f").plainCore(0).end();

  EXPECT_NE(complaintAboutXml(endless.text()), "");
}

TEST(HwlocXml, AFileThatIsNotThereIsNamed) {
  try {
    readHwloc("hwloc:/nowhere.xml");
    FAIL();
  } catch (const Tarn::Inventory::InventoryError& error) {
    EXPECT_STREQ(error.what(),
                 "cannot read the inventory: /nowhere.xml: no such file or directory; name an XML file as lstopo "
                 "writes it");
  }
}

}  // namespace
}  // namespace Corvcim::Testing
