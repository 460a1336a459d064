#include "platform/instrumentation/SystemModel.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "platform/instrumentation/CpuIdentity.h"

namespace Tarn::Inventory {

namespace {

constexpr std::string_view virtualMachine = "Virtual Machine";

// What firmware vendors leave in a field that they did not fill in. Sorted.
constexpr std::array placeholders = {
    std::string_view("Default string"),
    std::string_view("None"),
    std::string_view("Not Applicable"),
    std::string_view("Not Specified"),
    std::string_view("O.E.M."),
    std::string_view("System Product Name"),
    std::string_view("System manufacturer"),
    std::string_view("To Be Filled By O.E.M."),
    std::string_view("To be filled by O.E.M."),
    std::string_view("Undefined"),
};
static_assert(std::ranges::is_sorted(placeholders));

// The model that emulators give their device tree.
constexpr std::string_view emulatedBoard = "linux,dummy-virt";

/// A text that the firmware gives; empty where nobody filled it in.
std::string firmwareText(Machine& machine, const char* path) {
  std::string text(machine.root().text(path).value_or(std::string_view()));
  return std::ranges::binary_search(placeholders, text) ? std::string() : text;
}

std::string deviceTreeModel(Machine& machine) {
  std::string model(machine.root().text("proc/device-tree/model").value_or(std::string_view()));
  return model == emulatedBoard ? model + " (" + std::string(virtualMachine) + ')' : model;
}

// Without firmware that names a model the hypervisor is all that is known of the machine.
std::string hypervisorModel(Machine& machine) {
  const std::string type(machine.root().text("sys/hypervisor/type").value_or(std::string_view()));
  if (!type.empty()) {
    return std::string(virtualMachine) + " (" + type + ')';
  }
  const CpuInfo& info = machine.cpuInfo();
  const bool isVirtual = !info.cpus().empty() && identifyCpu(info, info.cpus().first()).hypervisor;
  return std::string(isVirtual ? virtualMachine : std::string_view());
}

}  // namespace

std::string readSystemModel(Machine& machine) {
  std::string product = firmwareText(machine, "sys/class/dmi/id/product_name");
  if (!product.empty()) {
    return product;
  }
  const std::string file = machine.root().fileName();
  const FileError error = machine.root().error();
  std::string model = deviceTreeModel(machine);
  if (!model.empty()) {
    return model;
  }
  if (error != 0) {
    machine.noteUnread(file, error, "it is there on machines whose firmware has DMI tables");
  }
  return hypervisorModel(machine);
}

std::string readSystemManufacturer(Machine& machine) {
  return firmwareText(machine, "sys/class/dmi/id/sys_vendor");
}

}  // namespace Tarn::Inventory
