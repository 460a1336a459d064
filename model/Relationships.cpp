#include <CPU.h>
#include <tarn/Instrumentation.h>

#include <algorithm>

#include "ExceptionBarriers.h"
#include "PrintablePath.h"

namespace Tarn::CPUProvider {

namespace {

using namespace NodeLexicon;

/// Moves the cursor to the node that an identifier names; false when there is none.
bool selectIdentified(Instrumentation& node, const std::string& identifier) {
  node.selectNode(node.convertStringToPath(identifier));
  return static_cast<bool>(node);
}

/// The records of one kind: their nodes, how they are collected and which identifier stands for a node.
template <class Record>
struct Kind {
  NodeType nodeType;
  unsigned short (*collect)(std::vector<Record>&);
  std::string (Record::*identifier)() const;
};

constexpr Kind<Processor> processorKind{NodeProcessor, getProcessorInstances, &Processor::getProcessorDeviceID};
constexpr Kind<Memory> memoryKind{NodeCacheMemory, getMemoryInstances, &Memory::getMemoryDeviceID};
constexpr Kind<ProcessorCore> coreKind{NodeProcessorCore, getProcessorCoreInstances, &ProcessorCore::getInstanceID};

/// Collects all records anew and appends the first whose identifier is `path`.
template <class Record>
bool appendCollected(const Kind<Record>& kind, const std::string& path, std::vector<Record>& collected,
                     std::vector<Record>& matches) {
  collected.clear();
  if (kind.collect(collected) != 0) {
    return false;
  }
  const auto match = std::find_if(collected.begin(), collected.end(),
                                  [&](const Record& record) { return (record.*kind.identifier)() == path; });
  if (match != collected.end()) {
    matches.push_back(*match);
  }
  return true;
}

/// From a core or cache to the processor that owns it.
unsigned short appendOwner(const std::string& identifier, std::vector<Processor>& matches, const char* failure,
                           const char* function) {
  Instrumentation node;
  if (!selectIdentified(node, identifier)) {
    return 1;
  }
  const std::string owner = node.convertPathToString(node.getPathToParentNode());
  node.selectNode(NodeProcessor);
  if (!node) {
    return 1;
  }
  node.setFilter(PathSelf, node.convertStringToPath(owner));
  if (!node) {
    return 1;
  }
  std::vector<Processor> collected;
  if (!appendCollected(processorKind, printablePath(node), collected, matches)) {
    modelEvents.message(LevelError, failure, __builtin_LINE(), function);
    return 1;
  }
  return 0;
}

/// From a processor to the records of one kind below it. `withoutNodes` is the result when the tree
/// has no node of the kind at all.
template <class Record>
unsigned short appendChildren(const std::string& identifier, const Kind<Record>& kind, std::vector<Record>& matches,
                              unsigned short withoutNodes, const char* failure, const char* function) {
  Instrumentation node;
  if (!selectIdentified(node, identifier)) {
    return 0;
  }
  const std::string owner = printablePath(node);
  node.selectNode(kind.nodeType);
  if (!node) {
    return withoutNodes;
  }
  std::vector<Record> collected;  // its memory serves the collection for every child
  for (node.setFilter(PathChildren, node.convertStringToPath(owner)); node; ++node) {
    if (!appendCollected(kind, printablePath(node), collected, matches)) {
      modelEvents.message(LevelError, failure, __builtin_LINE(), function);
      return 1;
    }
  }
  return 0;
}

/// The children of each processor in turn; the first failure ends the walk and is the result.
template <class Record>
unsigned short appendChildrenOf(const std::vector<Processor>& processors,
                                unsigned short (*childrenOf)(std::string, std::vector<Record>&),
                                std::vector<Record>& matches) {
  for (const Processor& processor : processors) {
    std::vector<Record> children;
    const unsigned short result = childrenOf(processor.getProcessorDeviceID(), children);
    if (result != 0) {
      return result;
    }
    matches.insert(matches.end(), children.begin(), children.end());
  }
  return 0;
}

}  // namespace

unsigned short getCPUProcessorsFromCPUProcCore(std::string instanceID, std::vector<Processor>& matchedProcessors) {
  modelEvents.entering({{" matchedProcessors=", &matchedProcessors}});
  modelEvents.variable("instanceID", instanceID.c_str());
  const unsigned short result = printingExceptions([&, function = __func__] {
    return appendOwner(instanceID, matchedProcessors,
                       "Exception while getting processor based on unique id from proccores", function);
  });
  modelEvents.exiting({{" matchedProcessors=", &matchedProcessors}});
  return result;
}

unsigned short getCPUProcessorsFromCPUMemory(std::string deviceID, std::vector<Processor>& matchedProcessors) {
  modelEvents.entering({{" matchedProcessors=", &matchedProcessors}});
  modelEvents.variable("deviceID", deviceID.c_str());
  const unsigned short result = printingExceptions([&, function = __func__] {
    return appendOwner(deviceID, matchedProcessors,
                       "Exception while getting processor based on unique id from cache memories", function);
  });
  modelEvents.exiting({{" matchedProcessors=", &matchedProcessors}});
  return result;
}

unsigned short getCPUMemoriesFromCPUProcessor(std::string deviceID, std::vector<Memory>& matchedMemories) {
  modelEvents.entering({{" matchedMemories=", &matchedMemories}});
  modelEvents.variable("deviceID", deviceID.c_str());
  const unsigned short result = loggingExceptions("Caught Exception: ", [&, function = __func__] {
    return appendChildren(deviceID, memoryKind, matchedMemories, 0, "Error while setting filter", function);
  });
  modelEvents.exiting({{" matchedMemories=", &matchedMemories}});
  return result;
}

unsigned short getCPUProcCoresFromCPUProcessor(std::string deviceID, std::vector<ProcessorCore>& matchedProcCores) {
  modelEvents.entering({{" matchedProcCores=", &matchedProcCores}});
  modelEvents.variable("deviceID", deviceID.c_str());
  const unsigned short result = printingExceptions([&, function = __func__] {
    return appendChildren(deviceID, coreKind, matchedProcCores, 1, "Exception while applying filter on Processor core",
                          function);
  });
  modelEvents.exiting({{" matchedProcCores=", &matchedProcCores}});
  return result;
}

unsigned short getCPUMemoriesFromCPUProcessorCore(std::string instanceID, std::vector<Memory>& matchedMemories) {
  modelEvents.entering({{" matchedMemories=", &matchedMemories}});
  modelEvents.variable("instanceID", instanceID.c_str());
  const unsigned short result = loggingExceptions("Caught Exception: ", [&] {
    std::vector<Processor> owners;
    const unsigned short found = getCPUProcessorsFromCPUProcCore(instanceID, owners);
    return found != 0 ? found : appendChildrenOf(owners, getCPUMemoriesFromCPUProcessor, matchedMemories);
  });
  modelEvents.exiting({{" matchedMemories=", &matchedMemories}});
  return result;
}

unsigned short getCPUProcessorCoresFromCPUMemory(std::string deviceID, std::vector<ProcessorCore>& matchedProcCores) {
  modelEvents.entering({{" matchedProcCores=", &matchedProcCores}});
  modelEvents.variable("deviceID", deviceID.c_str());
  const unsigned short result = loggingExceptions("Caught Exception: ", [&] {
    std::vector<Processor> owners;
    const unsigned short found = getCPUProcessorsFromCPUMemory(deviceID, owners);
    return found != 0 ? found : appendChildrenOf(owners, getCPUProcCoresFromCPUProcessor, matchedProcCores);
  });
  modelEvents.exiting({{" matchedProcCores=", &matchedProcCores}});
  return result;
}

}  // namespace Tarn::CPUProvider
