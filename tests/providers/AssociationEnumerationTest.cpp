// EnumInstances and EnumInstanceNames of the five associations.

#include <CPUObjFactory.h>

#include <algorithm>

#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::Instance;
using Scripted::inventory;
using Support::answered;
using Support::answeredNothing;
using Support::outcome;

class AssociationEnumeration : public Association {
 protected:
  std::vector<Instance> allInstances() const {
    std::vector<Instance> instances;
    for (const Pair& pair : row().pairs()) {
      instances.push_back(instanceOf(pair, row().enumerationsDescribeTheCache));
    }
    return instances;
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachAssociation, AssociationEnumeration, ::testing::ValuesIn(rows()), className);

TEST_P(AssociationEnumeration, AnswersAnInstanceForEachPair) {
  EXPECT_EQ(enumerateInstances(row().className), answered(allInstances()));
  expectEvents(leavingBuilder(enteringBuilder("EnumInstances"), "EnumInstances"));
}

TEST_P(AssociationEnumeration, AnswersAPathForEachPair) {
  EXPECT_EQ(enumerateInstanceNames(row().className), answered(allPaths()));
  expectEvents(events("EnumInstanceNames").entering().exiting());
}

TEST_P(AssociationEnumeration, MakesNoInstanceOfItsOwnForNames) {
  broker.services().record(true);
  enumerateInstanceNames(row().className);
  for (const std::string& madeClass : Support::detailsOf(broker.services().takeRecord(), "newInstance")) {
    EXPECT_NE(madeClass, row().className);
  }
}

TEST_P(AssociationEnumeration, FiltersPropertiesByItsKeyList) {
  const auto filtersOf = [&](const Corvcim::PropertyList& properties) {
    broker.services().record(true);
    afterwards([&] { enumerateInstances(row().className); });  // what is collected once is collected now
    enumerateInstances(row().className, properties);
    return Support::detailsOf(broker.services().takeRecord(), "setPropertyFilter");
  };
  const std::string keys = std::string(" keys ") + row().filterKeys;
  const std::size_t pairs = row().pairs().size();
  const auto countOf = [&](const std::vector<std::string>& filters, const std::string& wanted) {
    return static_cast<std::size_t>(std::count(filters.begin(), filters.end(), wanted));
  };
  EXPECT_EQ(countOf(filtersOf(std::nullopt), "properties NULL" + keys), pairs);
  EXPECT_EQ(countOf(filtersOf(std::vector<std::string>{"Level", "X"}), "properties {Level,X}" + keys), pairs);
  EXPECT_EQ(countOf(filtersOf(std::vector<std::string>{}), "properties {}" + keys), pairs);
}

// Where the key list names the references, they pass any property list; elsewhere they do not.
TEST_P(AssociationEnumeration, PropertyListLeavesWhatItAndTheKeyListName) {
  const bool keepsItsEnds = std::string(row().filterKeys).find(row().firstEnd) != std::string::npos;
  const auto response = enumerateInstances(row().className, std::vector<std::string>{"Level", "NoSuchProperty"});
  ASSERT_EQ(response.instances.size(), row().pairs().size());
  for (std::size_t i = 0; i < response.instances.size(); ++i) {
    const auto whole = allInstances()[i];
    std::vector<Corvcim::NamedValue> expected;
    for (const auto& property : whole.properties) {
      if (property.name == "Level" || (keepsItsEnds && property.value.type() == CMPI_ref)) {
        expected.push_back(property);
      }
    }
    EXPECT_EQ(response.instances[i].properties, expected);
  }
}

TEST_P(AssociationEnumeration, AnswersInTheNameSpaceOfTheRequest) {
  ObjectPath elsewhere = Support::classPath(row().className);
  elsewhere.nameSpace = "root/elsewhere";
  elsewhere.host = "client";
  const auto expectOwnEndsThere = [&](const ObjectPath& path) {
    EXPECT_EQ(path.nameSpace, "root/elsewhere");
    EXPECT_EQ(path.host, "scripted-host");
    for (const auto& key : path.keys) {
      const ObjectPath& end = key.value.asReference();
      if (end.className != "HALDA_ComputerSystem") {
        EXPECT_EQ(end.nameSpace, "root/elsewhere") << key.name;
        EXPECT_EQ(end.host, "scripted-host") << key.name;
      }
    }
  };
  const auto instances = broker.enumerateInstances(mi(), elsewhere);
  const auto names = broker.enumerateInstanceNames(mi(), elsewhere);
  EXPECT_EQ(instances.instances.size(), row().pairs().size());
  EXPECT_EQ(names.paths.size(), row().pairs().size());
  for (const Instance& each : instances.instances) {
    expectOwnEndsThere(each.path);
  }
  for (const ObjectPath& each : names.paths) {
    expectOwnEndsThere(each);
  }
}

TEST_P(AssociationEnumeration, CollectsTheKindsOfItsEndsOnly) {
  const std::string name = row().className;
  enumerateInstances(name);
  const bool processors = name != "HALDA_CPUCoreAssociatedCacheMemory";
  const bool caches = name.find("Cache") != std::string::npos;
  const bool cores = name == "HALDA_CPUCoreAssociatedCacheMemory" || name == "HALDA_CPUConcreteComponent";
  using Tarn::CPUProvider::CPUObjFactory;
  EXPECT_EQ(CPUObjFactory::_isProcPopulated, processors);
  EXPECT_EQ(CPUObjFactory::_isMemPopulated, caches);
  EXPECT_EQ(CPUObjFactory::_isProcCorePopulated, cores);
}

TEST_P(AssociationEnumeration, OfNothingIsEmpty) {
  inventory().reset();
  broker.serveInstances("HALDA_ComputerSystem", {});
  const auto instances = enumerateInstances(row().className);
  EXPECT_EQ(instances, answeredNothing());
}

TEST_P(AssociationEnumeration, ElementThatTheBrokerCannotMakeIsLeftOut) {
  // The far ends of the walks are instances; computer systems are not the library's.
  const std::string farClass = row().pairs().front().second.className;
  const bool farIsFirst = std::string(row().className) == "HALDA_CPUCoreAssociatedCacheMemory";
  const std::string made = farIsFirst ? row().pairs().front().first.className : farClass;
  if (std::string(row().className) == "HALDA_CPUSystemDevice") {
    GTEST_SKIP() << "both ends are paths";
  }
  const unsigned int ordinal = ordinalOf("newInstance", made, 1, [&] { enumerateInstanceNames(row().className); });
  broker.failNth("newInstance", ordinal);
  Paths expected = allPaths();
  expected.erase(expected.begin());
  EXPECT_EQ(enumerateInstanceNames(row().className), answered(expected));
}

}  // namespace
