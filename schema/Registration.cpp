#include "schema/Registration.h"

#include <algorithm>
#include <array>
#include <set>
#include <stdexcept>

#include "schema/ClassTable.h"

namespace Registration {
namespace {

using Corvcim::ClassDefinition;

struct Module {
  std::string_view group;
  std::string_view name;
  std::string_view description;
};

// OpenPegasus runs each module in a process of its own, so a process group is a module there.
constexpr std::array modules = {
    Module{"cpu", "CorvaneCPUModule", "CPU inventory"},
    Module{"cpu-cache", "CorvaneCPUCacheModule", "CPU inventory: caches of processors"},
    Module{"system", "CorvaneComputerSystemModule", "Computer system"},
};

const Module& moduleOf(const ClassDefinition& definition) {
  const auto* const found = std::ranges::find(modules, definition.group, &Module::group);
  if (found == modules.end()) {
    throw std::logic_error("process group " + std::string(definition.group) + " has no module");
  }
  return *found;
}

/// One property of a MOF instance; `value` as MOF writes it.
std::string line(std::string_view property, std::string_view value) {
  return std::string("   ").append(property).append(" = ").append(value).append(";\n");
}

std::string quoted(std::string_view text) {
  return '"' + std::string(text) + '"';
}

std::string moduleInstance(const Module& module, const ClassDefinition& definition, std::string_view version) {
  return "instance of PG_ProviderModule {\n" + line("Name", quoted(module.name)) +
         line("Description", quoted(module.description)) + line("Vendor", quoted("Corvane")) +
         line("Version", quoted(version)) + line("InterfaceType", quoted("CMPI")) +
         line("InterfaceVersion", quoted("2.0.0")) + line("Location", quoted(definition.library)) + "};\n\n";
}

std::string providerInstances(const Module& module, const ClassDefinition& definition) {
  return "instance of PG_Provider {\n" + line("ProviderModuleName", quoted(module.name)) +
         line("Name", quoted(definition.provider)) + "};\n\n" + "instance of PG_ProviderCapabilities {\n" +
         line("ProviderModuleName", quoted(module.name)) + line("ProviderName", quoted(definition.provider)) +
         line("CapabilityID", quoted(definition.name)) + line("ClassName", quoted(definition.name)) +
         line("Namespaces", "{" + quoted(nameSpace) + "}") +
         line("ProviderType", definition.association ? "{2, 3}" : "{2}") + "};\n\n";
}

}  // namespace

std::string forSfcb(std::string_view library) {
  std::string text;
  for (const ClassDefinition& each : Corvcim::classDefinitions()) {
    if (each.library == library) {
      text.append(text.empty() ? "" : "\n").append("[").append(each.name).append("]\n");
      text.append("   provider: ").append(each.provider).append("\n");
      text.append("   location: ").append(each.library).append("\n");
      text.append("   type: ").append(each.association ? "instance association" : "instance").append("\n");
      text.append("   namespace: ").append(nameSpace).append("\n");
      text.append("   group: corvane-").append(each.group).append("\n");
    }
  }
  return text;
}

std::string forPegasus(std::string_view library, std::string_view version) {
  std::string text;
  std::set<std::string_view> written;
  for (const ClassDefinition& each : Corvcim::classDefinitions()) {
    if (each.library == library) {
      const Module& module = moduleOf(each);
      if (written.insert(module.name).second) {
        text += moduleInstance(module, each, version);
      }
      text += providerInstances(module, each);
    }
  }
  text.resize(text.empty() ? 0 : text.size() - 1);
  return text;
}

}  // namespace Registration
