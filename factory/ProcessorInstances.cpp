#include <CPUObjFactory.h>

#include "InstanceBuilder.h"

namespace Tarn::CPUProvider {

namespace {

using P = Processor;

constexpr Property<P> processorProperties[] = {
    {"Caption", "Caption", localized, L"MSGID_CPU_PROCESSOR_CAPTION"},
    {"Description", "Description", localized, L"MSGID_CPU_PROCESSOR_DESCRIPTION"},
    {"ElementName", "ElementName", chars<&P::getElementName>},
    {"Name", "Name", chars<&P::getName>, nullptr, "name"},
    {"Family", "Family", uint16<&P::getFamily>},
    {"OtherFamilyDescription", "OtherFamilyDescription", chars<&P::getOtherFamilyDescription>},
    {"EnabledState", "EnabledState", uint16<&P::getEnabledState>},
    {"RequestedState", "RequestedState", uint16<&P::getRequestedState>},
    {"CurrentClockSpeed", "CurrentClockSpeed", uint32<&P::getCurrentClockSpeed>},
    {"MaxClockSpeed", "MaxClockSpeed", uint32<&P::getMaxClockSpeed>},
    {"ExternalBusClockSpeed", "ExternalBusClockSpeed", uint32<&P::getExternalClockSpeed>},
    {"CPUStatus", "CPUStatus", uint16<&P::getCPUStatus>},
    {"Status", "Status", chars<&P::getStatusString>},
    {"HealthState", "HealthState", uint16<&P::getHealthState>},
    {"OperationalStatus", "OperationalStatus", uint16Array<&P::getOperationalStatus>},
    {"DataWidth", "DataWidth", uint16UnlessZero<&P::getDataWidth>},
    {"AddressWidth", "AddressWidth", uint16UnlessZero<&P::getAddressWidth>},
    {"Stepping", "Stepping", chars<&P::getStepping>},
    // Clients have always selected this one by the schema's spelling and received the other.
    {"UniqueID", "UniqueId", chars<&P::getUniqueId>},
    {"UpgradeMethod", "UpgradeMethod", uint16<&P::getUpgradeMethod>},
    {"NumberOfEnabledCores", "NumberOfEnabledCores", uint16UnlessZero<&P::getNumberOfEnabledCores>},
};

constexpr Property<P> capabilitiesProperties[] = {
    {"Caption", "Caption", localized, L"MSGID_CPU_PROC_CAPABILITIES_CAPTION"},
    {"Description", "Description", localized, L"MSGID_CPU_PROC_CAPABILITIES_DESCRIPTION"},
    {"NumberOfProcessorCores", "NumberOfProcessorCores", uint16<&P::getNumberOfProcessorCores>, nullptr,
     "numProcCores"},
    {"NumberOfHardwareThreads", "NumberOfHardwareThreads", uint16<&P::getNumberOfHardwareThreads>},
    {"RequestedStatesSupported", "RequestedStatesSupported", uint16Array<&P::getRequestedStatesSupported>},
    {"ElementNameEditSupported", "ElementNameEditSupported", boolean<&P::isElementNameEditSupported>},
};

constexpr InstanceClass<P> processorInstances{
    cpuProcessorClass, KeyStyle::Device, &P::getProcessorDeviceID, processorProperties,
    ArrayFailure{"Create Array for Property                         OperationalStatus failed.", LevelInfo, true}};

constexpr InstanceClass<P> capabilitiesInstances{
    cpuProcessorCapClass, KeyStyle::InstanceId, &P::getInstanceId, capabilitiesProperties,
    ArrayFailure{"Create Array for Property                         RequestedStatesSupported failed.", LevelError,
                 false}};

}  // namespace

CMPIInstance* CPUObjFactory::makeCPUProcInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Processor proc,
                                                 const char** properties, bool isObjPath, CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},       {" ref=", ref},
                                 {" proc=", &proc},          {" properties=", properties},
                                 {" isObjPath=", isObjPath}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  CMPIInstance* instance = makeInstance(processorInstances, broker, ref, proc, properties, isObjPath, rc);
  if (!isNull(instance)) {
    factoryEvents.exiting(parameters);
  }
  return instance;
}

CMPIInstance* CPUObjFactory::makeCPUProcCapInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Processor proc,
                                                    const char** properties, bool isObjPath, CMPIStatus* rc) {
  const ParameterList parameters{{" broker=", broker},       {" ref=", ref},
                                 {" proc=", &proc},          {" properties=", properties},
                                 {" isObjPath=", isObjPath}, {" rc=", rc}};
  factoryEvents.entering(parameters);
  CMPIInstance* instance = makeInstance(capabilitiesInstances, broker, ref, proc, properties, isObjPath, rc);
  if (!isNull(instance)) {
    factoryEvents.exiting(parameters);
  }
  return instance;
}

}  // namespace Tarn::CPUProvider
