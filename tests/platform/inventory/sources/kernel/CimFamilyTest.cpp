#include "platform/inventory/sources/kernel/CimFamily.h"

#include <gtest/gtest.h>

#include <string>

namespace Tarn::Inventory {
namespace {

TEST(CimFamily, EveryRowIsReached) {
  for (const FamilyRow& row : familyTable()) {
    EXPECT_EQ(cimFamily(row.vendor, row.brand, row.family, row.model), row.code)
        << row.vendor << ' ' << row.brand << ' ' << row.family << ' ' << row.model;
    EXPECT_EQ(cimFamily(row.vendor, "x(R) " + std::string(row.brand) + "(TM) 9999", row.family, row.model), row.code)
        << row.vendor << ' ' << row.brand << ' ' << row.family << ' ' << row.model;
    EXPECT_EQ(cimFamily("Nobody", row.brand, row.family, row.model), CimFamily::unknown);
  }
}

struct Known {
  const char* vendor;
  const char* name;
  int family;
  int model;
  unsigned int code;
};

TEST(CimFamily, KnowsTheNamesThatProcessorsBear) {
  const Known known[] = {
      {"GenuineIntel", "Intel(R) Xeon(R) Processor", 6, 207, 179},
      {"GenuineIntel", "Intel(R) Xeon(R) Gold 6334 CPU @ 3.60GHz", 6, 106, 179},
      {"GenuineIntel", "Intel(R) Xeon(R) CPU D-1541 @ 2.10GHz", 6, 86, 179},
      {"GenuineIntel", "Intel(R) Xeon(R) D-2146NT CPU @ 2.30GHz", 6, 85, 208},
      {"GenuineIntel", "12th Gen Intel(R) Core(TM) i7-12700H", 6, 154, 198},
      {"GenuineIntel", "Intel Core i7 9xx (Nehalem Class Core i7)", 6, 26, 198},
      {"GenuineIntel", "Intel(R) Core(TM) i9-9900K CPU @ 3.60GHz", 6, 158, 207},
      {"GenuineIntel", "Intel(R) Core(TM) i5 CPU       M 520  @ 2.40GHz", 6, 37, 205},
      {"GenuineIntel", "Intel(R) Core(TM) i3-8100 CPU @ 3.60GHz", 6, 158, 206},
      {"GenuineIntel", "Intel(R) Core(TM) m3-7Y30 CPU @ 1.00GHz", 6, 142, 45},
      {"GenuineIntel", "Intel(R) Core(TM) M-5Y71 CPU @ 1.20GHz", 6, 61, 44},
      {"GenuineIntel", "Intel(R) Core(TM)2 Duo CPU     E8400  @ 3.00GHz", 6, 23, 191},
      {"GenuineIntel", "Intel(R) Core(TM)2 Quad CPU    Q6600  @ 2.40GHz", 6, 15, 194},
      {"GenuineIntel", "Genuine Intel(R) CPU           T2300  @ 1.66GHz", 6, 14, 40},
      {"GenuineIntel", "Intel(R) Celeron(R) N4020 CPU @ 1.10GHz", 6, 122, 15},
      {"GenuineIntel", "Intel(R) Pentium(R) Dual  CPU  E2180  @ 2.00GHz", 6, 15, 11},
      {"GenuineIntel", "Intel(R) Pentium(R) D CPU 2.80GHz", 15, 4, 187},
      {"GenuineIntel", "Intel(R) Pentium(R) 4 CPU 3.00GHz", 15, 4, 178},
      {"GenuineIntel", "Pentium III (Coppermine)", 6, 8, 17},
      {"GenuineIntel", "Pentium MMX", 5, 4, 14},
      {"GenuineIntel", "Intel(R) Atom(TM) CPU  330   @ 1.60GHz", 6, 28, 43},
      {"GenuineIntel", "Genuine Intel(R) CPU 0000%@", 6, 85, 179},
      {"GenuineIntel", "Intel(R) N100", 6, 190, 2},
      {"GenuineIntel", "Common KVM processor", 15, 6, 178},
      {"AuthenticAMD", "AMD EPYC 7763 64-Core Processor", 25, 1, 107},
      {"AuthenticAMD", "AMD EPYC-Rome Processor", 23, 49, 107},
      {"AuthenticAMD", "AMD Ryzen 7 5800X 8-Core Processor", 25, 33, 107},
      {"AuthenticAMD", "AMD Eng Sample: 100-000000", 26, 2, 107},
      {"AuthenticAMD", "AMD Athlon(tm) 64 X2 Dual Core Processor 4400+", 15, 75, 136},
      {"AuthenticAMD", "AMD Athlon(tm) II X2 250 Processor", 16, 6, 237},
      {"AuthenticAMD", "AMD Athlon(tm) 64 Processor 3200+", 15, 47, 131},
      {"AuthenticAMD", "AMD Athlon(tm) XP 2500+", 6, 10, 182},
      {"AuthenticAMD", "AMD Opteron(tm) Processor 246", 15, 5, 132},
      {"AuthenticAMD", "Dual-Core AMD Opteron(tm) Processor 2218", 15, 65, 135},
      {"AuthenticAMD", "Quad-Core AMD Opteron(tm) Processor 2352", 16, 2, 138},
      {"AuthenticAMD", "Six-Core AMD Opteron(tm) Processor 2435", 16, 8, 238},
      {"AuthenticAMD", "AMD Opteron(tm) Processor 6172", 16, 9, 59},
      {"AuthenticAMD", "AMD Opteron(tm) Processor 6274", 21, 1, 61},
      {"AuthenticAMD", "AMD FX(tm)-8350 Eight-Core Processor", 21, 2, 63},
      {"AuthenticAMD", "AMD A10-7850K APU with Radeon(TM) R7 Graphics", 21, 48, 72},
      {"AuthenticAMD", "AMD Phenom(tm) II X4 955 Processor", 16, 4, 236},
      {"AuthenticAMD", "AMD-K6(tm) 3D processor", 5, 8, 27},
      {"CentaurHauls", "VIA Nano processor U2250 (1.6GHz Capable)", 6, 15, 217},
      {"CentaurHauls", "VIA C7-M Processor 1200MHz", 6, 13, 210},
      {"HygonGenuine", "Hygon C86 7185 32-core Processor", 24, 0, 2},
      {"PowerPC", "POWER9, altivec supported", -1, -1, 32},
      {"PowerPC", "Cell Broadband Engine, altivec supported", -1, -1, 1},
      {"IBM/S390", "", -1, -1, 204},
      {"RISC-V 64", "sifive,u74-mc", -1, -1, 513},
      {"IA-64", "Dual-Core Intel(R) Itanium(R) Processor 9140M", -1, -1, 130},
      {"SPARC", "UltraSparc T5 (Niagara5)", -1, -1, 80},
      {"SPARC", "TI UltraSparc I   (SpitFire)", -1, -1, 84},
      {"SPARC", "TI UltraSparc II  (BlackBird)", -1, -1, 85},
      {"SPARC", "TI UltraSparc IIi (Sabre)", -1, -1, 86},
      {"SPARC", "TI UltraSparc III+ (Cheetah+)", -1, -1, 87},
      {"SPARC", "TI UltraSparc IIIi (Jalapeno)", -1, -1, 88},
  };
  for (const Known& row : known) {
    EXPECT_EQ(cimFamily(row.vendor, row.name, row.family, row.model), row.code) << row.name;
  }
}

}  // namespace
}  // namespace Tarn::Inventory
