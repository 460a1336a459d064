#include "platform/inventory/tree/PropertyTable.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using enum PropertyKind;

TEST(PropertyTable, HoldsEveryPropertyOfTheLexiconAndWhatOnlyTheInventoryKnows) {
  struct Row {
    unsigned int id;
    NodeType type;
    PropertyKind kind;
    const char* name;
  };
  const Row expected[] = {
      {5, NodeCacheMemory, Number, "CacheAssociativity"},
      {9, NodeCacheMemory, Number, "CacheType"},
      {15, NodeProcessor, Number, "DataWidth"},
      {19, NodeProcessor, Number, "ExternalClockSpeed"},
      {30, NodeCacheMemory, Number, "CacheLevel"},
      {38, NodeProcessor, Number, "MaxClockSpeed"},
      {39, NodeSystem, Text, "SystemModel"},
      {53, NodeCacheMemory, Text, "CacheName"},
      {66, NodeProcessor, Number, "AddressWidth"},
      {69, NodeCacheMemory, Number, "CacheBlockSize"},
      {72, NodeCacheMemory, Number, "CacheWritePolicy"},
      {73, NodeCacheMemory, Number, "CacheConsumableBlocks"},
      {80, NodeProcessor, Number, "CurrentClockSpeed"},
      {87, NodeProcessor, Number, "HardwareThreads"},
      {89, NodeProcessor, Text, "ProcessorId"},
      {112, NodeCacheMemory, Number, "CacheNumberOfBlocks"},
      {124, NodeProcessor, Text, "Stepping"},
      {125, NodeProcessor, List, "RequestedStatesSupported"},
      {189, NodeProcessor, Number, "EnabledCores"},
      {190, NodeProcessor, Number, "ProcessorCores"},
      {298, NodeProcessor, Number, "Family"},
      {304, NodeProcessor, Number, "UpgradeMethod"},
      {307, NodeProcessor, Text, "ProcessorName"},
      {400, NodeSystem, Text, "SystemManufacturer"},
      {401, NodeProcessor, Text, "Socket"},
      {402, NodeProcessor, Text, "SerialNumber"},
      {403, NodeProcessor, Text, "AssetTag"},
      {404, NodeProcessor, Text, "PartNumber"},
      {405, NodeSystem, Text, "SystemName"},
  };

  ASSERT_EQ(propertyTable().size(), std::size(expected));
  for (std::size_t i = 0; i < std::size(expected); ++i) {
    const PropertyEntry& entry = propertyTable()[i];
    EXPECT_EQ(static_cast<unsigned int>(entry.id), expected[i].id);
    EXPECT_EQ(entry.nodeType, expected[i].type) << entry.name;
    EXPECT_EQ(entry.kind, expected[i].kind) << entry.name;
    EXPECT_EQ(entry.name, expected[i].name);
    EXPECT_EQ(findProperty(entry.id), &entry);
    EXPECT_EQ(findProperty(entry.name), &entry);
  }
}

TEST(PropertyTable, KnowsNoOtherProperty) {
  EXPECT_EQ(findProperty(static_cast<Properties>(6)), nullptr);
  EXPECT_EQ(findProperty("cachelevel"), nullptr);
}

TEST(PropertyTable, NamesTheNodeTypes) {
  EXPECT_EQ(nodeTypeName(NodeSystem), "system");
  EXPECT_EQ(nodeTypeName(NodeProcessor), "processor");
  EXPECT_EQ(nodeTypeName(NodeProcessorCore), "core");
  EXPECT_EQ(nodeTypeName(NodeCacheMemory), "cache");
  EXPECT_EQ(nodeTypeName(static_cast<NodeType>(2)), "node");
  EXPECT_EQ(nodeTypeTable().size(), 4U);
}

}  // namespace
}  // namespace Tarn::Inventory
