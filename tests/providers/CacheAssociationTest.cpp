// What only the two associations of caches have: the guard of the one, the cache's own properties.

#include <CPUObjFactory.h>

#include "tests/providers/AssociationRows.h"

namespace {

using namespace Associations;
using Corvcim::OperationKind;
using Corvcim::Response;
using Scripted::inventory;
using Support::answered;
using Support::answeredNothing;
using Support::cachePath;
using Support::corePath;
using Support::outcome;
using Support::processorPath;
using Support::withoutDone;
using Tarn::CPUProvider::CPUObjFactory;

class CacheAssociation : public Support::ProviderTest {
 protected:
  CacheAssociation() { scriptMachine(); }

  Response ask(const std::string& association, OperationKind kind, const ObjectPath& source) {
    Corvcim::AssociationFilter filter;
    filter.assocClass = association;
    return associate(association, kind, source, filter);
  }
};

class Guard : public CacheAssociation {
 protected:
  Guard() {
    afterwards([&] { enumerateInstances("HALDA_CPUProcessorCore"); });
  }
  const Support::ProviderFunctions& provider() const { return Support::providerOf(processorCaches); }
  Support::EventList events(const std::string& operation) const { return {provider(), operation}; }
  Support::EventList framedBuilder(const std::string& operation) const {
    return events(operation)
        .entering()
        .in("CPUAssociatedCacheMemoryCMPIInstances")
        .entering()
        .exiting()
        .in("CPUAssociatedCacheMemory_" + operation)
        .exiting();
  }
};

TEST_F(Guard, AnswersNoInstanceOnceCoresAreKnown) {
  EXPECT_EQ(enumerateInstances(processorCaches), answeredNothing());
  Support::expectEvents(provider(), framedBuilder("EnumInstances"));
}

TEST_F(Guard, AnswersNoNameOnceCoresAreKnown) {
  EXPECT_EQ(enumerateInstanceNames(processorCaches), answeredNothing());
  Support::expectEvents(provider(), events("EnumInstanceNames").entering().exiting());
}

TEST_F(Guard, FindsNothingOnceCoresAreKnown) {
  const ObjectPath path =
      Support::associationPath(processorCaches, "Antecedent", cachePath("cache0"), "Dependent", processorPath("cpu0"));
  EXPECT_EQ(getInstance(path), answeredNothing());
  Support::expectEvents(provider(), framedBuilder("GetInstance"));
}

TEST_F(Guard, NavigatesNowhereOnceCoresAreKnown) {
  for (const ObjectPath& source : {cachePath("cache0"), processorPath("cpu0"), Support::classPath("HALDA_Unrelated")}) {
    for (const OperationKind kind : associationOperations) {
      EXPECT_EQ(ask(processorCaches, kind, source), withoutDone(answeredNothing()));
      Support::expectEvents(provider(), events(std::string(Corvcim::operationName(kind))).entering().exiting());
    }
  }
}

TEST_F(Guard, StillRefusesAGetInstanceWithoutKeys) {
  EXPECT_EQ(outcome(getInstance(Support::classPath(processorCaches))),
            "CMPI_RC_ERR_FAILED |At least one key should be passed| done");
}

TEST_F(Guard, DoesNotConcernTheOtherAssociations) {
  EXPECT_EQ(enumerateInstances(coreCaches).instances.size(), 5U);
  EXPECT_EQ(enumerateInstances("HALDA_CPUConcreteComponent").instances.size(), 3U);
  EXPECT_EQ(enumerateInstances("HALDA_CPUElementCapabilities").instances.size(), 2U);
}

TEST_F(Guard, CountsCoresThatAreKnownNow) {
  CPUObjFactory::_cpuProcCoreMap.clear();
  EXPECT_EQ(enumerateInstanceNames(processorCaches).paths.size(), 3U);
}

TEST_F(CacheAssociation, WithOneProcessorOfTwoCachesEachTellsFourAssociations) {
  inventory().reset();
  inventory().processor("cpu0").fullCache("a").fullCache("b").processor("cpu1").fullCache("c").fullCache("d");
  const Response response = enumerateInstances(processorCaches);
  ASSERT_EQ(response.instances.size(), 4U);
  for (const Corvcim::Instance& each : response.instances) {
    EXPECT_EQ(each.properties.size(), 7U);
    EXPECT_EQ(*each.property("ReadPolicy"), Corvcim::Value::uint16(0));
  }
}

// The cache is found in the inventory, but what the factory keeps of it is gone.
TEST_F(CacheAssociation, BuilderOfCoresGivesUpAtACacheWithoutData) {
  afterwards([&] { enumerateInstances(coreCaches); });
  CPUObjFactory::_cpuMemoryMap.erase("cache0");
  EXPECT_EQ(enumerateInstances(coreCaches), answeredNothing());
  const Support::ProviderFunctions& provider = Support::providerOf(coreCaches);
  Support::expectEvents(provider, Support::EventList(provider, "EnumInstances")
                                      .entering()
                                      .in("CPUCoreAssociatedCacheMemoryCMPIInstances")
                                      .entering()
                                      .error("Error retrieving CPU AssociatedCacheMemory data")
                                      .exiting()
                                      .in("CPUCoreAssociatedCacheMemory_EnumInstances")
                                      .exiting());
}

TEST_F(CacheAssociation, NamesNeedNoDataOfTheCaches) {
  afterwards([&] { enumerateInstances(coreCaches); });
  CPUObjFactory::_cpuMemoryMap.erase("cache0");
  EXPECT_EQ(enumerateInstanceNames(coreCaches).paths.size(), 5U);
  EXPECT_EQ(ask(coreCaches, OperationKind::ReferenceNames, corePath("core0")).paths.size(), 2U);
}

TEST_F(CacheAssociation, ReferencesOfCoresDeliverACacheWithoutDataUndescribed) {
  afterwards([&] { enumerateInstances(coreCaches); });
  CPUObjFactory::_cpuMemoryMap.erase("cache1");
  const Response response = ask(coreCaches, OperationKind::References, corePath("core0"));
  EXPECT_EQ(outcome(response), "CMPI_RC_OK no message not done");
  ASSERT_EQ(response.instances.size(), 2U);
  EXPECT_EQ(response.instances[0].properties.size(), 2U);
  EXPECT_EQ(response.instances[1].properties.size(), 7U);
  const Support::ProviderFunctions& provider = Support::providerOf(coreCaches);
  Support::expectEvents(provider, Support::EventList(provider, "References")
                                      .entering()
                                      .variable("resultClass = ", "(null)")
                                      .error("Error retrieving CPU AssociatedCacheMemory data")
                                      .exiting());
}

// From the cache's side the source itself is the one that is described, by the key it came with.
TEST_F(CacheAssociation, ReferencesOfACacheWithoutDataAreUndescribed) {
  afterwards([&] { enumerateInstances(coreCaches); });
  CPUObjFactory::_cpuMemoryMap.erase("cache1");
  const Response response = ask(coreCaches, OperationKind::References, cachePath("cache1"));
  ASSERT_EQ(response.instances.size(), 2U);
  EXPECT_EQ(response.instances[0].properties.size(), 2U);
  EXPECT_EQ(response.instances[1].properties.size(), 2U);
}

TEST_F(CacheAssociation, BuilderOfProcessorsGivesUpWhenTheKeyCannotBeReadAgain) {
  afterwards([&] { enumerateInstances(processorCaches); });
  broker.failNth("getKey", 2);
  EXPECT_EQ(enumerateInstances(processorCaches), answeredNothing());
  const Support::ProviderFunctions& provider = Support::providerOf(processorCaches);
  Support::expectEvents(provider, Support::EventList(provider, "EnumInstances")
                                      .entering()
                                      .in("CPUAssociatedCacheMemoryCMPIInstances")
                                      .entering()
                                      .error("Error retrieving CPU AssociatedCacheMemory data")
                                      .exiting()
                                      .in("CPUAssociatedCacheMemory_EnumInstances")
                                      .exiting());
}

TEST_F(CacheAssociation, ReferencesOfProcessorsNeedNoDataOfTheCaches) {
  afterwards([&] { enumerateInstances(processorCaches); });
  CPUObjFactory::_cpuMemoryMap.clear();
  const Response response = ask(processorCaches, OperationKind::References, processorPath("cpu0"));
  ASSERT_EQ(response.instances.size(), 2U);
  EXPECT_EQ(response.instances[0].properties.size(), 2U);
}

}  // namespace
