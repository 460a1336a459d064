#include "platform/inventory/sources/kernel/ArmParts.h"

#include <gtest/gtest.h>

#include "platform/inventory/sources/kernel/CpuIdentity.h"

namespace Tarn::Inventory {
namespace {

std::string hexadecimal(unsigned int number) {
  char text[16];
  std::snprintf(text, sizeof text, "0x%x", number);
  return text;
}

TEST(ArmParts, EveryRowIsFound) {
  for (const ArmPart& part : armParts()) {
    EXPECT_EQ(findArmPart(part.implementer, part.part), &part) << part.name;
  }
  EXPECT_EQ(findArmPart(0x41, 0xFFF), nullptr);
  EXPECT_EQ(findArmPart(0xFF, 0xD03), nullptr);
  EXPECT_EQ(findArmPart(0, 0), nullptr);
}

TEST(ArmParts, EveryRowNamesTheCpuThatTellsItsNumbers) {
  for (const ArmPart& part : armParts()) {
    const CpuInfo info("processor\t: 0\nCPU implementer\t: " + hexadecimal(part.implementer) +
                       "\nCPU architecture: 8\nCPU part\t: " + hexadecimal(part.part) + "\n");
    const CpuIdentity cpu = identifyCpu(info, 0);
    EXPECT_EQ(cpu.name, part.name);
    EXPECT_EQ(cpu.family, part.family) << part.name;
  }
}

TEST(ArmParts, FamiliesAreThoseOfTheArchitectureVersions) {
  struct Row {
    unsigned int implementer, part, family;
    const char* name;
  };
  const Row expected[] = {
      {0x41, 0xB76, 280, "ARM1176"},     {0x41, 0xC07, 256, "Cortex-A7"},    {0x41, 0xD03, 257, "Cortex-A53"},
      {0x41, 0xD08, 257, "Cortex-A72"},  {0x41, 0xD0C, 257, "Neoverse-N1"},  {0x41, 0xD40, 257, "Neoverse-V1"},
      {0x41, 0xD47, 258, "Cortex-A710"}, {0x41, 0xD49, 258, "Neoverse-N2"},  {0x41, 0xD4F, 258, "Neoverse-V2"},
      {0x46, 0x001, 257, "A64FX"},       {0x48, 0xD01, 257, "TaiShan-v110"}, {0xC0, 0xAC3, 257, "Ampere-1"},
  };
  for (const Row& row : expected) {
    const ArmPart* part = findArmPart(row.implementer, row.part);
    ASSERT_NE(part, nullptr) << row.name;
    EXPECT_EQ(part->name, row.name);
    EXPECT_EQ(part->family, row.family) << row.name;
  }
}

}  // namespace
}  // namespace Tarn::Inventory
