#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>

#include "platform/inventory/tree/PropertyTable.h"
#include "tests/platform/inventory/KernelFiles.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using testing::Contains;

const std::string productName = "sys/class/dmi/id/product_name";

KernelFiles machine() {
  KernelFiles files;
  files.cpus("0")
      .cpu(0, {.package = 0, .core = 0, .siblings = "0"})
      .cache(0, 0, {.cpus = "0"})
      .maxFrequency(0, "1000000");
  files.x86Block(0);
  return files;
}

std::optional<std::string> modelOf(KernelFiles files) {
  return textAt(files.tree(), "system", PropSystemModel);
}

KernelFiles underHypervisor() {
  return machine().file("proc/cpuinfo", "processor\t: 0\ncpu family\t: 6\nflags\t\t: fpu hypervisor lm\n");
}

TEST(SystemModel, IsTheFirmwaresProductName) {
  const Tree tree = machine().file(productName, "  Rack Server 2200 \n").tree();

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "Rack Server 2200");
  EXPECT_EQ(nodeAt(tree, "system").description, "Rack Server 2200");
  EXPECT_TRUE(tree.unread().empty());
}

TEST(SystemModel, IsTheProductNameAlsoUnderAHypervisor) {
  EXPECT_EQ(modelOf(underHypervisor().file(productName, "Standard PC (Q35 + ICH9, 2009)\n")),
            "Standard PC (Q35 + ICH9, 2009)");
}

TEST(SystemModel, HasBlanksForControlCharacters) {
  const Tree tree =
      machine().file(productName, "\001Box\002 9\037\n").file("sys/class/dmi/id/sys_vendor", "\177Maker\010\n").tree();

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "Box  9");
  EXPECT_EQ(nodeAt(tree, "system").description, "Box  9");
  EXPECT_EQ(textAt(tree, "system", PropSystemManufacturer), "Maker");
}

TEST(SystemModel, IsNoPlaceholder) {
  for (const char* text : {"To Be Filled By O.E.M.", "To be filled by O.E.M.", "System Product Name", "Default string",
                           "Not Specified", "Not Applicable", "None", "O.E.M.", "Undefined", "", "  "}) {
    const Tree tree = machine().file(productName, text + std::string("\n")).tree();
    EXPECT_EQ(textAt(tree, "system", PropSystemModel), std::nullopt) << text;
    EXPECT_EQ(nodeAt(tree, "system").description, "Computer system");
    EXPECT_TRUE(tree.unread().empty()) << "it was read";
  }
}

TEST(SystemModel, IsElseTheDeviceTrees) {
  const Tree tree = machine().file("proc/device-tree/model", std::string("Single Board 4B\0", 16)).tree();

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "Single Board 4B");
  EXPECT_TRUE(tree.unread().empty());
}

TEST(SystemModel, OfAnEmulatedBoardSaysThatItIsVirtual) {
  EXPECT_EQ(modelOf(machine().file("proc/device-tree/model", std::string("linux,dummy-virt\0", 17))),
            "linux,dummy-virt (Virtual Machine)");
}

TEST(SystemModel, IsElseWhatTheHypervisorTells) {
  EXPECT_EQ(modelOf(underHypervisor()), "Virtual Machine");
  EXPECT_EQ(modelOf(machine().file("sys/hypervisor/type", "xen\n")), "Virtual Machine (xen)");
}

TEST(SystemModel, OfAPlaceholderUnderAHypervisorIsVirtual) {
  EXPECT_EQ(modelOf(underHypervisor().file(productName, "None\n")), "Virtual Machine");
}

TEST(SystemModel, IsAbsentWhereNothingTellsIt) {
  const Tree tree = machine().remove("sys/firmware").tree();

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), std::nullopt);
  ASSERT_EQ(tree.unread().size(), 2U);
  EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/class/dmi/id/product_name", "no such file or directory",
                                             "needs firmware with DMI tables"}));
}

TEST(SystemModel, ThatMayNotBeReadIsTold) {
  const Tree tree = machine().fail(productName, EACCES).tree();

  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_THAT(tree.unread(), Contains(Unread{"/sys/class/dmi/id/product_name", "permission denied",
                                             "run as root, or let this process read it"}));
}

TEST(SystemModel, ComesFromTheTablesWhereTheKernelTellsNone) {
  Support::SmbiosEncoder tables;
  tables.add(Support::SmbiosSystem{.manufacturer = " Boxes Inc. ", .product = "Box 3 "});
  tables.end();

  const Tree tree = underHypervisor().firmware(tables).tree();

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "Box 3");
  EXPECT_EQ(textAt(tree, "system", PropSystemManufacturer), "Boxes Inc.");
  EXPECT_TRUE(tree.unread().empty());
}

TEST(SystemModel, OfTheKernelCountsAndTheTablesMayDisagree) {
  Support::SmbiosEncoder tables;
  tables.add(Support::SmbiosSystem{.manufacturer = "", .product = "Box 3"});
  tables.end();

  const Tree tree = machine().file(productName, "Box 4\n").firmware(tables).tree();

  EXPECT_EQ(textAt(tree, "system", PropSystemModel), "Box 4");
  ASSERT_EQ(tree.disagreements().size(), 1U);
  EXPECT_EQ(tree.disagreements()[0], (Disagreement{"system", "SystemModel", "Box 4", "/sys/class/dmi/id/product_name",
                                                   "Box 3", "SMBIOS type 1, handle 0x0010, offset 0x05"}));
}

TEST(SystemModel, WithStrangeBytesIsValidUtf8) {
  EXPECT_EQ(modelOf(machine().file(productName, "Box\xFF\n")), "Box\xEF\xBF\xBD");
}

TEST(SystemName, IsTheKernelsNameOfTheHost) {
  KernelFiles files;
  files.cpus("0").cpu(0, {.package = 0, .core = 0, .siblings = "0"});
  EXPECT_EQ(textAt(files.tree(), "system", PropSystemName), std::nullopt);
  EXPECT_EQ(textAt(files.file("proc/sys/kernel/hostname", "node17.example\n").tree(), "system", PropSystemName),
            "node17.example");
  EXPECT_EQ(textAt(files.file("proc/sys/kernel/hostname", "(none)\n").tree(), "system", PropSystemName), std::nullopt)
      << "the kernel's word for no name";
}

TEST(SystemManufacturer, IsTheFirmwaresVendor) {
  const Tree tree = machine().file(productName, "Box\n").file("sys/class/dmi/id/sys_vendor", "Boxes Inc.\n").tree();

  EXPECT_EQ(textAt(tree, "system", PropSystemManufacturer), "Boxes Inc.");
}

TEST(SystemManufacturer, IsNoPlaceholder) {
  for (const char* text : {"System manufacturer", "To Be Filled By O.E.M.", ""}) {
    const Tree tree = machine().file("sys/class/dmi/id/sys_vendor", text + std::string("\n")).tree();
    EXPECT_EQ(textAt(tree, "system", PropSystemManufacturer), std::nullopt) << text;
  }
  EXPECT_EQ(textAt(machine().tree(), "system", PropSystemManufacturer), std::nullopt);
}

}  // namespace
}  // namespace Tarn::Inventory
