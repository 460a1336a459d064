#include "platform/inventory/sources/smbios/EntryPoint.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Kind = EntryPoint::Kind;
using Support::SmbiosEncoder;

struct Reading {
  std::variant<EntryPoint, Problem> result;
  std::vector<std::string> problems;

  const EntryPoint& entryPoint() const { return std::get<EntryPoint>(result); }
  std::string failure() const {
    const auto* const problem = std::get_if<Problem>(&result);
    return problem == nullptr ? "" : describe(*problem);
  }
};

Reading readFrom(const std::string& bytes) {
  Problems problems;
  Reading reading{readEntryPoint(bytesOf(bytes), problems), {}};
  for (const Problem& problem : problems.list()) {
    reading.problems.push_back(describe(problem));
  }
  return reading;
}

SmbiosEncoder encoderOf(unsigned int majorNumber, unsigned int minorNumber, SmbiosEncoder::EntryPoint kind) {
  SmbiosEncoder encoder(majorNumber, minorNumber, kind);
  encoder.add(Support::SmbiosSystem{});
  encoder.end();
  return encoder;
}

TEST(EntryPoint, Of64BitsTellsTheMostBytesAndNoCount) {
  const SmbiosEncoder encoder = encoderOf(3, 7, SmbiosEncoder::EntryPoint::Smbios3);

  const Reading reading = readFrom(encoder.entryPoint());

  EXPECT_EQ(reading.entryPoint(), (EntryPoint{.kind = Kind::Smbios3,
                                              .version = {3, 7},
                                              .tableAddress = 0xE0000,
                                              .tableLength = static_cast<std::uint32_t>(encoder.table().size()),
                                              .structures = {},
                                              .length = 0x18}));
  EXPECT_THAT(reading.problems, testing::IsEmpty());
}

TEST(EntryPoint, Of32BitsTellsLengthAndCount) {
  const SmbiosEncoder encoder = encoderOf(2, 8, SmbiosEncoder::EntryPoint::Smbios2);

  const Reading reading = readFrom(encoder.entryPoint());

  EXPECT_EQ(reading.entryPoint(), (EntryPoint{.kind = Kind::Smbios2,
                                              .version = {2, 8},
                                              .tableAddress = 0xE0000,
                                              .tableLength = static_cast<std::uint32_t>(encoder.table().size()),
                                              .structures = 2,
                                              .length = 0x1F}));
  EXPECT_THAT(reading.problems, testing::IsEmpty());
}

TEST(EntryPoint, BeforeTheAnchorHasItsVersionInOneByte) {
  const SmbiosEncoder encoder = encoderOf(2, 0, SmbiosEncoder::EntryPoint::Legacy);

  const Reading reading = readFrom(encoder.entryPoint());

  EXPECT_EQ(reading.entryPoint(), (EntryPoint{.kind = Kind::Legacy,
                                              .version = {2, 0},
                                              .tableAddress = 0xE0000,
                                              .tableLength = static_cast<std::uint32_t>(encoder.table().size()),
                                              .structures = 2,
                                              .length = 0x0F}));
  EXPECT_THAT(reading.problems, testing::IsEmpty());
}

TEST(EntryPoint, IsUsedDespiteAWrongChecksum) {
  std::string bytes = encoderOf(3, 0, SmbiosEncoder::EntryPoint::Smbios3).entryPoint();
  bytes[0x0A] = 3;

  const Reading reading = readFrom(bytes);

  EXPECT_EQ(reading.entryPoint().version, (Version{3, 0}));
  EXPECT_THAT(reading.problems,
              testing::ElementsAre("SMBIOS entry point, offset 0x0: the checksum is wrong: 24 bytes add up to 0x02 "
                                   "instead of 0"));
}

TEST(EntryPoint, HasTwoChecksumsUnder32Bits) {
  std::string bytes = encoderOf(2, 8, SmbiosEncoder::EntryPoint::Smbios2).entryPoint();
  bytes[0x15] = static_cast<char>(bytes[0x15] + 1);
  bytes[0x04] = static_cast<char>(bytes[0x04] - 1);

  EXPECT_THAT(readFrom(bytes).problems,
              testing::ElementsAre("SMBIOS entry point, offset 0x10: the intermediate checksum is wrong: 15 bytes add "
                                   "up to 0x01 instead of 0"));
}

TEST(EntryPoint, OfALengthThatCannotBeIsReadAtItsLeast) {
  for (const int length : {0, 0x17, 0x40}) {
    std::string bytes = encoderOf(3, 0, SmbiosEncoder::EntryPoint::Smbios3).entryPoint();
    bytes[0x05] = static_cast<char>(bytes[0x05] + 0x18 - length);
    bytes[0x06] = static_cast<char>(length);

    const Reading reading = readFrom(bytes);

    EXPECT_EQ(reading.entryPoint().length, 0x18U);
    EXPECT_THAT(reading.problems,
                testing::ElementsAre("SMBIOS entry point, offset 0x6: it gives its own length as " +
                                     std::to_string(length) + "; it has at least 24 bytes, and 24 are there"));
  }
}

TEST(EntryPoint, OneByteShorterIsTheOneThatVersion21Describes) {
  std::string bytes = encoderOf(2, 1, SmbiosEncoder::EntryPoint::Smbios2).entryPoint();
  // The last byte is the revision; without it the first checksum is made up by what it had.
  bytes[0x05] = 0x1E;
  bytes[0x04] = static_cast<char>(bytes[0x04] + 1 + bytes[0x1E]);
  bytes.resize(0x1E);

  const Reading reading = readFrom(bytes);

  EXPECT_EQ(reading.entryPoint().structures, 2);
  EXPECT_THAT(reading.problems, testing::IsEmpty());
}

TEST(EntryPoint, IsRefusedWithoutItsAnchor) {
  for (const std::string& bytes : {std::string(), std::string("_SM"), std::string("_SMX_").append(40, '\0')}) {
    EXPECT_EQ(readFrom(bytes).failure(),
              "SMBIOS entry point, offset 0x0: no SMBIOS entry point begins here: neither _SM3_ nor _SM_ nor _DMI_");
  }
}

TEST(EntryPoint, IsRefusedWhereItIsCut) {
  struct Case {
    SmbiosEncoder::EntryPoint kind;
    std::string anchor;
    std::size_t least;
  };
  const Case cases[] = {{SmbiosEncoder::EntryPoint::Smbios3, "_SM3_", 24},
                        {SmbiosEncoder::EntryPoint::Smbios2, "_SM_", 30},
                        {SmbiosEncoder::EntryPoint::Legacy, "_DMI_", 15}};
  for (const Case& c : cases) {
    const std::string whole = encoderOf(2, 8, c.kind).entryPoint();
    EXPECT_EQ(readFrom(whole.substr(0, c.least)).failure(), "");
    EXPECT_EQ(readFrom(whole.substr(0, c.least - 1)).failure(), "SMBIOS entry point, offset 0x" +
                                                                    std::string(c.least == 15   ? "e"
                                                                                : c.least == 24 ? "17"
                                                                                                : "1d") +
                                                                    ": the entry point " + c.anchor + " ends after " +
                                                                    std::to_string(c.least - 1) + " bytes; it needs " +
                                                                    std::to_string(c.least));
  }
}

}  // namespace
}  // namespace Tarn::Smbios
