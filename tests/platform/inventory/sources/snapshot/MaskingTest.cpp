#include "platform/inventory/sources/snapshot/Masking.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

#include "platform/inventory/sources/smbios/Tables.h"
#include "platform/inventory/sources/snapshot/SmbiosMask.h"
#include "tests/support/SmbiosEncoder.h"

namespace Tarn::Inventory {
namespace {

using Support::SmbiosEncoder;
using testing::ElementsAre;
using testing::IsEmpty;

/// A table before and after it was masked, decoded.
struct Masked {
  explicit Masked(const SmbiosEncoder& encoder) : Masked(encoder.entryPoint(), encoder.table()) {}
  Masked(std::string entryPointBytes, std::string tableBytes)
      : entryPoint(std::move(entryPointBytes)), original(std::move(tableBytes)), table(original) {
    notes = maskTable(entryPoint, table);
    before = std::get<Smbios::Tables>(Smbios::decode(Smbios::bytesOf(entryPoint), Smbios::bytesOf(original)));
    after = std::get<Smbios::Tables>(Smbios::decode(Smbios::bytesOf(entryPoint), Smbios::bytesOf(table)));
  }
  Masked(const Masked&) = delete;
  Masked(Masked&&) = delete;
  Masked& operator=(const Masked&) = delete;
  Masked& operator=(Masked&&) = delete;
  ~Masked() = default;

  std::string entryPoint;
  std::string original;
  std::string table;
  std::vector<std::string> notes;
  Smbios::Tables before;
  Smbios::Tables after;
};

bool contains(const std::string& table, std::string_view text) {
  return table.find(text) != std::string::npos;
}

TEST(SmbiosMask, TakesWhatIdentifiesTheMachineAndKeepsItsKind) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosSystem{.frame = {.handle = 1}});
  encoder.add(Support::SmbiosProcessor{.frame = {.handle = 4}});
  encoder.end();

  const Masked masked(encoder);

  EXPECT_THAT(masked.notes, ElementsAre("SMBIOS type 1, handle 0x0001: serial number, SKU number, UUID",
                                        "SMBIOS type 4, handle 0x0004: serial number, asset tag, part number"));
  const Smbios::System& system = masked.after.systems.at(0);
  EXPECT_EQ(*system.serialNumber, "XXXXXXXX");
  EXPECT_EQ(*system.sku, "XXXXXXX");
  EXPECT_EQ(Smbios::hexOf(*system.uuid), "58585858585858585858585858585858");
  EXPECT_EQ(*system.manufacturer, "Example Systems");
  EXPECT_EQ(*system.product, "Example 100");
  EXPECT_EQ(*system.version, "1.0");
  EXPECT_EQ(*system.family, "Example");
  const Smbios::Processor& processor = masked.after.processors.at(0);
  EXPECT_EQ(*processor.serialNumber, "XXXXXXXX");
  EXPECT_EQ(*processor.assetTag, "XXXXXXXXXX");
  EXPECT_EQ(*processor.partNumber, "XXXXXXXXX");
  EXPECT_EQ(*processor.socket, "CPU 1");
  EXPECT_EQ(*processor.manufacturer, "Example Semiconductors");
  EXPECT_EQ(*processor.version, "Example Processor 1000 @ 2.00GHz");
  EXPECT_TRUE(std::ranges::equal(processor.structure.formatted, masked.before.processors.at(0).structure.formatted));
}

TEST(SmbiosMask, KeepsOnlyTheHeadersOfWhatTheInventoryDoesNotRead) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosOther{.type = 0, .fields = "\x01\x02", .strings = {"Example BIOS", "1.2.3"}});
  encoder.add(Support::SmbiosOther{.type = 17, .fields = "fields", .strings = {"MEM-0001", "Not Specified"}});
  encoder.add(Support::SmbiosOther{.type = 200, .fields = "secret", .strings = {"hidden"}});
  encoder.add(Support::SmbiosOther{.type = 201});
  encoder.end();

  const Masked masked(encoder);

  EXPECT_THAT(masked.notes, ElementsAre("SMBIOS types 17, 200: everything, the inventory is not read from them"));
  EXPECT_TRUE(contains(masked.table, "Example BIOS"));
  EXPECT_TRUE(contains(masked.table, "Not Specified"));
  EXPECT_FALSE(contains(masked.table, "MEM-0001"));
  EXPECT_FALSE(contains(masked.table, "fields"));
  EXPECT_FALSE(contains(masked.table, "secret"));
  EXPECT_FALSE(contains(masked.table, "hidden"));
}

// Looking for each text from the first on would take very long.
TEST(SmbiosMask, TakesVeryManyTexts) {
  const std::vector<std::string> texts(200000, "a");
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosOther{.type = 0, .strings = texts});
  encoder.add(Support::SmbiosOther{.type = 200, .strings = texts});
  encoder.end();

  const Masked masked(encoder);

  ASSERT_EQ(masked.notes.size(), 2U);
  EXPECT_THAT(masked.notes[0], testing::EndsWith(", text 200000"));
  EXPECT_EQ(masked.after.structures.at(1).stringCount(), 200000U);
  EXPECT_FALSE(contains(masked.table, "a"));
}

TEST(SmbiosMask, TakesTextsThatNoFieldRefersTo) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosProcessor{.frame = {.handle = 4, .length = 0x1A}});
  encoder.end();

  const Masked masked(encoder);

  EXPECT_THAT(masked.notes, ElementsAre("SMBIOS type 4, handle 0x0004: text 4, text 5, text 6"));
  EXPECT_FALSE(contains(masked.table, "CPU-0001"));
}

TEST(SmbiosMask, TakesATextThatIsASerialNumberAndSomethingElse) {
  SmbiosEncoder encoder(2, 0);
  encoder.add(Support::SmbiosOther{.frame = {.handle = 1}, .type = 1, .fields = "\x01\x01\x01\x01", .strings = {"S1"}});
  encoder.end();

  const Masked masked(encoder);

  EXPECT_THAT(masked.notes, ElementsAre("SMBIOS type 1, handle 0x0001: serial number"));
  EXPECT_EQ(*masked.after.systems.at(0).product, "XX");
}

TEST(SmbiosMask, LeavesWhatIdentifiesNothing) {
  SmbiosEncoder encoder;
  encoder.add(
      Support::SmbiosSystem{.serialNumber = "To Be Filled By O.E.M.  ", .uuid = std::string(16, '\xff'), .sku = "   "});
  encoder.add(Support::SmbiosCache{});
  encoder.end();

  const Masked masked(encoder);

  EXPECT_THAT(masked.notes, IsEmpty());
  EXPECT_EQ(masked.table, masked.original);
}

TEST(SmbiosMask, TakesFieldsAfterTheKnownOnes) {
  SmbiosEncoder encoder;
  encoder.add(
      Support::SmbiosOther{.frame = {.handle = 7}, .type = 7, .fields = std::string(0x20, '\x01'), .strings = {"L1"}});
  encoder.end();

  const Masked masked(encoder);

  EXPECT_THAT(masked.notes, ElementsAre("SMBIOS type 7, handle 0x0007: fields after the known ones"));
  EXPECT_EQ(Smbios::hexOf(masked.after.structures.at(0).formatted.subspan(0x19)), "0101000000000000000000");
}

TEST(SmbiosMask, TakesWhatFollowsTheTable) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosSystem{.serialNumber = "", .uuid = std::string(16, '\0'), .sku = ""});
  encoder.end();

  const Masked masked(encoder.entryPoint(), encoder.table() + std::string("....left over\0\0", 15));

  EXPECT_THAT(masked.notes, ElementsAre("what follows the last SMBIOS structure"));
  EXPECT_EQ(masked.table, encoder.table() + std::string("....XXXXXXXXX\0\0", 15));
}

TEST(SmbiosMask, TakesEverythingWhereNothingCanBeDecoded) {
  std::string table = "a serial number";

  EXPECT_THAT(maskTable("no entry point", table), ElementsAre("everything, as its entry point cannot be read"));
  EXPECT_EQ(table, "XXXXXXXXXXXXXXX");
}

// What counts for a replay: the same structures with the same fields, and the same problems.
void expectSameShape(const Masked& masked) {
  ASSERT_EQ(masked.after.structures.size(), masked.before.structures.size());
  for (std::size_t i = 0; i < masked.after.structures.size(); ++i) {
    const Smbios::Structure& before = masked.before.structures[i];
    const Smbios::Structure& after = masked.after.structures[i];
    EXPECT_EQ(after.offset, before.offset);
    EXPECT_EQ(after.type, before.type);
    EXPECT_EQ(after.handle, before.handle);
    EXPECT_EQ(after.formatted.size(), before.formatted.size());
    EXPECT_EQ(after.stringCount(), before.stringCount());
  }
  EXPECT_EQ(masked.after.problems, masked.before.problems);
}

TEST(SmbiosMask, KeepsTheShapeOfSoundAndOfBrokenTables) {
  const SmbiosEncoder encoder = Support::smbiosMachine(2, 12);
  const std::string entryPoint = encoder.entryPoint();
  const std::string& table = encoder.table();
  for (std::size_t length = 0; length <= table.size(); ++length) {
    expectSameShape(Masked(entryPoint, table.substr(0, length)));
  }
  for (std::size_t at = 0; at < table.size(); ++at) {
    for (const char byte : {'\0', '\x02', '\x7f', '\xff'}) {
      std::string broken = table;
      broken[at] = byte;
      expectSameShape(Masked(entryPoint, broken));
    }
  }
}

TEST(SmbiosMask, FindsNothingMoreInATableThatIsMasked) {
  Masked masked(Support::smbiosMachine(2, 12));
  const std::string once = masked.table;

  EXPECT_THAT(maskTable(masked.entryPoint, masked.table), IsEmpty());
  EXPECT_EQ(masked.table, once);
}

TEST(Masking, TakesTheSerialNumberOfTheBoardFromCpuInfo) {
  MemoryFileSystem::Files files;
  files["proc/cpuinfo"] = {
      "processor\t: 0\nCPU part\t: 0xd03\n\nHardware\t: Example\nSerial\t\t: 00000000a1b2c3d4\nModel\t\t: Example\n"};

  EXPECT_THAT(maskIdentifiers(files), ElementsAre("proc/cpuinfo: Serial"));
  EXPECT_EQ(files["proc/cpuinfo"].contents,
            "processor\t: 0\nCPU part\t: 0xd03\n\nHardware\t: Example\nSerial\t\t: XXXXXXXXXXXXXXXX\nModel\t\t: "
            "Example\n");
}

TEST(Masking, TakesTheMachinesIdentificationFromCpuInfo) {
  MemoryFileSystem::Files files;
  files["proc/cpuinfo"] = {
      "processor 0: version = FF,  identification = 0133E8,  machine = 2964\n"
      "processor 1: version = FF,  identification = 0133E8,  machine = 2964"};

  EXPECT_THAT(maskIdentifiers(files), ElementsAre("proc/cpuinfo: identification"));
  EXPECT_EQ(files["proc/cpuinfo"].contents,
            "processor 0: version = FF,  identification = XXXXXX,  machine = 2964\n"
            "processor 1: version = FF,  identification = XXXXXX,  machine = 2964");
}

TEST(Masking, TakesTheMachinesIdentificationFromTheBlocksOfCpuInfo) {
  MemoryFileSystem::Files files;
  files["proc/cpuinfo"] = {
      "cpu number      : 0\nversion         : 00\nidentification  : 0133E8\nmachine         : 8561\n"};

  EXPECT_THAT(maskIdentifiers(files), ElementsAre("proc/cpuinfo: identification"));
  EXPECT_EQ(files["proc/cpuinfo"].contents,
            "cpu number      : 0\nversion         : 00\nidentification  : XXXXXX\nmachine         : 8561\n");
}

TEST(Masking, TakesTheNameOfTheMachine) {
  MemoryFileSystem::Files files;
  files["proc/sys/kernel/hostname"] = {"node17.example\n"};

  EXPECT_THAT(maskIdentifiers(files), ElementsAre("proc/sys/kernel/hostname"));
  EXPECT_EQ(files["proc/sys/kernel/hostname"].contents, "XXXXXXXXXXXXXX\n");
}

TEST(Masking, LeavesCpuInfoWithoutIdentifiers) {
  MemoryFileSystem::Files files;
  files["proc/cpuinfo"] = {"processor\t: 0\nflags\t: fpu Serial\nSerial\t\t: 0000000000000000\n"};
  const MemoryFileSystem::Files before = files;

  EXPECT_THAT(maskIdentifiers(files), IsEmpty());
  EXPECT_EQ(files, before);
}

TEST(Masking, TakesTheKernelsFirmwareTextsButThoseOfTheKind) {
  MemoryFileSystem::Files files;
  files["sys/class/dmi/id/board_asset_tag"] = {"Default string\n"};
  files["sys/class/dmi/id/chassis_serial"] = {"AB 12\n"};
  files["sys/class/dmi/id/product_name"] = {"Example 100\n"};
  files["sys/class/dmi/id/product_serial"] = {"", 13};
  files["sys/class/dmi/id/product_uuid"] = {"01020304-0506\n"};
  files["sys/class/dmi/id/sys_vendor"] = {"Example Systems\n"};
  files["sys/devices/system/cpu/cpu0/topology/ppin"] = {"0x12345678\n"};

  EXPECT_THAT(maskIdentifiers(files), ElementsAre("sys/class/dmi/id/chassis_serial", "sys/class/dmi/id/product_uuid",
                                                  "sys/devices/system/cpu/cpu0/topology/ppin"));
  EXPECT_EQ(files["sys/class/dmi/id/board_asset_tag"].contents, "Default string\n");
  EXPECT_EQ(files["sys/class/dmi/id/chassis_serial"].contents, "XX XX\n");
  EXPECT_EQ(files["sys/class/dmi/id/product_name"].contents, "Example 100\n");
  EXPECT_EQ(files["sys/class/dmi/id/product_serial"].error, 13);
  EXPECT_EQ(files["sys/class/dmi/id/product_uuid"].contents, "XXXXXXXXXXXXX\n");
  EXPECT_EQ(files["sys/class/dmi/id/sys_vendor"].contents, "Example Systems\n");
}

TEST(Masking, TakesTheTableByItsEntryPoint) {
  SmbiosEncoder encoder;
  encoder.add(Support::SmbiosSystem{.frame = {.handle = 1}});
  encoder.end();
  MemoryFileSystem::Files files;
  files["sys/firmware/dmi/tables/DMI"] = {encoder.table()};
  files["sys/firmware/dmi/tables/smbios_entry_point"] = {encoder.entryPoint()};

  EXPECT_THAT(maskIdentifiers(files), ElementsAre("sys/firmware/dmi/tables/DMI: SMBIOS type 1, handle 0x0001: serial "
                                                  "number, SKU number, UUID"));
  EXPECT_FALSE(contains(files["sys/firmware/dmi/tables/DMI"].contents, "SYS-0001"));
  EXPECT_EQ(files["sys/firmware/dmi/tables/smbios_entry_point"].contents, encoder.entryPoint());
}

TEST(Masking, TakesATableWithoutItsEntryPointWhole) {
  MemoryFileSystem::Files files;
  files["sys/firmware/dmi/tables/DMI"] = {"serial"};

  EXPECT_THAT(maskIdentifiers(files),
              ElementsAre("sys/firmware/dmi/tables/DMI: everything, as its entry point cannot be read"));
}

}  // namespace
}  // namespace Tarn::Inventory
