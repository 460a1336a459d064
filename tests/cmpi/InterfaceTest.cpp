#include "tests/cmpi/Interface.h"

#include <cmpift.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {

std::size_t aligned(std::size_t offset, std::size_t alignment) {
  return (offset + alignment - 1) / alignment * alignment;
}

// Both ABIs lay records out in order, each member at the next multiple of its alignment.
void expectLayout(const Record& record) {
  std::size_t end = 0;
  std::size_t alignment = 1;
  for (const Member& member : record.members) {
    const std::size_t expected = record.isUnion ? 0 : aligned(end, member.alignment);
    EXPECT_EQ(member.offset, expected) << record.name << "." << member.name;
    EXPECT_TRUE(member.sameType) << record.name << "." << member.name;
    end = record.isUnion ? std::max(end, member.size) : expected + member.size;
    alignment = std::max(alignment, member.alignment);
  }
  EXPECT_EQ(record.alignment, alignment) << record.name;
  EXPECT_EQ(record.size, aligned(end, alignment)) << record.name;
}

std::size_t expectLayouts(std::span<const Record> records) {
  for (const Record& record : records) {
    expectLayout(record);
  }
  return records.size();
}

std::size_t expectValues(std::span<const Code> codes) {
  for (const Code& code : codes) {
    EXPECT_EQ(code.actual, code.expected) << code.name;
  }
  return codes.size();
}

struct Size {
  std::size_t size;
  std::size_t alignment;

  friend bool operator==(const Size&, const Size&) = default;
};

std::ostream& operator<<(std::ostream& stream, const Size& size) {
  return stream << size.size << " bytes aligned to " << size.alignment;
}

template <class T>
constexpr Size sizeOf() {
  return {sizeof(T), alignof(T)};
}

constexpr bool is64Bit = sizeof(void*) == 8;

}  // namespace

TEST(Interface, DataRecordsHaveTheirMembersInOrder) {
  EXPECT_EQ(expectLayouts(dataRecords()), 24U);
}

TEST(Interface, BrokerTablesHaveTheirSlotsInOrder) {
  EXPECT_EQ(expectLayouts(brokerTables()), 4U);
}

TEST(Interface, ObjectTablesHaveTheirSlotsInOrder) {
  EXPECT_EQ(expectLayouts(objectTables()), 14U);
}

TEST(Interface, ProviderTablesHaveTheirSlotsInOrder) {
  EXPECT_EQ(expectLayouts(providerTables()), 5U);
}

TEST(Interface, EverySlotBehindTheVersionIsOnePointerFurther) {
  for (const Record& record : objectTables()) {
    for (std::size_t slot = 0; slot < record.members.size(); ++slot) {
      EXPECT_EQ(record.members[slot].offset, slot * sizeof(void*)) << record.name << "." << record.members[slot].name;
    }
  }
}

TEST(Interface, ValuesHaveTheSizesOfTheAbi) {
  EXPECT_EQ(sizeOf<CMPIValuePtr>(), (is64Bit ? Size{16, 8} : Size{8, 4}));
  EXPECT_EQ(sizeOf<CMPIValue>(), (is64Bit ? Size{16, 8} : Size{8, 4}));
  EXPECT_EQ(sizeOf<CMPIData>(), (is64Bit ? Size{24, 8} : Size{12, 4}));
  EXPECT_EQ(sizeOf<CMPIStatus>(), (is64Bit ? Size{16, 8} : Size{8, 4}));
  EXPECT_EQ(offsetof(CMPIData, value), is64Bit ? 8U : 4U);
  EXPECT_EQ(offsetof(CMPIStatus, msg), is64Bit ? 8U : 4U);
}

TEST(Interface, ObjectRecordsAreAHandleAndATable) {
  EXPECT_EQ(sizeof(CMPIInstance), 2 * sizeof(void*));
  EXPECT_EQ(sizeof(CMPIBroker), 5 * sizeof(void*));
}

TEST(Interface, TypeAndStateCodesHaveTheirNumbers) {
  EXPECT_EQ(expectValues(typeCodes()), 84U);
}

TEST(Interface, EnumeratorsHaveTheirNumbers) {
  EXPECT_EQ(expectValues(enumerators()), 69U);
}

TEST(Interface, EnumerationsAreAsWideAsAnInt) {
  EXPECT_EQ(sizeof(CMPIrc), sizeof(int));
  EXPECT_EQ(sizeof(CMPISeverity), sizeof(int));
  EXPECT_EQ(sizeof(CMPIErrorProbableCause), sizeof(int));
}

TEST(Interface, IsOfVersionTwo) {
  EXPECT_EQ(CMPI_VERSION, 200);
}
