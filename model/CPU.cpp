#include <CPU.h>
#include <tarn/Instrumentation.h>

#include <utility>

#include "ExceptionBarriers.h"
#include "PrintablePath.h"

namespace Tarn::CPUProvider {

namespace {

using namespace NodeLexicon;

void report(bool set, const char* failure, unsigned int line, const char* function) {
  if (!set) {
    modelEvents.message(LevelWarning, failure, line, function);
  }
}

/// Fills one record from the node that a cursor stands on. A value that cannot be set is reported,
/// and the record goes on; a property that the node does not have leaves its field alone.
template <class Record>
class RecordFiller {
 public:
  RecordFiller(const Instrumentation& node, Record& record, const char* function)
      : node_(node), record_(record), function_(function) {}

  template <class Value>
  void set(bool (Record::*setter)(Value), Value&& value, const char* failure,
           unsigned int line = __builtin_LINE()) const {
    report((record_.*setter)(std::move(value)), failure, line, function_);
  }

  void set(bool (Record::*setter)(unsigned int), const unsigned int& code, const char* failure,
           unsigned int line = __builtin_LINE()) const {
    report((record_.*setter)(code), failure, line, function_);
  }

  template <class Value>
  bool copy(Properties property, bool (Record::*setter)(Value), const char* failure,
            unsigned int line = __builtin_LINE()) const {
    Value value{};
    if (!node_.getProperty(property, value)) {
      return false;
    }
    set(setter, std::move(value), failure, line);
    return true;
  }

  /// For counts that must not stay unset: here it is the missing property that is reported.
  void copyCount(Properties property, bool (Record::*setter)(unsigned int), const char* failure,
                 unsigned int line = __builtin_LINE()) const {
    unsigned int count = 0;
    if (!node_.getProperty(property, count)) {
      report(false, failure, line, function_);
      count = 0;
    }
    (record_.*setter)(count);
  }

 private:
  const Instrumentation& node_;
  Record& record_;
  const char* function_;
};

constexpr unsigned int statusUnknown = 0;
constexpr unsigned int statusEmptySocket = 15;

bool isInUse(unsigned int status) {
  return status != statusUnknown && status != statusEmptySocket;
}

/// A virtual machine's processor model says nothing about the hardware.
void setFamilyAndName(const Instrumentation& node, Processor& processor, bool isVirtual, const char* function) {
  constexpr unsigned int familyUnknown = 2;
  const RecordFiller<Processor> fill(node, processor, function);

  unsigned int family = 0;
  if (node.getProperty(PropFamily, family)) {
    if (isVirtual) {
      modelEvents.message(LevelWarning, "Its a Virtual Machine set the Family as Unknown", __builtin_LINE(), function);
      family = familyUnknown;
    }
    fill.set(&Processor::setFamily, family, "Failed while setting Processor Family");
  }

  std::string name;
  if (node.getProperty(PropProcessorName, name)) {
    if (isVirtual) {
      modelEvents.message(LevelWarning, "Its a Virtual Machine set the Family as Unknown", __builtin_LINE(), function);
      name = "Unknown";
    }
    processor.setName(std::move(name));
  }
}

/// A field that the status of the node decides.
template <class Record>
struct StateField {
  bool (Record::*set)(unsigned int status);
  const char* failure;
};

constexpr StateField<Processor> processorStates[] = {
    {&Processor::setCPUStatus, "Failed while setting CPU Status"},
    {&Processor::setEnabledState, "Failed while setting CPU Enabled State"},
    {&Processor::setOperationalStatus, "Failed while setting CPU OperationalStatus"},
    {&Processor::setHealthState, "Failed while setting CPU Health State"},
    {&Processor::setRequestedState, "Failed while setting CPU Requested State"},
};

constexpr StateField<Memory> memoryStates[] = {
    {&Memory::setEnabledState, "Failed while setting Cache Enabled State"},
    {&Memory::setOperationalStatus, "Failed while setting Cache OperationalStatus"},
    {&Memory::setHealthState, "Failed while setting Cache Health State"},
    {&Memory::setRequestedState, "Failed while setting Cache Requested State"},
};

constexpr StateField<ProcessorCore> coreStates[] = {
    {&ProcessorCore::setCoreEnabledState, "Failed while setting Core enabled state"},
    {&ProcessorCore::setEnabledState, "Failed while setting CPU Enabled State"},
    {&ProcessorCore::setOperationalStatus, "Failed while setting CPU OperationalStatus"},
    {&ProcessorCore::setHealthState, "Failed while setting CPU Health State"},
    {&ProcessorCore::setRequestedState, "Failed while setting CPU Core RequestedState"},
};

/// Of an unknown status nothing is known but that no state can be requested.
template <class Record, std::size_t count>
void setStates(const Instrumentation& node, Record& record, const StateField<Record> (&fields)[count],
               const char* function) {
  const unsigned int status = node.getNodeStatus();
  if (status == statusUnknown) {
    record.setRequestedState(0);
    return;
  }
  for (const StateField<Record>& field : fields) {
    report((record.*field.set)(status), field.failure, __builtin_LINE(), function);
  }
}

void setUniqueId(const Instrumentation& node, Processor& processor, const char* function) {
  std::string raw;
  if (node.getProperty(PropProcessorId, raw)) {
    std::string uniqueId;
    FormatUniqueId(raw, uniqueId);
    RecordFiller<Processor>(node, processor, function)
        .set(&Processor::setUniqueId, std::move(uniqueId), "Failed while setting CPU Unique Id");
  }
}

void setRequestedStatesSupported(const Instrumentation& node, Processor& processor, const char* function) {
  std::vector<unsigned int> states;
  if (node.getProperty(PropRequestedStatesSupported, states)) {
    report(processor.setRequestedStatesSupported(states), "Failed while setting Supported Status", __builtin_LINE(),
           function);
  }
}

void readProcessor(const Instrumentation& node, Processor& processor, const char* function) {
  const RecordFiller<Processor> fill(node, processor, function);
  const std::string path = printablePath(node);
  fill.set(&Processor::setProcessorDeviceID, std::string(path), "Failed while setting Device ID");
  fill.set(&Processor::setInstanceId, "NERITH:" + path, "Failed while setting Instance Id");
  setFamilyAndName(node, processor, checkIfVirtual(), function);
  fill.copy(PropCurrentClockSpeed, &Processor::setCurrentClockSpeed, "Failed while setting Current Clock Speed");
  fill.copy(PropMaxClockSpeed, &Processor::setMaxClockSpeed, "Failed while setting Maximum Clock Speed");
  fill.copy(PropExternalClockSpeed, &Processor::setExternalClockSpeed, "Failed while setting External Clock Speed");
  setStates(node, processor, processorStates, function);
  fill.set(&Processor::setElementName, node.getNodeDescription(), "Failed while setting CPU Element Name");
  fill.copy(PropDataWidth, &Processor::setDataWidth, "Failed while setting CPU Data Width");
  if (!fill.copy(PropAddressWidth, &Processor::setAddressWidth, "Failed while setting CPU Address width")) {
    fill.copy(PropDataWidth, &Processor::setAddressWidth, "Failed while setting CPU Address width");
  }
  fill.copy(PropStepping, &Processor::setStepping, "Failed while setting CPU Stepping");
  setUniqueId(node, processor, function);
  fill.copy(PropUpgradeMethod, &Processor::setUpgradeMethod, "Failed while setting CPU Upgrade method");
  setRequestedStatesSupported(node, processor, function);
  fill.copyCount(PropProcessorCores, &Processor::setNumberOfProcessorCores,
                 "Failed while setting Number of Processor cores");
  fill.copyCount(PropEnabledCores, &Processor::setNumberOfEnabledCores,
                 "Failed while setting Number of Enabled Processor cores");
  fill.copyCount(PropHardwareThreads, &Processor::setNumberOfHardwareThreads,
                 "Failed while setting Number of Hardware Threads");
}

void readMemory(const Instrumentation& node, Memory& memory, const char* function) {
  const RecordFiller<Memory> fill(node, memory, function);
  fill.set(&Memory::setMemoryDeviceID, printablePath(node), "Failed while setting Memory Device ID");
  fill.copy(PropCacheBlockSize, &Memory::setBlockSize, "Failed while setting Cache Block size");
  fill.copy(PropCacheConsumableBlocks, &Memory::setConsumableBlocks, "Failed while setting Cache Consumable blocks");
  fill.copy(PropCacheNumberOfBlocks, &Memory::setNumberOfBlocks, "Failed while setting Cache Numbe of blocks");

  setStates(node, memory, memoryStates, function);
  fill.set(&Memory::setElementName, node.getNodeDescription(), "Failed while setting Cache Element Name");
  fill.copy(PropCacheAssociativity, &Memory::setCacheAssociativity, "Failed while setting Cache Associativity");
  fill.copy(PropCacheType, &Memory::setCacheType, "Failed while setting Cache Type");
  fill.copy(PropCacheWritePolicy, &Memory::setCacheWritePolicy, "Failed while setting Cache Write Policy");
  fill.copy(PropCacheLevel, &Memory::setCacheLevel, "Failed while setting Cache Level");
  fill.copy(PropCacheName, &Memory::setCacheName, "Failed while setting Cache Name");
}

void readCore(const Instrumentation& node, ProcessorCore& core, const char* function) {
  const RecordFiller<ProcessorCore> fill(node, core, function);
  fill.set(&ProcessorCore::setInstanceID, printablePath(node), "Failed while setting Instance Id");
  fill.set(&ProcessorCore::setElementName, node.getNodeDescription(),
           "Failed while setting Processor Core Element Name");
  setStates(node, core, coreStates, function);
}

/// Appends a record and fills it where it stands; one that could not be read to its end is taken back.
template <class Record>
void append(std::vector<Record>& records, void (*read)(const Instrumentation&, Record&, const char*),
            const Instrumentation& node, const char* function) {
  Record& record = records.emplace_back();
  try {
    read(node, record, function);
  } catch (...) {
    records.pop_back();
    throw;
  }
}

/// What a collection returns: success if there was any node to read.
unsigned short resultOf(bool found) {
  return found ? 0 : 1;
}

/// Appends a record of every node that the cursor walks over.
template <class Record>
unsigned short appendAll(std::vector<Record>& records, void (*read)(const Instrumentation&, Record&, const char*),
                         Instrumentation& node, const char* function) {
  const bool found = static_cast<bool>(node);
  for (; node; ++node) {
    append(records, read, node, function);
  }
  return resultOf(found);
}

}  // namespace

unsigned short getProcessorInstances(std::vector<Processor>& processors) {
  modelEvents.entering({{" processors=", &processors}});
  const unsigned short result = loggingExceptions("Caught Exception", [&, function = __func__] {
    Instrumentation node;
    node.selectNode(NodeProcessor);
    const bool found = static_cast<bool>(node);
    for (; node; ++node) {
      if (isInUse(node.getNodeStatus())) {
        append(processors, readProcessor, node, function);
      } else {
        modelEvents.message(LevelWarning, "Dummy CPU Instance", __builtin_LINE(), function);
      }
    }
    return resultOf(found);
  });
  modelEvents.exiting({{" processors=", &processors}});
  return result;
}

unsigned short getMemoryInstances(std::vector<Memory>& memories) {
  modelEvents.entering({{" memories=", &memories}});
  const unsigned short result = printingExceptions([&, function = __func__] {
    Instrumentation node;
    node.selectNode(NodeCacheMemory);
    return appendAll(memories, readMemory, node, function);
  });
  modelEvents.exiting({{" memories=", &memories}});
  return result;
}

unsigned short getProcessorCoreInstances(std::vector<ProcessorCore>& cores) {
  modelEvents.entering({{" procCores=", &cores}});
  const unsigned short result = loggingExceptions("Caught Exception: ", [&, function = __func__] {
    Instrumentation node;
    node.selectNode(NodeProcessorCore);
    return appendAll(cores, readCore, node, function);
  });
  modelEvents.exiting({{" procCores=", &cores}});
  return result;
}

bool checkIfVirtual() {
  modelEvents.entering();
  Instrumentation system;
  system.selectNode(NodeSystem);
  bool isVirtual = false;
  if (system) {
    std::string model;
    system.getProperty(PropSystemModel, model);
    modelEvents.variable("model", model.c_str());
    isVirtual = model.find("Virtual") != std::string::npos;
    if (isVirtual) {
      modelEvents.message(LevelWarning, "VMWARE MACHINE");
    }
  }
  modelEvents.exiting();
  return isVirtual;
}

void FormatUniqueId(std::string& in, std::string& out) {
  modelEvents.entering();
  for (const char character : in) {
    if (character != ' ') {
      const bool isLower = character >= 'a' && character <= 'z';
      out += isLower ? static_cast<char>(character - 'a' + 'A') : character;
    }
  }
  modelEvents.exiting();
}

}  // namespace Tarn::CPUProvider
