// The build with CORVANE_STANDARD_REQUESTS: names of classes, roles and properties as clients and brokers give them.

#include <algorithm>

#include "host/broker/Objects.h"
#include "host/broker/Request.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"
#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::AssociationFilter;
using Corvcim::Instance;
using Corvcim::OperationKind;
using Corvcim::PropertyList;
using Corvcim::Response;
using Support::answeredNothing;

using Names = std::vector<std::string>;
using OptionalNames = std::vector<std::optional<std::string>>;

std::string lowered(std::string text) {
  std::ranges::transform(text, text.begin(), Corvcim::toLowerAscii);
  return text;
}

std::string raised(std::string text) {
  std::ranges::transform(text, text.begin(),
                         [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c; });
  return text;
}

/// What admits a class: nothing, itself and its parents, in any case.
OptionalNames admitting(const std::string& className) {
  OptionalNames names{std::nullopt, ""};
  for (std::string_view each = className; !each.empty(); each = Corvcim::parentOf(each)) {
    names.emplace_back(each);
    names.emplace_back(lowered(std::string(each)));
    names.emplace_back(raised(std::string(each)));
  }
  return names;
}

/// Classes that are neither this class nor one of its parents.
Names others(const std::string& className) {
  Names names{"HALDA_Unknown", "CIM_Unknown", className + "2", className.substr(0, className.size() - 1), " "};
  for (const Corvcim::ClassDefinition& each : Corvcim::classDefinitions()) {
    for (const std::string_view name : {each.name, each.parent}) {
      if (!Corvcim::isA(className, name)) {
        names.emplace_back(name);
      }
    }
  }
  return names;
}

class FrontDoor : public Association {
 protected:
  AssociationFilter own() const {
    AssociationFilter filter;
    filter.assocClass = row().className;
    return filter;
  }

  /// A filter by association class, which the reference operations take as their result class.
  static AssociationFilter byAssociation(OperationKind kind, const std::optional<std::string>& name) {
    AssociationFilter filter;
    (isAssociators(kind) ? filter.assocClass : filter.resultClass) = name;
    return filter;
  }

  std::string nearRole(const FarEnds& ends) const {
    return ends.source.className == row().pairs().front().first.className ? row().firstEnd : row().secondEnd;
  }
  std::string farRole(const FarEnds& ends) const {
    return nearRole(ends) == row().firstEnd ? row().secondEnd : row().firstEnd;
  }

  /// Hands every operation from every kind of source to `check`, with what the exact request is answered.
  template <class Check>
  void forEachRequest(Check check) {
    for (const FarEnds& ends : row().farEnds()) {
      for (const OperationKind kind : associationOperations) {
        SCOPED_TRACE(std::string(Corvcim::operationName(kind)) + " from " + ends.source.className);
        const Response expected = ask(kind, ends.source, isAssociators(kind) ? own() : AssociationFilter());
        ASSERT_EQ(expected.instances.size() + expected.paths.size(), ends.elements.size());
        check(ends, kind, expected);
      }
    }
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachAssociation, FrontDoor, ::testing::ValuesIn(rows()), className);

TEST_P(FrontDoor, SourceOfAnotherClassFindsNothing) {
  for (const char* other : {"HALDA_Unrelated", "CIM_Processor", "CIM_ComputerSystem", "CIM_Memory", "", "HALDA_",
                            "HALDA_CPUSystemDevice", "HALDA_CPUProcessorX"}) {
    for (const OperationKind kind : associationOperations) {
      ObjectPath source = Support::processorPath("cpu0");
      source.className = other;
      forgetTraces();
      EXPECT_EQ(ask(kind, source), answeredNothing()) << other;
      EXPECT_EQ(ask(kind, source, own()), answeredNothing()) << other;
      expectEvents(Support::EventList(provider(), ""));
    }
  }
}

TEST_P(FrontDoor, SourceAtAnEndOfAnotherAssociationFindsNothing) {
  for (const Row& other : rows()) {
    for (const FarEnds& ends : other.farEnds()) {
      const auto isOwn = [&](const FarEnds& each) { return each.source.className == ends.source.className; };
      const std::vector<FarEnds> ownEnds = row().farEnds();
      for (const OperationKind kind : associationOperations) {
        if (std::ranges::none_of(ownEnds, isOwn)) {
          EXPECT_EQ(ask(kind, ends.source), answeredNothing()) << ends.source.className;
        }
      }
    }
  }
}

TEST_P(FrontDoor, SourceWhoseClassTheBrokerCannotGiveFindsNothing) {
  for (const OperationKind kind : associationOperations) {
    broker.failNth("getClassName", 1);
    EXPECT_EQ(ask(kind, row().farEnds().front().source, own()), answeredNothing());
  }
}

TEST_P(FrontDoor, SourceWithoutAHandleFindsNothing) {
  const CMPIObjectPath source{nullptr, &Corvcim::objectPathOperations};
  CMPIAssociationMI* interface = provider().createAssociationMI(broker.handle(), nullptr, nullptr);
  for (const CMPIObjectPath* each : {&source, static_cast<const CMPIObjectPath*>(nullptr)}) {
    Corvcim::Request request(broker, Support::testNameSpace);
    const CMPIStatus status = interface->ft->associatorNames(interface, request.context(), request.result(), each,
                                                             nullptr, nullptr, nullptr, nullptr);
    EXPECT_EQ(request.response(status), answeredNothing());
  }
}

TEST_P(FrontDoor, SourceClassInAnotherCaseIsAnswered) {
  forEachRequest([&](const FarEnds& ends, OperationKind kind, const Response& expected) {
    for (const std::string& spelling : {lowered(ends.source.className), raised(ends.source.className)}) {
      ObjectPath source = ends.source;
      source.className = spelling;
      EXPECT_EQ(ask(kind, source), expected) << spelling;
    }
  });
}

TEST_P(FrontDoor, SourceThatTheBrokerCannotCopyIsHandedOnAsItIs) {
  ObjectPath source = row().farEnds().front().source;
  source.className = lowered(source.className);
  broker.failNth("clone", 1);
  EXPECT_EQ(ask(OperationKind::AssociatorNames, source).paths, Paths());
}

TEST_P(FrontDoor, AssociationClassMayBeAbsentAParentOrInAnotherCase) {
  forEachRequest([&](const FarEnds& ends, OperationKind kind, const Response& expected) {
    for (const std::optional<std::string>& name : admitting(row().className)) {
      EXPECT_EQ(ask(kind, ends.source, byAssociation(kind, name)), expected) << name.value_or("absent");
    }
  });
}

TEST_P(FrontDoor, AnotherAssociationClassFindsNothing) {
  forEachRequest([&](const FarEnds& ends, OperationKind kind, const Response&) {
    for (const std::string& name : others(row().className)) {
      EXPECT_EQ(ask(kind, ends.source, byAssociation(kind, name)), answeredNothing()) << name;
    }
  });
}

TEST_P(FrontDoor, ResultClassMayBeAbsentTheFarEndsOrAParentInAnyCase) {
  forEachRequest([&](const FarEnds& ends, OperationKind kind, const Response& expected) {
    if (!isAssociators(kind)) {
      return;
    }
    for (const std::optional<std::string>& name : admitting(ends.elements.front().className)) {
      AssociationFilter filter;
      filter.resultClass = name;
      EXPECT_EQ(ask(kind, ends.source, filter), expected) << name.value_or("absent");
    }
  });
}

TEST_P(FrontDoor, AnotherResultClassFindsNothing) {
  forEachRequest([&](const FarEnds& ends, OperationKind kind, const Response&) {
    if (!isAssociators(kind)) {
      return;
    }
    for (const std::string& name : others(ends.elements.front().className)) {
      AssociationFilter filter = own();
      filter.resultClass = name;
      EXPECT_EQ(ask(kind, ends.source, filter), answeredNothing()) << name;
    }
  });
}

TEST_P(FrontDoor, RolesOfTheseEndsAreAnsweredInAnyCase) {
  forEachRequest([&](const FarEnds& ends, OperationKind kind, const Response& expected) {
    for (const std::string& role : {nearRole(ends), lowered(nearRole(ends)), raised(nearRole(ends)), std::string()}) {
      AssociationFilter filter;
      filter.role = role;
      EXPECT_EQ(ask(kind, ends.source, filter), expected) << role;
    }
    for (const std::string& role : {farRole(ends), lowered(farRole(ends)), raised(farRole(ends)), std::string()}) {
      AssociationFilter filter;
      filter.resultRole = role;
      EXPECT_EQ(ask(kind, ends.source, filter), expected) << role;
    }
  });
}

TEST_P(FrontDoor, AnyOtherRoleFindsNothing) {
  forEachRequest([&](const FarEnds& ends, OperationKind kind, const Response&) {
    for (const std::string& role : {farRole(ends), std::string("NoSuchRole"), nearRole(ends) + "s"}) {
      AssociationFilter filter = own();
      filter.resultClass = std::nullopt;
      filter.assocClass = isAssociators(kind) ? filter.assocClass : std::nullopt;
      filter.role = role;
      EXPECT_EQ(ask(kind, ends.source, filter), answeredNothing()) << role;
    }
    for (const std::string& role : {nearRole(ends), std::string("NoSuchRole")}) {
      AssociationFilter filter;
      filter.resultRole = role;
      if (isAssociators(kind)) {
        EXPECT_EQ(ask(kind, ends.source, filter), answeredNothing()) << role;
      }
    }
  });
}

/// The names that a broker gives for a class's properties, in another case.
PropertyList loweredNames(const std::vector<Instance>& instances) {
  Names names;
  for (const Corvcim::NamedValue& each : instances.front().properties) {
    names.push_back(lowered(each.name));
  }
  return names;
}

TEST_P(FrontDoor, PropertyListInAnotherCaseReachesTheFarEnds) {
  for (const FarEnds& ends : row().farEnds()) {
    const std::vector<Instance> all = ask(OperationKind::Associators, ends.source).instances;
    ASSERT_FALSE(all.empty());
    EXPECT_EQ(ask(OperationKind::Associators, ends.source, {}, loweredNames(all)).instances, all);
  }
}

TEST_P(FrontDoor, PropertyListInAnotherCaseReachesReferences) {
  for (const FarEnds& ends : row().farEnds()) {
    const std::vector<Instance> all = ask(OperationKind::References, ends.source).instances;
    ASSERT_FALSE(all.empty());
    EXPECT_EQ(ask(OperationKind::References, ends.source, {}, loweredNames(all)).instances, all);
  }
}

TEST_P(FrontDoor, EnumerationWithAPropertyListDeliversTheKeys) {
  const std::vector<Instance> all = enumerateInstances(row().className).instances;
  EXPECT_EQ(enumerateInstances(row().className, loweredNames(all)).instances, all);
  for (const Names& names : {Names(), Names{"NoSuchProperty"}, Names{"level"}}) {
    const std::vector<Instance> instances = enumerateInstances(row().className, names).instances;
    ASSERT_EQ(instances.size(), all.size());
    for (std::size_t i = 0; i < all.size(); ++i) {
      EXPECT_EQ(instances[i].path, all[i].path);
    }
  }
}

TEST_P(FrontDoor, PropertyListReachesTheBrokerInTheSpellingOfTheLibrary) {
  Names asked;
  std::string names;
  for (const Corvcim::PropertyDefinition& each : Corvcim::findClass(row().className)->properties) {
    asked.push_back(raised(std::string(each.name)));
    names += (names.empty() ? "" : ",") + std::string(each.name);
  }
  // This association's key list does not let its references pass.
  const bool addsKeys = std::string_view(row().className) == "HALDA_CPUElementCapabilities";
  const std::string added = addsKeys ? std::string(",") + row().firstEnd + ',' + row().secondEnd : "";
  const std::string expected = "properties {" + names + added + "} keys " + row().filterKeys;

  broker.services().record(true);
  enumerateInstances(row().className, asked);
  const std::vector<std::string> filters = Support::detailsOf(broker.services().takeRecord(), "setPropertyFilter");

  EXPECT_EQ(std::count(filters.begin(), filters.end(), expected), static_cast<std::ptrdiff_t>(row().pairs().size()));
}

TEST_P(FrontDoor, GetInstanceWithAPropertyListFindsItsInstance) {
  for (const ObjectPath& path : allPaths()) {
    for (const Names& names : {Names(), Names{"NoSuchProperty"}}) {
      const Response response = getInstance(path, names);
      ASSERT_EQ(response.instances.size(), 1U);
      EXPECT_EQ(response.instances.front().path, path);
      EXPECT_EQ(response.instances.front().properties.size(), 2U);
    }
  }
}

class FrontDoorOfInstances : public Support::ProviderTest, public ::testing::WithParamInterface<const char*> {
 protected:
  FrontDoorOfInstances() { scriptMachine(); }
};

INSTANTIATE_TEST_SUITE_P(OfEachClass, FrontDoorOfInstances,
                         ::testing::Values("HALDA_CPUProcessor", "HALDA_CPUProcessorCore", "HALDA_CPUMemory",
                                           "HALDA_CPUProcessorCapabilities"));

TEST_P(FrontDoorOfInstances, PropertyListSelectsInAnyCase) {
  const std::vector<Instance> all = enumerateInstances(GetParam()).instances;
  ASSERT_FALSE(all.empty());
  EXPECT_EQ(enumerateInstances(GetParam(), loweredNames(all)).instances, all);
  for (const Instance& each : all) {
    EXPECT_EQ(getInstance(each.path, loweredNames(all)).instances, std::vector{each});
  }
}

TEST_P(FrontDoorOfInstances, EachPropertyIsSelectedAlone) {
  const std::vector<Instance> all = enumerateInstances(GetParam()).instances;
  for (const Corvcim::NamedValue& property : all.front().properties) {
    const std::vector<Instance> some = enumerateInstances(GetParam(), Names{raised(property.name)}).instances;
    ASSERT_EQ(some.size(), all.size());
    EXPECT_EQ(some.front().path, all.front().path);
    ASSERT_NE(some.front().property(property.name), nullptr) << property.name;
    EXPECT_EQ(*some.front().property(property.name), property.value);
    EXPECT_LE(some.front().properties.size(), all.front().path.keys.size() + 1);
  }
}

TEST_P(FrontDoorOfInstances, ListWithoutNamesSelectsTheKeys) {
  for (const Instance& each : enumerateInstances(GetParam(), Names()).instances) {
    EXPECT_EQ(each.properties.size(), each.path.keys.size());
  }
}

TEST_P(FrontDoorOfInstances, NameThatNoClassHasSelectsNothing) {
  for (const Instance& each : enumerateInstances(GetParam(), Names{"NoSuchProperty", ""}).instances) {
    EXPECT_EQ(each.properties.size(), each.path.keys.size());
  }
}

TEST_F(FrontDoorOfInstances, UniqueIdIsSelectedByBothSpellings) {
  for (const char* name : {"UniqueId", "UniqueID", "uniqueid", "UNIQUEID"}) {
    const std::vector<Instance> instances = enumerateInstances("HALDA_CPUProcessor", Names{name}).instances;
    ASSERT_FALSE(instances.empty());
    EXPECT_NE(instances.front().property("UniqueId"), nullptr) << name;
  }
}

}  // namespace
