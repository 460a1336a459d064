#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Support::SmbiosEncoder;
using Support::SmbiosOther;
using testing::ElementsAre;
using testing::IsEmpty;

/// Two structures of six bytes each, and with version 3 the end of the table, at offset 12.
SmbiosEncoder twoSmall(unsigned int majorNumber) {
  SmbiosEncoder encoder(majorNumber, 0);
  encoder.add(SmbiosOther{.type = 200});
  encoder.add(SmbiosOther{.type = 201});
  if (majorNumber >= 3) {
    encoder.end();
  }
  return encoder;
}

std::vector<unsigned int> typesOf(const Decoding& tables) {
  std::vector<unsigned int> types;
  for (const Structure& structure : tables->structures) {
    types.push_back(structure.type);
  }
  return types;
}

TEST(BrokenTable, ALengthBelowTheHeadersEndsTheTable) {
  for (const int length : {0, 1, 3}) {
    const SmbiosEncoder encoder = twoSmall(3);
    std::string table = encoder.table();
    table[7] = static_cast<char>(length);

    const Decoding tables(encoder.entryPoint(), table);

    EXPECT_THAT(typesOf(tables), ElementsAre(200));
    EXPECT_THAT(tables.problems(),
                ElementsAre("SMBIOS table, offset 0x6, structure 1 (handle 0x0011): the structure's length is " +
                            std::to_string(length) + ", less than the 4 bytes of its header"));
  }
}

TEST(BrokenTable, AStructureThatReachesBeyondTheTableIsNotUsed) {
  const SmbiosEncoder encoder = twoSmall(3);
  std::string table = encoder.table();
  table[7] = '\x40';

  const Decoding tables(encoder.entryPoint(), table);

  EXPECT_THAT(typesOf(tables), ElementsAre(200));
  EXPECT_THAT(tables.problems(),
              ElementsAre("SMBIOS table, offset 0x6, structure 1 (handle 0x0011): the structure's length is 64, and "
                          "the table ends after 12 of these bytes"));
}

TEST(BrokenTable, CutWithinAHeaderGivesWhatWasBefore) {
  const SmbiosEncoder encoder = twoSmall(3);

  const Decoding tables(encoder.entryPoint(), encoder.table().substr(0, 9));

  EXPECT_THAT(typesOf(tables), ElementsAre(200));
  EXPECT_THAT(tables.problems(), ElementsAre("SMBIOS table, offset 0x6, structure 1: the table ends within the "
                                             "structure's header, after 3 of its 4 bytes"));
}

TEST(BrokenTable, CutWithinStringsKeepsTheStructure) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosSystem{.manufacturer = "Maker", .product = "Product"});
  const std::string table = encoder.table().substr(0, 0x1B + 6 + 4);

  const Decoding tables(encoder.entryPoint(), table);

  ASSERT_EQ(tables->systems.size(), 1U);
  EXPECT_EQ(valueOf(tables->systems[0].manufacturer), "Maker");
  EXPECT_EQ(valueOf(tables->systems[0].product), "Prod");
  EXPECT_EQ(valueOf(tables->systems[0].version), "-");
  EXPECT_THAT(tables.problems(),
              ElementsAre("SMBIOS table, offset 0x25, structure 0 (handle 0x0010): the table ends within the "
                          "structure's strings",
                          "SMBIOS table, offset 0x6, structure 0 (handle 0x0010): string 3 is not there, the "
                          "structure has 2",
                          "SMBIOS table, offset 0x7, structure 0 (handle 0x0010): string 4 is not there, the "
                          "structure has 2",
                          "SMBIOS table, offset 0x19, structure 0 (handle 0x0010): string 5 is not there, the "
                          "structure has 2",
                          "SMBIOS table, offset 0x1a, structure 0 (handle 0x0010): string 6 is not there, the "
                          "structure has 2"));
}

TEST(BrokenTable, EveryCutGivesThePartBeforeIt) {
  const SmbiosEncoder encoder = Support::smbiosMachine(2, 12);
  const Decoding whole(encoder);
  for (std::size_t length = 0; length < encoder.table().size(); ++length) {
    const Decoding cut(encoder.entryPoint(), encoder.table().substr(0, length));

    EXPECT_FALSE(cut->problems.empty()) << length;
    const auto complete = std::ranges::count_if(whole->structures, [length](const Structure& structure) {
      return structure.offset + structure.formatted.size() + structure.strings.size() < length;
    });
    const auto delivered = static_cast<std::ptrdiff_t>(cut->structures.size());
    EXPECT_TRUE(delivered == complete || delivered == complete + 1) << length;
    for (std::size_t i = 0; i < cut->structures.size(); ++i) {
      EXPECT_EQ(hexOf(cut->structures[i].formatted), hexOf(whole->structures[i].formatted)) << length;
    }
  }
}

TEST(BrokenTable, WithoutItsEndIsNoted) {
  SmbiosEncoder encoder(3, 0);
  encoder.add(SmbiosOther{.type = 200});

  const Decoding tables(encoder);

  EXPECT_THAT(typesOf(tables), ElementsAre(200));
  EXPECT_THAT(tables.problems(),
              ElementsAre("SMBIOS table, offset 0x6: the table ends without an end-of-table structure"));
}

TEST(BrokenTable, MoreStructuresThanAnnouncedAreDelivered) {
  SmbiosEncoder encoder = twoSmall(2);
  encoder.announceStructures(1);

  const Decoding tables(encoder);

  EXPECT_THAT(typesOf(tables), ElementsAre(200, 201));
  EXPECT_THAT(tables.problems(),
              ElementsAre("SMBIOS table, offset 0xc: the table has 2 structures; its entry point announces 1"));
}

TEST(BrokenTable, FewerStructuresThanAnnouncedAreNoted) {
  SmbiosEncoder encoder = twoSmall(2);
  encoder.announceStructures(9);

  const Decoding tables(encoder);

  EXPECT_THAT(typesOf(tables), ElementsAre(200, 201));
  EXPECT_THAT(tables.problems(),
              ElementsAre("SMBIOS table, offset 0xc: the table has 2 structures; its entry point announces 9"));
}

TEST(BrokenTable, ZerosAfterTheLastStructureArePadding) {
  SmbiosEncoder encoder = twoSmall(2);
  encoder.announceLength(40);

  const Decoding tables(encoder.entryPoint(), encoder.table() + std::string(28, '\0'));

  EXPECT_THAT(typesOf(tables), ElementsAre(200, 201));
  EXPECT_THAT(tables.problems(), IsEmpty());
}

TEST(BrokenTable, ShorterThanItsEntryPointAnnouncesIsNoted) {
  SmbiosEncoder encoder = twoSmall(2);
  encoder.announceLength(13);

  EXPECT_THAT(Decoding(encoder).problems(),
              ElementsAre("SMBIOS table, offset 0xc: the table ends after 12 of the 13 bytes that its entry point "
                          "announces"));
}

TEST(BrokenTable, EndsWhereItsEntryPointSays) {
  SmbiosEncoder encoder = twoSmall(2);
  encoder.announceLength(6).announceStructures(1);

  const Decoding tables(encoder);

  EXPECT_THAT(typesOf(tables), ElementsAre(200));
  EXPECT_THAT(tables.problems(), IsEmpty());
}

TEST(BrokenTable, AHandleThatIsThereTwiceLeadsToTheFirst) {
  SmbiosEncoder encoder;
  encoder.add(SmbiosOther{.frame = {.handle = 5}, .type = 200});
  encoder.add(SmbiosOther{.frame = {.handle = 5}, .type = 201});
  encoder.add(SmbiosOther{.frame = {.handle = 5}, .type = StructureType::inactive});
  encoder.end();

  const Decoding tables(encoder);

  EXPECT_EQ(tables->structure(5), tables->structures.data());
  EXPECT_EQ(tables->structure(6), nullptr);
  EXPECT_THAT(tables.problems(), ElementsAre("SMBIOS table, offset 0x8, structure 1 (handle 0x0005): an earlier "
                                             "structure has the same handle"));
}

TEST(BrokenTable, ACacheHandleThatLeadsNowhereOrInACircleIsNoted) {
  SmbiosEncoder encoder;
  encoder.add(SmbiosOther{.frame = {.handle = 1}, .type = 200});
  encoder.add(Support::SmbiosProcessor{.frame = {.handle = 2}, .caches = {1, 2, 3}});
  encoder.end();

  const Decoding tables(encoder);

  EXPECT_EQ(tables->cache(1), nullptr);
  EXPECT_THAT(tables.problems(),
              ElementsAre("SMBIOS table, offset 0x20, structure 1 (handle 0x0002): there is no cache with the handle "
                          "0x0001",
                          "SMBIOS table, offset 0x22, structure 1 (handle 0x0002): there is no cache with the handle "
                          "0x0002",
                          "SMBIOS table, offset 0x24, structure 1 (handle 0x0002): there is no cache with the handle "
                          "0x0003"));
}

TEST(BrokenTable, OnlyTheFirstProblemsAreKept) {
  SmbiosEncoder encoder;
  for (int i = 0; i < 100; ++i) {
    encoder.add(SmbiosOther{.frame = {.handle = 5}, .type = 200});
  }
  encoder.end();

  const Decoding tables(encoder);

  EXPECT_EQ(tables->structures.size(), 101U);
  ASSERT_EQ(tables->problems.size(), Problems::most + 1);
  EXPECT_EQ(tables.problems().back(),
            "SMBIOS table, offset 0x188, structure 65 (handle 0x0005): there are more "
            "problems from here on, which are not listed");
}

TEST(BrokenTable, OfMoreStructuresThanHandlesEndsThere) {
  SmbiosEncoder encoder(3, 0);
  encoder.add(SmbiosOther{.type = 200});
  std::string table;
  for (int i = 0; i < 0x10001; ++i) {
    table += encoder.table();
  }
  encoder.announceLength(static_cast<std::uint32_t>(table.size()));

  const Decoding tables(encoder.entryPoint(), table);

  EXPECT_EQ(tables->structures.size(), 0x10000U);
  EXPECT_EQ(tables.problems().front(),
            "SMBIOS table, offset 0x60000: the table has more structures than there can be handles");
}

TEST(BrokenTable, LargerThanAnyIsReadUpToTheLimit) {
  const SmbiosEncoder encoder(3, 0);
  SmbiosEncoder filled = encoder;
  filled.add(SmbiosOther{.type = StructureType::inactive, .fields = std::string(250, 'x')});
  std::string table;
  while (table.size() < largestTable) {
    table += filled.table();
  }
  ASSERT_EQ(table.size(), largestTable) << "the structures fill it";
  SmbiosEncoder more = encoder;
  more.add(SmbiosOther{.type = 201});
  more.end();
  filled.announceLength(0x7FFFFFFF);

  const Decoding full(filled.entryPoint(), table);
  const Decoding tables(filled.entryPoint(), table + more.table());

  EXPECT_THAT(full.problems(),
              ElementsAre("SMBIOS table, offset 0x100000: the table ends without an end-of-table structure"));
  EXPECT_EQ(tables->structures.size(), largestTable / filled.table().size());
  EXPECT_EQ(
      tables.problems().front(),
      "SMBIOS table, offset 0x100000: the table has 1048588 bytes; what comes after the first 1048576 is not read");
}

TEST(BrokenTable, OfGarbageGivesNothingButWhy) {
  SmbiosEncoder encoder(3, 0);
  encoder.announceLength(64);
  for (const char garbage : {'\x00', '\x01', '\x7f', '\xff'}) {
    const Decoding tables(encoder.entryPoint(), std::string(64, garbage));

    EXPECT_THAT(typesOf(tables), IsEmpty()) << static_cast<int>(garbage);
    EXPECT_THAT(tables.problems(), testing::SizeIs(1)) << static_cast<int>(garbage);
  }
}

}  // namespace
}  // namespace Tarn::Smbios
