#include "schema/ClassTable.h"

#include "schema/DmtfClasses.h"
#include "schema/Names.h"

#include <algorithm>
#include <iterator>

namespace Corvcim {
namespace {

constexpr std::string_view cpuLibrary = "corvcpuprofileprovider";
constexpr std::string_view systemLibrary = "corvcomputersystemprovider";

constexpr std::string_view cpuGroup = "cpu";
constexpr std::string_view systemGroup = "system";
// The processor-cache association answers only as long as nobody collected cores in its process.
constexpr std::string_view cacheAssociationGroup = "cpu-cache";

constexpr bool key = true;

constexpr PropertyDefinition computerSystemProperties[] = {
    {"CreationClassName", CMPI_string, key, {}},
    {"Name", CMPI_string, key, {}},
    {"Caption", CMPI_string, false, {}},
    {"Description", CMPI_string, false, {}},
    {"ElementName", CMPI_string, false, {}},
    {"Model", CMPI_string, false, {}},
    {"Manufacturer", CMPI_string, false, {}},
    {"EnabledState", CMPI_uint16, false, {}},
    {"RequestedState", CMPI_uint16, false, {}},
    {"HealthState", CMPI_uint16, false, {}},
    {"OperationalStatus", CMPI_uint16A, false, {}},
};

constexpr PropertyDefinition processorProperties[] = {
    {"CreationClassName", CMPI_string, key, {}},
    {"DeviceID", CMPI_string, key, {}},
    {"SystemCreationClassName", CMPI_string, key, {}},
    {"SystemName", CMPI_string, key, {}},
    {"Caption", CMPI_string, false, {}},
    {"Description", CMPI_string, false, {}},
    {"ElementName", CMPI_string, false, {}},
    {"Name", CMPI_string, false, {}},
    {"Family", CMPI_uint16, false, {}},
    {"OtherFamilyDescription", CMPI_string, false, {}},
    {"EnabledState", CMPI_uint16, false, {}},
    {"RequestedState", CMPI_uint16, false, {}},
    {"CurrentClockSpeed", CMPI_uint32, false, {}},
    {"MaxClockSpeed", CMPI_uint32, false, {}},
    {"ExternalBusClockSpeed", CMPI_uint32, false, {}},
    {"CPUStatus", CMPI_uint16, false, {}},
    {"Status", CMPI_string, false, {}},
    {"HealthState", CMPI_uint16, false, {}},
    {"OperationalStatus", CMPI_uint16A, false, {}},
    {"DataWidth", CMPI_uint16, false, {}},
    {"AddressWidth", CMPI_uint16, false, {}},
    {"Stepping", CMPI_string, false, {}},
    {"UniqueId", CMPI_string, false, {}, "UniqueID"},
    {"UpgradeMethod", CMPI_uint16, false, {}},
    {"NumberOfEnabledCores", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition coreProperties[] = {
    {"InstanceID", CMPI_string, key, {}},           {"Caption", CMPI_string, false, {}},
    {"Description", CMPI_string, false, {}},        {"ElementName", CMPI_string, false, {}},
    {"CoreEnabledState", CMPI_uint16, false, {}},   {"EnabledState", CMPI_uint16, false, {}},
    {"RequestedState", CMPI_uint16, false, {}},     {"HealthState", CMPI_uint16, false, {}},
    {"OperationalStatus", CMPI_uint16A, false, {}},
};

constexpr PropertyDefinition memoryProperties[] = {
    {"CreationClassName", CMPI_string, key, {}},
    {"DeviceID", CMPI_string, key, {}},
    {"SystemCreationClassName", CMPI_string, key, {}},
    {"SystemName", CMPI_string, key, {}},
    {"Caption", CMPI_string, false, {}},
    {"Description", CMPI_string, false, {}},
    {"ElementName", CMPI_string, false, {}},
    {"Name", CMPI_string, false, {}},
    {"BlockSize", CMPI_uint64, false, {}},
    {"NumberOfBlocks", CMPI_uint64, false, {}},
    {"ConsumableBlocks", CMPI_uint64, false, {}},
    {"EnabledState", CMPI_uint16, false, {}},
    {"HealthState", CMPI_uint16, false, {}},
    {"RequestedState", CMPI_uint16, false, {}},
    {"OperationalStatus", CMPI_uint16A, false, {}},
};

constexpr PropertyDefinition capabilitiesProperties[] = {
    {"InstanceID", CMPI_string, key, {}},
    {"Caption", CMPI_string, false, {}},
    {"Description", CMPI_string, false, {}},
    {"NumberOfProcessorCores", CMPI_uint16, false, {}},
    {"NumberOfHardwareThreads", CMPI_uint16, false, {}},
    {"RequestedStatesSupported", CMPI_uint16A, false, {}},
    {"ElementNameEditSupported", CMPI_boolean, false, {}},
};

constexpr PropertyDefinition processorCacheProperties[] = {
    {"Antecedent", CMPI_ref, key, "HALDA_CPUMemory"},
    {"Dependent", CMPI_ref, key, "HALDA_CPUProcessor"},
    {"Level", CMPI_uint16, false, {}},
    {"WritePolicy", CMPI_uint16, false, {}},
    {"ReadPolicy", CMPI_uint16, false, {}},
    {"CacheType", CMPI_uint16, false, {}},
    {"Associativity", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition coreCacheProperties[] = {
    {"Antecedent", CMPI_ref, key, "HALDA_CPUMemory"},
    {"Dependent", CMPI_ref, key, "HALDA_CPUProcessorCore"},
    {"Level", CMPI_uint16, false, {}},
    {"WritePolicy", CMPI_uint16, false, {}},
    {"ReadPolicy", CMPI_uint16, false, {}},
    {"CacheType", CMPI_uint16, false, {}},
    {"Associativity", CMPI_uint16, false, {}},
};

constexpr PropertyDefinition systemDeviceProperties[] = {
    {"GroupComponent", CMPI_ref, key, "HALDA_ComputerSystem"},
    {"PartComponent", CMPI_ref, key, "HALDA_CPUProcessor"},
};

constexpr PropertyDefinition elementCapabilitiesProperties[] = {
    {"ManagedElement", CMPI_ref, key, "HALDA_CPUProcessor"},
    {"Capabilities", CMPI_ref, key, "HALDA_CPUProcessorCapabilities"},
};

constexpr PropertyDefinition concreteComponentProperties[] = {
    {"GroupComponent", CMPI_ref, key, "HALDA_CPUProcessor"},
    {"PartComponent", CMPI_ref, key, "HALDA_CPUProcessorCore"},
};

constexpr ClassDefinition classes[] = {
    {"HALDA_ComputerSystem", "CIM_ComputerSystem", false, computerSystemProperties, "CorvaneComputerSystemProvider",
     systemLibrary, systemGroup},
    {"HALDA_CPUProcessor", "CIM_Processor", false, processorProperties, "CPUProcessorProvider", cpuLibrary, cpuGroup},
    {"HALDA_CPUProcessorCore", "CIM_ProcessorCore", false, coreProperties, "CPUProcessorCoreProvider", cpuLibrary,
     cpuGroup},
    {"HALDA_CPUMemory", "CIM_Memory", false, memoryProperties, "CPUMemoryProvider", cpuLibrary, cpuGroup},
    {"HALDA_CPUProcessorCapabilities", "CIM_ProcessorCapabilities", false, capabilitiesProperties,
     "CPUProcessorCapProvider", cpuLibrary, cpuGroup},
    {"HALDA_CPUSystemDevice", "CIM_SystemDevice", true, systemDeviceProperties, "CPUSystemDeviceProvider", cpuLibrary,
     cpuGroup},
    {"HALDA_CPUConcreteComponent", "CIM_ConcreteComponent", true, concreteComponentProperties,
     "CPUConcreteComponentProvider", cpuLibrary, cpuGroup},
    {"HALDA_CPUAssociatedCacheMemory", "CIM_AssociatedCacheMemory", true, processorCacheProperties,
     "CPUAssociatedCacheMemoryProvider", cpuLibrary, cacheAssociationGroup},
    {"HALDA_CPUCoreAssociatedCacheMemory", "CIM_AssociatedCacheMemory", true, coreCacheProperties,
     "CPUCoreAssociatedCacheMemoryProvider", cpuLibrary, cpuGroup},
    {"HALDA_CPUElementCapabilities", "CIM_ElementCapabilities", true, elementCapabilitiesProperties,
     "CPUElementCapabilitiesProvider", cpuLibrary, cpuGroup},
};

constexpr std::size_t endsOfAnAssociation = 2;

void addOnce(std::vector<std::string>& names, std::string_view name) {
  if (!name.empty() && std::ranges::find(names, name) == names.end()) {
    names.emplace_back(name);
  }
}

}  // namespace

std::span<const ClassDefinition> classDefinitions() {
  return classes;
}

const ClassDefinition* findClass(std::string_view name) {
  const auto* found =
      std::ranges::find_if(classes, [&](const ClassDefinition& each) { return sameName(each.name, name); });
  return found == std::end(classes) ? nullptr : found;
}

const PropertyDefinition* findProperty(const ClassDefinition& definition, std::string_view name) {
  const auto found = std::ranges::find_if(definition.properties,
                                          [&](const PropertyDefinition& each) { return sameName(each.name, name); });
  return found == definition.properties.end() ? nullptr : &*found;
}

std::vector<std::string> asProvidersSpell(const std::vector<std::string>& propertyNames) {
  std::vector<std::string> result;
  for (const std::string& name : propertyNames) {
    bool isKnown = false;
    for (const ClassDefinition& each : classes) {
      if (const PropertyDefinition* property = findProperty(each, name)) {
        addOnce(result, property->name);
        addOnce(result, property->selection);
        isKnown = true;
      }
    }
    if (!isKnown) {
      addOnce(result, name);
    }
  }
  return result;
}

std::string_view parentOf(std::string_view name) {
  if (const ClassDefinition* definition = findClass(name)) {
    return definition->parent;
  }
  const DmtfClass* above = findDmtfClass(name);
  return above == nullptr ? std::string_view{} : above->parent;
}

bool isA(std::string_view name, std::string_view ancestor) {
  for (std::string_view each = name; !each.empty(); each = parentOf(each)) {
    if (sameName(each, ancestor)) {
      return true;
    }
  }
  return false;
}

std::vector<const ClassDefinition*> classesServing(std::string_view name) {
  std::vector<const ClassDefinition*> result;
  for (const ClassDefinition& each : classes) {
    if (isA(each.name, name)) {
      result.push_back(&each);
    }
  }
  return result;
}

std::vector<const ClassDefinition*> associationsOf(std::string_view source) {
  std::vector<const ClassDefinition*> result;
  for (const ClassDefinition& each : classes) {
    const auto ends = referenceEnds(each);
    if (std::ranges::any_of(ends, [&](const PropertyDefinition& end) {
          return isA(source, end.referenceClass) || isA(end.referenceClass, source);
        })) {
      result.push_back(&each);
    }
  }
  return result;
}

std::span<const PropertyDefinition> referenceEnds(const ClassDefinition& association) {
  return association.association ? association.properties.first(endsOfAnAssociation)
                                 : std::span<const PropertyDefinition>{};
}

}  // namespace Corvcim
