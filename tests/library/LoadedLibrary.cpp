#include "tests/library/LoadedLibrary.h"

#include <cstdlib>
#include <fstream>

#include "schema/ClassTable.h"

namespace Library {

using Corvcim::ObjectPath;
using Corvcim::OperationKind;
using Corvcim::Response;
using Corvcim::Value;

namespace {

const std::string libraryName = "corvcpuprofileprovider";
const std::string nameSpace = "root/cimv2";

std::string providerOf(const std::string& className) {
  return std::string(Corvcim::findClass(className)->provider);
}

std::vector<std::string> classesOfTheLibrary(bool associationsOnly) {
  std::vector<std::string> names;
  for (const Corvcim::ClassDefinition& each : Corvcim::classDefinitions()) {
    if (each.library == libraryName && (each.association || !associationsOnly)) {
      names.emplace_back(each.name);
    }
  }
  return names;
}

}  // namespace

const std::string file = CORVANE_BINARY_DIR "/lib/lib" + libraryName + ".so";

Environment::Environment(const Variables& variables) {
  for (const auto& [name, value] : variables) {
    const char* before = std::getenv(name.c_str());
    before_[name] = before != nullptr ? std::optional<std::string>(before) : std::nullopt;
    set(name, value);
  }
}

Environment::~Environment() {
  for (const auto& [name, value] : before_) {
    set(name, value);
  }
}

void Environment::set(const std::string& name, const std::optional<std::string>& value) {
  if (value) {
    setenv(name.c_str(), value->c_str(), 1);
  } else {
    unsetenv(name.c_str());
  }
}

Environment::Variables quietly(const std::string& inventory) {
  return {{"CORVANE_INVENTORY", inventory},
          {"CORVANE_CONFIG", "/dev/null"},
          {"CORVANE_LOG", "error:none"},
          {"CORVANE_TRACE", "error:none"},
          {"CORVANE_LANGUAGE", "en"}};
}

std::string fixture(const std::string& machine) {
  return "json:" + fixtures + machine + "/tree.json";
}

LoadedLibrary::LoadedLibrary(Corvcim::LoadScope scope) : library_(file, scope) {
  broker_.serveInstances("HALDA_ComputerSystem",
                         {Corvcim::makeInstance(nameSpace, "HALDA_ComputerSystem",
                                                {{"CreationClassName", Value::string("HALDA_ComputerSystem")},
                                                 {"Name", Value::string("this-system")}})});
}

CMPIInstanceMI* LoadedLibrary::instanceMI(const std::string& className) {
  return library_.instanceMI(broker_, providerOf(className));
}

void LoadedLibrary::createInterfaces() {
  for (const std::string& name : servedClasses()) {
    instanceMI(name);
  }
  for (const std::string& name : associationClasses()) {
    static_cast<void>(library_.associationMI(broker_, providerOf(name)));
  }
}

Response LoadedLibrary::enumerateInstances(const std::string& className) {
  return broker_.enumerateInstances(instanceMI(className), {"", nameSpace, className, {}});
}

Response LoadedLibrary::enumerateInstanceNames(const std::string& className) {
  return broker_.enumerateInstanceNames(instanceMI(className), {"", nameSpace, className, {}});
}

Response LoadedLibrary::getInstance(const ObjectPath& path) {
  return broker_.getInstance(instanceMI(path.className), path);
}

Response LoadedLibrary::associate(const std::string& associationClass, OperationKind kind, const ObjectPath& source) {
  Corvcim::AssociationFilter filter;
  if (kind == OperationKind::Associators || kind == OperationKind::AssociatorNames) {
    filter.assocClass = associationClass;
  }
  return broker_.perform(library_.associationMI(broker_, providerOf(associationClass)),
                         Corvcim::Operation{kind, source, {}, filter});
}

std::size_t LoadedLibrary::askEverything() {
  std::size_t results = 0;
  const auto count = [&](const Response& response) {
    results += response.instances.size() + response.paths.size();
    return response;
  };
  for (const std::string& name : servedClasses()) {
    count(enumerateInstances(name));
    const Response names = count(enumerateInstanceNames(name));
    if (!names.paths.empty()) {
      count(getInstance(names.paths.front()));
    }
    const Corvcim::ClassDefinition& definition = *Corvcim::findClass(name);
    if (!definition.association || names.paths.empty()) {
      continue;
    }
    for (const Corvcim::NamedValue& end : names.paths.front().keys) {
      for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                       OperationKind::References, OperationKind::ReferenceNames}) {
        count(associate(name, kind, end.value.asReference()));
      }
    }
  }
  return results;
}

std::vector<std::string> servedClasses() {
  return classesOfTheLibrary(false);
}

std::vector<std::string> associationClasses() {
  return classesOfTheLibrary(true);
}

std::size_t mappings() {
  std::ifstream maps("/proc/self/maps");
  std::size_t count = 0;
  for (std::string line; std::getline(maps, line);) {
    count += line.find(libraryName) != std::string::npos ? 1U : 0U;
  }
  return count;
}

}  // namespace Library
