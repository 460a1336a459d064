#include "tests/factory/BuilderCases.h"

#include <algorithm>
#include <ostream>
#include <regex>

#include "tests/factory/FactoryTexts.h"

namespace FactoryTests {

namespace {

constexpr const char* partName = "part0";

Lines deviceKeys(const std::string& className) {
  return {"CreationClassName chars |" + className + "|", "DeviceID chars |part0|",
          "SystemCreationClassName chars |HALDA_ComputerSystem|", "SystemName chars |scripted-host|"};
}

constexpr const char* deviceKeyNames = "{CreationClassName,DeviceID,SystemCreationClassName,SystemName}";

const BuilderCase processorBuilder{"makeCPUProcInstance",
                                   "HALDA_CPUProcessor",
                                   " proc=",
                                   [](CPUObjFactory& factory, const CMPIBroker* broker, const CMPIObjectPath* ref,
                                      const char** properties, bool isObjPath, CMPIStatus* rc) {
                                     return factory.makeCPUProcInstance(broker, ref, fullProcessor(partName),
                                                                        properties, isObjPath, rc);
                                   },
                                   deviceKeys("HALDA_CPUProcessor"),
                                   deviceKeyNames,
                                   {{"Caption", "Caption chars |en:MSGID_CPU_PROCESSOR_CAPTION|"},
                                    {"Description", "Description chars |en:MSGID_CPU_PROCESSOR_DESCRIPTION|"},
                                    {"ElementName", "ElementName chars |CPU 1|"},
                                    {"Name", "Name chars | Model 9000|"},
                                    {"Family", "Family uint16 1"},
                                    {"OtherFamilyDescription", "OtherFamilyDescription chars |Cell Blade Family|"},
                                    {"EnabledState", "EnabledState uint16 2"},
                                    {"RequestedState", "RequestedState uint16 12"},
                                    {"CurrentClockSpeed", "CurrentClockSpeed uint32 2100"},
                                    {"MaxClockSpeed", "MaxClockSpeed uint32 3700"},
                                    {"ExternalBusClockSpeed", "ExternalBusClockSpeed uint32 100"},
                                    {"CPUStatus", "CPUStatus uint16 21"},
                                    {"Status", "Status chars |Degraded|"},
                                    {"HealthState", "HealthState uint16 10"},
                                    {"OperationalStatus", "OperationalStatus uint16[] {13}"},
                                    {"DataWidth", "DataWidth uint16 64"},
                                    {"AddressWidth", "AddressWidth uint16 48"},
                                    {"Stepping", "Stepping chars |7|"},
                                    {"UniqueID", "UniqueId chars |0FA9|"},
                                    {"UpgradeMethod", "UpgradeMethod uint16 54"},
                                    {"NumberOfEnabledCores", "NumberOfEnabledCores uint16 15"}},
                                   {"OperationalStatus", processorArrayFailed, 4000, true},
                                   false};

const BuilderCase capabilitiesBuilder{
    "makeCPUProcCapInstance",
    "HALDA_CPUProcessorCapabilities",
    " proc=",
    [](CPUObjFactory& factory, const CMPIBroker* broker, const CMPIObjectPath* ref, const char** properties,
       bool isObjPath, CMPIStatus* rc) {
      return factory.makeCPUProcCapInstance(broker, ref, fullProcessor(partName), properties, isObjPath, rc);
    },
    {"InstanceID chars |NERITH:part0|"},
    "{InstanceID}",
    {{"Caption", "Caption chars |en:MSGID_CPU_PROC_CAPABILITIES_CAPTION|"},
     {"Description", "Description chars |en:MSGID_CPU_PROC_CAPABILITIES_DESCRIPTION|"},
     {"NumberOfProcessorCores", "NumberOfProcessorCores uint16 16"},
     {"NumberOfHardwareThreads", "NumberOfHardwareThreads uint16 32"},
     {"RequestedStatesSupported", "RequestedStatesSupported uint16[] {2, 2}"},
     {"ElementNameEditSupported", "ElementNameEditSupported boolean 0"}},
    {"RequestedStatesSupported", capabilitiesArrayFailed, 6000, false},
    false};

const BuilderCase coreBuilder{"makeCPUProcCoreInstance",
                              "HALDA_CPUProcessorCore",
                              " procCore=",
                              [](CPUObjFactory& factory, const CMPIBroker* broker, const CMPIObjectPath* ref,
                                 const char** properties, bool isObjPath, CMPIStatus* rc) {
                                return factory.makeCPUProcCoreInstance(broker, ref, fullCore(partName), properties,
                                                                       isObjPath, rc);
                              },
                              {"InstanceID chars |part0|"},
                              "{InstanceID}",
                              {{"Caption", "Caption chars |en:MSGID_CPU_PROC_CORE_CAPTION|"},
                               {"Description", "Description chars |en:MSGID_CPU_PROC_CORE_DESCRIPTION|"},
                               {"ElementName", "ElementName chars |Core 1|"},
                               {"CoreEnabledState", "CoreEnabledState uint16 2"},
                               {"EnabledState", "EnabledState uint16 2"},
                               {"RequestedState", "RequestedState uint16 12"},
                               {"HealthState", "HealthState uint16 25"},
                               {"OperationalStatus", "OperationalStatus uint16[] {5}"}},
                              {"OperationalStatus", coreAndCacheArrayFailed, 6000, true},
                              true};

const BuilderCase cacheBuilder{"makeCPUMemoryInstance",
                               "HALDA_CPUMemory",
                               " cpuMem=",
                               [](CPUObjFactory& factory, const CMPIBroker* broker, const CMPIObjectPath* ref,
                                  const char** properties, bool isObjPath, CMPIStatus* rc) {
                                 return factory.makeCPUMemoryInstance(broker, ref, fullCache(partName), properties,
                                                                      isObjPath, rc);
                               },
                               deviceKeys("HALDA_CPUMemory"),
                               deviceKeyNames,
                               {{"Caption", "Caption chars |en:MSGID_CPU_MEMORY_CAPTION|"},
                                {"Description", "Description chars |en:MSGID_CPU_MEMORY_DESCRIPTION|"},
                                {"ElementName", "ElementName chars |Cache 1|"},
                                {"Name", "Name chars | L1 |"},
                                {"BlockSize", "BlockSize uint64 64"},
                                {"NumberOfBlocks", "NumberOfBlocks uint64 4294967295"},
                                {"ConsumableBlocks", "ConsumableBlocks uint64 2147483648"},
                                {"EnabledState", "EnabledState uint16 3"},
                                {"HealthState", "HealthState uint16 25"},
                                {"RequestedState", "RequestedState uint16 12"},
                                {"OperationalStatus", "OperationalStatus uint16[] {5}"}},
                               {"OperationalStatus", coreAndCacheArrayFailed, 6000, false},
                               true};

}  // namespace

const std::vector<BuilderCase>& builderCases() {
  static const std::vector<BuilderCase> cases = {processorBuilder, capabilitiesBuilder, coreBuilder, cacheBuilder};
  return cases;
}

void PrintTo(const BuilderCase& builder, std::ostream* stream) {
  *stream << builder.function;
}

Lines BuilderCase::settings(const Lines& names) const {
  Lines lines = keySettings;
  for (const PropertyRow& row : properties) {
    if (std::find(names.begin(), names.end(), row.selection) != names.end()) {
      lines.push_back(row.setting);
    }
  }
  return lines;
}

Lines BuilderCase::allSettings() const {
  Lines lines = keySettings;
  for (const PropertyRow& row : properties) {
    lines.push_back(row.setting);
  }
  return lines;
}

Lines BuilderTest::takeBuilderEvents() {
  static const std::regex record("( proc=| procCore=| cpuMem=)0x[0-9a-f]+");
  Lines lines;
  for (const std::string& line : Scripted::takeEventsOf(GetParam().function)) {
    lines.push_back(std::regex_replace(line, record, "$1#"));
  }
  return lines;
}

std::string BuilderTest::parameters(const char** properties, bool isObjPath) const {
  return requestParameters(broker_, ref_,
                           GetParam().recordLabel + "# properties=" + Scripted::address(properties) +
                               " isObjPath=" + (isObjPath ? "1" : "0") + " rc=" + Scripted::address(&rc_));
}

std::vector<Corvcim::ServiceCall> BuilderTest::takeCallsOf(const Lines& services) {
  std::vector<Corvcim::ServiceCall> calls = hostBroker_.services().takeRecord();
  std::erase_if(calls, [&](const Corvcim::ServiceCall& call) {
    return std::find(services.begin(), services.end(), call.service) == services.end();
  });
  return calls;
}

}  // namespace FactoryTests
