#include <CPU.h>
#include <gtest/gtest.h>

#include <map>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "tests/model/CodeTables.h"

using CodeTables::codesToTry;
using Tarn::CPUProvider::Memory;

namespace {

// Codes that leave the field alone keep what the code `before` put there.
struct CodeCase {
  const char* name;
  bool (Memory::*set)(unsigned int);
  unsigned short (Memory::*get)() const;
  CodeTables::Table table;
  unsigned int before;
};

const CodeCase codeCases[] = {
    {"write policy", &Memory::setCacheWritePolicy, &Memory::getCacheWritePolicy, {{1, 2}, {2, 3}, {3, 4}, {4, 1}}, 3},
    {"type", &Memory::setCacheType, &Memory::getCacheType, {{0, 0}, {1, 2}, {2, 3}, {3, 4}}, 2},
    {"associativity",
     &Memory::setCacheAssociativity,
     &Memory::getCacheAssociativity,
     {{0, 0}, {1, 2}, {2, 5}, {3, 3}, {4, 4}, {5, 6}, {6, 7}},
     6},
};

}  // namespace

TEST(Memory, IsAPlainValue) {
  EXPECT_FALSE(std::is_polymorphic_v<Memory>);
  EXPECT_TRUE(std::is_copy_constructible_v<Memory>);
  EXPECT_TRUE(std::is_copy_assignable_v<Memory>);
}

TEST(Memory, StartsWithItsDefaults) {
  const Memory memory;

  EXPECT_EQ(memory.getMemoryDeviceID(), "");
  EXPECT_EQ(memory.getElementName(), "");
  EXPECT_EQ(memory.getCacheName(), "");
  EXPECT_EQ(memory.getHealthString(), "Unknown");
  EXPECT_EQ(memory.getOperationalStatus(), std::vector<unsigned short>{0});
  EXPECT_EQ(memory.getBlockSize(), 0U);
  EXPECT_EQ(memory.getNumberOfBlocks(), 0U);
  EXPECT_EQ(memory.getConsumableBlocks(), 0U);
  EXPECT_EQ(memory.getEnabledState(), 0);
  EXPECT_EQ(memory.getRequestedState(), 0);
  EXPECT_EQ(memory.getHealthState(), 0);
  EXPECT_EQ(memory.getCacheLevel(), 0);
  EXPECT_EQ(memory.getCacheWritePolicy(), 0);
  EXPECT_EQ(memory.getCacheType(), 0);
  EXPECT_EQ(memory.getCacheAssociativity(), 0);
}

TEST(Memory, IdentifierAndElementNameAreReadWithoutBlanksAtTheEndsTheNameAsItIs) {
  Memory memory;

  EXPECT_TRUE(memory.setMemoryDeviceID("  cache 0 "));
  EXPECT_TRUE(memory.setElementName(" a  name "));
  EXPECT_TRUE(memory.setCacheName("  L1 "));

  EXPECT_EQ(memory.getMemoryDeviceID(), "cache 0");
  EXPECT_EQ(memory.getElementName(), "a  name");
  EXPECT_EQ(memory.getCacheName(), "  L1 ");
}

TEST(Memory, EmptyTextsAreStoredAndReportedButForTheName) {
  Memory memory;
  memory.setMemoryDeviceID("cache0");
  memory.setElementName("name");
  memory.setCacheName("L1");

  EXPECT_FALSE(memory.setMemoryDeviceID(""));
  EXPECT_FALSE(memory.setElementName(""));
  EXPECT_TRUE(memory.setCacheName(""));

  EXPECT_EQ(memory.getMemoryDeviceID(), "");
  EXPECT_EQ(memory.getElementName(), "");
  EXPECT_EQ(memory.getCacheName(), "");
}

TEST(Memory, SizesKeepAll32Bits) {
  for (const unsigned int value : {0U, 1U, 65537U, 0x80000000U, 0xFFFFFFFFU}) {
    Memory memory;
    EXPECT_TRUE(memory.setBlockSize(value));
    EXPECT_TRUE(memory.setNumberOfBlocks(value));
    EXPECT_TRUE(memory.setConsumableBlocks(value));
    EXPECT_EQ(memory.getBlockSize(), value);
    EXPECT_EQ(memory.getNumberOfBlocks(), value);
    EXPECT_EQ(memory.getConsumableBlocks(), value);
  }
}

TEST(Memory, EnabledStateByNodeStatus) {
  for (const unsigned int code : codesToTry()) {
    Memory memory;
    EXPECT_TRUE(memory.setEnabledState(code));
    EXPECT_EQ(memory.getEnabledState(),
              CodeTables::find(CodeTables::enabledState, code).value_or(CodeTables::otherEnabledState))
        << code;
  }
}

TEST(Memory, RequestedStateIsNeverApplicable) {
  for (const unsigned int code : codesToTry()) {
    Memory memory;
    EXPECT_TRUE(memory.setRequestedState(code));
    EXPECT_EQ(memory.getRequestedState(), 12) << code;
  }
}

TEST(Memory, HealthStateAndItsTextByNodeStatus) {
  for (const unsigned int code : codesToTry()) {
    Memory memory;
    EXPECT_TRUE(memory.setHealthState(code));
    const auto row = CodeTables::partHealth.find(code);
    const auto expected =
        row != CodeTables::partHealth.end() ? row->second : std::pair<unsigned short, std::string>(5, "OK");
    EXPECT_EQ(memory.getHealthState(), expected.first) << code;
    EXPECT_EQ(memory.getHealthString(), expected.second) << code;
  }
}

TEST(Memory, OperationalStatusByNodeStatus) {
  constexpr unsigned short before = 15;
  for (const unsigned int code : codesToTry()) {
    Memory memory;
    memory.setOperationalStatus(8);
    EXPECT_TRUE(memory.setOperationalStatus(code));
    const std::vector<unsigned short> expected = {
        CodeTables::find(CodeTables::operationalStatus, code).value_or(before)};
    EXPECT_EQ(memory.getOperationalStatus(), expected) << code;
  }
}

TEST(Memory, CacheLevelIsKeptAsItIsAndZeroReported) {
  for (const unsigned int code : codesToTry()) {
    Memory memory;
    memory.setCacheLevel(9);
    EXPECT_EQ(memory.setCacheLevel(code), (code & 0xFFFF) != 0) << code;
    EXPECT_EQ(memory.getCacheLevel(), code & 0xFFFF) << code;
  }
}

TEST(Memory, CacheCodesAreTranslatedOrLeaveTheFieldAlone) {
  for (const CodeCase& codeCase : codeCases) {
    const unsigned short before = codeCase.table.at(codeCase.before);
    for (const unsigned int code : codesToTry()) {
      Memory memory;
      (memory.*codeCase.set)(codeCase.before);
      EXPECT_TRUE((memory.*codeCase.set)(code)) << codeCase.name << ' ' << code;
      EXPECT_EQ((memory.*codeCase.get)(), CodeTables::find(codeCase.table, code).value_or(before))
          << codeCase.name << ' ' << code;
    }
  }
}

TEST(Memory, ACopyHasEveryField) {
  Memory original;
  original.setMemoryDeviceID("cache0");
  original.setElementName("name");
  original.setCacheName("L1");
  original.setBlockSize(64);
  original.setNumberOfBlocks(512);
  original.setConsumableBlocks(500);
  original.setEnabledState(16);
  original.setRequestedState(0);
  original.setHealthState(24);
  original.setOperationalStatus(20);
  original.setCacheLevel(4);
  original.setCacheWritePolicy(1);
  original.setCacheType(2);
  original.setCacheAssociativity(5);

  const Memory copy(original);

  EXPECT_EQ(copy.getMemoryDeviceID(), "cache0");
  EXPECT_EQ(copy.getElementName(), "name");
  EXPECT_EQ(copy.getCacheName(), "L1");
  EXPECT_EQ(copy.getBlockSize(), 64U);
  EXPECT_EQ(copy.getNumberOfBlocks(), 512U);
  EXPECT_EQ(copy.getConsumableBlocks(), 500U);
  EXPECT_EQ(copy.getEnabledState(), 3);
  EXPECT_EQ(copy.getRequestedState(), 12);
  EXPECT_EQ(copy.getHealthState(), 25);
  EXPECT_EQ(copy.getHealthString(), "Error");
  EXPECT_EQ(copy.getOperationalStatus(), std::vector<unsigned short>{5});
  EXPECT_EQ(copy.getCacheLevel(), 4);
  EXPECT_EQ(copy.getCacheWritePolicy(), 2);
  EXPECT_EQ(copy.getCacheType(), 3);
  EXPECT_EQ(copy.getCacheAssociativity(), 6);
}
