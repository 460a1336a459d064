#include "platform/instrumentation/kernel/CpuIdentity.h"

#include <array>
#include <charconv>
#include <cmath>
#include <string_view>

#include "platform/common/Hex.h"
#include "platform/instrumentation/tree/PlainText.h"

namespace Tarn::Inventory {

namespace {

/// The fields of one CPU.
class Fields {
 public:
  Fields(const CpuInfo& info, unsigned int cpu) : info_(info), cpu_(cpu) {}

  std::string_view operator[](std::string_view name) const { return info_.field(cpu_, name); }

  /// A field that clients see.
  std::string text(std::string_view name) const { return plainText((*this)[name]); }

  /// Decimal, or hexadecimal after 0x; what stands after the digits is skipped.
  std::optional<unsigned int> number(std::string_view name) const {
    std::string_view text = (*this)[name];
    const int base = text.starts_with("0x") ? 16 : 10;
    text.remove_prefix(base == 16 ? 2 : 0);
    unsigned int value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, base);
    return error == std::errc() ? std::optional(value) : std::nullopt;
  }

  /// A number of MHz, such as "2299.998" or "3425.000000MHz", rounded.
  std::optional<unsigned int> megahertz(std::string_view name) const {
    const std::string_view text = (*this)[name];
    double value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, std::chars_format::fixed);
    const std::string_view unit = text.substr(static_cast<std::size_t>(end - text.data()));
    constexpr double largest = 1e6;
    const bool usable = error == std::errc() && value >= 1 && value < largest && (unit.empty() || unit == "MHz");
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
  const auto family = fields.number("cpu family");
  const auto model = fields.number("model");
  const auto stepping = fields.number("stepping");
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
  const auto implementer = fields.number("CPU implementer");
  const auto part = fields.number("CPU part");
  const auto variant = fields.number("CPU variant");
  const auto revision = fields.number("CPU revision");
  const auto version = fields.number("CPU architecture");
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

void identifyS390(const Fields& fields, CpuIdentity& cpu) {
  setFamily(cpu);
  cpu.width = fields.hasWord("features", "zarch") ? 64 : 31;
  cpu.clockSpeed = fields.megahertz("cpu MHz dynamic");
}

void identifyRiscV(const Fields& fields, CpuIdentity& cpu) {
  const bool is64 = fields["isa"].starts_with("rv64");
  cpu.vendor = is64 ? "RISC-V 64" : "RISC-V 32";
  cpu.name = fields.text("uarch");
  setFamily(cpu);
  cpu.width = is64 ? 64 : 32;
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
    Dialect{"cpu family", "", Architecture::X86, identifyX86},
    Dialect{"CPU implementer", "0x", Architecture::Arm, identifyArm},
    Dialect{"isa", "rv", Architecture::RiscV, identifyRiscV},
    Dialect{"Model Name", "Loongson", Architecture::LoongArch, identifyLoongArch},
    Dialect{"clock", "", Architecture::PowerPc, identifyPowerPc},
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
