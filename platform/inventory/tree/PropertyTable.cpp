#include "platform/inventory/tree/PropertyTable.h"

#include <algorithm>
#include <array>

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;
using enum PropertyKind;

constexpr std::array properties = {
    PropertyEntry{PropCacheAssociativity, NodeCacheMemory, Number, "CacheAssociativity"},
    PropertyEntry{PropCacheType, NodeCacheMemory, Number, "CacheType"},
    PropertyEntry{PropDataWidth, NodeProcessor, Number, "DataWidth"},
    PropertyEntry{PropExternalClockSpeed, NodeProcessor, Number, "ExternalClockSpeed"},
    PropertyEntry{PropCacheLevel, NodeCacheMemory, Number, "CacheLevel"},
    PropertyEntry{PropMaxClockSpeed, NodeProcessor, Number, "MaxClockSpeed"},
    PropertyEntry{PropSystemModel, NodeSystem, Text, "SystemModel"},
    PropertyEntry{PropCacheName, NodeCacheMemory, Text, "CacheName"},
    PropertyEntry{PropAddressWidth, NodeProcessor, Number, "AddressWidth"},
    PropertyEntry{PropCacheBlockSize, NodeCacheMemory, Number, "CacheBlockSize"},
    PropertyEntry{PropCacheWritePolicy, NodeCacheMemory, Number, "CacheWritePolicy"},
    PropertyEntry{PropCacheConsumableBlocks, NodeCacheMemory, Number, "CacheConsumableBlocks"},
    PropertyEntry{PropCurrentClockSpeed, NodeProcessor, Number, "CurrentClockSpeed"},
    PropertyEntry{PropHardwareThreads, NodeProcessor, Number, "HardwareThreads"},
    PropertyEntry{PropProcessorId, NodeProcessor, Text, "ProcessorId"},
    PropertyEntry{PropCacheNumberOfBlocks, NodeCacheMemory, Number, "CacheNumberOfBlocks"},
    PropertyEntry{PropStepping, NodeProcessor, Text, "Stepping"},
    PropertyEntry{PropRequestedStatesSupported, NodeProcessor, List, "RequestedStatesSupported"},
    PropertyEntry{PropEnabledCores, NodeProcessor, Number, "EnabledCores"},
    PropertyEntry{PropProcessorCores, NodeProcessor, Number, "ProcessorCores"},
    PropertyEntry{PropFamily, NodeProcessor, Number, "Family"},
    PropertyEntry{PropUpgradeMethod, NodeProcessor, Number, "UpgradeMethod"},
    PropertyEntry{PropProcessorName, NodeProcessor, Text, "ProcessorName"},
    PropertyEntry{PropSystemManufacturer, NodeSystem, Text, "SystemManufacturer"},
    PropertyEntry{PropSocket, NodeProcessor, Text, "Socket"},
    PropertyEntry{PropSerialNumber, NodeProcessor, Text, "SerialNumber"},
    PropertyEntry{PropAssetTag, NodeProcessor, Text, "AssetTag"},
    PropertyEntry{PropPartNumber, NodeProcessor, Text, "PartNumber"},
    PropertyEntry{PropSystemName, NodeSystem, Text, "SystemName"},
};
static_assert(std::ranges::is_sorted(properties, {}, &PropertyEntry::id));

constexpr std::array types = {
    NodeTypeEntry{NodeSystem, "system"},
    NodeTypeEntry{NodeProcessor, "processor"},
    NodeTypeEntry{NodeProcessorCore, "core"},
    NodeTypeEntry{NodeCacheMemory, "cache"},
};

template <class Key>
const PropertyEntry* findBy(Key PropertyEntry::*member, const Key& wanted) {
  const auto* const found = std::ranges::find(properties, wanted, member);
  return found == properties.end() ? nullptr : &*found;
}

}  // namespace

std::span<const PropertyEntry> propertyTable() {
  return properties;
}

const PropertyEntry* findProperty(Properties id) {
  return findBy(&PropertyEntry::id, id);
}

const PropertyEntry* findProperty(std::string_view name) {
  return findBy(&PropertyEntry::name, name);
}

std::string_view kindName(PropertyKind kind) {
  switch (kind) {
    case Number:
      return "number";
    case Text:
      return "text";
    case List:
      return "list of numbers";
  }
  return "value";
}

std::span<const NodeTypeEntry> nodeTypeTable() {
  return types;
}

std::string_view nodeTypeName(NodeType type) {
  const auto* const found = std::ranges::find(types, type, &NodeTypeEntry::type);
  return found == types.end() ? "node" : found->name;
}

}  // namespace Tarn::Inventory
