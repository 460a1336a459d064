// The providers' behaviour tests, run on a build with CORVANE_STANDARD_REQUESTS: exactly those fail that describe
// what the front door changes.

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>
#include <set>
#include <string>
#include <string_view>

namespace {

/// A test whose requests the front door answers differently: for one parameter, or for all if that is empty.
struct Change {
  std::string_view test;
  std::string_view parameter = {};
};

constexpr std::string_view coreCaches = "HALDA_CPUCoreAssociatedCacheMemory";
constexpr std::string_view capabilities = "HALDA_CPUElementCapabilities";

constexpr Change changes[] = {
    // The source is at neither end, or its class is spelled differently.
    {"AssociationFrame.AssociationTableIsInOrder"},
    {"AssociationTarget.IsAbsentForASourceOfAnotherClass"},
    {"AssociationTarget.IsAbsentForASourceClassInAnotherCase"},
    {"AssociationTarget.SourceWhoseClassTheBrokerCannotTellLeadsNowhere"},
    {"Guard.NavigatesNowhereOnceCoresAreKnown"},
    // The association class is absent, a parent, spelled differently, or another.
    {"AssociationTarget.IsAbsentWithoutAnAssociationClass"},
    {"AssociationTarget.IsAbsentForAnUnknownAssociationClassAndForAParentAndForAnotherCase"},
    {"AssociationTarget.OfAnotherAssociationOfTheLibraryFindsNothing"},
    {"AssociationNavigation.ResultClassOfReferencesPlaysNoPart"},
    // The result class is a parent beyond those that the association of systems takes, or another.
    {"SystemDevice.AnyOtherResultClassFindsNothing"},
    // The role is another.
    {"AssociationNavigation.RolesPlayNoPart"},
    // The key list does not name the keys, so a property list does.
    {"AssociationEnumeration.FiltersPropertiesByItsKeyList", capabilities},
    {"AssociationEnumeration.PropertyListLeavesWhatItAndTheKeyListName", capabilities},
    {"AssociationGetInstance.PropertyListReachesTheInstance", capabilities},
    // This association logs the classes of a request, which the front door fills in.
    {"AssociationNavigation.AssociatorsAnswersTheFarEnds", coreCaches},
    {"AssociationNavigation.AssociatorNamesAnswersThePathsOfTheFarEnds", coreCaches},
    {"AssociationNavigation.ReferencesAnswersAnInstanceForEachFarEnd", coreCaches},
    {"AssociationTarget.IsAbsentWhenTheBrokerHasNoPathForIt", coreCaches},
    {"AssociationTarget.TemplateThatTheBrokerCannotMakeCountsLikeAnAbsentTarget", coreCaches},
    {"CacheAssociation.ReferencesOfCoresDeliverACacheWithoutDataUndescribed"},
};

/// "Suite.Test/parameter", without the instantiation.
std::string nameOf(const testing::TestInfo& test) {
  const std::string suite = test.test_suite_name();
  return suite.substr(suite.find('/') + 1) + "." + test.name();
}

bool isChanged(const std::string& name) {
  const std::size_t slash = name.find('/');
  const std::string_view parameter = slash == std::string::npos ? "" : std::string_view(name).substr(slash + 1);
  return std::ranges::any_of(changes, [&](const Change& change) {
    return change.test == std::string_view(name).substr(0, slash) &&
           (change.parameter.empty() || change.parameter == parameter);
  });
}

class Results : public testing::EmptyTestEventListener {
 public:
  void OnTestEnd(const testing::TestInfo& test) override {
    const std::string name = nameOf(test);
    if (test.result()->Failed() != isChanged(name)) {
      wrong.insert(name + (test.result()->Failed() ? " fails, but is not listed as changed by the front door"
                                                   : " passes, but is listed as changed by the front door"));
    }
    listed.insert(name.substr(0, name.find('/')));
  }

  std::set<std::string> wrong;
  std::set<std::string, std::less<>> listed;
};

}  // namespace

int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  testing::TestEventListeners& listeners = testing::UnitTest::GetInstance()->listeners();
  if (!GTEST_FLAG_GET(brief)) {  // --gtest_brief=1 shows the failures themselves
    delete listeners.Release(listeners.default_result_printer());
  }
  auto* results = new Results;  // owned by the listeners
  listeners.Append(results);
  [[maybe_unused]] const int anyFailed = RUN_ALL_TESTS();  // some shall fail

  for (const Change& change : changes) {
    if (results->listed.count(change.test) == 0) {
      results->wrong.insert(std::string(change.test) + " is listed as changed, but there is no such test");
    }
  }
  for (const std::string& each : results->wrong) {
    std::cout << each << "\n";
  }
  std::cout << results->listed.size() << " behaviours compared\n";
  return results->wrong.empty() ? 0 : 1;
}
