// The four association operations of the five associations, from both ends.

#include <algorithm>

#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::AssociationFilter;
using Corvcim::Instance;
using Corvcim::OperationKind;
using Corvcim::Response;
using Support::answered;
using Support::answeredNothing;
using Support::withHost;
using Support::withoutDone;

class AssociationNavigation : public Association {
 protected:
  Paths linksOf(const FarEnds& ends) const {
    Paths links;
    for (const ObjectPath& element : ends.elements) {
      links.push_back(pathOf(pairOf(ends.source, element)));
    }
    return links;
  }

  std::vector<Instance> linkInstancesOf(const FarEnds& ends) const {
    std::vector<Instance> links;
    for (const ObjectPath& element : ends.elements) {
      links.push_back(instanceOf(pairOf(ends.source, element), row().referencesDescribeTheCache));
    }
    return links;
  }

  Support::EventList wholeRequest(OperationKind kind, const FarEnds& ends) const {
    AssociationFilter filter;
    filter.assocClass = row().className;
    Support::EventList list = enteringAssociation(kind, filter);
    if (row().tracesTargetClass && isAssociators(kind)) {
      list.variable("((targetClass)->ft->getCharPtr((targetClass),(&rc)))", ends.elements.front().className);
    }
    return list.exiting();
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachAssociation, AssociationNavigation, ::testing::ValuesIn(rows()), className);

TEST_P(AssociationNavigation, AssociatorsAnswersTheFarEnds) {
  for (const FarEnds& ends : row().farEnds()) {
    const Response response = askOwn(OperationKind::Associators, ends.source);
    EXPECT_EQ(Support::pathsOf(response), ends.elements);
    EXPECT_EQ(Support::outcome(response), "CMPI_RC_OK no message not done");
    expectEvents(wholeRequest(OperationKind::Associators, ends));
  }
}

// The far ends are the instances that their own classes answer.
TEST_P(AssociationNavigation, AssociatorsAnswersWholeInstances) {
  for (const FarEnds& ends : row().farEnds()) {
    const std::string farClass = ends.elements.front().className;
    if (farClass == "HALDA_ComputerSystem") {
      EXPECT_EQ(askOwn(OperationKind::Associators, ends.source).instances,
                (std::vector{Support::systemInstance("sysB"), Support::systemInstance("sysA")}));
      continue;
    }
    for (const Instance& each : askOwn(OperationKind::Associators, ends.source).instances) {
      EXPECT_EQ(getInstance(each.path).instances, std::vector{each});
    }
    Support::forgetInventory();  // the cores, which the processor-cache association does not bear
  }
}

TEST_P(AssociationNavigation, AssociatorNamesAnswersThePathsOfTheFarEnds) {
  for (const FarEnds& ends : row().farEnds()) {
    EXPECT_EQ(askOwn(OperationKind::AssociatorNames, ends.source), withoutDone(answered(ends.elements)));
    expectEvents(wholeRequest(OperationKind::AssociatorNames, ends));
  }
}

TEST_P(AssociationNavigation, ReferencesAnswersAnInstanceForEachFarEnd) {
  for (const FarEnds& ends : row().farEnds()) {
    EXPECT_EQ(askOwn(OperationKind::References, ends.source), withoutDone(answered(linkInstancesOf(ends))));
    expectEvents(wholeRequest(OperationKind::References, ends));
  }
}

TEST_P(AssociationNavigation, ReferenceNamesAnswersAPathForEachFarEnd) {
  for (const FarEnds& ends : row().farEnds()) {
    EXPECT_EQ(askOwn(OperationKind::ReferenceNames, ends.source), withoutDone(answered(linksOf(ends))));
    expectEvents(wholeRequest(OperationKind::ReferenceNames, ends));
  }
}

TEST_P(AssociationNavigation, BothEndsTellTheSameAssociation) {
  const Pair pair = row().pairs().front();
  for (const ObjectPath& source : {pair.first, pair.second}) {
    const Paths names = askOwn(OperationKind::ReferenceNames, source).paths;
    EXPECT_EQ(std::count(names.begin(), names.end(), pathOf(pair)), 1);
  }
}

// The request's path goes into the reference as the client sent it.
TEST_P(AssociationNavigation, KeepsTheSourceAsTheClientNamedIt) {
  for (FarEnds ends : row().farEnds()) {
    for (const std::string& host : {std::string("client"), std::string()}) {
      ends.source = withHost(ends.source, host);
      EXPECT_EQ(askOwn(OperationKind::References, ends.source).instances, linkInstancesOf(ends));
      EXPECT_EQ(askOwn(OperationKind::ReferenceNames, ends.source).paths, linksOf(ends));
    }
  }
}

TEST_P(AssociationNavigation, AnswersInTheNameSpaceOfTheSource) {
  for (const FarEnds& ends : row().farEnds()) {
    ObjectPath source = ends.source;
    source.nameSpace = "root/elsewhere";
    Paths expected = ends.elements;
    for (ObjectPath& each : expected) {
      if (each.className != "HALDA_ComputerSystem") {
        each.nameSpace = "root/elsewhere";
      }
    }
    EXPECT_EQ(Support::pathsOf(askOwn(OperationKind::Associators, source)), expected);
    EXPECT_EQ(askOwn(OperationKind::AssociatorNames, source).paths, expected);
    for (const ObjectPath& link : askOwn(OperationKind::ReferenceNames, source).paths) {
      EXPECT_EQ(link.nameSpace, "root/elsewhere");
    }
  }
}

TEST_P(AssociationNavigation, WorksWithoutNameSpace) {
  for (const FarEnds& ends : row().farEnds()) {
    for (const OperationKind kind : associationOperations) {
      const Response response = askOwn(kind, Support::withoutNameSpace(ends.source));
      EXPECT_EQ(Support::outcome(response), "CMPI_RC_OK no message not done");
      EXPECT_EQ(response.instances.size() + response.paths.size(), ends.elements.size());
    }
  }
}

TEST_P(AssociationNavigation, RolesPlayNoPart) {
  AssociationFilter filter;
  filter.assocClass = row().className;
  filter.role = "NoSuchRole";
  filter.resultRole = "NoSuchRole";
  for (const FarEnds& ends : row().farEnds()) {
    for (const OperationKind kind : associationOperations) {
      EXPECT_EQ(ask(kind, ends.source, filter), askOwn(kind, ends.source));
    }
  }
}

TEST_P(AssociationNavigation, ResultClassOfReferencesPlaysNoPart) {
  AssociationFilter filter;
  filter.resultClass = "NoSuchClass";
  for (const FarEnds& ends : row().farEnds()) {
    for (const OperationKind kind : {OperationKind::References, OperationKind::ReferenceNames}) {
      EXPECT_EQ(ask(kind, ends.source, filter), askOwn(kind, ends.source));
    }
    forgetTraces();
    ask(OperationKind::References, ends.source, filter);
    expectEvents(enteringAssociation(OperationKind::References, filter).exiting());
  }
}

TEST_P(AssociationNavigation, SourceWithoutItsKeyFindsNothing) {
  for (const FarEnds& ends : row().farEnds()) {
    if (std::string(row().className) == "HALDA_CPUSystemDevice") {
      continue;  // looks at no key of its source
    }
    ObjectPath keyless = Support::classPath(ends.source.className);
    ObjectPath wrongKey = keyless;
    wrongKey.keys = {Support::textKey("Other", "cpu0")};
    ObjectPath nullKey = keyless;
    ObjectPath numberKey = keyless;
    for (const char* name : {"DeviceID", "InstanceID"}) {
      nullKey.keys.push_back({name, Corvcim::Value::null(CMPI_string)});
      numberKey.keys.push_back({name, Corvcim::Value::uint64(0)});
    }
    for (const ObjectPath& source : {keyless, wrongKey, nullKey, numberKey}) {
      for (const OperationKind kind : associationOperations) {
        const Response response = askOwn(kind, source);
        EXPECT_EQ(response, withoutDone(answeredNothing())) << source;
      }
    }
  }
}

TEST_P(AssociationNavigation, UnknownSourceFindsNothing) {
  if (std::string(row().className) == "HALDA_CPUSystemDevice") {
    GTEST_SKIP() << "looks at no key of its source";
  }
  for (const FarEnds& ends : row().farEnds()) {
    const std::string known = ends.source.key("DeviceID") != nullptr ? "DeviceID" : "InstanceID";
    for (const std::string& unknown :
         {std::string("unknown"), std::string(), std::string("CPU0"), std::string(" cpu0")}) {
      ObjectPath source = ends.source;
      Corvcim::assignValue(source.keys, known, Corvcim::Value::string(unknown));
      for (const OperationKind kind : associationOperations) {
        EXPECT_EQ(askOwn(kind, source), withoutDone(answeredNothing())) << source;
      }
    }
  }
}

TEST_P(AssociationNavigation, PropertyListReachesTheFarEnds) {
  for (const FarEnds& ends : row().farEnds()) {
    if (ends.elements.front().className == "HALDA_ComputerSystem") {
      continue;  // asked for without a list
    }
    const Response response = askOwn(OperationKind::Associators, ends.source, std::vector<std::string>{"Caption"});
    ASSERT_EQ(response.instances.size(), ends.elements.size());
    for (std::size_t i = 0; i < ends.elements.size(); ++i) {
      EXPECT_EQ(response.instances[i].properties.size(), ends.elements[i].keys.size() + 1);
      EXPECT_NE(response.instances[i].property("Caption"), nullptr);
    }
  }
}

TEST_P(AssociationNavigation, PropertyListLeavesReferencesTheirEnds) {
  for (const FarEnds& ends : row().farEnds()) {
    const Response response =
        askOwn(OperationKind::References, ends.source, std::vector<std::string>{"ReadPolicy", "NoSuchProperty"});
    ASSERT_EQ(response.instances.size(), ends.elements.size());
    const std::size_t described = row().referencesDescribeTheCache ? 1 : 0;
    for (const Instance& each : response.instances) {
      EXPECT_EQ(each.properties.size(), 2 + described);
      EXPECT_EQ(each.property("ReadPolicy") != nullptr, described == 1);
    }
  }
}

// Of the associations of systems and of capabilities only enumerations are filtered.
TEST_P(AssociationNavigation, ReferencesAreFilteredByTheirKeyList) {
  broker.services().record(true);
  const FarEnds ends = row().farEnds().front();
  const auto filtersOf = [&](OperationKind kind, const Corvcim::PropertyList& properties) {
    static_cast<void>(broker.services().takeRecord());
    askOwn(kind, ends.source, properties);
    std::vector<std::string> filters;
    std::string made;
    for (const Corvcim::ServiceCall& call : broker.services().takeRecord()) {
      made = call.service == "newInstance" ? call.detail : made;
      if (call.service == "setPropertyFilter" && made == row().className) {
        filters.push_back(call.detail);
      }
    }
    return filters;
  };
  using Filters = std::vector<std::string>;
  const std::size_t count = row().referencesAreFiltered ? ends.elements.size() : 0;
  const auto filters = [&](const std::string& properties) {
    return Filters(count, "properties " + properties + " keys " + row().filterKeys);
  };
  EXPECT_EQ(filtersOf(OperationKind::References, std::vector<std::string>{"Level"}), filters("{Level}"));
  EXPECT_EQ(filtersOf(OperationKind::References, std::nullopt), filters("NULL"));
  EXPECT_EQ(filtersOf(OperationKind::ReferenceNames, std::nullopt), filters("NULL"));
}

TEST_P(AssociationNavigation, ResultThatTheBrokerRefusesDoesNotEndTheRequest) {
  for (const FarEnds& ends : row().farEnds()) {
    for (const OperationKind kind : associationOperations) {
      broker.failNth("returnInstance", 1);
      broker.failNth("returnObjectPath", 1);
      const Response response = askOwn(kind, ends.source);
      broker.services().clearFailures();
      EXPECT_EQ(Support::outcome(response), "CMPI_RC_OK no message not done");
      EXPECT_EQ(response.instances.size() + response.paths.size(), ends.elements.size() - 1);
    }
  }
}

}  // namespace
