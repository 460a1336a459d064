// What the built libraries set, against the MOF. The host refuses a value of another type than the
// class table's, and the class table equals the MOF, so what arrives has the right type by name.

#include <gtest/gtest.h>

#include <cstdlib>
#include <set>
#include <string>

#include "host/ClassTable.h"
#include "host/broker/Dispatcher.h"
#include "host/broker/Names.h"
#include "tests/schema/Mof.h"

namespace Corvcim {
namespace {

using Names = std::set<std::string>;

// "class.property type" of everything that the MOF declares.
Names declared() {
  Names names;
  for (const char* file : {"/schema/corvane-cpu.mof", "/schema/corvane-computersystem.mof"}) {
    for (const Mof::Class& each : Mof::readClasses(std::string(CORVANE_SOURCE_DIR) + file)) {
      for (const Mof::Property& property : each.properties) {
        names.insert(each.name + "." + Mof::lowered(property.name) + " " + property.type);
      }
    }
  }
  return names;
}

// The same of everything that the libraries set on a machine whose inventory leaves nothing out.
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

TEST(Library, SetsExactlyWhatTheMofDeclares) {
  setenv("CORVANE_INVENTORY", "json:" CORVANE_SOURCE_DIR "/tests/schema/inventory.json", 1);
  setenv("CORVANE_CONFIG", "/dev/null", 1);

  const Names inMof = declared();
  const Names inLibrary = set();

  EXPECT_EQ(without(inLibrary, inMof), Names{});
  EXPECT_EQ(without(inMof, inLibrary), Names{});
}

}  // namespace Corvcim
