#ifndef TARN_CPU_H
#define TARN_CPU_H

#include <string>
#include <vector>

/// The processor inventory as plain records, and the functions that read it from the inventory tree.
///
/// Setters take the raw codes of the tree and store CIM values; each returns whether the value was
/// usable, and stores it either way. Numbers above 16 bits lose their high half where the field has
/// 16 bits. Records are copied freely and are not locked.
namespace Tarn::CPUProvider {

/// Family names by position, which is not a CIM family code.
__attribute__((visibility("default"))) extern const std::string cpufamily[40];

/// One processor package.
class Processor {
 public:
  // Getters of identifiers and element names return them without blanks at the ends. Setting an empty text
  // returns false.

  /// The printable path of the node.
  std::string getProcessorDeviceID() const;
  bool setProcessorDeviceID(std::string deviceID);
  /// "NERITH:" and the printable path: what the processor's capabilities are known by.
  std::string getInstanceId() const;
  bool setInstanceId(std::string instanceId);
  /// The description of the node.
  std::string getElementName() const;
  bool setElementName(std::string elementName);

  /// The model name as it stands, empty allowed.
  std::string getName() const { return name_; }
  bool setName(std::string name);

  std::string getUniqueId() const { return uniqueId_; }
  bool setUniqueId(std::string uniqueId);
  std::string getStepping() const { return stepping_; }
  bool setStepping(std::string stepping);

  /// CIM family code. Code 1 ("Other") also sets the description of the other family.
  unsigned short getFamily() const { return family_; }
  bool setFamily(unsigned int family);
  std::string getOtherFamilyDescription() const { return otherFamilyDescription_; }
  bool setOtherFamilyDescription(std::string description);

  /// Clocks in MHz.
  unsigned int getMaxClockSpeed() const { return maxClockSpeed_; }
  bool setMaxClockSpeed(unsigned int megahertz);
  unsigned int getCurrentClockSpeed() const { return currentClockSpeed_; }
  bool setCurrentClockSpeed(unsigned int megahertz);
  /// An unknown external clock becomes, and stays, 3600 MHz once it is asked for.
  unsigned int getExternalClockSpeed();
  bool setExternalClockSpeed(unsigned int megahertz);

  /// Widths in bits, 0 when unknown.
  unsigned short getDataWidth() const { return dataWidth_; }
  bool setDataWidth(unsigned int bits);
  unsigned short getAddressWidth() const { return addressWidth_; }
  bool setAddressWidth(unsigned int bits);

  /// The status of the node as the tree has it.
  unsigned short getCPUStatus() const { return cpuStatus_; }
  bool setCPUStatus(unsigned int status);
  /// The CIM upgrade-method code as the tree has it.
  unsigned short getUpgradeMethod() const { return upgradeMethod_; }
  bool setUpgradeMethod(unsigned int method);

  unsigned short getNumberOfProcessorCores() const { return numberOfProcessorCores_; }
  bool setNumberOfProcessorCores(unsigned int count);
  unsigned short getNumberOfEnabledCores() const { return numberOfEnabledCores_; }
  bool setNumberOfEnabledCores(unsigned int count);
  unsigned short getNumberOfHardwareThreads() const { return numberOfHardwareThreads_; }
  bool setNumberOfHardwareThreads(unsigned int count);

  /// States by the status of the node.
  unsigned short getEnabledState() const { return enabledState_; }
  bool setEnabledState(unsigned int status);
  /// Always "not applicable": the inventory cannot be asked to change a state.
  unsigned short getRequestedState() const { return requestedState_; }
  bool setRequestedState(unsigned int status);
  /// One element, always; statuses without a meaning leave it as it is.
  std::vector<unsigned short> getOperationalStatus() const { return {operationalStatus_}; }
  bool setOperationalStatus(unsigned int status);
  /// Sets the status text as well.
  unsigned short getHealthState() const { return healthState_; }
  bool setHealthState(unsigned int status);
  std::string getStatusString() const { return statusString_; }

  /// Appends "enabled" for each 1 in `states`; the rest is ignored, earlier entries stay.
  std::vector<unsigned short> getRequestedStatesSupported() const { return requestedStatesSupported_; }
  bool setRequestedStatesSupported(const std::vector<unsigned int>& states);

  bool isElementNameEditSupported() const { return false; }

 private:
  std::string processorDeviceID_;
  unsigned short family_ = 0;
  std::string otherFamilyDescription_ = "Other";
  unsigned int maxClockSpeed_ = 0;
  unsigned int currentClockSpeed_ = 0;
  unsigned int externalClockSpeed_ = 0;
  unsigned short cpuStatus_ = 0;
  unsigned short enabledState_ = 0;
  std::string elementName_;
  std::string name_;
  unsigned short requestedState_ = 0;
  unsigned short healthState_ = 0;
  unsigned short operationalStatus_ = 0;
  unsigned short dataWidth_ = 0;
  unsigned short addressWidth_ = 0;
  std::string stepping_;
  std::string uniqueId_;
  std::string statusString_ = "Unknown";
  unsigned short upgradeMethod_ = 0;
  std::string instanceId_;
  unsigned short numberOfProcessorCores_ = 0;
  unsigned short numberOfEnabledCores_ = 0;
  unsigned short numberOfHardwareThreads_ = 0;
  std::vector<unsigned short> requestedStatesSupported_;
};

/// One core of a processor.
class ProcessorCore {
 public:
  /// The printable path of the node, and its description; texts as with processors.
  std::string getInstanceID() const;
  bool setInstanceID(std::string instanceID);
  std::string getElementName() const;
  bool setElementName(std::string elementName);

  /// A core is always reported enabled: these two getters store 2 before they return it.
  unsigned short getCoreEnabledState();
  bool setCoreEnabledState(unsigned int status);
  unsigned short getEnabledState();
  bool setEnabledState(unsigned int status);

  unsigned short getRequestedState() const { return requestedState_; }
  bool setRequestedState(unsigned int status);
  unsigned short getHealthState() const { return healthState_; }
  bool setHealthState(unsigned int status);
  std::string getHealthString() const { return healthString_; }
  std::vector<unsigned short> getOperationalStatus() const { return {operationalStatus_}; }
  bool setOperationalStatus(unsigned int status);

 private:
  std::string instanceID_;
  unsigned short coreEnabledState_ = 0;
  unsigned short enabledState_ = 0;
  std::string elementName_;
  unsigned short requestedState_ = 0;
  unsigned short healthState_ = 0;
  std::string healthString_ = "Unknown";
  unsigned short operationalStatus_ = 0;
};

/// One processor cache.
class Memory {
 public:
  /// The printable path of the node, and its description; texts as with processors.
  std::string getMemoryDeviceID() const;
  bool setMemoryDeviceID(std::string deviceID);
  std::string getElementName() const;
  bool setElementName(std::string elementName);
  /// The name as the tree has it, empty allowed.
  std::string getCacheName() const { return cacheName_; }
  bool setCacheName(std::string name);

  /// Bytes in a block, and counts of blocks.
  unsigned int getBlockSize() const { return blockSize_; }
  bool setBlockSize(unsigned int bytes);
  unsigned int getNumberOfBlocks() const { return numberOfBlocks_; }
  bool setNumberOfBlocks(unsigned int count);
  unsigned int getConsumableBlocks() const { return consumableBlocks_; }
  bool setConsumableBlocks(unsigned int count);

  unsigned short getEnabledState() const { return enabledState_; }
  bool setEnabledState(unsigned int status);
  unsigned short getRequestedState() const { return requestedState_; }
  bool setRequestedState(unsigned int status);
  unsigned short getHealthState() const { return healthState_; }
  bool setHealthState(unsigned int status);
  std::string getHealthString() const { return healthString_; }
  std::vector<unsigned short> getOperationalStatus() const { return {operationalStatus_}; }
  bool setOperationalStatus(unsigned int status);

  /// CIM level code; setting level 0 returns false.
  unsigned short getCacheLevel() const { return cacheLevel_; }
  bool setCacheLevel(unsigned int level);
  /// CIM codes from the tree's; codes without a meaning leave the field as it is.
  unsigned short getCacheWritePolicy() const { return cacheWritePolicy_; }
  bool setCacheWritePolicy(unsigned int policy);
  unsigned short getCacheType() const { return cacheType_; }
  bool setCacheType(unsigned int type);
  unsigned short getCacheAssociativity() const { return cacheAssociativity_; }
  bool setCacheAssociativity(unsigned int associativity);

 private:
  std::string memoryDeviceID_;
  unsigned int blockSize_ = 0;
  unsigned int numberOfBlocks_ = 0;
  unsigned int consumableBlocks_ = 0;
  unsigned short enabledState_ = 0;
  std::string elementName_;
  unsigned short requestedState_ = 0;
  unsigned short healthState_ = 0;
  unsigned short operationalStatus_ = 0;
  std::string cacheName_;
  unsigned short cacheLevel_ = 0;
  unsigned short cacheWritePolicy_ = 0;
  unsigned short cacheType_ = 0;
  unsigned short cacheAssociativity_ = 0;
  std::string healthString_ = "Unknown";
};

// Collections. Each appends a record for every node of its kind and returns 0, or 1 when the tree
// has no such node or an exception ended the walk; records appended before it stay.

/// Nodes with status 0 or 15 are left out. In a virtual machine family and name read unknown.
unsigned short getProcessorInstances(std::vector<Processor>& processors);
/// An exception's text goes to standard error; what is no std::exception passes on.
unsigned short getMemoryInstances(std::vector<Memory>& memories);
unsigned short getProcessorCoreInstances(std::vector<ProcessorCore>& cores);

/// Whether the system's model text contains "Virtual".
bool checkIfVirtual();
/// Appends `in` to `out` without blanks and with letters in upper case (ASCII).
void FormatUniqueId(std::string& in, std::string& out);

// Relationships. Each appends the records related to the one with the given identifier, a printable path,
// and returns 0, or 1 on failure. An identifier that names no node finds nothing: that is 1 for the
// queries that begin at a core or a cache, which look for its processor first, and 0 for those that begin
// at a processor. The records come from a full collection, so they are always as the collections report
// them.

unsigned short getCPUProcessorsFromCPUProcCore(std::string instanceID, std::vector<Processor>& matchedProcessors);
unsigned short getCPUProcessorsFromCPUMemory(std::string deviceID, std::vector<Processor>& matchedProcessors);
unsigned short getCPUMemoriesFromCPUProcessor(std::string deviceID, std::vector<Memory>& matchedMemories);
unsigned short getCPUProcCoresFromCPUProcessor(std::string deviceID, std::vector<ProcessorCore>& matchedProcCores);
/// All caches of the core's processor.
unsigned short getCPUMemoriesFromCPUProcessorCore(std::string instanceID, std::vector<Memory>& matchedMemories);
/// All cores of the cache's processor.
unsigned short getCPUProcessorCoresFromCPUMemory(std::string deviceID, std::vector<ProcessorCore>& matchedProcCores);

}  // namespace Tarn::CPUProvider

#endif
