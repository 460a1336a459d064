// The MOF against the class table, and both against the DMTF parents.

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <set>
#include <string>

#include "host/broker/Value.h"
#include "host/corvcim/ClassList.h"
#include "host/corvcim/results/ValueNames.h"
#include "include/CPUClassNames.h"
#include "schema/ClassTable.h"
#include "schema/DmtfClasses.h"
#include "schema/Names.h"
#include "tests/schema/Mof.h"

namespace Corvcim {
namespace {

const std::string schemaDirectory = CORVANE_SOURCE_DIR "/schema/";

std::vector<Mof::Class> cpuClasses() {
  return Mof::readClasses(schemaDirectory + "corvane-cpu.mof");
}

std::vector<Mof::Class> allClasses() {
  std::vector<Mof::Class> classes = Mof::readClasses(schemaDirectory + "corvane-computersystem.mof");
  std::ranges::move(cpuClasses(), std::back_inserter(classes));
  return classes;
}

const Mof::Qualifier& qualifier(const Mof::Class& owner, std::string_view property, std::string_view name) {
  const auto found =
      std::ranges::find_if(owner.properties, [&](const Mof::Property& each) { return sameName(each.name, property); });
  if (found == owner.properties.end() || Mof::find(found->qualifiers, name) == nullptr) {
    throw std::runtime_error(owner.name + "." + std::string(property) + " has no " + std::string(name));
  }
  return *Mof::find(found->qualifiers, name);
}

using Lines = std::set<std::string>;

// One line for each property with all that a broker goes by; names without their case.
Lines fromTable(const ClassDefinition& definition) {
  Lines lines;
  for (const PropertyDefinition& each : definition.properties) {
    lines.insert(std::string(each.key ? "key " : "") + typeName(each.type) + " " + Mof::lowered(each.name) + " " +
                 Mof::lowered(each.referenceClass));
  }
  return lines;
}

Lines fromMof(const Mof::Class& definition) {
  Lines lines;
  for (const Mof::Property& each : definition.properties) {
    lines.insert(std::string(Mof::find(each.qualifiers, "Key") != nullptr ? "key " : "") + each.type + " " +
                 Mof::lowered(each.name) + " " + Mof::lowered(each.referenceClass));
  }
  return lines;
}

}  // namespace

TEST(Classes, EachStandsInTheMofOfItsLibrary) {
  Lines cpu;
  for (const Mof::Class& each : cpuClasses()) {
    cpu.insert(each.name);
  }

  Lines expected;
  for (const ClassDefinition& each : classDefinitions()) {
    if (each.name != "HALDA_ComputerSystem") {
      expected.insert(std::string(each.name));
    }
  }
  EXPECT_EQ(cpu, expected);
  EXPECT_EQ(cpuClasses().size(), 9U);
  const auto companion = Mof::readClasses(schemaDirectory + "corvane-computersystem.mof");
  ASSERT_EQ(companion.size(), 1U);
  EXPECT_EQ(companion.front().name, "HALDA_ComputerSystem");
}

TEST(Classes, MofAndTableHaveTheSamePropertiesKeysAndTypes) {
  for (const Mof::Class& each : allClasses()) {
    const ClassDefinition* definition = findClass(each.name);
    ASSERT_NE(definition, nullptr) << each.name;
    EXPECT_EQ(each.name, definition->name);
    EXPECT_EQ(each.parent, definition->parent);
    EXPECT_EQ(Mof::find(each.qualifiers, "Association") != nullptr, definition->association) << each.name;
    EXPECT_EQ(fromMof(each), fromTable(*definition)) << each.name;
    EXPECT_EQ(each.properties.size(), definition->properties.size()) << each.name;
  }
}

TEST(Classes, TheHostDeclaresThoseOfTheTable) {
  const std::string file = testing::TempDir() + "class-list.mof";
  std::ofstream(file) << writeClassList(Format::Mof);

  const std::vector<Mof::Class> declared = Mof::readClasses(file);

  std::filesystem::remove(file);
  ASSERT_EQ(declared.size(), classDefinitions().size());
  for (std::size_t i = 0; i < declared.size(); ++i) {
    const ClassDefinition& definition = classDefinitions()[i];
    EXPECT_EQ(declared[i].name, definition.name);
    EXPECT_EQ(declared[i].parent, definition.parent);
    EXPECT_EQ(Mof::find(declared[i].qualifiers, "Association") != nullptr, definition.association) << definition.name;
    EXPECT_EQ(fromMof(declared[i]), fromTable(definition)) << definition.name;
  }
}

TEST(Classes, PropertiesOverrideThoseOfTheParentButForTwo) {
  Lines additions;
  for (const Mof::Class& each : allClasses()) {
    for (const Mof::Property& property : each.properties) {
      const Mof::Qualifier* override = Mof::find(property.qualifiers, "Override");
      const PropertyDefinition* inherited = inheritedProperty(*findClass(each.name), property.name);
      EXPECT_EQ(override != nullptr, inherited != nullptr) << each.name << "." << property.name;
      if (inherited == nullptr) {
        additions.insert(each.name + "." + property.name);
      } else if (override != nullptr) {
        EXPECT_EQ(override->values, std::vector<std::string>{std::string(inherited->name)}) << each.name;
      }
    }
  }

  EXPECT_EQ(additions, (Lines{"HALDA_ComputerSystem.Model", "HALDA_ComputerSystem.Manufacturer"}));
}

TEST(Classes, OverridesHaveTheTypeAndTheKeyOfTheParent) {
  for (const ClassDefinition& each : classDefinitions()) {
    for (const PropertyDefinition& property : each.properties) {
      if (const PropertyDefinition* inherited = inheritedProperty(each, property.name)) {
        EXPECT_EQ(typeName(property.type), typeName(inherited->type)) << each.name << "." << property.name;
        EXPECT_EQ(property.key, inherited->key) << each.name << "." << property.name;
        EXPECT_TRUE(isA(property.referenceClass, inherited->referenceClass) || property.type != CMPI_ref)
            << each.name << "." << property.name;
      }
    }
  }
}

TEST(Classes, KeysOfTheParentsAreKeysHere) {
  for (const ClassDefinition& each : classDefinitions()) {
    for (const DmtfClass* above = findDmtfClass(each.parent); above != nullptr; above = findDmtfClass(above->parent)) {
      for (const PropertyDefinition& property : above->properties) {
        const PropertyDefinition* own = findProperty(each, property.name);
        EXPECT_TRUE(!property.key || (own != nullptr && own->key)) << each.name << " lacks " << property.name;
      }
    }
  }
}

// A broker that compares names letter by letter takes the parent's spelling.
TEST(Classes, MofSpellsPropertiesAsTheParentDoes) {
  for (const Mof::Class& each : allClasses()) {
    for (const Mof::Property& property : each.properties) {
      if (const PropertyDefinition* inherited = inheritedProperty(*findClass(each.name), property.name)) {
        EXPECT_EQ(property.name, inherited->name) << each.name;
      }
    }
  }
}

TEST(Classes, LibraryKnowsEachParentOfItsClasses) {
  Lines expected;
  for (const ClassDefinition& definition : classDefinitions()) {
    for (std::string_view each = definition.name; !parentOf(each).empty(); each = parentOf(each)) {
      expected.insert(std::string(each) + " : " + std::string(parentOf(each)));
    }
  }

  Lines known;
  for (const Tarn::CPUProvider::ClassParent& each : Tarn::CPUProvider::classParents) {
    known.insert(std::string(each.name) + " : " + each.parent);
  }

  EXPECT_EQ(known, expected);
  EXPECT_EQ(std::size(Tarn::CPUProvider::classParents), expected.size());
}

TEST(DmtfClasses, FormOneTreeWithThreeKindsOfTop) {
  Lines tops;
  for (const DmtfClass& each : dmtfClasses()) {
    EXPECT_TRUE(each.parent.empty() || findDmtfClass(each.parent) != nullptr) << each.name;
    if (each.parent.empty()) {
      tops.insert(std::string(each.name));
    }
  }
  for (const ClassDefinition& each : classDefinitions()) {
    EXPECT_NE(findDmtfClass(each.parent), nullptr) << each.name;
  }

  EXPECT_EQ(tops, (Lines{"CIM_Component", "CIM_Dependency", "CIM_ElementCapabilities", "CIM_ManagedElement"}));
}

TEST(DmtfClasses, NearestDefinitionCounts) {
  EXPECT_TRUE(inheritedProperty(*findClass("HALDA_CPUProcessorCore"), "INSTANCEID")->key);
  EXPECT_FALSE(inheritedProperty(*findClass("HALDA_CPUProcessor"), "InstanceID")->key);
  EXPECT_TRUE(inheritedProperty(*findClass("HALDA_ComputerSystem"), "Name")->key);
  EXPECT_FALSE(inheritedProperty(*findClass("HALDA_CPUMemory"), "Name")->key);
  EXPECT_EQ(inheritedProperty(*findClass("HALDA_CPUMemory"), "Level"), nullptr);
  EXPECT_EQ(inheritedProperty(*findClass("HALDA_CPUSystemDevice"), "PartComponent")->referenceClass,
            "CIM_LogicalDevice");
}

TEST(Classes, EverythingIsDescribed) {
  for (const Mof::Class& each : allClasses()) {
    EXPECT_NE(Mof::find(each.qualifiers, "Description"), nullptr) << each.name;
    for (const Mof::Property& property : each.properties) {
      EXPECT_NE(Mof::find(property.qualifiers, "Description"), nullptr) << each.name << "." << property.name;
    }
  }
}

// Values that are texts themselves have no names.
TEST(ValueMaps, GiveEveryCodeTheNameThatTheHostShows) {
  std::size_t compared = 0;
  for (const Mof::Class& each : allClasses()) {
    for (const Mof::Property& property : each.properties) {
      const Mof::Qualifier* codes = Mof::find(property.qualifiers, "ValueMap");
      if (codes == nullptr || property.type == "string" || property.name == "CPUStatus") {
        continue;
      }
      const Mof::Qualifier& names = qualifier(each, property.name, "Values");
      ASSERT_EQ(codes->values.size(), names.values.size()) << each.name << "." << property.name;
      for (std::size_t i = 0; i < codes->values.size(); ++i) {
        if (codes->values[i] != "..") {
          EXPECT_EQ(names.values[i], valueName(property.name, std::stoul(codes->values[i])))
              << each.name << "." << property.name;
          ++compared;
        }
      }
    }
  }
  EXPECT_GT(compared, 100U);
}

TEST(ValueMaps, CpuStatusIsTheInventorysState) {
  const Mof::Class processor = cpuClasses().front();
  const Mof::Qualifier& codes = qualifier(processor, "CPUStatus", "ValueMap");
  const Mof::Qualifier& names = qualifier(processor, "CPUStatus", "Values");

  std::string text;
  ASSERT_EQ(codes.values.size(), names.values.size());
  for (std::size_t i = 0; i < codes.values.size(); ++i) {
    text += codes.values[i] + " " + names.values[i] + "\n";
  }
  EXPECT_EQ(text,
            "1 In Use\n2 Starting\n3 Stopping\n8 Dormant\n10 Stopped\n12 Offline\n13 Lost Communication\n"
            "15 Empty Socket\n16 Disabled\n17 No Contact\n20 Predictive Failure\n21 Degraded\n24 Failed\n.. Other\n");
}

TEST(ValueMaps, StatusHasTheProcessorsOwnSpelling) {
  EXPECT_EQ(qualifier(cpuClasses().front(), "Status", "ValueMap").values,
            (std::vector<std::string>{"OK", "Degraded", "Error", "UnKnown", "Unknown"}));
}

}  // namespace Corvcim
