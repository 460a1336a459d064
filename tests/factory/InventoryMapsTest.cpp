#include <string>
#include <type_traits>

#include "tests/factory/FactoryTest.h"

using namespace FactoryTests;

namespace {

using InventoryMaps = FactoryTest;

Processor processorWith(const std::string& deviceId, unsigned int family) {
  Processor processor;
  processor.setProcessorDeviceID(deviceId);
  processor.setFamily(family);
  return processor;
}

template <class Record>
Lines keysOf(const std::map<std::string, Record>& map) {
  Lines keys;
  for (const auto& entry : map) {
    keys.push_back(entry.first);
  }
  return keys;
}

}  // namespace

TEST_F(InventoryMaps, TheFactoryIsAPlainClass) {
  EXPECT_FALSE(std::is_polymorphic_v<CPUObjFactory>);
}

TEST_F(InventoryMaps, RecordsAreKeyedByTheirIdentifiers) {
  factory()._processorList = {fullProcessor(" cpu0 ")};
  factory()._cpuMemoryList = {fullCache("cache0")};
  factory()._cpuProcCoreList = {fullCore("core0 ")};

  factory().createProcessorMap();
  factory().createCPUMemoryMap();
  factory().createProcessorCoreMap();

  EXPECT_EQ(keysOf(CPUObjFactory::_processorMap), Lines{"cpu0"});
  EXPECT_EQ(keysOf(CPUObjFactory::_cpuMemoryMap), Lines{"cache0"});
  EXPECT_EQ(keysOf(CPUObjFactory::_cpuProcCoreMap), Lines{"core0"});
  EXPECT_EQ(CPUObjFactory::_processorMap.at("cpu0").getStepping(), "7");
  EXPECT_EQ(CPUObjFactory::_cpuMemoryMap.at("cache0").getBlockSize(), 64U);
  EXPECT_EQ(CPUObjFactory::_cpuProcCoreMap.at("core0").getElementName(), "Core 1");
}

TEST_F(InventoryMaps, KeysAscendByteByByte) {
  for (const char* deviceId : {"cpu2", "cpu10", "CPU3", "cpu", "cpu\xc3\xa4", "cpu1"}) {
    factory()._processorList.push_back(processorWith(deviceId, 0));
  }

  factory().createProcessorMap();

  EXPECT_EQ(keysOf(CPUObjFactory::_processorMap), (Lines{"CPU3", "cpu", "cpu1", "cpu10", "cpu2", "cpu\xc3\xa4"}));
}

TEST_F(InventoryMaps, OfRecordsThatShareAnIdentifierTheLastWins) {
  factory()._processorList = {processorWith("cpu0", 10), processorWith("cpu1", 20), processorWith("cpu0", 30)};

  factory().createProcessorMap();

  EXPECT_EQ(factory().getNumberOfProcInstances(), 2);
  EXPECT_EQ(CPUObjFactory::_processorMap.at("cpu0").getFamily(), 30);
}

TEST_F(InventoryMaps, ANewMapReplacesRecordsAndRemovesNone) {
  CPUObjFactory::_processorMap["old"] = processorWith("old", 1);
  CPUObjFactory::_processorMap["cpu0"] = processorWith("cpu0", 10);
  factory()._processorList = {processorWith("cpu0", 20)};

  factory().createProcessorMap();

  EXPECT_EQ(keysOf(CPUObjFactory::_processorMap), (Lines{"cpu0", "old"}));
  EXPECT_EQ(CPUObjFactory::_processorMap.at("cpu0").getFamily(), 20);
}

TEST_F(InventoryMaps, MapsHoldCopies) {
  factory()._processorList = {processorWith("cpu0", 10)};
  factory().createProcessorMap();

  factory()._processorList[0].setFamily(20);

  EXPECT_EQ(CPUObjFactory::_processorMap.at("cpu0").getFamily(), 10);
}

TEST_F(InventoryMaps, NothingIsReported) {
  factory()._processorList = {fullProcessor("cpu0")};
  factory()._cpuMemoryList = {fullCache("cache0")};
  factory()._cpuProcCoreList = {fullCore("core0")};

  factory().createProcessorMap();
  factory().createCPUMemoryMap();
  factory().createProcessorCoreMap();
  EXPECT_EQ(factory().getNumberOfProcInstances() + factory().getNumberOfMemInstances() +
                factory().getNumberOfProcCoreInstances(),
            3);

  EXPECT_TRUE(Scripted::takeMessages().empty());
}

// Counts are 16 bits wide.

TEST_F(InventoryMaps, Exactly65536RecordsIndexNone) {
  factory()._processorList.assign(65536, processorWith("cpu0", 10));
  factory()._cpuMemoryList.assign(65536, fullCache("cache0"));
  factory()._cpuProcCoreList.assign(65536, fullCore("core0"));

  factory().createProcessorMap();
  factory().createCPUMemoryMap();
  factory().createProcessorCoreMap();

  EXPECT_TRUE(CPUObjFactory::_processorMap.empty());
  EXPECT_TRUE(CPUObjFactory::_cpuMemoryMap.empty());
  EXPECT_TRUE(CPUObjFactory::_cpuProcCoreMap.empty());
}

TEST_F(InventoryMaps, OfMoreThan65536RecordsOnlyTheFirstOfTheRemainderAreIndexed) {
  factory()._processorList.assign(65538, processorWith("late", 10));
  factory()._processorList[0] = processorWith("cpu0", 10);
  factory()._processorList[1] = processorWith("cpu1", 10);

  factory().createProcessorMap();

  EXPECT_EQ(keysOf(CPUObjFactory::_processorMap), (Lines{"cpu0", "cpu1"}));
}

TEST_F(InventoryMaps, UpTo65535RecordsAreAllIndexed) {
  factory()._cpuProcCoreList.assign(65535, fullCore("core0"));
  factory()._cpuProcCoreList.back() = fullCore("last");

  factory().createProcessorCoreMap();

  EXPECT_EQ(keysOf(CPUObjFactory::_cpuProcCoreMap), (Lines{"core0", "last"}));
}

TEST_F(InventoryMaps, NumbersOfInstancesAreThoseOfDistinctKeys) {
  EXPECT_EQ(factory().getNumberOfProcInstances(), 0);
  EXPECT_EQ(factory().getNumberOfMemInstances(), 0);
  EXPECT_EQ(factory().getNumberOfProcCoreInstances(), 0);
  place(fullProcessor("a"));
  place(fullCache("a"));
  place(fullCache("b"));
  place(fullCore("a"));
  place(fullCore("b"));
  place(fullCore("c"));

  EXPECT_EQ(factory().getNumberOfProcInstances(), 1);
  EXPECT_EQ(factory().getNumberOfMemInstances(), 2);
  EXPECT_EQ(factory().getNumberOfProcCoreInstances(), 3);
  EXPECT_EQ(sizeof(factory().getNumberOfProcInstances()), 2U);
}

TEST_F(InventoryMaps, ACopyOfTheFactoryIsEmpty) {
  factory()._processorList = {fullProcessor("cpu0")};
  factory()._cpuMemoryList = {fullCache("cache0")};
  factory()._cpuProcCoreList = {fullCore("core0")};

  const CPUObjFactory copy(factory());

  EXPECT_TRUE(copy._processorList.empty());
  EXPECT_TRUE(copy._cpuMemoryList.empty());
  EXPECT_TRUE(copy._cpuProcCoreList.empty());
  EXPECT_EQ(factory()._processorList.size(), 1U);
}

TEST_F(InventoryMaps, AnAssignmentChangesNothing) {
  factory()._processorList = {fullProcessor("cpu0")};
  CPUObjFactory other(factory());
  other._cpuMemoryList = {fullCache("x"), fullCache("y")};

  EXPECT_EQ(&(other = factory()), &other);
  EXPECT_TRUE(other._processorList.empty());
  EXPECT_EQ(other._cpuMemoryList.size(), 2U);

  factory() = other;
  EXPECT_EQ(factory()._processorList.size(), 1U);
  EXPECT_TRUE(factory()._cpuMemoryList.empty());
}

TEST_F(InventoryMaps, TheEndOfAFactoryLeavesMapsAndFlags) {
  place(fullProcessor("cpu0"));
  CPUObjFactory::_isProcPopulated = true;
  {
    CPUObjFactory shortLived(false, false, false);
    shortLived._processorList = {fullProcessor("cpu1")};
  }
  EXPECT_EQ(keysOf(CPUObjFactory::_processorMap), Lines{"cpu0"});
  EXPECT_TRUE(CPUObjFactory::_isProcPopulated);
}

TEST_F(InventoryMaps, AConstructionCollectsWhateverTheFlagsSayOfEarlierOnes) {
  Scripted::inventory().system("Model").processor("cpu0").cache("cache0").core("core0");
  CPUObjFactory::_isProcPopulated = true;
  CPUObjFactory::_isMemPopulated = true;
  CPUObjFactory::_isProcCorePopulated = true;

  const CPUObjFactory another(true, true, true);

  EXPECT_EQ(another._processorList.size(), 1U);
  EXPECT_EQ(another._cpuMemoryList.size(), 1U);
  EXPECT_EQ(another._cpuProcCoreList.size(), 1U);
}
