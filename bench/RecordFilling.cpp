#include "bench/RecordFilling.h"

#include <CPU.h>
#include <benchmark/benchmark.h>

#include <vector>

namespace Corvane::Bench {
namespace {

using Tarn::CPUProvider::Memory;
using Tarn::CPUProvider::Processor;
using Tarn::CPUProvider::ProcessorCore;

constexpr unsigned int inUse = 1;

void fill(Processor& record) {
  static const std::vector<unsigned int> requestedStates = {1};
  record.setProcessorDeviceID("P0");
  record.setInstanceId("NERITH:P0");
  record.setFamily(179);
  record.setName("Server Processor 8480 at 2.60 GHz");
  record.setCurrentClockSpeed(2600);
  record.setMaxClockSpeed(4000);
  record.setExternalClockSpeed(100);
  record.setCPUStatus(inUse);
  record.setEnabledState(inUse);
  record.setOperationalStatus(inUse);
  record.setHealthState(inUse);
  record.setRequestedState(inUse);
  record.setElementName("Processor in socket 0");
  record.setDataWidth(64);
  record.setAddressWidth(64);
  record.setStepping("7");
  record.setUniqueId("57060500FFFBEBBF");
  record.setUpgradeMethod(6);
  record.setRequestedStatesSupported(requestedStates);
  record.setNumberOfProcessorCores(64);
  record.setNumberOfEnabledCores(64);
  record.setNumberOfHardwareThreads(128);
}

void fill(ProcessorCore& record) {
  record.setInstanceID("P0.C0");
  record.setElementName("Core 0");
  record.setCoreEnabledState(inUse);
  record.setEnabledState(inUse);
  record.setOperationalStatus(inUse);
  record.setHealthState(inUse);
  record.setRequestedState(inUse);
}

void fill(Memory& record, const CacheKind& kind) {
  record.setMemoryDeviceID("P0.L1d.0");
  record.setBlockSize(cacheBlockSize);
  record.setConsumableBlocks(kind.blocks);
  record.setNumberOfBlocks(kind.blocks);
  record.setEnabledState(inUse);
  record.setOperationalStatus(inUse);
  record.setHealthState(inUse);
  record.setRequestedState(inUse);
  record.setElementName(kind.description);
  record.setCacheAssociativity(kind.associativity);
  record.setCacheType(kind.type);
  record.setCacheWritePolicy(cacheWritePolicy);
  record.setCacheLevel(kind.level);
  record.setCacheName(kind.name);
}

/// Fills a new vector, as often as asked.
template <class Record, class Fill>
void fillTimes(std::size_t times, Fill fillAll) {
  for (; times != 0; --times) {
    std::vector<Record> records;
    fillAll(records);
    benchmark::DoNotOptimize(records.data());
  }
}

}  // namespace

void fillProcessors(const MachineSize& machine, std::size_t times) {
  fillTimes<Processor>(times, [&](std::vector<Processor>& records) {
    for (std::size_t i = 0; i < machine.processors; ++i) {
      fill(records.emplace_back());
    }
  });
}

void fillCores(const MachineSize& machine, std::size_t times) {
  fillTimes<ProcessorCore>(times, [&](std::vector<ProcessorCore>& records) {
    for (std::size_t i = 0; i < machine.cores(); ++i) {
      fill(records.emplace_back());
    }
  });
}

void fillCaches(const MachineSize& machine, std::size_t times) {
  fillTimes<Memory>(times, [&](std::vector<Memory>& records) {
    for (std::size_t i = 0; i < machine.cores(); ++i) {
      for (const CacheKind& kind : coreCaches) {
        fill(records.emplace_back(), kind);
      }
    }
    for (std::size_t i = 0; i < machine.processors; ++i) {
      fill(records.emplace_back(), sharedCache);
    }
  });
}

}  // namespace Corvane::Bench
