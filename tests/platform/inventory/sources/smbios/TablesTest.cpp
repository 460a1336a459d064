#include "platform/inventory/sources/smbios/Tables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Support::SmbiosEncoder;
using Support::SmbiosOther;
using testing::ElementsAre;
using testing::IsEmpty;

const Tables& tablesOf(const Decoded& decoded) {
  return std::get<Tables>(decoded);
}

TEST(Tables, OfADumpAreThoseOfItsTwoParts) {
  for (const auto kind :
       {SmbiosEncoder::EntryPoint::Legacy, SmbiosEncoder::EntryPoint::Smbios2, SmbiosEncoder::EntryPoint::Smbios3}) {
    SmbiosEncoder encoder(2, 8, kind);
    encoder.add(Support::SmbiosSystem{});
    encoder.add(Support::SmbiosProcessor{});
    encoder.end();
    const std::string dump = encoder.dump();

    const Decoded decoded = decodeDump(bytesOf(dump));

    ASSERT_EQ(failureOf(decoded), "");
    EXPECT_EQ(tablesOf(decoded).entryPoint.tableAddress, 32U);
    EXPECT_EQ(tablesOf(decoded).structures.size(), 3U);
    EXPECT_EQ(valueOf(tablesOf(decoded).processors.at(0).socket), "CPU 1");
    EXPECT_THAT(tablesOf(decoded).problems, IsEmpty());
  }
}

TEST(Tables, OfADumpMayStandAnywhereAfterTheEntryPoint) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosProcessor{});
  encoder.end();
  std::string dump = encoder.dump();
  dump.insert(32, 100, '\xee');
  dump[0x10] = static_cast<char>(132);
  dump[0x05] = static_cast<char>(dump[0x05] - 100);
  dump.append(50, '\xee');

  const Decoded decoded = decodeDump(bytesOf(dump));

  ASSERT_EQ(failureOf(decoded), "");
  EXPECT_EQ(tablesOf(decoded).structures.size(), 2U);
  EXPECT_THAT(tablesOf(decoded).problems, IsEmpty());
}

TEST(Tables, OfADumpThatDoesNotHoldThemAreRefused) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosProcessor{});
  encoder.end();
  std::string inEntryPoint = encoder.dump();
  inEntryPoint[0x10] = 0x17;
  std::string behindFile = encoder.dump().substr(0, 32);
  std::string inMemory = encoder.dump();
  inMemory[0x17] = '\x80';

  EXPECT_EQ(failureOf(decodeDump(bytesOf(inEntryPoint))),
            "SMBIOS entry point, offset 0x0: the table is not in the file: it should begin at 0x17, after the entry "
            "point's 24 bytes and within the " +
                std::to_string(inEntryPoint.size()) + " bytes of the file");
  EXPECT_EQ(failureOf(decodeDump(bytesOf(behindFile))),
            "SMBIOS entry point, offset 0x0: the table is not in the file: it should begin at 0x20, after the entry "
            "point's 24 bytes and within the 32 bytes of the file");
  EXPECT_NE(failureOf(decodeDump(bytesOf(inMemory))), "");
  EXPECT_EQ(failureOf(decodeDump(bytesOf("# no dump\n"))),
            "SMBIOS entry point, offset 0x0: no SMBIOS entry point begins here: neither _SM3_ nor _SM_ nor _DMI_");
}

TEST(Tables, EndAtTheirMarkUnder64Bits) {
  SmbiosEncoder encoder(3, 0);
  encoder.add(SmbiosOther{.type = 200});
  encoder.end();
  encoder.add(SmbiosOther{.type = 201});

  const Decoding tables(encoder);

  EXPECT_EQ(tables->structures.size(), 2U);
  EXPECT_EQ(tables->structures.back().type, StructureType::endOfTable);
  EXPECT_THAT(tables.problems(), IsEmpty());
}

TEST(Tables, GoOnAfterAMarkUnder32BitsWhileMoreAreAnnounced) {
  SmbiosEncoder encoder(2, 8);
  encoder.add(SmbiosOther{.type = 200});
  encoder.end();
  encoder.add(SmbiosOther{.type = 201});

  EXPECT_EQ(Decoding(encoder)->structures.size(), 3U);
  EXPECT_THAT(Decoding(encoder).problems(), IsEmpty());
  encoder.announceStructures(2);
  EXPECT_EQ(Decoding(encoder)->structures.size(), 2U);
  EXPECT_THAT(Decoding(encoder).problems(), IsEmpty());
}

TEST(Tables, AnInactiveStructureEndsNothing) {
  SmbiosEncoder encoder;
  encoder.add(SmbiosOther{.type = StructureType::inactive, .fields = "xxxx", .strings = {"was a processor"}});
  encoder.add(Support::SmbiosProcessor{});
  encoder.end();

  const Decoding tables(encoder);

  EXPECT_EQ(tables->structures.size(), 3U);
  EXPECT_EQ(tables->processors.size(), 1U);
}

TEST(Tables, HoldBothSocketsOfAMachineWithOneEmpty) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosProcessor{.socket = "CPU 1", .cores = 512, .coresEnabled = 510, .threads = 1024});
  encoder.add(Support::emptySocket("CPU 2"));
  encoder.end();

  const Decoding tables(encoder);

  ASSERT_EQ(tables->processors.size(), 2U);
  EXPECT_EQ(valueOf(tables->processors[0].cores), 512);
  EXPECT_EQ(valueOf(tables->processors[0].coresEnabled), 510);
  EXPECT_EQ(valueOf(tables->processors[0].threads), 1024);
  EXPECT_EQ(valueOf(tables->processors[1].populated), 0);
}

TEST(Tables, OfALargeMachineHaveEverythingInOrder) {
  const Decoding tables(Support::smbiosMachine(8, 100));

  EXPECT_EQ(tables->structures.size(), 100U);
  EXPECT_EQ(tables->systems.size(), 1U);
  ASSERT_EQ(tables->processors.size(), 8U);
  EXPECT_EQ(tables->caches.size(), 24U);
  EXPECT_THAT(tables.problems(), IsEmpty());
  for (std::size_t i = 0; i < 8; ++i) {
    EXPECT_EQ(valueOf(tables->processors[i].socket), "CPU " + std::to_string(i + 1));
    for (unsigned int level = 1; level <= 3; ++level) {
      const Cache* const cache = tables->cache(*tables->processors[i].caches[level - 1]);
      ASSERT_NE(cache, nullptr);
      EXPECT_EQ(valueOf(cache->level), level);
    }
  }
}

TEST(Tables, MayBeEmpty) {
  SmbiosEncoder encoder(2, 8);

  const Decoding tables(encoder);

  EXPECT_EQ(tables->structures.size(), 0U);
  EXPECT_THAT(tables.problems(), IsEmpty());
}

}  // namespace
}  // namespace Tarn::Smbios
