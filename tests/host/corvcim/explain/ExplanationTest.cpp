#include <gtest/gtest.h>

#include <algorithm>
#include <set>

#include "host/corvcim/explain/Explanation.h"
#include "host/corvcim/explain/ExplanationTable.h"
#include "model/StateCodes.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "schema/ClassTable.h"
#include "tests/host/corvcim/Machines.h"

namespace Corvcim::Testing {
namespace {

using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::Tree;
using Tarn::Inventory::TreeBuilder;

const PropertySource& sourceOf(std::string_view className, std::string_view property) {
  const auto all = propertySources();
  const auto found = std::ranges::find_if(
      all, [&](const PropertySource& source) { return source.className == className && source.property == property; });
  EXPECT_NE(found, all.end()) << className << '.' << property;
  return *found;
}

TEST(ExplanationTable, CoversEveryPropertyOfItsClasses) {
  for (const std::string_view name :
       {"HALDA_ComputerSystem", "HALDA_CPUProcessor", "HALDA_CPUProcessorCore", "HALDA_CPUMemory",
        "HALDA_CPUProcessorCapabilities", "HALDA_CPUAssociatedCacheMemory"}) {
    std::vector<std::string_view> expected;
    for (const PropertyDefinition& property : findClass(name)->properties) {
      expected.push_back(property.name);
    }
    std::vector<std::string_view> actual;
    for (const PropertySource& source : propertySources()) {
      if (source.className == name) {
        actual.push_back(source.property);
      }
    }
    EXPECT_EQ(actual, expected) << name;
  }
}

TEST(ExplanationTable, TakesEveryFieldThatThereIs) {
  const std::vector<std::string_view> fields = fieldNames();
  // No class has these.
  std::set<std::string_view> taken = {"type", "parent", "cpus", "Socket", "SerialNumber", "AssetTag", "PartNumber"};
  for (const PropertySource& source : propertySources()) {
    if (!source.field.empty() && source.field != "path") {
      EXPECT_NE(std::ranges::find(fields, source.field), fields.end()) << source.field;
      taken.insert(source.field);
    }
    EXPECT_EQ(source.step == Step::Coded, source.codes != nullptr) << source.property;
    EXPECT_EQ(source.step == Step::Constant, source.field.empty()) << source.property;
  }
  EXPECT_EQ(taken, std::set<std::string_view>(fields.begin(), fields.end()));
}

using Product = unsigned (*)(unsigned code);

void expectCodes(std::string_view className, std::string_view property, Product product) {
  const PropertySource& source = sourceOf(className, property);
  for (const unsigned code : {0U,  1U,  2U,  3U,  4U,  5U,  6U,  7U,  8U,  9U,  10U, 11U, 12U,  13U,    14U,
                              15U, 16U, 17U, 18U, 19U, 20U, 21U, 22U, 23U, 24U, 25U, 99U, 255U, 65536U, 65537U}) {
    EXPECT_EQ(expectedValue(source, {FieldValue(code), false}), std::to_string(product(code)))
        << className << '.' << property << ' ' << code;
  }
}

TEST(ExplanationTable, HasTheCodesOfTheLibrary) {
  using namespace Tarn::CPUProvider;
  for (const std::string_view name : {"HALDA_CPUProcessor", "HALDA_CPUMemory"}) {
    expectCodes(name, "EnabledState",
                [](unsigned code) -> unsigned { return translate(enabledStates, code, enabledStateNotApplicable); });
  }
  for (const std::string_view name : {"HALDA_CPUProcessor", "HALDA_CPUMemory", "HALDA_CPUProcessorCore"}) {
    expectCodes(name, "OperationalStatus",
                [](unsigned code) -> unsigned { return translate(operationalStatuses, code, 0); });
  }
  for (const std::string_view name : {"HALDA_CPUMemory", "HALDA_CPUProcessorCore"}) {
    expectCodes(name, "HealthState",
                [](unsigned code) -> unsigned { return healthOf(coreAndCacheHealth, code).state; });
  }
  expectCodes("HALDA_CPUProcessor", "HealthState",
              [](unsigned code) -> unsigned { return healthOf(processorHealth, code).state; });
  expectCodes("HALDA_CPUAssociatedCacheMemory", "WritePolicy",
              [](unsigned code) -> unsigned { return translate(cacheWritePolicies, code, 0); });
  expectCodes("HALDA_CPUAssociatedCacheMemory", "CacheType",
              [](unsigned code) -> unsigned { return translate(cacheTypes, code, 0); });
  expectCodes("HALDA_CPUAssociatedCacheMemory", "Associativity",
              [](unsigned code) -> unsigned { return translate(cacheAssociativities, code, 0); });
}

TEST(ExplanationTable, HasTheStatusTextsOfTheLibrary) {
  using namespace Tarn::CPUProvider;
  for (const unsigned code : {0U, 1U, 12U, 21U, 24U}) {
    EXPECT_EQ(expectedValue(sourceOf("HALDA_CPUProcessor", "Status"), {FieldValue(code), false}),
              healthOf(processorHealth, code).text);
  }
}

TEST(ExplanationTable, SaysWhatTheLibraryDoes) {
  const PropertySource& state = sourceOf("HALDA_CPUProcessor", "EnabledState");
  const PropertySource& clock = sourceOf("HALDA_CPUProcessor", "MaxClockSpeed");
  const PropertySource& name = sourceOf("HALDA_CPUProcessor", "Name");
  const PropertySource& upgrade = sourceOf("HALDA_CPUProcessor", "UpgradeMethod");

  EXPECT_EQ(describeStep(state, {FieldValue(12U), false}), "table EnabledState: 12 is 6");
  EXPECT_EQ(describeStep(state, {FieldValue(24U), false}),
            "table EnabledState: any code without a row, such as 24, is 5");
  EXPECT_EQ(describeStep(clock, {FieldValue(3000U), false}), "as it is");
  EXPECT_EQ(describeStep(clock, {std::nullopt, false}), "0 where it is not known");
  EXPECT_EQ(describeStep(name, {FieldValue(std::string("CPU")), true}),
            "Unknown, because the system's model says that the machine is virtual");
  EXPECT_EQ(describeStep(name, {std::nullopt, true}), "empty where it is not known");
  EXPECT_EQ(describeStep(upgrade, {FieldValue(65537U), false}), "its lowest 16 bits");
  EXPECT_EQ(expectedValue(upgrade, {FieldValue(65537U), false}), "1");
  EXPECT_EQ(expectedValue(clock, {FieldValue(65537U), false}), "65537");
}

std::string targetsOf(const Tree& tree, const std::string& text) {
  std::string list;
  try {
    for (const ExplanationTarget& target : explanationTargets(tree, text)) {
      list +=
          (list.empty() ? "" : ", ") + std::string(target.className) + ' ' + std::string(tree.node(target.node).path());
    }
  } catch (const std::exception& error) {
    return error.what();
  }
  return list;
}

TEST(ExplanationTargets, NothingIsEveryProcessor) {
  EXPECT_EQ(targetsOf(smallBoard(), ""),
            "HALDA_CPUProcessor P0, HALDA_CPUProcessorCapabilities P0, "
            "HALDA_CPUProcessor P1, HALDA_CPUProcessorCapabilities P1");
}

TEST(ExplanationTargets, APathOfTheTreeIsEveryClassOfThePart) {
  const Tree tree = smallBoard();
  EXPECT_EQ(targetsOf(tree, "system"), "HALDA_ComputerSystem system");
  EXPECT_EQ(targetsOf(tree, "P1"), "HALDA_CPUProcessor P1, HALDA_CPUProcessorCapabilities P1");
  EXPECT_EQ(targetsOf(tree, "P0.C3"), "HALDA_CPUProcessorCore P0.C3");
  EXPECT_EQ(targetsOf(tree, "P0.L2.0"), "HALDA_CPUMemory P0.L2.0, HALDA_CPUAssociatedCacheMemory P0.L2.0");
}

TEST(ExplanationTargets, AnObjectPathIsItsInstance) {
  const Tree tree = smallBoard();
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUProcessor.DeviceID=\"P0\""), "HALDA_CPUProcessor P0");
  EXPECT_EQ(targetsOf(tree, "root/cimv2:HALDA_CPUMemory.CreationClassName=\"HALDA_CPUMemory\",DeviceID=\"P0.L2.0\""),
            "HALDA_CPUMemory P0.L2.0");
  EXPECT_EQ(targetsOf(tree, "halda_cpuprocessorcapabilities.InstanceID=\"NERITH:P0\""),
            "HALDA_CPUProcessorCapabilities P0");
  EXPECT_EQ(targetsOf(tree, "HALDA_ComputerSystem.Name=\"host\""), "HALDA_ComputerSystem system");
  EXPECT_EQ(targetsOf(tree,
                      "HALDA_CPUAssociatedCacheMemory.Antecedent=\"HALDA_CPUMemory.DeviceID=\\\"P0.L2.0\\\"\","
                      "Dependent=\"HALDA_CPUProcessor.DeviceID=\\\"P0\\\"\""),
            "HALDA_CPUAssociatedCacheMemory P0.L2.0");
}

TEST(ExplanationTargets, AClassAndAKeyIsItsInstanceAndAClassAllOfThem) {
  const Tree tree = smallBoard();
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUMemory.P0.L2.0"), "HALDA_CPUMemory P0.L2.0");
  EXPECT_EQ(targetsOf(tree, "root/cimv2:HALDA_CPUProcessorCore.P0.C0"), "HALDA_CPUProcessorCore P0.C0");
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUProcessorCapabilities.NERITH:P0"), "HALDA_CPUProcessorCapabilities P0");
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUProcessorCapabilities.P0"), "HALDA_CPUProcessorCapabilities P0");
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUProcessor"), "HALDA_CPUProcessor P0, HALDA_CPUProcessor P1");
}

TEST(ExplanationTargets, WhatIsNotThereIsNamed) {
  const Tree tree = smallBoard();
  const std::string noPart = ": the inventory has no such part; 'corvcim inventory' lists them all";
  EXPECT_EQ(targetsOf(tree, "P7"),
            "explain P7: neither a part of this inventory nor a class; 'corvcim inventory' and 'corvcim classes' list "
            "them");
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUMemory.P0"), "explain HALDA_CPUMemory.P0" + noPart);
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUProcessor.DeviceID=\"\""), "explain HALDA_CPUProcessor.DeviceID=\"\"" + noPart);
  EXPECT_EQ(targetsOf(TreeBuilder().build(), "HALDA_ComputerSystem.x"), "explain HALDA_ComputerSystem.x" + noPart);
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUProcessor.Name=\"P0\""),
            "explain HALDA_CPUProcessor.Name=\"P0\": the path has no key DeviceID");
  EXPECT_EQ(targetsOf(tree, "HALDA_CPUSystemDevice"),
            "explain HALDA_CPUSystemDevice: instances of HALDA_CPUSystemDevice are not explained; there are "
            "HALDA_ComputerSystem, HALDA_CPUProcessor, HALDA_CPUProcessorCapabilities, HALDA_CPUProcessorCore, "
            "HALDA_CPUMemory, HALDA_CPUAssociatedCacheMemory");
}

}  // namespace
}  // namespace Corvcim::Testing
