// The operations of each association tell the same pairs, on every machine of tests/fixtures.

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <nlohmann/json.hpp>
#include <set>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "schema/ClassTable.h"
#include "tests/library/LoadedLibrary.h"

namespace {

using Corvcim::ObjectPath;
using Corvcim::OperationKind;
using Corvcim::Response;
using Library::Environment;
using Library::LoadedLibrary;

/// Both ends' paths as texts.
using Pair = std::pair<std::string, std::string>;
using Pairs = std::set<Pair>;

constexpr std::size_t mostCores = 16;  // to keep the run short

std::size_t countCores(const nlohmann::json& nodes) {
  std::size_t cores = 0;
  for (const auto& node : nodes) {
    cores += node.value("type", "") == "core" ? 1U : 0U;
    cores += node.contains("children") ? countCores(node["children"]) : 0U;
  }
  return cores;
}

std::vector<std::string> machines() {
  std::vector<std::string> names;
  for (const auto& entry : std::filesystem::directory_iterator(Library::fixtures)) {
    std::ifstream file(entry.path() / "tree.json");
    if (!file) {
      continue;
    }
    const nlohmann::json tree = nlohmann::json::parse(file);
    if (countCores(tree["nodes"]) <= mostCores) {
      names.push_back(entry.path().filename());
    }
  }
  std::sort(names.begin(), names.end());
  return names;
}

class Consistency : public ::testing::TestWithParam<std::tuple<std::string, std::string>> {
 protected:
  Consistency() : environment_(Library::quietly(Library::fixture(std::get<0>(GetParam())))) {}

  const std::string& association() const { return std::get<1>(GetParam()); }
  const Corvcim::PropertyDefinition& end(std::size_t index) const {
    return Corvcim::referenceEnds(*Corvcim::findClass(association()))[index];
  }

  Pair pairOf(const ObjectPath& path) const {
    return {path.key(end(0).name)->asReference().text(), path.key(end(1).name)->asReference().text()};
  }
  Pairs pairsOf(const std::vector<ObjectPath>& paths) const {
    Pairs pairs;
    for (const ObjectPath& each : paths) {
      EXPECT_TRUE(pairs.insert(pairOf(each)).second) << "told twice: " << each;
    }
    return pairs;
  }
  static std::vector<ObjectPath> pathsOf(const Response& response) {
    std::vector<ObjectPath> paths = response.paths;
    for (const Corvcim::Instance& each : response.instances) {
      paths.push_back(each.path);
    }
    return paths;
  }

  /// What stands at one end: of a class of the library, or the computer system.
  std::vector<ObjectPath> elements(std::size_t index) {
    const std::string elementClass(end(index).referenceClass);
    if (elementClass == "HALDA_ComputerSystem") {
      return {ObjectPath::parse(
          "root/cimv2:HALDA_ComputerSystem.CreationClassName=\"HALDA_ComputerSystem\",Name=\"this-system\"")};
    }
    // In a library of its own: what it collects must not change this one's answers.
    LoadedLibrary other;
    return other.enumerateInstanceNames(elementClass).paths;
  }

  /// The pairs that an operation tells when it is asked of every element at one end.
  Pairs pairsFromEnd(std::size_t index, OperationKind kind) {
    Pairs pairs;
    for (const ObjectPath& element : elements(index)) {
      for (const ObjectPath& path : pathsOf(library.associate(association(), kind, element))) {
        EXPECT_EQ(path.key(end(index).name)->asReference(), element);
        EXPECT_TRUE(pairs.insert(pairOf(path)).second) << "told twice: " << path;
      }
    }
    return pairs;
  }

  /// The same of an operation that tells far ends.
  Pairs pairsByFarEnds(std::size_t index, OperationKind kind) {
    Pairs pairs;
    for (const ObjectPath& element : elements(index)) {
      for (const ObjectPath& far : pathsOf(library.associate(association(), kind, element))) {
        pairs.insert(index == 0 ? Pair{element.text(), far.text()} : Pair{far.text(), element.text()});
      }
    }
    return pairs;
  }

 private:
  Environment environment_;

 protected:
  LoadedLibrary library;
};

std::string machineAndAssociation(const ::testing::TestParamInfo<std::tuple<std::string, std::string>>& tested) {
  std::string name = std::get<0>(tested.param) + "_" + std::get<1>(tested.param);
  std::erase(name, '-');
  return name;
}

INSTANTIATE_TEST_SUITE_P(OfEachMachine, Consistency,
                         ::testing::Combine(::testing::ValuesIn(machines()),
                                            ::testing::ValuesIn(Library::associationClasses())),
                         machineAndAssociation);

TEST_P(Consistency, EveryOperationTellsTheSamePairs) {
  const Pairs pairs = pairsOf(pathsOf(library.enumerateInstances(association())));
  EXPECT_EQ(pairsOf(library.enumerateInstanceNames(association()).paths), pairs);
  for (const std::size_t index : {0U, 1U}) {
    EXPECT_EQ(pairsFromEnd(index, OperationKind::References), pairs) << "from " << end(index).name;
    EXPECT_EQ(pairsFromEnd(index, OperationKind::ReferenceNames), pairs) << "from " << end(index).name;
    EXPECT_EQ(pairsByFarEnds(index, OperationKind::Associators), pairs) << "from " << end(index).name;
    EXPECT_EQ(pairsByFarEnds(index, OperationKind::AssociatorNames), pairs) << "from " << end(index).name;
  }
}

TEST_P(Consistency, EveryPairCanBeGot) {
  const auto names = library.enumerateInstanceNames(association()).paths;
  const std::size_t step = 1 + names.size() / 8;
  for (std::size_t i = 0; i < names.size(); i += step) {
    const Response response = library.getInstance(names[i]);
    ASSERT_EQ(response.instances.size(), 1U) << names[i];
    EXPECT_EQ(pairOf(response.instances[0].path), pairOf(names[i]));
  }
}

}  // namespace
