// What the built libraries set, against the MOF. The host refuses a value of another type than the
// class table's, and the class table equals the MOF, so what arrives has the right type by name.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <iterator>
#include <set>
#include <string>
#include <vector>

#include "host/broker/Broker.h"
#include "host/broker/Dispatcher.h"
#include "host/broker/ProviderLibrary.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"
#include "tests/schema/Mof.h"

namespace Corvcim {
namespace {

using Names = std::set<std::string>;

std::vector<Mof::Class> declaredClasses() {
  std::vector<Mof::Class> classes;
  for (const char* file : {"/schema/corvane-cpu.mof", "/schema/corvane-computersystem.mof"}) {
    std::ranges::move(Mof::readClasses(std::string(CORVANE_SOURCE_DIR) + file), std::back_inserter(classes));
  }
  return classes;
}

// A machine whose inventory leaves nothing out.
void useInventory() {
  setenv("CORVANE_INVENTORY", "json:" CORVANE_SOURCE_DIR "/tests/schema/inventory.json", 1);
  setenv("CORVANE_CONFIG", "/dev/null", 1);
}

// "class.property type" of everything that the MOF declares.
Names declared() {
  Names names;
  for (const Mof::Class& each : declaredClasses()) {
    for (const Mof::Property& property : each.properties) {
      names.insert(each.name + "." + Mof::lowered(property.name) + " " + property.type);
    }
  }
  return names;
}

// "class.property type" of everything that the libraries set.
Names set() {
  Dispatcher dispatcher({{"corvcpuprofileprovider", CPU_LIBRARY}, {"corvcomputersystemprovider", SYSTEM_LIBRARY}});
  Names names;
  for (const ClassDefinition& each : classDefinitions()) {
    const Answer answer = dispatcher.enumerateInstances({{}, "root/cimv2", std::string(each.name), {}});
    EXPECT_TRUE(answer.response.ok()) << each.name << ": " << answer.response.message.value_or("");
    EXPECT_FALSE(answer.response.instances.empty()) << each.name;
    for (const Instance& instance : answer.response.instances) {
      for (const NamedValue& property : instance.properties) {
        names.insert(std::string(each.name) + "." + Mof::lowered(property.name) + " " +
                     typeName(property.value.type()));
      }
    }
  }
  return names;
}

Names without(Names names, const Names& others) {
  for (const std::string& each : others) {
    names.erase(each);
  }
  return names;
}

}  // namespace

// Some brokers ask for the names of the class, as its MOF spells them, when a client gives no list.
TEST(Library, PropertyListOfTheMofDeliversEveryValue) {
  useInventory();
  const ClassDefinition& systemClass = *findClass("HALDA_ComputerSystem");
  Broker broker;
  const ProviderLibrary cpu(CPU_LIBRARY);
  const ProviderLibrary system(SYSTEM_LIBRARY);
  const auto ask = [&](const ClassDefinition& definition, const PropertyList& properties) {
    const ProviderLibrary& library = definition.library == systemClass.library ? system : cpu;
    return broker.enumerateInstances(library.instanceMI(broker, definition.provider),
                                     {{}, "root/cimv2", std::string(definition.name), {}}, properties);
  };
  broker.serveInstances(systemClass.name, ask(systemClass, {}).instances);

  // The processor-cache association comes first: it answers as long as no cores are known.
  std::vector<Mof::Class> classes = declaredClasses();
  std::ranges::stable_partition(classes,
                                [](const Mof::Class& each) { return each.name == "HALDA_CPUAssociatedCacheMemory"; });
  for (const Mof::Class& each : classes) {
    std::vector<std::string> names;
    for (const Mof::Property& property : each.properties) {
      names.push_back(property.name);
    }
    const ClassDefinition& definition = *findClass(each.name);
    const Response all = ask(definition, {});
    EXPECT_FALSE(all.instances.empty()) << each.name;
    EXPECT_EQ(ask(definition, names), all) << each.name;
  }
}

TEST(Library, SetsExactlyWhatTheMofDeclares) {
  useInventory();

  const Names inMof = declared();
  const Names inLibrary = set();

  EXPECT_EQ(without(inLibrary, inMof), Names{});
  EXPECT_EQ(without(inMof, inLibrary), Names{});
}

}  // namespace Corvcim
