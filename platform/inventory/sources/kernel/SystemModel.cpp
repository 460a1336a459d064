#include "platform/inventory/sources/kernel/SystemModel.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <string_view>

#include "platform/inventory/sources/kernel/CpuIdentity.h"
#include "platform/inventory/tree/PlainText.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

constexpr std::string_view virtualMachine = "Virtual Machine";

// What firmware vendors leave in a field that they did not fill in. Sorted.
constexpr std::array placeholders = {
    std::string_view("Default string"),
    std::string_view("Fill By OEM"),
    std::string_view("N/A"),
    std::string_view("NONE"),
    std::string_view("None"),
    std::string_view("Not Applicable"),
    std::string_view("Not Provided"),
    std::string_view("Not Specified"),
    std::string_view("O.E.M."),
    std::string_view("System Product Name"),
    std::string_view("System manufacturer"),
    std::string_view("To Be Filled By O.E.M."),
    std::string_view("To be filled by O.E.M."),
    std::string_view("UNKNOWN"),
    std::string_view("Undefined"),
    std::string_view("Unknown"),
};
static_assert(std::ranges::is_sorted(placeholders));

// The model that emulators give their device tree.
constexpr std::string_view emulatedBoard = "linux,dummy-virt";

/// A text and where it comes from: a file, or where none is named, the flags of a CPU.
struct Found {
  std::string text;
  const char* file;
  const char* rule;
};

Found inFile(Machine& machine, const char* file) {
  return {plainText(machine.root().text(file).value_or(std::string_view())), file, "as it stands"};
}

/// A text that the firmware gives; empty where nobody filled it in.
Found givenByFirmware(Machine& machine, const char* file) {
  Found found = inFile(machine, file);
  if (isPlaceholder(found.text)) {
    found.text.clear();
  }
  return found;
}

Found deviceTreeModel(Machine& machine) {
  Found model = inFile(machine, "proc/device-tree/model");
  if (model.text == emulatedBoard) {
    model.text += " (" + std::string(virtualMachine) + ')';
    model.rule = "the board that emulators provide: marked as a virtual machine";
  }
  return model;
}

// Without firmware that names a model the hypervisor is all that is known of the machine.
Found hypervisorModel(Machine& machine) {
  Found type = inFile(machine, "sys/hypervisor/type");
  if (!type.text.empty()) {
    return {std::string(virtualMachine) + " (" + type.text + ')', type.file, "the hypervisor's name"};
  }
  const CpuInfo& info = machine.cpuInfo();
  const bool isVirtual = !info.cpus().empty() && identifyCpu(info, info.cpus().first()).hypervisor;
  return {std::string(isVirtual ? virtualMachine : std::string_view()), nullptr,
          "with the flag hypervisor it is a virtual machine"};
}

bool tellsModel(const Facts* firmware) {
  return firmware != nullptr && firmware->find(PropSystemModel) != nullptr;
}

Found systemModel(Machine& machine, const Facts* firmware) {
  Found product = givenByFirmware(machine, "sys/class/dmi/id/product_name");
  if (!product.text.empty()) {
    return product;
  }
  const std::string file = machine.root().fileName();
  const FileError error = machine.root().error();
  Found model = deviceTreeModel(machine);
  if (!model.text.empty() || tellsModel(firmware)) {
    return model;
  }
  // Beside tables that are there, the kernel's file is not missed.
  if (error != 0 && !(error == ENOENT && firmware != nullptr)) {
    machine.noteUnread(file, error, "needs firmware with DMI tables");
  }
  return hypervisorModel(machine);
}

// Until a machine is given a name the kernel has "(none)".
Found systemName(Machine& machine) {
  Found name = inFile(machine, "proc/sys/kernel/hostname");
  if (name.text == "(none)") {
    name.text.clear();
  }
  return name;
}

Origin originOf(const Machine& machine, const char* file, const char* rule) {
  constexpr std::array<std::string_view, 1> fields = {"flags/hypervisor"};
  return file != nullptr ? machine.originIn(file, rule)
                         : machine.originInCpuInfo(machine.cpuInfo().cpus().first(), fields, rule);
}

void add(Facts& facts, Properties id, const Machine& machine, const Found& found) {
  facts.text(id, found.text,
             [&machine, file = found.file, rule = found.rule] { return originOf(machine, file, rule); });
}

}  // namespace

bool isPlaceholder(std::string_view text) {
  return std::ranges::binary_search(placeholders, text);
}

Facts readSystemFacts(Machine& machine, const Facts* firmware) {
  Facts facts;
  add(facts, PropSystemModel, machine, systemModel(machine, firmware));
  add(facts, PropSystemManufacturer, machine, givenByFirmware(machine, "sys/class/dmi/id/sys_vendor"));
  add(facts, PropSystemName, machine, systemName(machine));
  return facts;
}

}  // namespace Tarn::Inventory
