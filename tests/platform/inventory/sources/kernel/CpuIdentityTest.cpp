#include "platform/inventory/sources/kernel/CpuIdentity.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

CpuIdentity identify(const std::string& block) {
  return identifyCpu(CpuInfo("processor\t: 0\n" + block), 0);
}

std::string x86(const std::string& family, const std::string& model, const std::string& stepping) {
  return "vendor_id\t: GenuineIntel\ncpu family\t: " + family + "\nmodel\t\t: " + model +
         "\nmodel name\t: Intel(R) Xeon(R) CPU\nstepping\t: " + stepping +
         "\ncpu MHz\t\t: 2299.998\nflags\t\t: fpu sse2 lm hypervisor\n";
}

TEST(CpuIdentity, IsReadFromABlockOfX86) {
  const CpuIdentity cpu = identify(x86("6", "207", "2"));

  EXPECT_EQ(cpu.architecture, Architecture::X86);
  EXPECT_EQ(cpu.vendor, "GenuineIntel");
  EXPECT_EQ(cpu.name, "Intel(R) Xeon(R) CPU");
  EXPECT_EQ(cpu.stepping, "2");
  EXPECT_EQ(cpu.processorId, "F2 06 0C 00");
  EXPECT_EQ(cpu.family, 179U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(cpu.clockSpeed, 2300U);
  EXPECT_TRUE(cpu.hypervisor);
}

TEST(CpuIdentity, FormsTheX86SignatureFromItsParts) {
  EXPECT_EQ(identify(x86("6", "94", "3")).processorId, "E3 06 05 00");
  EXPECT_EQ(identify(x86("25", "1", "1")).processorId, "11 0F A0 00");
  EXPECT_EQ(identify(x86("15", "6", "1")).processorId, "61 0F 00 00");
  EXPECT_EQ(identify(x86("5", "4", "3")).processorId, "43 05 00 00");
  EXPECT_EQ(identify(x86("6", "94", "unknown")).processorId, "");
  EXPECT_EQ(identify(x86("6", "94", "unknown")).stepping, "");
}

TEST(CpuIdentity, ReadsTheX86WidthFromTheFlags) {
  const std::string begin = "vendor_id\t: x\ncpu family\t: 6\n";
  EXPECT_EQ(identify(begin + "flags\t: fpu lm sse\n").width, 64U);
  EXPECT_EQ(identify(begin + "flags\t: fpu lmx abm xlm\n").width, 32U) << "whole words";
  EXPECT_EQ(identify(begin).width, std::nullopt);
}

TEST(CpuIdentity, LeavesOutAnX86NameThatIsUnknown) {
  EXPECT_EQ(identify("cpu family\t: 6\nmodel name\t: unknown\n").name, "");
}

TEST(CpuIdentity, TakesNoClockSpeedThatIsNone) {
  for (const char* text : {"", "0.000", "-1", "unknown", "1e30", "nan", "99999999999"}) {
    EXPECT_EQ(identify("cpu family\t: 6\ncpu MHz\t: " + std::string(text) + "\n").clockSpeed, std::nullopt) << text;
  }
}

std::string arm(const std::string& part, const std::string& architecture) {
  return "CPU implementer\t: 0x41\nCPU architecture: " + architecture + "\nCPU variant\t: 0x1\nCPU part\t: " + part +
         "\nCPU revision\t: 3\n";
}

TEST(CpuIdentity, IsReadFromABlockOfArm) {
  const CpuIdentity cpu = identify(arm("0xd08", "8"));

  EXPECT_EQ(cpu.architecture, Architecture::Arm);
  EXPECT_EQ(cpu.name, "Cortex-A72");
  EXPECT_EQ(cpu.stepping, "r1p3");
  EXPECT_EQ(cpu.processorId, "83 D0 1F 41");
  EXPECT_EQ(cpu.family, 257U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(cpu.clockSpeed, std::nullopt);
  EXPECT_FALSE(cpu.hypervisor);
}

TEST(CpuIdentity, IsTheArchitecturesForArmPartsThatAreNotKnown) {
  EXPECT_EQ(identify(arm("0xfff", "8")).name, "");
  EXPECT_EQ(identify(arm("0xfff", "9")).family, 257U);
  EXPECT_EQ(identify(arm("0xfff", "7")).family, 256U);
  EXPECT_EQ(identify(arm("0xfff", "7")).width, 32U);
  EXPECT_EQ(identify(arm("0xfff", "5TEJ")).family, 280U);
  EXPECT_EQ(identify(arm("0xfff", "5TEJ")).processorId, "") << "older registers tell their version";
}

TEST(CpuIdentity, IsReadFromABlockOfPowerPc) {
  const CpuIdentity cpu =
      identify("cpu\t\t: POWER9, altivec supported\nclock\t\t: 3425.000000MHz\nrevision\t: 2.2 (pvr 004e 1202)\n");

  EXPECT_EQ(cpu.architecture, Architecture::PowerPc);
  EXPECT_EQ(cpu.name, "POWER9, altivec supported");
  EXPECT_EQ(cpu.stepping, "2.2");
  EXPECT_EQ(cpu.family, 32U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(cpu.clockSpeed, 3425U);
}

CpuIdentity s390(const std::string& block) {
  return identifyCpu(CpuInfo("vendor_id       : IBM/S390\nfeatures\t: esan3 zarch stfle\n"
                             "processor 0: version = FF,  identification = 0123,  machine = 2964\n"
                             "processor 1: version = FF,  identification = 0123,  machine = 3931\n\n"
                             "cpu number      : 0\ncpu MHz dynamic : 5000\n\ncpu number      : 1\n" +
                             block),
                     1);
}

TEST(CpuIdentity, IsReadFromABlockOfS390) {
  const CpuIdentity cpu = s390("cpu MHz dynamic : 5100\ncpu MHz static  : 5200\n");

  EXPECT_EQ(cpu.architecture, Architecture::S390);
  EXPECT_EQ(cpu.vendor, "IBM/S390");
  EXPECT_EQ(cpu.name, "IBM/S390 machine 3931");
  EXPECT_EQ(cpu.family, 204U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(cpu.clockSpeed, 5100U);
}

TEST(CpuIdentity, OfS390WithoutADynamicClockHasTheStaticOne) {
  EXPECT_EQ(s390("cpu MHz static  : 5200\n").clockSpeed, 5200U);
  EXPECT_EQ(s390("").clockSpeed, std::nullopt) << "that of another CPU is not taken";
}

TEST(CpuIdentity, OfS390HasTheMachineOfItsBlockBeforeThatOfTheLine) {
  EXPECT_EQ(s390("machine         : 8561\n").name, "IBM/S390 machine 8561");
  EXPECT_EQ(identifyCpu(CpuInfo("vendor_id : IBM/S390\n\ncpu number : 0\n"), 0).name, "");
}

TEST(CpuIdentity, IsReadFromABlockOfIa64) {
  const CpuIdentity cpu = identify(
      "vendor     : GenuineIntel\narch       : IA-64\nfamily     : 32\nmodel      : 1\n"
      "model name : Dual-Core Intel(R) Itanium(R) Processor 9140M\nrevision   : 1\ncpu MHz    : 1668.999\n");

  EXPECT_EQ(cpu.architecture, Architecture::Ia64);
  EXPECT_EQ(cpu.name, "Dual-Core Intel(R) Itanium(R) Processor 9140M");
  EXPECT_EQ(cpu.stepping, "1");
  EXPECT_EQ(cpu.family, 130U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(cpu.clockSpeed, 1669U);
}

CpuIdentity sparc(const std::string& name, const std::string& clocks) {
  return identifyCpu(CpuInfo("cpu\t\t: " + name + "\ntype\t\t: sun4v\n" + clocks + "State:\nCPU0:\t\tonline\n"), 1);
}

TEST(CpuIdentity, IsReadFromTheTextOfSparc64) {
  const CpuIdentity cpu =
      sparc("UltraSparc T5 (Niagara5)", "Cpu0ClkTck\t: 00000000d693a400\nCpu1ClkTck\t: 000000003b9aca00\n");

  EXPECT_EQ(cpu.architecture, Architecture::Sparc);
  EXPECT_EQ(cpu.name, "UltraSparc T5 (Niagara5)");
  EXPECT_EQ(cpu.family, 80U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(cpu.clockSpeed, 1000U);
}

TEST(CpuIdentity, TakesNoSparcClockThatIsNone) {
  for (const char* text : {"", "0", "xyz", "00000000d693a400 Hz", "ffffffffffffffff", "10000000000000000"}) {
    EXPECT_EQ(sparc("SPARC-M7", "Cpu1ClkTck\t: " + std::string(text) + '\n').clockSpeed, std::nullopt) << text;
  }
  EXPECT_EQ(sparc("SPARC-M7", "Cpu0ClkTck\t: 000000003b9aca00\n").clockSpeed, std::nullopt);
}

TEST(CpuIdentity, IsReadFromABlockOfRiscV) {
  const CpuIdentity cpu = identify("hart\t\t: 1\nisa\t\t: rv64imafdc\nmmu\t\t: sv39\nuarch\t\t: sifive,u74-mc\n");

  EXPECT_EQ(cpu.architecture, Architecture::RiscV);
  EXPECT_EQ(cpu.name, "sifive,u74-mc");
  EXPECT_EQ(cpu.family, 513U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(identify("isa\t: rv32imac\n").family, 512U);
  EXPECT_EQ(identify("isa\t: rv32imac\n").width, 32U);
}

TEST(CpuIdentity, OfRiscVWithoutADesignIsNamedByItsNumbers) {
  const CpuIdentity cpu = identify("isa\t: rv64imac\nmvendorid\t: 0x489\nmarchid\t: 0x7\nmimpid\t: 0x4210427\n");
  EXPECT_EQ(cpu.name, "mvendorid 0x489, marchid 0x7");
  EXPECT_EQ(cpu.stepping, "0x4210427");

  const CpuIdentity unnumbered = identify("isa\t: rv64imac\nmvendorid\t: 0x0\nmarchid\t: 0x0\nmimpid\t: 0x0\n");
  EXPECT_EQ(unnumbered.name, "") << "zero is no maker";
  EXPECT_EQ(unnumbered.stepping, "");
}

TEST(CpuIdentity, IsReadFromABlockOfLoongArch) {
  const CpuIdentity cpu = identify(
      "package\t\t\t: 0\nModel Name\t\t: Loongson-3A5000-HV\nCPU Revision\t\t: 0x11\n"
      "CPU MHz\t\t\t: 2500.00\nISA\t\t\t: loongarch32 loongarch64\n");

  EXPECT_EQ(cpu.architecture, Architecture::LoongArch);
  EXPECT_EQ(cpu.name, "Loongson-3A5000-HV");
  EXPECT_EQ(cpu.family, 600U);
  EXPECT_EQ(cpu.width, 64U);
  EXPECT_EQ(cpu.stepping, "0x11");
  EXPECT_EQ(cpu.clockSpeed, 2500U);
}

TEST(CpuIdentity, OfLoongArchIsRecognizedByItsFamilyAsWell) {
  const CpuIdentity cpu =
      identify("CPU Family\t\t: Loongson-64bit\nModel Name\t\t: Engineering Sample\nCPU MHz : 2000.00\n");

  EXPECT_EQ(cpu.architecture, Architecture::LoongArch);
  EXPECT_EQ(cpu.name, "Engineering Sample");
  EXPECT_EQ(cpu.clockSpeed, 2000U);
}

TEST(CpuIdentity, TakesNoNumberThatItsRegisterCannotHold) {
  EXPECT_EQ(identify(x86("4294967295", "94", "3")).processorId, "");
  EXPECT_EQ(identify(x86("6", "256", "3")).processorId, "");
  EXPECT_EQ(identify(x86("6", "94", "16")).stepping, "");
  EXPECT_EQ(identify(arm("0x1000", "8")).processorId, "");
}

TEST(CpuIdentity, HasBlanksForControlCharacters) {
  const auto x86Name = [](const std::string& name) { return identify("cpu family\t: 6\nmodel name\t: " + name).name; };
  EXPECT_EQ(x86Name("\001Some\tCPU\033[1m 9\177\n"), "Some CPU [1m 9");
  EXPECT_EQ(x86Name("Some CPU\r\n"), "Some CPU");

  const CpuIdentity powerPc = identify("cpu\t: POWER\0339\nclock\t: 3425MHz\nrevision\t: 2\033.2 (pvr)\n");
  EXPECT_EQ(powerPc.name, "POWER 9");
  EXPECT_EQ(powerPc.stepping, "2");
  EXPECT_EQ(identify("isa\t: rv64\nuarch\t: a\010b\n").name, "a b");
  const CpuIdentity loongArch = identify("Model Name\t: Loongson\002X\nCPU Revision\t: 0x\0211\n");
  EXPECT_EQ(loongArch.name, "Loongson X");
  EXPECT_EQ(loongArch.stepping, "0x 1");
}

TEST(CpuIdentity, IsUnknownWhereTheBlockSaysNothing) {
  const CpuIdentity cpu = identify("");

  EXPECT_EQ(cpu.architecture, Architecture::Unknown);
  EXPECT_EQ(cpu.family, 2U);
  EXPECT_EQ(cpu.name, "");
  EXPECT_EQ(cpu.width, std::nullopt);
}

}  // namespace
}  // namespace Tarn::Inventory
