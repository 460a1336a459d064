#include "platform/inventory/sources/kernel/ArmParts.h"

#include <algorithm>
#include <array>
#include <utility>

#include "platform/inventory/sources/kernel/CimFamily.h"

namespace Tarn::Inventory {

namespace {

constexpr std::array parts = {
    ArmPart{0x41, 0x920, CimFamily::arm, "ARM920T"},
    ArmPart{0x41, 0x922, CimFamily::arm, "ARM922T"},
    ArmPart{0x41, 0x926, CimFamily::arm, "ARM926"},
    ArmPart{0x41, 0x946, CimFamily::arm, "ARM946"},
    ArmPart{0x41, 0x966, CimFamily::arm, "ARM966"},
    ArmPart{0x41, 0xB02, CimFamily::arm, "ARM11-MPCore"},
    ArmPart{0x41, 0xB36, CimFamily::arm, "ARM1136"},
    ArmPart{0x41, 0xB56, CimFamily::arm, "ARM1156"},
    ArmPart{0x41, 0xB76, CimFamily::arm, "ARM1176"},
    ArmPart{0x41, 0xC05, CimFamily::armv7, "Cortex-A5"},
    ArmPart{0x41, 0xC07, CimFamily::armv7, "Cortex-A7"},
    ArmPart{0x41, 0xC08, CimFamily::armv7, "Cortex-A8"},
    ArmPart{0x41, 0xC09, CimFamily::armv7, "Cortex-A9"},
    ArmPart{0x41, 0xC0D, CimFamily::armv7, "Cortex-A12"},
    ArmPart{0x41, 0xC0E, CimFamily::armv7, "Cortex-A17"},
    ArmPart{0x41, 0xC0F, CimFamily::armv7, "Cortex-A15"},
    ArmPart{0x41, 0xC14, CimFamily::armv7, "Cortex-R4"},
    ArmPart{0x41, 0xC15, CimFamily::armv7, "Cortex-R5"},
    ArmPart{0x41, 0xC17, CimFamily::armv7, "Cortex-R7"},
    ArmPart{0x41, 0xC18, CimFamily::armv7, "Cortex-R8"},
    ArmPart{0x41, 0xD01, CimFamily::armv8, "Cortex-A32"},
    ArmPart{0x41, 0xD02, CimFamily::armv8, "Cortex-A34"},
    ArmPart{0x41, 0xD03, CimFamily::armv8, "Cortex-A53"},
    ArmPart{0x41, 0xD04, CimFamily::armv8, "Cortex-A35"},
    ArmPart{0x41, 0xD05, CimFamily::armv8, "Cortex-A55"},
    ArmPart{0x41, 0xD06, CimFamily::armv8, "Cortex-A65"},
    ArmPart{0x41, 0xD07, CimFamily::armv8, "Cortex-A57"},
    ArmPart{0x41, 0xD08, CimFamily::armv8, "Cortex-A72"},
    ArmPart{0x41, 0xD09, CimFamily::armv8, "Cortex-A73"},
    ArmPart{0x41, 0xD0A, CimFamily::armv8, "Cortex-A75"},
    ArmPart{0x41, 0xD0B, CimFamily::armv8, "Cortex-A76"},
    ArmPart{0x41, 0xD0C, CimFamily::armv8, "Neoverse-N1"},
    ArmPart{0x41, 0xD0D, CimFamily::armv8, "Cortex-A77"},
    ArmPart{0x41, 0xD0E, CimFamily::armv8, "Cortex-A76AE"},
    ArmPart{0x41, 0xD13, CimFamily::armv8, "Cortex-R52"},
    ArmPart{0x41, 0xD15, CimFamily::armv8, "Cortex-R82"},
    ArmPart{0x41, 0xD40, CimFamily::armv8, "Neoverse-V1"},
    ArmPart{0x41, 0xD41, CimFamily::armv8, "Cortex-A78"},
    ArmPart{0x41, 0xD42, CimFamily::armv8, "Cortex-A78AE"},
    ArmPart{0x41, 0xD43, CimFamily::armv8, "Cortex-A65AE"},
    ArmPart{0x41, 0xD44, CimFamily::armv8, "Cortex-X1"},
    ArmPart{0x41, 0xD46, CimFamily::armv9, "Cortex-A510"},
    ArmPart{0x41, 0xD47, CimFamily::armv9, "Cortex-A710"},
    ArmPart{0x41, 0xD48, CimFamily::armv9, "Cortex-X2"},
    ArmPart{0x41, 0xD49, CimFamily::armv9, "Neoverse-N2"},
    ArmPart{0x41, 0xD4A, CimFamily::armv8, "Neoverse-E1"},
    ArmPart{0x41, 0xD4B, CimFamily::armv8, "Cortex-A78C"},
    ArmPart{0x41, 0xD4C, CimFamily::armv8, "Cortex-X1C"},
    ArmPart{0x41, 0xD4D, CimFamily::armv9, "Cortex-A715"},
    ArmPart{0x41, 0xD4E, CimFamily::armv9, "Cortex-X3"},
    ArmPart{0x41, 0xD4F, CimFamily::armv9, "Neoverse-V2"},
    ArmPart{0x41, 0xD80, CimFamily::armv9, "Cortex-A520"},
    ArmPart{0x41, 0xD81, CimFamily::armv9, "Cortex-A720"},
    ArmPart{0x41, 0xD82, CimFamily::armv9, "Cortex-X4"},
    ArmPart{0x41, 0xD83, CimFamily::armv9, "Neoverse-V3AE"},
    ArmPart{0x41, 0xD84, CimFamily::armv9, "Neoverse-V3"},
    ArmPart{0x41, 0xD85, CimFamily::armv9, "Cortex-X925"},
    ArmPart{0x41, 0xD87, CimFamily::armv9, "Cortex-A725"},
    ArmPart{0x41, 0xD8E, CimFamily::armv9, "Neoverse-N3"},
    ArmPart{0x42, 0x100, CimFamily::armv8, "Brahma-B53"},
    ArmPart{0x42, 0x516, CimFamily::armv8, "ThunderX2"},
    ArmPart{0x43, 0x0A0, CimFamily::armv8, "ThunderX"},
    ArmPart{0x43, 0x0A1, CimFamily::armv8, "ThunderX-88XX"},
    ArmPart{0x43, 0x0A2, CimFamily::armv8, "ThunderX-81XX"},
    ArmPart{0x43, 0x0A3, CimFamily::armv8, "ThunderX-83XX"},
    ArmPart{0x43, 0x0AF, CimFamily::armv8, "ThunderX2-99xx"},
    ArmPart{0x46, 0x001, CimFamily::armv8, "A64FX"},
    ArmPart{0x48, 0xD01, CimFamily::armv8, "TaiShan-v110"},
    ArmPart{0x48, 0xD02, CimFamily::armv8, "TaiShan-v120"},
    ArmPart{0x4E, 0x000, CimFamily::armv8, "Denver"},
    ArmPart{0x4E, 0x003, CimFamily::armv8, "Denver-2"},
    ArmPart{0x4E, 0x004, CimFamily::armv8, "Carmel"},
    ArmPart{0x50, 0x000, CimFamily::armv8, "X-Gene"},
    ArmPart{0x51, 0x04D, CimFamily::armv7, "Krait"},
    ArmPart{0x51, 0x06F, CimFamily::armv7, "Krait"},
    ArmPart{0x51, 0x201, CimFamily::armv8, "Kryo"},
    ArmPart{0x51, 0x205, CimFamily::armv8, "Kryo"},
    ArmPart{0x51, 0x211, CimFamily::armv8, "Kryo"},
    ArmPart{0x51, 0x800, CimFamily::armv8, "Kryo-2XX-Gold"},
    ArmPart{0x51, 0x801, CimFamily::armv8, "Kryo-2XX-Silver"},
    ArmPart{0x51, 0x802, CimFamily::armv8, "Kryo-3XX-Gold"},
    ArmPart{0x51, 0x803, CimFamily::armv8, "Kryo-3XX-Silver"},
    ArmPart{0x51, 0x804, CimFamily::armv8, "Kryo-4XX-Gold"},
    ArmPart{0x51, 0x805, CimFamily::armv8, "Kryo-4XX-Silver"},
    ArmPart{0x51, 0xC00, CimFamily::armv8, "Falkor"},
    ArmPart{0x51, 0xC01, CimFamily::armv8, "Saphira"},
    ArmPart{0x61, 0x022, CimFamily::armv8, "Icestorm-M1"},
    ArmPart{0x61, 0x023, CimFamily::armv8, "Firestorm-M1"},
    ArmPart{0x61, 0x024, CimFamily::armv8, "Icestorm-M1-Pro"},
    ArmPart{0x61, 0x025, CimFamily::armv8, "Firestorm-M1-Pro"},
    ArmPart{0x61, 0x028, CimFamily::armv8, "Icestorm-M1-Max"},
    ArmPart{0x61, 0x029, CimFamily::armv8, "Firestorm-M1-Max"},
    ArmPart{0x61, 0x032, CimFamily::armv8, "Blizzard-M2"},
    ArmPart{0x61, 0x033, CimFamily::armv8, "Avalanche-M2"},
    ArmPart{0x6D, 0xD49, CimFamily::armv9, "Azure-Cobalt-100"},
    ArmPart{0x70, 0x660, CimFamily::armv8, "FTC660"},
    ArmPart{0x70, 0x661, CimFamily::armv8, "FTC661"},
    ArmPart{0x70, 0x662, CimFamily::armv8, "FTC662"},
    ArmPart{0x70, 0x663, CimFamily::armv8, "FTC663"},
    ArmPart{0x70, 0x664, CimFamily::armv8, "FTC664"},
    ArmPart{0xC0, 0xAC3, CimFamily::armv8, "Ampere-1"},
    ArmPart{0xC0, 0xAC4, CimFamily::armv8, "Ampere-1a"},
};

constexpr std::pair<unsigned int, unsigned int> keyOf(const ArmPart& part) {
  return {part.implementer, part.part};
}
static_assert(std::ranges::is_sorted(parts, {}, keyOf));

}  // namespace

std::span<const ArmPart> armParts() {
  return parts;
}

const ArmPart* findArmPart(unsigned int implementer, unsigned int part) {
  const std::pair wanted(implementer, part);
  const auto* const found = std::ranges::lower_bound(parts, wanted, {}, keyOf);
  return found == parts.end() || keyOf(*found) != wanted ? nullptr : &*found;
}

}  // namespace Tarn::Inventory
