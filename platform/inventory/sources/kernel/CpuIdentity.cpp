#include "platform/inventory/sources/kernel/CpuIdentity.h"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <string_view>

#include "platform/base/Hex.h"
#include "platform/inventory/tree/PlainText.h"

namespace Tarn::Inventory {

namespace {

constexpr unsigned int fastestClock = 1'000'000;  // MHz; from here on a number is no clock

/// The fields of one CPU.
class Fields {
 public:
  Fields(const CpuInfo& info, unsigned int cpu) : info_(info), cpu_(cpu) {}

  std::string_view operator[](std::string_view name) const { return info_.field(cpu_, name); }

  /// A field that clients see.
  std::string text(std::string_view name) const { return plainText((*this)[name]); }

  /// Decimal, or hexadecimal after 0x; what stands after the digits is skipped. A larger number than the most
  /// that the field can hold is none.
  std::optional<unsigned int> number(std::string_view name, unsigned int most) const {
    std::string_view text = (*this)[name];
    const int base = text.starts_with("0x") ? 16 : 10;
    text.remove_prefix(base == 16 ? 2 : 0);
    unsigned int value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, base);
    return error == std::errc() && value <= most ? std::optional(value) : std::nullopt;
  }

  /// A text of the field's that is a number other than zero.
  std::string identifier(std::string_view name) const {
    const std::string_view text = (*this)[name];
    return text.find_first_not_of("0x") == std::string_view::npos ? std::string() : plainText(text);
  }

  /// A number of Hz in hexadecimal, in MHz, rounded.
  std::optional<unsigned int> megahertzOfHertz(std::string_view name) const {
    constexpr std::uint64_t megahertz = 1'000'000;
    const std::string_view text = (*this)[name];
    std::uint64_t hertz = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), hertz, 16);
    const std::uint64_t speed = hertz / megahertz + (hertz % megahertz >= megahertz / 2 ? 1 : 0);
    const bool isUsable =
        error == std::errc() && end == text.data() + text.size() && speed >= 1 && speed < fastestClock;
    return isUsable ? std::optional(static_cast<unsigned int>(speed)) : std::nullopt;
  }

  /// A number of MHz, such as "2299.998" or "3425.000000MHz", rounded.
  std::optional<unsigned int> megahertz(std::string_view name) const {
    const std::string_view text = (*this)[name];
    double value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, std::chars_format::fixed);
    const std::string_view unit = text.substr(static_cast<std::size_t>(end - text.data()));
    const bool usable = error == std::errc() && value >= 1 && value < fastestClock && (unit.empty() || unit == "MHz");
    return usable ? std::optional(static_cast<unsigned int>(std::lround(value))) : std::nullopt;
  }

  bool hasWord(std::string_view name, std::string_view word) const {
    std::string_view text = (*this)[name];
    while (!text.empty()) {
      const std::size_t end = std::min(text.find(' '), text.size());
      if (text.substr(0, end) == word) {
        return true;
      }
      text.remove_prefix(std::min(end + 1, text.size()));
    }
    return false;
  }

 private:
  const CpuInfo& info_;
  unsigned int cpu_;
};

// The register's bytes from the lowest on, in hexadecimal, as SMBIOS tables are printed.
std::string registerText(unsigned int value) {
  std::string text;
  for (unsigned int shift = 0; shift < 32; shift += 8) {
    text += text.empty() ? "" : " ";
    Common::appendHex(text, static_cast<unsigned char>((value >> shift) & 0xFFU), Common::hexCapitals);
  }
  return text;
}

void setFamily(CpuIdentity& cpu, int family = FamilyRow::any, int model = FamilyRow::any) {
  cpu.familyRow = findFamilyRow(cpu.vendor, cpu.name, family, model);
  cpu.family = cpu.familyRow == nullptr ? CimFamily::unknown : cpu.familyRow->code;
}

// CPUID keeps what exceeds family 15 and model 15 in fields of their own.
unsigned int x86Signature(unsigned int family, unsigned int model, unsigned int stepping) {
  const unsigned int extendedFamily = family > 0xF ? family - 0xF : 0;
  return (stepping & 0xFU) | (model & 0xFU) << 4U | (family - extendedFamily) << 8U | (model >> 4U & 0xFU) << 16U |
         extendedFamily << 20U;
}

void identifyX86(const Fields& fields, CpuIdentity& cpu) {
  const auto family = fields.number("cpu family", 0xF + 0xFF);
  const auto model = fields.number("model", 0xFF);
  const auto stepping = fields.number("stepping", 0xF);
  const auto known = [](std::optional<unsigned int> number) {
    return number ? static_cast<int>(*number) : FamilyRow::any;
  };
  cpu.name = fields["model name"] == "unknown" ? std::string() : fields.text("model name");
  setFamily(cpu, known(family), known(model));
  cpu.stepping = stepping ? std::to_string(*stepping) : std::string();
  if (family && model && stepping) {
    cpu.processorId = registerText(x86Signature(*family, *model, *stepping));
  }
  if (!fields["flags"].empty()) {
    cpu.width = fields.hasWord("flags", "lm") ? 64 : 32;
  }
  cpu.clockSpeed = fields.megahertz("cpu MHz");
  cpu.hypervisor = fields.hasWord("flags", "hypervisor");
}

unsigned int armFamily(const ArmPart* part, unsigned int version) {
  if (part != nullptr) {
    return part->family;
  }
  return version >= 8 ? CimFamily::armv8 : version == 7 ? CimFamily::armv7 : CimFamily::arm;
}

void identifyArm(const Fields& fields, CpuIdentity& cpu) {
  const auto implementer = fields.number("CPU implementer", 0xFF);
  const auto part = fields.number("CPU part", 0xFFF);
  const auto variant = fields.number("CPU variant", 0xF);
  const auto revision = fields.number("CPU revision", 0xF);
  const auto version = fields.number("CPU architecture", 0xFF);
  const ArmPart* known = implementer && part ? findArmPart(*implementer, *part) : nullptr;
  cpu.armPart = known;
  cpu.name = known != nullptr ? known->name : std::string_view();
  if (version) {
    cpu.family = armFamily(known, *version);
    cpu.width = *version >= 8 ? 64 : 32;
  }
  if (variant && revision) {
    cpu.stepping = "r" + std::to_string(*variant) + "p" + std::to_string(*revision);
  }
  if (implementer && part && variant && revision && version && *version >= 7) {
    // From version 7 on the register's own version field says "see elsewhere".
    cpu.processorId = registerText(*implementer << 24U | *variant << 20U | 0xFU << 16U | *part << 4U | *revision);
  }
}

void identifyPowerPc(const Fields& fields, CpuIdentity& cpu) {
  cpu.vendor = "PowerPC";
  cpu.name = fields.text("cpu");
  setFamily(cpu);
  const std::string revision = fields.text("revision");
  cpu.stepping = revision.substr(0, revision.find(' '));
  cpu.clockSpeed = fields.megahertz("clock");
  if (cpu.name.starts_with("POWER")) {
    cpu.width = 64;
  }
}

void identifyIa64(const Fields& fields, CpuIdentity& cpu) {
  cpu.vendor = "IA-64";
  cpu.name = fields.text("model name");
  setFamily(cpu);
  cpu.stepping = fields.text("revision");
  cpu.width = 64;
  cpu.clockSpeed = fields.megahertz("cpu MHz");
}

// The machine's type is a field of the CPU's block, or in older kernels a part of a line for each CPU:
// "processor 0: version = FF,  identification = 0133E8,  machine = 2964".
std::string s390Machine(const Fields& fields) {
  std::string machine = fields.text("machine");
  if (machine.empty()) {
    constexpr std::string_view mark = "machine = ";
    const std::string line = fields.text("processor *");
    const std::size_t found = line.find(mark);
    machine = found == std::string::npos ? std::string() : line.substr(found + mark.size());
  }
  return machine;
}

void identifyS390(const Fields& fields, CpuIdentity& cpu) {
  setFamily(cpu);
  const std::string machine = s390Machine(fields);
  cpu.name = machine.empty() ? std::string() : cpu.vendor + " machine " + machine;
  cpu.width = fields.hasWord("features", "zarch") ? 64 : 31;
  cpu.clockSpeed = fields.megahertz("cpu MHz dynamic");
  if (!cpu.clockSpeed) {
    cpu.clockSpeed = fields.megahertz("cpu MHz static");
  }
}

void identifyRiscV(const Fields& fields, CpuIdentity& cpu) {
  const bool is64 = fields["isa"].starts_with("rv64");
  cpu.vendor = is64 ? "RISC-V 64" : "RISC-V 32";
  cpu.name = fields.text("uarch");
  if (const std::string maker = fields.identifier("mvendorid"); cpu.name.empty() && !maker.empty()) {
    cpu.name = "mvendorid " + maker + ", marchid " + fields.text("marchid");
  }
  setFamily(cpu);
  cpu.stepping = fields.identifier("mimpid");
  cpu.width = is64 ? 64 : 32;
}

void identifySparc(const Fields& fields, CpuIdentity& cpu) {
  cpu.vendor = "SPARC";
  cpu.name = fields.text("cpu");
  setFamily(cpu);
  cpu.width = 64;
  cpu.clockSpeed = fields.megahertzOfHertz("Cpu*ClkTck");
}

void identifyLoongArch(const Fields& fields, CpuIdentity& cpu) {
  cpu.vendor = "Loongson";
  cpu.name = fields.text("Model Name");
  setFamily(cpu);
  cpu.stepping = fields.text("CPU Revision");
  cpu.width = fields["ISA"].find("loongarch64") != std::string_view::npos ? 64 : 32;
  cpu.clockSpeed = fields.megahertz("CPU MHz");
}

/// How an architecture's cpuinfo is recognized: by a field that it has, and how this field begins.
struct Dialect {
  std::string_view field;
  std::string_view begin;
  Architecture architecture;
  void (*identify)(const Fields& fields, CpuIdentity& cpu);
};
constexpr std::array dialects = {
    Dialect{"vendor_id", "IBM/S390", Architecture::S390, identifyS390},
    Dialect{"arch", "IA-64", Architecture::Ia64, identifyIa64},
    Dialect{"type", "sun4u", Architecture::Sparc, identifySparc},
    Dialect{"type", "sun4v", Architecture::Sparc, identifySparc},
    Dialect{"cpu family", "", Architecture::X86, identifyX86},
    Dialect{"CPU implementer", "0x", Architecture::Arm, identifyArm},
    Dialect{"isa", "rv", Architecture::RiscV, identifyRiscV},
    Dialect{"CPU Family", "Loongson", Architecture::LoongArch, identifyLoongArch},
    Dialect{"Model Name", "Loongson", Architecture::LoongArch, identifyLoongArch},
    Dialect{"clock", "", Architecture::PowerPc, identifyPowerPc},
    Dialect{"timebase", "", Architecture::PowerPc, identifyPowerPc},
};

}  // namespace

CpuIdentity identifyCpu(const CpuInfo& info, unsigned int cpu) {
  const Fields fields(info, cpu);
  CpuIdentity identity;
  for (const Dialect& dialect : dialects) {
    const std::string_view value = fields[dialect.field];
    if (!value.empty() && value.starts_with(dialect.begin)) {
      identity.architecture = dialect.architecture;
      identity.vendor = fields.text("vendor_id");
      dialect.identify(fields, identity);
      break;
    }
  }
  return identity;
}

}  // namespace Tarn::Inventory
