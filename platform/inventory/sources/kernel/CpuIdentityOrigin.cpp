#include "platform/inventory/sources/kernel/CpuIdentityOrigin.h"

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

#include "platform/base/Hex.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;
using enum Architecture;

/// The fields of /proc/cpuinfo that tell a property, and what becomes of them.
struct Account {
  Architecture architecture;
  Properties id;
  std::array<std::string_view, 5> fields;
  std::string_view rule;  // empty: the row of a table, named at run time
};

constexpr std::string_view asItStands = "as it stands";
constexpr std::string_view rounded = "rounded to whole MHz";

constexpr std::array accounts = {
    Account{X86, PropProcessorName, {"model name"}, asItStands},
    Account{X86, PropFamily, {"vendor_id", "model name", "cpu family", "model"}, {}},
    Account{X86, PropStepping, {"stepping"}, asItStands},
    Account{X86,
            PropProcessorId,
            {"cpu family", "model", "stepping"},
            "the CPUID signature that they make up, its bytes from the lowest on"},
    Account{X86, PropAddressWidth, {"flags/lm"}, "64 with the flag lm, else 32"},
    Account{X86, PropCurrentClockSpeed, {"cpu MHz"}, rounded},
    Account{Arm, PropProcessorName, {"CPU implementer", "CPU part"}, {}},
    Account{Arm, PropFamily, {"CPU implementer", "CPU part", "CPU architecture"}, {}},
    Account{Arm, PropStepping, {"CPU variant", "CPU revision"}, "r and the variant, p and the revision"},
    Account{Arm,
            PropProcessorId,
            {"CPU implementer", "CPU variant", "CPU architecture", "CPU part", "CPU revision"},
            "the main ID register that they make up, its bytes from the lowest on"},
    Account{Arm, PropAddressWidth, {"CPU architecture"}, "64 from version 8 on, else 32"},
    Account{PowerPc, PropProcessorName, {"cpu"}, asItStands},
    Account{PowerPc, PropFamily, {"cpu"}, {}},
    Account{PowerPc, PropStepping, {"revision"}, "up to the first blank"},
    Account{PowerPc, PropAddressWidth, {"cpu"}, "64 for every POWER processor"},
    Account{PowerPc, PropCurrentClockSpeed, {"clock"}, rounded},
    Account{Ia64, PropProcessorName, {"model name"}, asItStands},
    Account{Ia64, PropFamily, {"arch"}, {}},
    Account{Ia64, PropStepping, {"revision"}, asItStands},
    Account{Ia64, PropAddressWidth, {"arch"}, "64 for every IA-64 processor"},
    Account{Ia64, PropCurrentClockSpeed, {"cpu MHz"}, rounded},
    Account{S390, PropProcessorName, {"vendor_id", "machine", "processor *"}, "the vendor, and the machine's type"},
    Account{S390, PropFamily, {"vendor_id"}, {}},
    Account{S390, PropAddressWidth, {"features/zarch"}, "64 with the feature zarch, else 31"},
    Account{S390, PropCurrentClockSpeed, {"cpu MHz dynamic", "cpu MHz static"}, "the first of them, in whole MHz"},
    Account{Sparc, PropProcessorName, {"cpu"}, asItStands},
    Account{Sparc, PropFamily, {"cpu"}, {}},
    Account{Sparc, PropAddressWidth, {"type"}, "64 for sun4u and sun4v"},
    Account{Sparc, PropCurrentClockSpeed, {"Cpu*ClkTck"}, "Hz in hexadecimal, rounded to whole MHz"},
    Account{RiscV,
            PropProcessorName,
            {"uarch", "mvendorid", "marchid"},
            "uarch as it stands, without it the maker and the architecture by number"},
    Account{RiscV, PropStepping, {"mimpid"}, asItStands},
    Account{RiscV, PropFamily, {"isa"}, {}},
    Account{RiscV, PropAddressWidth, {"isa"}, "64 where it begins with rv64, else 32"},
    Account{LoongArch, PropProcessorName, {"Model Name"}, asItStands},
    Account{LoongArch, PropFamily, {"Model Name"}, {}},
    Account{LoongArch, PropStepping, {"CPU Revision"}, asItStands},
    Account{LoongArch, PropAddressWidth, {"ISA"}, "64 where it has loongarch64, else 32"},
    Account{LoongArch, PropCurrentClockSpeed, {"CPU MHz"}, rounded},
};

std::string hex(unsigned int number) {
  return "0x" + Common::hexText(number);
}

std::string armRow(const ArmPart& part) {
  return "row " + hex(part.implementer) + ", " + hex(part.part) + " (" + std::string(part.name) +
         ") of the table of Arm designs";
}

std::string familyRow(const FamilyRow& row) {
  std::string text = "row " + std::string(row.vendor);
  text += row.brand.empty() ? "" : ", \"" + std::string(row.brand) + '"';
  text += row.family == FamilyRow::any ? "" : ", family " + std::to_string(row.family);
  text += row.model == FamilyRow::any ? "" : ", model " + std::to_string(row.model);
  return text + " of the table of CIM families";
}

// By which row of a table the name or the family was found.
std::string rowRule(const CpuIdentity& identity, Properties id) {
  if (identity.armPart != nullptr) {
    return armRow(*identity.armPart);
  }
  if (id == PropFamily && identity.familyRow != nullptr) {
    return familyRow(*identity.familyRow);
  }
  if (identity.architecture == Arm && identity.family != CimFamily::unknown) {
    return "the design is in no table; the code of its architecture version";
  }
  return "no row of the table of CIM families fits: unknown";
}

}  // namespace

Origin originOfIdentity(const Machine& machine, unsigned int cpu, const CpuIdentity& identity, Properties id) {
  const Properties told = id == PropDataWidth ? PropAddressWidth : id;
  const auto* const account = std::ranges::find_if(
      accounts, [&](const Account& a) { return a.architecture == identity.architecture && a.id == told; });
  if (account == accounts.end()) {
    return machine.originInCpuInfo(cpu, {}, "no field tells the architecture: unknown");
  }
  const auto used =
      static_cast<std::size_t>(std::ranges::find(account->fields, std::string_view()) - account->fields.begin());
  return machine.originInCpuInfo(cpu, std::span(account->fields).first(used),
                                 account->rule.empty() ? rowRule(identity, id) : std::string(account->rule));
}

}  // namespace Tarn::Inventory
