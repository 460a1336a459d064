#include "schema/DmtfClasses.h"

#include <algorithm>
#include <iterator>

#include "schema/Names.h"

namespace Corvcim {
namespace {

constexpr bool key = true;

constexpr PropertyDefinition managedElement[] = {
    {"InstanceID", CMPI_string, false, {}},
    {"Caption", CMPI_string, false, {}},
    {"Description", CMPI_string, false, {}},
    {"ElementName", CMPI_string, false, {}},
};

constexpr PropertyDefinition managedSystemElement[] = {
    {"InstallDate", CMPI_dateTime, false, {}},
    {"Name", CMPI_string, false, {}},
    {"OperationalStatus", CMPI_uint16A, false, {}},
    {"StatusDescriptions", CMPI_stringA, false, {}},
    {"Status", CMPI_string, false, {}},
    {"HealthState", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition enabledLogicalElement[] = {
    {"EnabledState", CMPI_uint16, false, {}},
    {"OtherEnabledState", CMPI_string, false, {}},
    {"RequestedState", CMPI_uint16, false, {}},
    {"EnabledDefault", CMPI_uint16, false, {}},
    {"TimeOfLastStateChange", CMPI_dateTime, false, {}},
};

constexpr PropertyDefinition logicalDevice[] = {
    {"SystemCreationClassName", CMPI_string, key, {}}, {"SystemName", CMPI_string, key, {}},
    {"CreationClassName", CMPI_string, key, {}},       {"DeviceID", CMPI_string, key, {}},
    {"Availability", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition processor[] = {
    {"Role", CMPI_string, false, {}},
    {"Family", CMPI_uint16, false, {}},
    {"OtherFamilyDescription", CMPI_string, false, {}},
    {"UpgradeMethod", CMPI_uint16, false, {}},
    {"MaxClockSpeed", CMPI_uint32, false, {}},
    {"CurrentClockSpeed", CMPI_uint32, false, {}},
    {"DataWidth", CMPI_uint16, false, {}},
    {"AddressWidth", CMPI_uint16, false, {}},
    {"LoadPercentage", CMPI_uint16, false, {}},
    {"Stepping", CMPI_string, false, {}},
    {"UniqueID", CMPI_string, false, {}},
    {"CPUStatus", CMPI_uint16, false, {}},
    {"ExternalBusClockSpeed", CMPI_uint32, false, {}},
    {"Characteristics", CMPI_uint16A, false, {}},
    {"NumberOfEnabledCores", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition processorCore[] = {
    {"InstanceID", CMPI_string, key, {}},
    {"CoreEnabledState", CMPI_uint16, false, {}},
    {"LoadPercentage", CMPI_uint16, false, {}},
    {"Characteristics", CMPI_uint16A, false, {}},
};

constexpr PropertyDefinition storageExtent[] = {
    {"DataOrganization", CMPI_uint16, false, {}},
    {"Purpose", CMPI_string, false, {}},
    {"Access", CMPI_uint16, false, {}},
    {"BlockSize", CMPI_uint64, false, {}},
    {"NumberOfBlocks", CMPI_uint64, false, {}},
    {"ConsumableBlocks", CMPI_uint64, false, {}},
    {"SequentialAccess", CMPI_boolean, false, {}},
    {"ExtentStatus", CMPI_uint16A, false, {}},
};

constexpr PropertyDefinition memory[] = {
    {"Volatile", CMPI_boolean, false, {}},
    {"StartingAddress", CMPI_uint64, false, {}},
    {"EndingAddress", CMPI_uint64, false, {}},
};

constexpr PropertyDefinition capabilities[] = {
    {"InstanceID", CMPI_string, key, {}},
    {"ElementName", CMPI_string, false, {}},
};

constexpr PropertyDefinition enabledLogicalElementCapabilities[] = {
    {"ElementNameEditSupported", CMPI_boolean, false, {}},
    {"MaxElementNameLen", CMPI_uint16, false, {}},
    {"RequestedStatesSupported", CMPI_uint16A, false, {}},
};

constexpr PropertyDefinition processorCapabilities[] = {
    {"NumberOfProcessorCores", CMPI_uint16, false, {}},
    {"NumberOfHardwareThreads", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition system[] = {
    {"CreationClassName", CMPI_string, key, {}},
    {"Name", CMPI_string, key, {}},
    {"NameFormat", CMPI_string, false, {}},
    {"Roles", CMPI_stringA, false, {}},
};

constexpr PropertyDefinition computerSystem[] = {
    {"OtherIdentifyingInfo", CMPI_stringA, false, {}},
    {"IdentifyingDescriptions", CMPI_stringA, false, {}},
    {"Dedicated", CMPI_uint16A, false, {}},
    {"ResetCapability", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition dependency[] = {
    {"Antecedent", CMPI_ref, key, "CIM_ManagedElement"},
    {"Dependent", CMPI_ref, key, "CIM_ManagedElement"},
};

// What may depend on a memory differs between versions of the schema, so it is not narrowed here.
constexpr PropertyDefinition associatedMemory[] = {
    {"Antecedent", CMPI_ref, key, "CIM_Memory"},
};

constexpr PropertyDefinition associatedCacheMemory[] = {
    {"Level", CMPI_uint16, false, {}},         {"OtherLevelDescription", CMPI_string, false, {}},
    {"WritePolicy", CMPI_uint16, false, {}},   {"CacheType", CMPI_uint16, false, {}},
    {"LineSize", CMPI_uint32, false, {}},      {"ReplacementPolicy", CMPI_uint16, false, {}},
    {"ReadPolicy", CMPI_uint16, false, {}},    {"FlushTimer", CMPI_uint32, false, {}},
    {"Associativity", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition component[] = {
    {"GroupComponent", CMPI_ref, key, "CIM_ManagedElement"},
    {"PartComponent", CMPI_ref, key, "CIM_ManagedElement"},
};

constexpr PropertyDefinition systemComponent[] = {
    {"GroupComponent", CMPI_ref, key, "CIM_System"},
    {"PartComponent", CMPI_ref, key, "CIM_ManagedSystemElement"},
};

constexpr PropertyDefinition systemDevice[] = {
    {"GroupComponent", CMPI_ref, key, "CIM_System"},
    {"PartComponent", CMPI_ref, key, "CIM_LogicalDevice"},
};

constexpr PropertyDefinition elementCapabilities[] = {
    {"ManagedElement", CMPI_ref, key, "CIM_ManagedElement"},
    {"Capabilities", CMPI_ref, key, "CIM_Capabilities"},
    {"Characteristics", CMPI_uint16A, false, {}},
};

constexpr DmtfClass classes[] = {
    {"CIM_AssociatedCacheMemory", "CIM_AssociatedMemory", associatedCacheMemory},
    {"CIM_AssociatedMemory", "CIM_Dependency", associatedMemory},
    {"CIM_Capabilities", "CIM_ManagedElement", capabilities},
    {"CIM_Component", "", component},
    {"CIM_ComputerSystem", "CIM_System", computerSystem},
    {"CIM_ConcreteComponent", "CIM_Component", {}},
    {"CIM_Dependency", "", dependency},
    {"CIM_ElementCapabilities", "", elementCapabilities},
    {"CIM_EnabledLogicalElement", "CIM_LogicalElement", enabledLogicalElement},
    {"CIM_EnabledLogicalElementCapabilities", "CIM_Capabilities", enabledLogicalElementCapabilities},
    {"CIM_LogicalDevice", "CIM_EnabledLogicalElement", logicalDevice},
    {"CIM_LogicalElement", "CIM_ManagedSystemElement", {}},
    {"CIM_ManagedElement", "", managedElement},
    {"CIM_ManagedSystemElement", "CIM_ManagedElement", managedSystemElement},
    {"CIM_Memory", "CIM_StorageExtent", memory},
    {"CIM_Processor", "CIM_LogicalDevice", processor},
    {"CIM_ProcessorCapabilities", "CIM_EnabledLogicalElementCapabilities", processorCapabilities},
    {"CIM_ProcessorCore", "CIM_EnabledLogicalElement", processorCore},
    {"CIM_StorageExtent", "CIM_LogicalDevice", storageExtent},
    {"CIM_System", "CIM_EnabledLogicalElement", system},
    {"CIM_SystemComponent", "CIM_Component", systemComponent},
    {"CIM_SystemDevice", "CIM_SystemComponent", systemDevice},
};

}  // namespace

std::span<const DmtfClass> dmtfClasses() {
  return classes;
}

const DmtfClass* findDmtfClass(std::string_view name) {
  const auto* found = std::ranges::find_if(classes, [&](const DmtfClass& each) { return sameName(each.name, name); });
  return found == std::end(classes) ? nullptr : found;
}

const PropertyDefinition* inheritedProperty(const ClassDefinition& definition, std::string_view property) {
  for (const DmtfClass* each = findDmtfClass(definition.parent); each != nullptr; each = findDmtfClass(each->parent)) {
    const auto found = std::ranges::find_if(
        each->properties, [&](const PropertyDefinition& candidate) { return sameName(candidate.name, property); });
    if (found != each->properties.end()) {
      return &*found;
    }
  }
  return nullptr;
}

}  // namespace Corvcim
