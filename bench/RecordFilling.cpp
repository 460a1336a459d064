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

void fill(Memory& record) {
  record.setMemoryDeviceID("P0.L1d.0");
  record.setBlockSize(64);
  record.setConsumableBlocks(512);
  record.setNumberOfBlocks(512);
  record.setEnabledState(inUse);
  record.setOperationalStatus(inUse);
  record.setHealthState(inUse);
  record.setRequestedState(inUse);
  record.setElementName("L1 data cache");
  record.setCacheAssociativity(5);
  record.setCacheType(2);
  record.setCacheWritePolicy(1);
  record.setCacheLevel(3);
  record.setCacheName("L1d");
}

template <class Record>
void fillTimes(std::size_t records, std::size_t times) {
  for (; times != 0; --times) {
    std::vector<Record> filled;
    for (std::size_t i = 0; i < records; ++i) {
      fill(filled.emplace_back());
    }
    benchmark::DoNotOptimize(filled.data());
  }
}

}  // namespace

void fillProcessors(const MachineSize& machine, std::size_t times) {
  fillTimes<Processor>(machine.processors, times);
}
void fillCores(const MachineSize& machine, std::size_t times) {
  fillTimes<ProcessorCore>(machine.cores(), times);
}
void fillCaches(const MachineSize& machine, std::size_t times) {
  fillTimes<Memory>(machine.caches(), times);
}

}  // namespace Corvane::Bench
