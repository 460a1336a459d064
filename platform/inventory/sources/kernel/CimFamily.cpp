#include "platform/inventory/sources/kernel/CimFamily.h"

#include <algorithm>
#include <array>
#include <string>
#include <tuple>

namespace Tarn::Inventory {

namespace {

constexpr int any = FamilyRow::any;

constexpr std::array rows = {
    FamilyRow{"AuthenticAMD", "", 23, any, 107},
    FamilyRow{"AuthenticAMD", "", 25, any, 107},
    FamilyRow{"AuthenticAMD", "", 26, any, 107},
    FamilyRow{"AuthenticAMD", "A10-", any, any, 72},
    FamilyRow{"AuthenticAMD", "A12-", any, any, 72},
    FamilyRow{"AuthenticAMD", "A4-", any, any, 72},
    FamilyRow{"AuthenticAMD", "A6-", any, any, 72},
    FamilyRow{"AuthenticAMD", "A8-", any, any, 72},
    FamilyRow{"AuthenticAMD", "A9-", any, any, 72},
    FamilyRow{"AuthenticAMD", "AMD C-", any, any, 70},
    FamilyRow{"AuthenticAMD", "AMD E-", any, any, 71},
    FamilyRow{"AuthenticAMD", "AMD E1-", any, any, 71},
    FamilyRow{"AuthenticAMD", "AMD E2-", any, any, 71},
    FamilyRow{"AuthenticAMD", "AMD FX-", any, any, 63},
    FamilyRow{"AuthenticAMD", "AMD G-T", any, any, 73},
    FamilyRow{"AuthenticAMD", "AMD R-", any, any, 75},
    FamilyRow{"AuthenticAMD", "AMD Z-", any, any, 74},
    FamilyRow{"AuthenticAMD", "Athlon", any, any, 29},
    FamilyRow{"AuthenticAMD", "Athlon 64", any, any, 131},
    FamilyRow{"AuthenticAMD", "Athlon 64 X2", any, any, 136},
    FamilyRow{"AuthenticAMD", "Athlon Dual Core", any, any, 234},
    FamilyRow{"AuthenticAMD", "Athlon II", any, any, 237},
    FamilyRow{"AuthenticAMD", "Athlon MP", any, any, 183},
    FamilyRow{"AuthenticAMD", "Athlon X2", any, any, 143},
    FamilyRow{"AuthenticAMD", "Athlon XP", any, any, 182},
    FamilyRow{"AuthenticAMD", "Dual Core AMD Opteron", any, any, 135},
    FamilyRow{"AuthenticAMD", "Dual-Core AMD Opteron", any, any, 135},
    FamilyRow{"AuthenticAMD", "Duron", any, any, 24},
    FamilyRow{"AuthenticAMD", "EPYC", any, any, 107},
    FamilyRow{"AuthenticAMD", "K5", any, any, 25},
    FamilyRow{"AuthenticAMD", "K6", any, any, 26},
    FamilyRow{"AuthenticAMD", "K6 3D", any, any, 27},
    FamilyRow{"AuthenticAMD", "K6-III", any, any, 28},
    FamilyRow{"AuthenticAMD", "Opteron", any, any, 132},
    FamilyRow{"AuthenticAMD", "Opteron", 16, any, 139},
    FamilyRow{"AuthenticAMD", "Opteron Processor 33", any, any, 78},
    FamilyRow{"AuthenticAMD", "Opteron Processor 41", any, any, 60},
    FamilyRow{"AuthenticAMD", "Opteron Processor 42", any, any, 62},
    FamilyRow{"AuthenticAMD", "Opteron Processor 43", any, any, 76},
    FamilyRow{"AuthenticAMD", "Opteron Processor 61", any, any, 59},
    FamilyRow{"AuthenticAMD", "Opteron Processor 62", any, any, 61},
    FamilyRow{"AuthenticAMD", "Opteron Processor 63", any, any, 77},
    FamilyRow{"AuthenticAMD", "Opteron X1", any, any, 102},
    FamilyRow{"AuthenticAMD", "Opteron X2", any, any, 103},
    FamilyRow{"AuthenticAMD", "Opteron X3", any, any, 105},
    FamilyRow{"AuthenticAMD", "Phenom 8", any, any, 231},
    FamilyRow{"AuthenticAMD", "Phenom 9", any, any, 141},
    FamilyRow{"AuthenticAMD", "Phenom FX", any, any, 140},
    FamilyRow{"AuthenticAMD", "Phenom II", any, any, 236},
    FamilyRow{"AuthenticAMD", "Quad-Core AMD Opteron", any, any, 138},
    FamilyRow{"AuthenticAMD", "Ryzen", any, any, 107},
    FamilyRow{"AuthenticAMD", "Sempron", any, any, 133},
    FamilyRow{"AuthenticAMD", "Six-Core AMD Opteron", any, any, 238},
    FamilyRow{"AuthenticAMD", "Threadripper", any, any, 107},
    FamilyRow{"AuthenticAMD", "Turion 64", any, any, 134},
    FamilyRow{"AuthenticAMD", "Turion 64 X2", any, any, 137},
    FamilyRow{"AuthenticAMD", "Turion Dual-Core", any, any, 233},
    FamilyRow{"AuthenticAMD", "Turion II", any, any, 57},
    FamilyRow{"AuthenticAMD", "Turion II Ultra", any, any, 56},
    FamilyRow{"AuthenticAMD", "Turion X2 Ultra", any, any, 232},
    FamilyRow{"CentaurHauls", "C7", any, any, 212},
    FamilyRow{"CentaurHauls", "C7-D", any, any, 211},
    FamilyRow{"CentaurHauls", "C7-M", any, any, 210},
    FamilyRow{"CentaurHauls", "Eden", any, any, 213},
    FamilyRow{"CentaurHauls", "Nano", any, any, 217},
    FamilyRow{"CentaurHauls", "WinChip", any, any, 320},
    FamilyRow{"CyrixInstead", "6x86", any, any, 300},
    FamilyRow{"CyrixInstead", "MediaGX", any, any, 301},
    FamilyRow{"GenuineIntel", "", 4, any, 6},
    FamilyRow{"GenuineIntel", "", 5, any, 11},
    FamilyRow{"GenuineIntel", "", 6, 46, 179},
    FamilyRow{"GenuineIntel", "", 6, 47, 179},
    FamilyRow{"GenuineIntel", "", 6, 62, 179},
    FamilyRow{"GenuineIntel", "", 6, 63, 179},
    FamilyRow{"GenuineIntel", "", 6, 79, 179},
    FamilyRow{"GenuineIntel", "", 6, 85, 179},
    FamilyRow{"GenuineIntel", "", 6, 106, 179},
    FamilyRow{"GenuineIntel", "", 6, 108, 179},
    FamilyRow{"GenuineIntel", "", 6, 143, 179},
    FamilyRow{"GenuineIntel", "", 6, 173, 179},
    FamilyRow{"GenuineIntel", "", 6, 174, 179},
    FamilyRow{"GenuineIntel", "", 6, 175, 179},
    FamilyRow{"GenuineIntel", "", 6, 207, 179},
    FamilyRow{"GenuineIntel", "", 15, any, 178},
    FamilyRow{"GenuineIntel", "Atom", any, any, 43},
    FamilyRow{"GenuineIntel", "Celeron", any, any, 15},
    FamilyRow{"GenuineIntel", "Celeron D", any, any, 186},
    FamilyRow{"GenuineIntel", "Celeron Dual-Core", any, any, 199},
    FamilyRow{"GenuineIntel", "Celeron M", any, any, 20},
    FamilyRow{"GenuineIntel", "Core Duo", any, any, 40},
    FamilyRow{"GenuineIntel", "Core M-", any, any, 44},
    FamilyRow{"GenuineIntel", "Core Solo", any, any, 189},
    FamilyRow{"GenuineIntel", "Core i3", any, any, 206},
    FamilyRow{"GenuineIntel", "Core i5", any, any, 205},
    FamilyRow{"GenuineIntel", "Core i7", any, any, 198},
    FamilyRow{"GenuineIntel", "Core i9", any, any, 207},
    FamilyRow{"GenuineIntel", "Core m3", any, any, 45},
    FamilyRow{"GenuineIntel", "Core m5", any, any, 46},
    FamilyRow{"GenuineIntel", "Core m7", any, any, 47},
    FamilyRow{"GenuineIntel", "Core2", any, any, 191},
    FamilyRow{"GenuineIntel", "Core2 Duo", any, any, 191},
    FamilyRow{"GenuineIntel", "Core2 Extreme", any, any, 193},
    FamilyRow{"GenuineIntel", "Core2 Quad", any, any, 194},
    FamilyRow{"GenuineIntel", "Core2 Solo", any, any, 192},
    FamilyRow{"GenuineIntel", "Genuine Intel CPU T1", any, any, 189},
    FamilyRow{"GenuineIntel", "Genuine Intel CPU T2", any, any, 40},
    FamilyRow{"GenuineIntel", "Pentium", any, any, 11},
    FamilyRow{"GenuineIntel", "Pentium 4", any, any, 178},
    FamilyRow{"GenuineIntel", "Pentium D", any, any, 187},
    FamilyRow{"GenuineIntel", "Pentium Dual", any, any, 11},
    FamilyRow{"GenuineIntel", "Pentium Extreme", any, any, 188},
    FamilyRow{"GenuineIntel", "Pentium II", any, any, 13},
    FamilyRow{"GenuineIntel", "Pentium III", any, any, 17},
    FamilyRow{"GenuineIntel", "Pentium III Xeon", any, any, 176},
    FamilyRow{"GenuineIntel", "Pentium M", any, any, 185},
    FamilyRow{"GenuineIntel", "Pentium MMX", any, any, 14},
    FamilyRow{"GenuineIntel", "Pentium Pro", any, any, 12},
    FamilyRow{"GenuineIntel", "Xeon", any, any, 179},
    FamilyRow{"GenuineIntel", "Xeon D-", any, any, 208},
    FamilyRow{"GenuineIntel", "Xeon MP", any, any, 181},
    FamilyRow{"GenuineTMx86", "Crusoe", any, any, 120},
    FamilyRow{"GenuineTMx86", "Efficeon", any, any, 121},
    FamilyRow{"IA-64", "", any, any, 130},
    FamilyRow{"IBM/S390", "", any, any, 204},
    FamilyRow{"Loongson", "", any, any, 600},
    FamilyRow{"PowerPC", "", any, any, 32},
    FamilyRow{"PowerPC", "601", any, any, 33},
    FamilyRow{"PowerPC", "603", any, any, 34},
    FamilyRow{"PowerPC", "604", any, any, 36},
    FamilyRow{"PowerPC", "620", any, any, 37},
    FamilyRow{"PowerPC", "740/750", any, any, 39},
    FamilyRow{"PowerPC", "750", any, any, 39},
    FamilyRow{"PowerPC", "Cell Broadband Engine", any, any, CimFamily::other},
    FamilyRow{"RISC-V 32", "", any, any, 512},
    FamilyRow{"RISC-V 64", "", any, any, 513},
    FamilyRow{"SPARC", "", any, any, 80},
    FamilyRow{"SPARC", "UltraSparc I (", any, any, 84},
    FamilyRow{"SPARC", "UltraSparc II", any, any, 85},
    FamilyRow{"SPARC", "UltraSparc III", any, any, 87},
    FamilyRow{"SPARC", "UltraSparc IIIi", any, any, 88},
    FamilyRow{"SPARC", "UltraSparc IIi", any, any, 86},
};

constexpr auto keyOf(const FamilyRow& row) {
  return std::tuple(row.vendor, row.brand, row.family, row.model);
}
static_assert(std::ranges::is_sorted(rows, {}, [](const FamilyRow& row) { return keyOf(row); }));

// "Intel(R) Core(TM) i7 CPU" and "Intel Core i7" are one brand; some names are filled up with blanks.
std::string withoutMarks(std::string_view name) {
  std::string plain;
  while (!name.empty()) {
    const std::size_t close = name.front() == '(' ? name.find(')') : std::string_view::npos;
    const std::string_view mark = name.substr(0, close == std::string_view::npos ? 0 : close + 1);
    if (mark == "(R)" || mark == "(r)" || mark == "(TM)" || mark == "(tm)") {
      name.remove_prefix(mark.size());
      continue;
    }
    if (name.front() != ' ' || !plain.ends_with(' ')) {
      plain += name.front();
    }
    name.remove_prefix(1);
  }
  return plain;
}

bool fits(int wanted, int actual) {
  return wanted == any || wanted == actual;
}

}  // namespace

std::span<const FamilyRow> familyTable() {
  return rows;
}

const FamilyRow* findFamilyRow(std::string_view vendor, std::string_view name, int family, int model) {
  const std::string plain = withoutMarks(name);
  const auto weight = [](const FamilyRow& row) {
    return std::tuple(row.brand.size(), row.family != any, row.model != any);
  };
  const FamilyRow* best = nullptr;
  for (const FamilyRow& row : rows) {
    const bool matches = row.vendor == vendor && plain.find(row.brand) != std::string::npos &&
                         fits(row.family, family) && fits(row.model, model);
    if (matches && (best == nullptr || weight(row) > weight(*best))) {
      best = &row;
    }
  }
  return best;
}

unsigned int cimFamily(std::string_view vendor, std::string_view name, int family, int model) {
  const FamilyRow* row = findFamilyRow(vendor, name, family, model);
  return row == nullptr ? CimFamily::unknown : row->code;
}

}  // namespace Tarn::Inventory
