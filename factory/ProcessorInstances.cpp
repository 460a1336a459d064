#include <CPUObjFactory.h>

#include "InstanceBuilder.h"

namespace Tarn::CPUProvider {

namespace {

using P = Processor;

constexpr Property<P> processorProperties[] = {
    {"Caption", localized, L"MSGID_CPU_PROCESSOR_CAPTION"},
    {"Description", localized, L"MSGID_CPU_PROCESSOR_DESCRIPTION"},
    {"ElementName", chars<&P::getElementName>},
    {"Name", chars<&P::getName>, nullptr, "name"},
    {"Family", uint16<&P::getFamily>},
    {"OtherFamilyDescription", chars<&P::getOtherFamilyDescription>},
    {"EnabledState", uint16<&P::getEnabledState>},
    {"RequestedState", uint16<&P::getRequestedState>},
    {"CurrentClockSpeed", uint32<&P::getCurrentClockSpeed>},
    {"MaxClockSpeed", uint32<&P::getMaxClockSpeed>},
    {"ExternalBusClockSpeed", uint32<&P::getExternalClockSpeed>},
    {"CPUStatus", uint16<&P::getCPUStatus>},
    {"Status", chars<&P::getStatusString>},
    {"HealthState", uint16<&P::getHealthState>},
    {"OperationalStatus", uint16Array<&P::getOperationalStatus>},
    {"DataWidth", uint16UnlessZero<&P::getDataWidth>},
    {"AddressWidth", uint16UnlessZero<&P::getAddressWidth>},
    {"Stepping", chars<&P::getStepping>},
    // Clients select this one by the schema's spelling and receive the other: do not correct it.
    {.name = "UniqueId", .set = chars<&P::getUniqueId>, .selection = "UniqueID"},
    {"UpgradeMethod", uint16<&P::getUpgradeMethod>},
    {"NumberOfEnabledCores", uint16UnlessZero<&P::getNumberOfEnabledCores>},
};

constexpr Property<P> capabilitiesProperties[] = {
    {"Caption", localized, L"MSGID_CPU_PROC_CAPABILITIES_CAPTION"},
    {"Description", localized, L"MSGID_CPU_PROC_CAPABILITIES_DESCRIPTION"},
    {"NumberOfProcessorCores", uint16<&P::getNumberOfProcessorCores>, nullptr, "numProcCores"},
    {"NumberOfHardwareThreads", uint16<&P::getNumberOfHardwareThreads>},
    {"RequestedStatesSupported", uint16Array<&P::getRequestedStatesSupported>},
    {"ElementNameEditSupported", boolean<&P::isElementNameEditSupported>},
};

constexpr InstanceClass<P> processorInstances{
    cpuProcessorClass, KeyStyle::Device, &P::getProcessorDeviceID, processorProperties,
    ArrayFailure{"Create Array for Property                         OperationalStatus failed.", LevelInfo, true}};

constexpr InstanceClass<P> capabilitiesInstances{
    cpuProcessorCapClass, KeyStyle::InstanceId, &P::getInstanceId, capabilitiesProperties,
    ArrayFailure{"Create Array for Property                         RequestedStatesSupported failed.", LevelError,
                 false}};

}  // namespace

const char* selectionName(const char* name) {
  for (const char* selection : {selectionOf(processorInstances.properties, name),
                                selectionOf(capabilitiesInstances.properties, name), selectionOfCoresAndCaches(name)}) {
    if (selection != nullptr) {
      return selection;
    }
  }
  return name;
}

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
