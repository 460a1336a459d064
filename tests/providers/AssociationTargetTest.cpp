// Sources and association classes that lead nowhere, for the five associations.

#include <algorithm>

#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::AssociationFilter;
using Corvcim::OperationKind;
using Corvcim::Response;
using Support::answeredNothing;
using Support::outcome;
using Support::withoutDone;

class AssociationTarget : public Association {
 protected:
  AbsentTarget expectation(OperationKind kind) const {
    return isAssociators(kind) ? row().absentAssociators : row().absentReferences;
  }

  std::string textOf(OperationKind kind) const {
    if (kind == OperationKind::Associators && row().absentAssociatorsText != nullptr) {
      return row().absentAssociatorsText;
    }
    return "Object Path is NULL in " + std::string(Corvcim::operationName(kind)) + ".";
  }

  void expectNoTarget(OperationKind kind, const ObjectPath& source, const AssociationFilter& filter) {
    forgetTraces();
    const Response response = ask(kind, source, filter);
    EXPECT_EQ(response.instances.size() + response.paths.size(), 0U);
    const Support::EventList entering = enteringAssociation(kind, filter);
    switch (expectation(kind)) {
      case AbsentTarget::Fails:
        EXPECT_EQ(outcome(response), "CMPI_RC_ERR_FAILED |" + textOf(kind) + "| not done");
        expectEvents(Support::EventList(entering).error(textOf(kind)));
        break;
      case AbsentTarget::LogsOnly:
        EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
        expectEvents(Support::EventList(entering).error(textOf(kind)));
        break;
      case AbsentTarget::Succeeds:
        EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
        expectEvents(Support::EventList(entering).exiting());
        break;
    }
  }

  /// What a request answers whose target's path the broker did not make; `left` is the status that is left then.
  std::string outcomeWithoutPath(OperationKind kind, const std::string& left) const {
    switch (expectation(kind)) {
      case AbsentTarget::Fails:
        return "CMPI_RC_ERR_FAILED |" + textOf(kind) + "| not done";
      case AbsentTarget::LogsOnly:
        return left + " not done";
      case AbsentTarget::Succeeds:
        break;
    }
    return "CMPI_RC_OK no message not done";
  }

  AssociationFilter ownClass() const {
    AssociationFilter filter;
    filter.assocClass = row().className;
    return filter;
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachAssociation, AssociationTarget, ::testing::ValuesIn(rows()), className);

TEST_P(AssociationTarget, IsAbsentForASourceOfAnotherClass) {
  for (const char* other : {"HALDA_Unrelated", "CIM_Processor", "CIM_ComputerSystem", "CIM_Memory", ""}) {
    ObjectPath source = Support::processorPath("cpu0");
    source.className = other;
    for (const OperationKind kind : associationOperations) {
      expectNoTarget(kind, source, ownClass());
    }
  }
}

TEST_P(AssociationTarget, IsAbsentForASourceClassInAnotherCase) {
  for (const FarEnds& ends : row().farEnds()) {
    ObjectPath source = ends.source;
    for (char& letter : source.className) {
      letter = letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
    }
    for (const OperationKind kind : associationOperations) {
      expectNoTarget(kind, source, ownClass());
    }
  }
}

TEST_P(AssociationTarget, IsAbsentWithoutAnAssociationClass) {
  for (const FarEnds& ends : row().farEnds()) {
    AssociationFilter none;
    AssociationFilter empty;
    empty.assocClass = "";
    for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames}) {
      expectNoTarget(kind, ends.source, none);
      expectNoTarget(kind, ends.source, empty);
    }
  }
}

TEST_P(AssociationTarget, IsAbsentForAnUnknownAssociationClassAndForAParentAndForAnotherCase) {
  std::string lowerCase = row().className;
  lowerCase[0] = 'h';
  for (const std::string& name :
       {std::string("HALDA_Unknown"), std::string("CIM_Dependency"), std::string("CIM_AssociatedCacheMemory"),
        std::string("CIM_SystemDevice"), lowerCase}) {
    AssociationFilter filter;
    filter.assocClass = name;
    for (const FarEnds& ends : row().farEnds()) {
      for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames}) {
        expectNoTarget(kind, ends.source, filter);
      }
    }
  }
}

TEST_P(AssociationTarget, OfReferencesDoesNotDependOnTheRequest) {
  for (const FarEnds& ends : row().farEnds()) {
    AssociationFilter filter;
    filter.assocClass = "HALDA_Unknown";
    for (const OperationKind kind : {OperationKind::References, OperationKind::ReferenceNames}) {
      const Response response = ask(kind, ends.source, filter);
      EXPECT_EQ(response.instances.size() + response.paths.size(), ends.elements.size());
    }
  }
}

TEST_P(AssociationTarget, IsAbsentWhenTheBrokerHasNoPathForIt) {
  for (const FarEnds& ends : row().farEnds()) {
    for (const OperationKind kind : associationOperations) {
      const std::string targetClass = ends.elements.front().className;
      const auto request = [&] { askOwn(kind, ends.source); };
      // Once more, so that only this request's calls are counted and not those of a collection.
      afterwards(request);
      const unsigned int target = ordinalOf("newObjectPath", targetClass, 1, request);
      for (const auto result : {Corvcim::FailureResult::Null, Corvcim::FailureResult::HandleLess}) {
        broker.failNth("newObjectPath", target,
                       {.result = result, .rc = CMPI_RC_ERR_ACCESS_DENIED, .message = "no path"});
        const auto filter = isAssociators(kind) ? ownClass() : AssociationFilter();
        const Response response = ask(kind, ends.source, filter);
        EXPECT_EQ(response.instances.size() + response.paths.size(), 0U);
        EXPECT_EQ(outcome(response), outcomeWithoutPath(kind, "CMPI_RC_ERR_ACCESS_DENIED |no path|"));
        const Support::EventList entering = enteringAssociation(kind, filter);
        expectEvents(expectation(kind) == AbsentTarget::Succeeds ? Support::EventList(entering).exiting()
                                                                 : Support::EventList(entering).error(textOf(kind)));
      }
    }
  }
}

// The reference operations treat their own path like the target's.
TEST_P(AssociationTarget, TemplateThatTheBrokerCannotMakeCountsLikeAnAbsentTarget) {
  const ObjectPath source = row().farEnds().front().source;
  for (const OperationKind kind : {OperationKind::References, OperationKind::ReferenceNames}) {
    afterwards([&] { askOwn(kind, source); });
    const unsigned int ownPath = ordinalOf("newObjectPath", row().className, 1, [&] { askOwn(kind, source); });
    for (const auto result : {Corvcim::FailureResult::Null, Corvcim::FailureResult::HandleLess}) {
      broker.failNth("newObjectPath", ownPath, {.result = result});
      const Response response = ask(kind, source);
      EXPECT_EQ(response.instances.size() + response.paths.size(), 0U);
      EXPECT_EQ(outcome(response), outcomeWithoutPath(kind, "CMPI_RC_OK no message"));
      expectEvents(enteringAssociation(kind, {}).error(textOf(kind)));
    }
  }
}

// A class that the broker cannot give reads as the empty class.
TEST_P(AssociationTarget, SourceWhoseClassTheBrokerCannotTellLeadsNowhere) {
  const ObjectPath source = row().farEnds().front().source;
  for (const OperationKind kind : associationOperations) {
    for (const auto result : {Corvcim::FailureResult::Null, Corvcim::FailureResult::HandleLess}) {
      broker.failNth("getClassName", 1, {.result = result});
      const Response response = askOwn(kind, source);
      EXPECT_EQ(response.instances.size() + response.paths.size(), 0U);
      EXPECT_FALSE(response.done());
    }
  }
}

// Associations of the same source class that this provider does not serve.
TEST_P(AssociationTarget, OfAnotherAssociationOfTheLibraryFindsNothing) {
  for (const FarEnds& ends : row().farEnds()) {
    for (const Row& other : rows()) {
      if (std::string(other.className) == row().className) {
        continue;
      }
      const auto otherEnds = other.farEnds();
      const bool leadsSomewhere = std::any_of(otherEnds.begin(), otherEnds.end(), [&](const FarEnds& each) {
        return each.source.className == ends.source.className;
      });
      const auto own = row().farEnds();
      const bool leadsToOwnClass = std::any_of(otherEnds.begin(), otherEnds.end(), [&](const FarEnds& each) {
        return each.source.className == ends.source.className &&
               std::any_of(own.begin(), own.end(), [&](const FarEnds& mine) {
                 return mine.elements.front().className == each.elements.front().className;
               });
      });
      AssociationFilter filter;
      filter.assocClass = other.className;
      for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames}) {
        if (!leadsSomewhere) {
          expectNoTarget(kind, ends.source, filter);
        } else if (!leadsToOwnClass) {
          EXPECT_EQ(ask(kind, ends.source, filter), withoutDone(answeredNothing()));
        }
      }
    }
  }
}

}  // namespace
