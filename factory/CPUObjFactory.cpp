#include <CPUObjFactory.h>

#include "FactoryEvents.h"

namespace Tarn::CPUProvider {

std::map<std::string, Processor> CPUObjFactory::_processorMap;
std::map<std::string, Memory> CPUObjFactory::_cpuMemoryMap;
std::map<std::string, ProcessorCore> CPUObjFactory::_cpuProcCoreMap;
bool CPUObjFactory::_isProcPopulated = false;
bool CPUObjFactory::_isMemPopulated = false;
bool CPUObjFactory::_isProcCorePopulated = false;

namespace {

template <class Record>
void indexRecords(const std::vector<Record>& records, std::string (Record::*identifier)() const,
                  std::map<std::string, Record>& map) {
  const auto count = static_cast<unsigned short>(records.size());
  for (unsigned short i = 0; i < count; ++i) {
    map[(records[i].*identifier)()] = records[i];
  }
}

// Fixed: log filters know these events by their lines.
constexpr unsigned int factoryEntryLine = 54;
constexpr unsigned int factoryExitLine = 84;
constexpr unsigned int constructionEntryLine = 103;
constexpr unsigned int constructionExitLine = 128;

}  // namespace

CPUObjFactory* CPUObjFactory::getFactoryInstance(bool isProc, bool isMem, bool isProcCore) {
  factoryEvents.entering({{" isProc=", isProc}, {" isMem=", isMem}, {" isProcCore=", isProcCore}}, factoryEntryLine);
  static CPUObjFactory factory(isProc, isMem, isProcCore);
  // Also on the first call: a kind whose collection failed in the constructor gets a second attempt.
  factory.collect(isProc && !_isProcPopulated, isMem && !_isMemPopulated, isProcCore && !_isProcCorePopulated);
  factoryEvents.exiting({{" isProc=", isProc}, {" isMem=", isMem}, {" isProcCore=", isProcCore}}, factoryExitLine);
  return &factory;
}

CPUObjFactory::CPUObjFactory(bool isProc, bool isMem, bool isProcCore) {
  factoryEvents.entering({{" isProc=", isProc}, {" isMem=", isMem}, {" isProcCore=", isProcCore}},
                         constructionEntryLine);
  collect(isProc, isMem, isProcCore);
  factoryEvents.exiting({{" isProc=", isProc}, {" isMem=", isMem}, {" isProcCore=", isProcCore}}, constructionExitLine);
}

CPUObjFactory::CPUObjFactory(const CPUObjFactory& /*other*/) {}

// NOLINTNEXTLINE(cert-oop54-cpp,bugprone-unhandled-self-assignment): nothing is assigned.
CPUObjFactory& CPUObjFactory::operator=(const CPUObjFactory& /*other*/) {
  return *this;
}

void CPUObjFactory::collect(bool isProc, bool isMem, bool isProcCore) {
  if (isProc && getProcessorInstances(_processorList) == 0) {
    createProcessorMap();
    _isProcPopulated = true;
  }
  if (isMem && getMemoryInstances(_cpuMemoryList) == 0) {
    createCPUMemoryMap();
    _isMemPopulated = true;
  }
  if (isProcCore && getProcessorCoreInstances(_cpuProcCoreList) == 0) {
    createProcessorCoreMap();
    _isProcCorePopulated = true;
  }
}

void CPUObjFactory::createProcessorMap() {
  indexRecords(_processorList, &Processor::getProcessorDeviceID, _processorMap);
}

void CPUObjFactory::createCPUMemoryMap() {
  indexRecords(_cpuMemoryList, &Memory::getMemoryDeviceID, _cpuMemoryMap);
}

void CPUObjFactory::createProcessorCoreMap() {
  indexRecords(_cpuProcCoreList, &ProcessorCore::getInstanceID, _cpuProcCoreMap);
}

unsigned short CPUObjFactory::getNumberOfProcInstances() const {
  return static_cast<unsigned short>(_processorMap.size());
}

unsigned short CPUObjFactory::getNumberOfMemInstances() const {
  return static_cast<unsigned short>(_cpuMemoryMap.size());
}

unsigned short CPUObjFactory::getNumberOfProcCoreInstances() const {
  return static_cast<unsigned short>(_cpuProcCoreMap.size());
}

}  // namespace Tarn::CPUProvider
