#include "platform/inventory/sources/smbios/Structure.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Support::SmbiosEncoder;
using Support::SmbiosOther;

std::string textOf(const std::optional<Bytes>& bytes) {
  if (!bytes) {
    return "-";
  }
  std::string text;
  for (const std::byte byte : *bytes) {
    text += std::to_integer<char>(byte);
  }
  return text;
}

std::string textOf(Bytes bytes) {
  return textOf(std::optional(bytes));
}

TEST(Structure, HasItsHeaderFieldsAndStrings) {
  SmbiosEncoder encoder;
  encoder.add(SmbiosOther{.type = 200, .fields = "ab"});
  encoder.add(SmbiosOther{.frame = {.handle = 0x1234}, .type = 201, .fields = "xyz", .strings = {"one", "two"}});
  encoder.end();
  const Decoding tables(encoder);

  ASSERT_EQ(tables->structures.size(), 3U);
  const Structure& first = tables->structures[0];
  const Structure& second = tables->structures[1];
  const Structure& end = tables->structures[2];
  EXPECT_EQ(first.number, 0U);
  EXPECT_EQ(first.offset, 0U);
  EXPECT_EQ(first.type, 200);
  EXPECT_EQ(first.handle, 0x0010);
  EXPECT_EQ(hexOf(first.formatted), "c80610006162");
  EXPECT_EQ(first.strings.size(), 0U);
  EXPECT_EQ(second.number, 1U);
  EXPECT_EQ(second.offset, 8U);
  EXPECT_EQ(second.handle, 0x1234);
  EXPECT_EQ(hexOf(second.formatted), "c907341278797a");
  EXPECT_EQ(textOf(second.strings), std::string("one\0two\0", 8));
  EXPECT_EQ(end.offset, 8U + 7 + 9);
  EXPECT_EQ(end.type, StructureType::endOfTable);
  EXPECT_THAT(tables.problems(), testing::IsEmpty());
}

TEST(Structure, CountsItsStringsFromOne) {
  SmbiosEncoder encoder;
  encoder.add(SmbiosOther{.type = 11, .strings = {"one", "t", "three"}});
  encoder.end();
  const Decoding tables(encoder);
  const Structure& structure = tables->structures[0];

  EXPECT_EQ(textOf(structure.string(0)), "-");
  EXPECT_EQ(textOf(structure.string(1)), "one");
  EXPECT_EQ(textOf(structure.string(2)), "t");
  EXPECT_EQ(textOf(structure.string(3)), "three");
  EXPECT_EQ(textOf(structure.string(4)), "-");
  EXPECT_EQ(structure.stringCount(), 3U);
  EXPECT_EQ(tables->structures[1].stringCount(), 0U);
  EXPECT_EQ(textOf(tables->structures[1].string(1)), "-");
}

TEST(Structure, HandsOutItsStringsInTheirOrder) {
  SmbiosEncoder encoder;
  encoder.add(SmbiosOther{.type = 11, .strings = {"one", "t", "three"}});
  encoder.end();
  const Decoding whole(encoder);
  const Decoding cut(encoder.entryPoint(), encoder.table().substr(0, 4 + 4 + 2 + 3));
  const auto stringsOf = [](const Structure& structure) {
    std::vector<std::string> strings;
    structure.eachString(
        [&](unsigned int index, Bytes text) { strings.push_back(std::to_string(index) + ' ' + textOf(text)); });
    return strings;
  };

  EXPECT_THAT(stringsOf(whole->structures[0]), testing::ElementsAre("1 one", "2 t", "3 three"));
  EXPECT_THAT(stringsOf(whole->structures[1]), testing::IsEmpty());
  EXPECT_THAT(stringsOf(cut->structures[0]), testing::ElementsAre("1 one", "2 t", "3 thr"));
}

TEST(Structure, KnowsItsPlaceInWords) {
  SmbiosEncoder encoder;
  encoder.add(SmbiosOther{.frame = {.handle = 0x43}, .type = 4});
  const Decoding tables(encoder);

  EXPECT_EQ(placeOf(tables->structures[0]), "SMBIOS type 4, handle 0x0043");
  EXPECT_EQ(placeOf(tables->structures[0], 0x6), "SMBIOS type 4, handle 0x0043, offset 0x06");
}

TEST(Bytes, AreReadFromTheLowestOn) {
  const std::string bytes("\x01\x02\x83\xf4\x05\x06\x07\x88\x09", 9);

  EXPECT_EQ(littleEndian<std::uint8_t>(bytesOf(bytes), 3), 0xF4U);
  EXPECT_EQ(littleEndian<std::uint16_t>(bytesOf(bytes), 1), 0x8302U);
  EXPECT_EQ(littleEndian<std::uint32_t>(bytesOf(bytes), 0), 0xF4830201U);
  EXPECT_EQ(littleEndian<std::uint64_t>(bytesOf(bytes), 1), 0x0988070605F48302U);
  EXPECT_EQ(hexOf(bytesOf(bytes)), "010283f40506078809");
}

}  // namespace
}  // namespace Tarn::Smbios
