#include "platform/inventory/sources/smbios/System.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Support::SmbiosSystem;

TEST(System, HasEveryField) {
  const Decoding tables(tableOf(SmbiosSystem{}));

  ASSERT_EQ(tables->systems.size(), 1U);
  const System& system = tables->systems[0];
  EXPECT_EQ(valueOf(system.manufacturer), "Example Systems");
  EXPECT_EQ(valueOf(system.product), "Example 100");
  EXPECT_EQ(valueOf(system.version), "1.0");
  EXPECT_EQ(valueOf(system.serialNumber), "SYS-0001");
  ASSERT_TRUE(system.uuid);
  EXPECT_EQ(hexOf(*system.uuid), "0102030405060708090a0b0c0d0e0f10");
  EXPECT_EQ(valueOf(system.sku), "SKU-100");
  EXPECT_EQ(valueOf(system.family), "Example");
  EXPECT_EQ(placeOf(system.structure, system.sku), "SMBIOS type 1, handle 0x0010, offset 0x19");
  EXPECT_EQ(hexOf(system.sku.raw), "05");
}

TEST(System, EndsAfterTheFieldsOfItsLength) {
  const Decoding before21(tableOf(SmbiosSystem{.frame = {.length = 0x08}}));
  const Decoding cutUuid(tableOf(SmbiosSystem{.frame = {.length = 0x17}}));
  const Decoding noFamily(tableOf(SmbiosSystem{.frame = {.length = 0x1A}}));

  EXPECT_EQ(valueOf(before21->systems[0].serialNumber), "SYS-0001");
  EXPECT_FALSE(before21->systems[0].uuid);
  EXPECT_TRUE(before21->systems[0].uuid.raw.empty());
  EXPECT_FALSE(cutUuid->systems[0].uuid);
  EXPECT_TRUE(noFamily->systems[0].uuid);
  EXPECT_EQ(valueOf(noFamily->systems[0].sku), "SKU-100");
  EXPECT_EQ(valueOf(noFamily->systems[0].family), "-");
}

TEST(System, HasNoUuidWhereAllItsBytesAreZerosOrOnes) {
  const Decoding none(tableOf(SmbiosSystem{.uuid = std::string(16, '\0')}));
  const Decoding notSet(tableOf(SmbiosSystem{.uuid = std::string(16, '\xff')}));
  const Decoding almost(tableOf(SmbiosSystem{.uuid = std::string(15, '\0') + '\x01'}));

  EXPECT_FALSE(none->systems[0].uuid);
  EXPECT_EQ(none->systems[0].uuid.raw.size(), 16U);
  EXPECT_FALSE(notSet->systems[0].uuid);
  EXPECT_TRUE(almost->systems[0].uuid);
}

TEST(System, KeepsTheBlanksThatTheFirmwareWrote) {
  const Decoding tables(tableOf(SmbiosSystem{.product = "  Example  ", .family = ""}));

  EXPECT_EQ(valueOf(tables->systems[0].product), "  Example  ");
  EXPECT_EQ(valueOf(tables->systems[0].family), "-");
}

TEST(System, TooShortIsNotedAndGivesWhatItHas) {
  const Decoding tables(tableOf(SmbiosSystem{.frame = {.length = 0x06}}));

  EXPECT_EQ(valueOf(tables->systems[0].product), "Example 100");
  EXPECT_EQ(valueOf(tables->systems[0].version), "-");
  EXPECT_THAT(tables.problems(),
              testing::ElementsAre("SMBIOS table, offset 0x1, structure 0 (handle 0x0010): the structure of type 1 has "
                                   "6 bytes; the shortest ever defined has 8"));
}

}  // namespace
}  // namespace Tarn::Smbios
