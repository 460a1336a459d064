#include "schema/ClassTable.h"

#include <gtest/gtest.h>

#include <map>
#include <string>

#include "host/broker/Value.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

std::string names(const std::vector<const ClassDefinition*>& classes) {
  std::string result;
  for (const ClassDefinition* each : classes) {
    result += std::string(each->name) + " ";
  }
  return result;
}

std::string signature(std::string_view className) {
  std::string result;
  for (const PropertyDefinition& each : findClass(className)->properties) {
    result += (each.key ? "key " : "") + typeName(each.type) + " " + std::string(each.name) +
              (each.referenceClass.empty() ? "" : " -> " + std::string(each.referenceClass)) + "\n";
  }
  return result;
}

}  // namespace

TEST(ClassTable, HoldsEveryClassOnce) {
  std::map<std::string_view, int, NameLess> count;
  for (const ClassDefinition& each : classDefinitions()) {
    ++count[each.name];
  }

  EXPECT_EQ(classDefinitions().size(), 10U);
  EXPECT_EQ(count.size(), 10U);
}

TEST(ClassTable, FindsClassesWithoutRegardToCase) {
  ASSERT_NE(findClass("halda_CPUPROCESSOR"), nullptr);
  EXPECT_EQ(findClass("halda_CPUPROCESSOR")->name, "HALDA_CPUProcessor");
  EXPECT_EQ(findClass("HALDA_CPUProcessorX"), nullptr);
  EXPECT_EQ(findClass("CIM_Processor"), nullptr);
  EXPECT_EQ(findClass(""), nullptr);
}

TEST(ClassTable, FindsPropertiesWithoutRegardToCase) {
  const ClassDefinition& memory = *findClass("HALDA_CPUMemory");

  ASSERT_NE(findProperty(memory, "BLOCKSIZE"), nullptr);
  EXPECT_EQ(findProperty(memory, "BLOCKSIZE")->type, CMPI_uint64);
  EXPECT_EQ(findProperty(memory, "Level"), nullptr);
}

TEST(ClassTable, ProcessorHasThesePropertiesOfTheseTypes) {
  EXPECT_EQ(signature("HALDA_CPUProcessor"),
            "key string CreationClassName\nkey string DeviceID\nkey string SystemCreationClassName\n"
            "key string SystemName\nstring Caption\nstring Description\nstring ElementName\nstring Name\n"
            "uint16 Family\nstring OtherFamilyDescription\nuint16 EnabledState\nuint16 RequestedState\n"
            "uint32 CurrentClockSpeed\nuint32 MaxClockSpeed\nuint32 ExternalBusClockSpeed\nuint16 CPUStatus\n"
            "string Status\nuint16 HealthState\nuint16[] OperationalStatus\nuint16 DataWidth\nuint16 AddressWidth\n"
            "string Stepping\nstring UniqueId\nuint16 UpgradeMethod\nuint16 NumberOfEnabledCores\n");
}

TEST(ClassTable, CoreHasThesePropertiesOfTheseTypes) {
  EXPECT_EQ(signature("HALDA_CPUProcessorCore"),
            "key string InstanceID\nstring Caption\nstring Description\nstring ElementName\nuint16 CoreEnabledState\n"
            "uint16 EnabledState\nuint16 RequestedState\nuint16 HealthState\nuint16[] OperationalStatus\n");
}

TEST(ClassTable, CacheHasThesePropertiesOfTheseTypes) {
  EXPECT_EQ(signature("HALDA_CPUMemory"),
            "key string CreationClassName\nkey string DeviceID\nkey string SystemCreationClassName\n"
            "key string SystemName\nstring Caption\nstring Description\nstring ElementName\nstring Name\n"
            "uint64 BlockSize\nuint64 NumberOfBlocks\nuint64 ConsumableBlocks\nuint16 EnabledState\n"
            "uint16 HealthState\nuint16 RequestedState\nuint16[] OperationalStatus\n");
}

TEST(ClassTable, CapabilitiesHaveThesePropertiesOfTheseTypes) {
  EXPECT_EQ(signature("HALDA_CPUProcessorCapabilities"),
            "key string InstanceID\nstring Caption\nstring Description\nuint16 NumberOfProcessorCores\n"
            "uint16 NumberOfHardwareThreads\nuint16[] RequestedStatesSupported\nboolean ElementNameEditSupported\n");
}

TEST(ClassTable, AssociationsLinkTheseClasses) {
  const std::string cacheProperties =
      "uint16 Level\nuint16 WritePolicy\nuint16 ReadPolicy\nuint16 CacheType\nuint16 Associativity\n";

  EXPECT_EQ(signature("HALDA_CPUAssociatedCacheMemory"),
            "key ref Antecedent -> HALDA_CPUMemory\nkey ref Dependent -> HALDA_CPUProcessor\n" + cacheProperties);
  EXPECT_EQ(signature("HALDA_CPUCoreAssociatedCacheMemory"),
            "key ref Antecedent -> HALDA_CPUMemory\nkey ref Dependent -> HALDA_CPUProcessorCore\n" + cacheProperties);
  EXPECT_EQ(signature("HALDA_CPUSystemDevice"),
            "key ref GroupComponent -> HALDA_ComputerSystem\nkey ref PartComponent -> HALDA_CPUProcessor\n");
  EXPECT_EQ(signature("HALDA_CPUElementCapabilities"),
            "key ref ManagedElement -> HALDA_CPUProcessor\nkey ref Capabilities -> HALDA_CPUProcessorCapabilities\n");
  EXPECT_EQ(signature("HALDA_CPUConcreteComponent"),
            "key ref GroupComponent -> HALDA_CPUProcessor\nkey ref PartComponent -> HALDA_CPUProcessorCore\n");
}

TEST(ClassTable, ReferenceEndsAreTheTwoReferencesOfAnAssociation) {
  for (const ClassDefinition& each : classDefinitions()) {
    const auto ends = referenceEnds(each);
    EXPECT_EQ(ends.size(), each.association ? 2U : 0U) << each.name;
    for (const PropertyDefinition& end : ends) {
      EXPECT_EQ(end.type, CMPI_ref) << each.name;
      EXPECT_NE(findClass(end.referenceClass), nullptr) << each.name << "." << end.name;
    }
  }
}

TEST(ClassTable, InheritanceGoesThroughTheDmtfClasses) {
  EXPECT_TRUE(isA("HALDA_CPUProcessor", "HALDA_CPUProcessor"));
  EXPECT_TRUE(isA("halda_cpuprocessor", "cim_logicaldevice"));
  EXPECT_TRUE(isA("HALDA_CPUMemory", "CIM_StorageExtent"));
  EXPECT_TRUE(isA("HALDA_CPUProcessorCapabilities", "CIM_ManagedElement"));
  EXPECT_TRUE(isA("HALDA_CPUSystemDevice", "CIM_Component"));
  EXPECT_TRUE(isA("Unknown_Class", "unknown_class"));
  EXPECT_FALSE(isA("HALDA_CPUProcessor", "CIM_ProcessorCore"));
  EXPECT_FALSE(isA("CIM_Processor", "HALDA_CPUProcessor"));
  EXPECT_FALSE(isA("", ""));
}

TEST(ClassTable, EveryInstanceClassIsAManagedElement) {
  for (const ClassDefinition& each : classDefinitions()) {
    EXPECT_EQ(isA(each.name, "CIM_ManagedElement"), !each.association) << each.name;
  }
}

TEST(ClassTable, ClassesServingAnAncestorAreAllOfItsDescendants) {
  EXPECT_EQ(names(classesServing("CIM_LogicalDevice")), "HALDA_CPUProcessor HALDA_CPUMemory ");
  EXPECT_EQ(names(classesServing("CIM_AssociatedMemory")),
            "HALDA_CPUAssociatedCacheMemory HALDA_CPUCoreAssociatedCacheMemory ");
  EXPECT_EQ(names(classesServing("HALDA_CPUMemory")), "HALDA_CPUMemory ");
  EXPECT_EQ(names(classesServing("CIM_Fan")), "");
}

TEST(ClassTable, AssociationsOfAClassAreThoseWithAnEndOfIt) {
  EXPECT_EQ(names(associationsOf("HALDA_CPUProcessor")),
            "HALDA_CPUSystemDevice HALDA_CPUConcreteComponent HALDA_CPUAssociatedCacheMemory "
            "HALDA_CPUElementCapabilities ");
  EXPECT_EQ(names(associationsOf("HALDA_CPUProcessorCore")),
            "HALDA_CPUConcreteComponent HALDA_CPUCoreAssociatedCacheMemory ");
  EXPECT_EQ(names(associationsOf("HALDA_CPUMemory")),
            "HALDA_CPUAssociatedCacheMemory HALDA_CPUCoreAssociatedCacheMemory ");
  EXPECT_EQ(names(associationsOf("HALDA_CPUProcessorCapabilities")), "HALDA_CPUElementCapabilities ");
  EXPECT_EQ(names(associationsOf("HALDA_ComputerSystem")), "HALDA_CPUSystemDevice ");
  EXPECT_EQ(names(associationsOf("CIM_Fan")), "");
}

TEST(ClassTable, CacheAssociationHasAProcessGroupOfItsOwn) {
  std::map<std::string_view, std::string> groups;
  for (const ClassDefinition& each : classDefinitions()) {
    groups[each.group] += std::string(each.name) + " ";
  }

  EXPECT_EQ(groups[findClass("HALDA_CPUAssociatedCacheMemory")->group], "HALDA_CPUAssociatedCacheMemory ");
  EXPECT_EQ(groups[findClass("HALDA_ComputerSystem")->group], "HALDA_ComputerSystem ");
  EXPECT_EQ(groups.size(), 3U);
}

TEST(ClassTable, ProvidersAreNamedAfterTheirClassesButForOne) {
  for (const ClassDefinition& each : classDefinitions()) {
    if (each.name != "HALDA_CPUProcessorCapabilities" && each.name != "HALDA_ComputerSystem") {
      EXPECT_EQ(each.provider, std::string(each.name.substr(std::string_view("HALDA_").size())) + "Provider");
    }
  }
  EXPECT_EQ(findClass("HALDA_CPUProcessorCapabilities")->provider, "CPUProcessorCapProvider");
}

TEST(ClassTable, SpellsPropertyListsAsProvidersCompareThem) {
  using Names = std::vector<std::string>;

  EXPECT_EQ(asProvidersSpell({"caption", "HEALTHSTATE", "Caption"}), (Names{"Caption", "HealthState"}));
  EXPECT_EQ(asProvidersSpell({"uniqueid"}), (Names{"UniqueId", "UniqueID"}));
  EXPECT_EQ(asProvidersSpell({"UniqueID", "colour"}), (Names{"UniqueId", "UniqueID", "colour"}));
  EXPECT_EQ(asProvidersSpell({}), Names());
}

}  // namespace Corvcim
