#include "platform/instrumentation/SystemModel.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <string_view>
#include <utility>

#include "platform/instrumentation/CpuIdentity.h"
#include "platform/instrumentation/PropertyTable.h"

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

/// A text and the account of where it comes from.
struct Found {
  std::string text;
  Facts::Explain explain;
};

Facts::Explain inFile(const Machine& machine, const char* path, const char* rule) {
  return [&machine, path, rule] { return machine.originIn(path, rule); };
}

/// A text that the firmware gives; empty where nobody filled it in.
Found firmwareText(Machine& machine, const char* path) {
  const std::string text(machine.root().text(path).value_or(std::string_view()));
  return {isPlaceholder(text) ? std::string() : text, inFile(machine, path, "as it stands")};
}

Found deviceTreeModel(Machine& machine) {
  constexpr const char* path = "proc/device-tree/model";
  const std::string model(machine.root().text(path).value_or(std::string_view()));
  if (model == emulatedBoard) {
    return {model + " (" + std::string(virtualMachine) + ')',
            inFile(machine, path, "the board that emulators provide: marked as a virtual machine")};
  }
  return {model, inFile(machine, path, "as it stands")};
}

// Without firmware that names a model the hypervisor is all that is known of the machine.
Found hypervisorModel(Machine& machine) {
  constexpr const char* path = "sys/hypervisor/type";
  const std::string type(machine.root().text(path).value_or(std::string_view()));
  if (!type.empty()) {
    return {std::string(virtualMachine) + " (" + type + ')', inFile(machine, path, "the hypervisor's name")};
  }
  const CpuInfo& info = machine.cpuInfo();
  const bool isVirtual = !info.cpus().empty() && identifyCpu(info, info.cpus().first()).hypervisor;
  return {std::string(isVirtual ? virtualMachine : std::string_view()), [&machine] {
            constexpr std::array<std::string_view, 1> fields = {"flags/hypervisor"};
            return machine.originInCpuInfo(machine.cpuInfo().cpus().first(), fields,
                                           "with the flag hypervisor it is a virtual machine");
          }};
}

Found systemModel(Machine& machine, const Facts* firmware) {
  Found product = firmwareText(machine, "sys/class/dmi/id/product_name");
  if (!product.text.empty()) {
    return product;
  }
  const std::string file = machine.root().fileName();
  const FileError error = machine.root().error();
  Found model = deviceTreeModel(machine);
  if (!model.text.empty() || (firmware != nullptr && firmware->find(PropSystemModel) != nullptr)) {
    return model;
  }
  // Beside tables that are there, the kernel's file is not missed.
  if (error != 0 && !(error == ENOENT && firmware != nullptr)) {
    machine.noteUnread(file, error, "it is there on machines whose firmware has DMI tables");
  }
  return hypervisorModel(machine);
}

}  // namespace

bool isPlaceholder(std::string_view text) {
  return std::ranges::binary_search(placeholders, text);
}

Facts readSystemFacts(Machine& machine, const Facts* firmware) {
  Facts facts;
  Found model = systemModel(machine, firmware);
  facts.text(PropSystemModel, std::move(model.text), std::move(model.explain));
  Found maker = firmwareText(machine, "sys/class/dmi/id/sys_vendor");
  facts.text(PropSystemManufacturer, std::move(maker.text), std::move(maker.explain));
  return facts;
}

}  // namespace Tarn::Inventory
