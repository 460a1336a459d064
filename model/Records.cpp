#include <CPU.h>
#include <tarn/Common.h>

#include <utility>

#include "StateCodes.h"

namespace Tarn::CPUProvider {

namespace {

unsigned short low16(unsigned int number) {
  return static_cast<unsigned short>(number);
}

bool storeNonEmpty(std::string& field, std::string&& value) {
  field = std::move(value);
  return !field.empty();
}

template <class Field, class Value>
bool store(Field& field, Value&& value) {
  field = std::forward<Value>(value);
  return true;
}

}  // namespace

const std::string cpufamily[40] = {
    "Unknown",    "Intel8086",  "Intel286",   "Intel386",   "Intel486",     "Intel8087",  "Intel287",     "Intel387",
    "Intel487",   "Pentium",    "PentiumPro", "Pentium2",   "Pentium2Xeon", "Pentium3",   "Pentium3Xeon", "Pentium4",
    "Xeon",       "Celeron",    "Itanium",    "Itanium2",   "AMDDuron",     "AMDK5",      "AMDK6",        "Athlon",
    "Athlon64",   "AthlonXP",   "AthlonMP",   "Opteron",    "PowerPC",      "PowerPC601", "PowerPC603",   "PowerPC603p",
    "PowerPC604", "PowerPC620", "PowerPC704", "PowerPC750", "AS400",        "Cell",       "S390",         "Invalid"};

std::string Processor::getProcessorDeviceID() const {
  return stripSpaces(processorDeviceID_);
}
bool Processor::setProcessorDeviceID(std::string deviceID) {
  return storeNonEmpty(processorDeviceID_, std::move(deviceID));
}

std::string Processor::getInstanceId() const {
  return stripSpaces(instanceId_);
}
bool Processor::setInstanceId(std::string instanceId) {
  return storeNonEmpty(instanceId_, std::move(instanceId));
}

std::string Processor::getElementName() const {
  return stripSpaces(elementName_);
}
bool Processor::setElementName(std::string elementName) {
  return storeNonEmpty(elementName_, std::move(elementName));
}

bool Processor::setName(std::string name) {
  return store(name_, std::move(name));
}
bool Processor::setUniqueId(std::string uniqueId) {
  return storeNonEmpty(uniqueId_, std::move(uniqueId));
}
bool Processor::setStepping(std::string stepping) {
  return storeNonEmpty(stepping_, std::move(stepping));
}

bool Processor::setFamily(unsigned int family) {
  constexpr unsigned short familyOther = 1;
  family_ = low16(family);
  return family_ != familyOther || setOtherFamilyDescription("Cell Blade Family");
}

bool Processor::setOtherFamilyDescription(std::string description) {
  return storeNonEmpty(otherFamilyDescription_, std::move(description));
}

bool Processor::setMaxClockSpeed(unsigned int megahertz) {
  return store(maxClockSpeed_, megahertz);
}
bool Processor::setCurrentClockSpeed(unsigned int megahertz) {
  return store(currentClockSpeed_, megahertz);
}

unsigned int Processor::getExternalClockSpeed() {
  constexpr unsigned int assumedExternalClock = 3600;
  if (externalClockSpeed_ == 0) {
    externalClockSpeed_ = assumedExternalClock;
  }
  return externalClockSpeed_;
}
bool Processor::setExternalClockSpeed(unsigned int megahertz) {
  return store(externalClockSpeed_, megahertz);
}

bool Processor::setDataWidth(unsigned int bits) {
  return store(dataWidth_, low16(bits));
}
bool Processor::setAddressWidth(unsigned int bits) {
  return store(addressWidth_, low16(bits));
}
bool Processor::setCPUStatus(unsigned int status) {
  return store(cpuStatus_, low16(status));
}
bool Processor::setUpgradeMethod(unsigned int method) {
  return store(upgradeMethod_, low16(method));
}
bool Processor::setNumberOfProcessorCores(unsigned int count) {
  return store(numberOfProcessorCores_, low16(count));
}
bool Processor::setNumberOfEnabledCores(unsigned int count) {
  return store(numberOfEnabledCores_, low16(count));
}
bool Processor::setNumberOfHardwareThreads(unsigned int count) {
  return store(numberOfHardwareThreads_, low16(count));
}

bool Processor::setEnabledState(unsigned int status) {
  return store(enabledState_, translate(enabledStates, status, enabledStateNotApplicable));
}

bool Processor::setRequestedState(unsigned int /*status*/) {
  return store(requestedState_, requestedStateNotApplicable);
}

bool Processor::setOperationalStatus(unsigned int status) {
  return store(operationalStatus_, translate(operationalStatuses, status, operationalStatus_));
}

bool Processor::setHealthState(unsigned int status) {
  const Health& health = healthOf(processorHealth, status);
  healthState_ = health.state;
  return store(statusString_, std::string(health.text));
}

bool Processor::setRequestedStatesSupported(const std::vector<unsigned int>& states) {
  constexpr unsigned int canBeEnabled = 1;
  constexpr unsigned short enabled = 2;
  for (const unsigned int state : states) {
    if (state == canBeEnabled) {
      requestedStatesSupported_.push_back(enabled);
    }
  }
  return true;
}

std::string ProcessorCore::getInstanceID() const {
  return stripSpaces(instanceID_);
}
bool ProcessorCore::setInstanceID(std::string instanceID) {
  return storeNonEmpty(instanceID_, std::move(instanceID));
}

std::string ProcessorCore::getElementName() const {
  return stripSpaces(elementName_);
}
bool ProcessorCore::setElementName(std::string elementName) {
  return storeNonEmpty(elementName_, std::move(elementName));
}

unsigned short ProcessorCore::getCoreEnabledState() {
  return coreEnabledState_ = 2;
}
bool ProcessorCore::setCoreEnabledState(unsigned int status) {
  return store(coreEnabledState_, translate(coreEnabledStates, status, coreEnabledStateUnknown));
}

unsigned short ProcessorCore::getEnabledState() {
  return enabledState_ = 2;
}
bool ProcessorCore::setEnabledState(unsigned int status) {
  return store(enabledState_, translate(enabledStates, status, enabledStateNotApplicable));
}

bool ProcessorCore::setRequestedState(unsigned int /*status*/) {
  return store(requestedState_, requestedStateNotApplicable);
}

bool ProcessorCore::setHealthState(unsigned int status) {
  const Health& health = healthOf(coreAndCacheHealth, status);
  healthState_ = health.state;
  return store(healthString_, std::string(health.text));
}

bool ProcessorCore::setOperationalStatus(unsigned int status) {
  return store(operationalStatus_, translate(operationalStatuses, status, operationalStatus_));
}

std::string Memory::getMemoryDeviceID() const {
  return stripSpaces(memoryDeviceID_);
}
bool Memory::setMemoryDeviceID(std::string deviceID) {
  return storeNonEmpty(memoryDeviceID_, std::move(deviceID));
}

std::string Memory::getElementName() const {
  return stripSpaces(elementName_);
}
bool Memory::setElementName(std::string elementName) {
  return storeNonEmpty(elementName_, std::move(elementName));
}

bool Memory::setCacheName(std::string name) {
  return store(cacheName_, std::move(name));
}
bool Memory::setBlockSize(unsigned int bytes) {
  return store(blockSize_, bytes);
}
bool Memory::setNumberOfBlocks(unsigned int count) {
  return store(numberOfBlocks_, count);
}
bool Memory::setConsumableBlocks(unsigned int count) {
  return store(consumableBlocks_, count);
}

bool Memory::setEnabledState(unsigned int status) {
  return store(enabledState_, translate(enabledStates, status, enabledStateNotApplicable));
}

bool Memory::setRequestedState(unsigned int /*status*/) {
  return store(requestedState_, requestedStateNotApplicable);
}

bool Memory::setHealthState(unsigned int status) {
  const Health& health = healthOf(coreAndCacheHealth, status);
  healthState_ = health.state;
  return store(healthString_, std::string(health.text));
}

bool Memory::setOperationalStatus(unsigned int status) {
  return store(operationalStatus_, translate(operationalStatuses, status, operationalStatus_));
}

bool Memory::setCacheLevel(unsigned int level) {
  cacheLevel_ = low16(level);
  return cacheLevel_ != 0;
}

bool Memory::setCacheWritePolicy(unsigned int policy) {
  return store(cacheWritePolicy_, translate(cacheWritePolicies, policy, cacheWritePolicy_));
}

bool Memory::setCacheType(unsigned int type) {
  return store(cacheType_, translate(cacheTypes, type, cacheType_));
}

bool Memory::setCacheAssociativity(unsigned int associativity) {
  return store(cacheAssociativity_, translate(cacheAssociativities, associativity, cacheAssociativity_));
}

}  // namespace Tarn::CPUProvider
