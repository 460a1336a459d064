// Machines that no one expects, seen through the associations.

#include <CPUObjFactory.h>

#include "tests/support/ProviderTest.h"

namespace {

using Corvcim::ObjectPath;
using Corvcim::OperationKind;
using Corvcim::Response;
using Scripted::inventory;
using Support::answered;
using Support::answeredNothing;
using Support::cachePath;
using Support::capabilitiesPath;
using Support::corePath;
using Support::processorPath;
using Support::withoutDone;
using Tarn::CPUProvider::CPUObjFactory;
using Tarn::CPUProvider::Processor;

using Paths = std::vector<ObjectPath>;

const std::string capabilities = "HALDA_CPUElementCapabilities";
const std::string components = "HALDA_CPUConcreteComponent";

class UnusualInventory : public Support::ProviderTest {
 protected:
  Paths farEnds(const std::string& association, const ObjectPath& source) {
    Corvcim::AssociationFilter filter;
    filter.assocClass = association;
    const Response response = associate(association, OperationKind::AssociatorNames, source, filter);
    EXPECT_EQ(Support::outcome(response), "CMPI_RC_OK no message not done");
    return response.paths;
  }
  std::size_t pairs(const std::string& association) {
    const Response response = enumerateInstances(association);
    EXPECT_EQ(Support::outcome(response), "CMPI_RC_OK no message done");
    EXPECT_EQ(enumerateInstanceNames(association).paths.size(), response.instances.size());
    return response.instances.size();
  }
};

// Empty sockets and absent processors are not reported, but their nodes may have parts.
TEST_F(UnusualInventory, PartsOfASkippedProcessorHaveNoOwner) {
  inventory().processor("cpu0").status(15).core("core0").cache("cache0").processor("cpu1").core("core1").cache(
      "cache1");
  EXPECT_EQ(farEnds(processorCaches, cachePath("cache0")), Paths());
  EXPECT_EQ(pairs(processorCaches), 1U);
  EXPECT_EQ(farEnds(components, corePath("core0")), Paths());
  EXPECT_EQ(pairs(components), 1U);
  EXPECT_EQ(farEnds(coreCaches, cachePath("cache0")), Paths());
  EXPECT_EQ(farEnds(coreCaches, corePath("core0")), Paths());
  EXPECT_EQ(pairs(coreCaches), 1U);
}

// The inventory's node is there even when the library does not report it.
TEST_F(UnusualInventory, SkippedProcessorStillLeadsToItsParts) {
  inventory().processor("cpu0").status(0).core("core0").cache("cache0").processor("cpu1");
  EXPECT_EQ(farEnds(processorCaches, processorPath("cpu0")), Paths{cachePath("cache0")});
  EXPECT_EQ(farEnds(components, processorPath("cpu0")), Paths{corePath("core0")});
  EXPECT_EQ(farEnds(capabilities, processorPath("cpu1")), Paths{capabilitiesPath("cpu1")});
}

// Here the missing processor is not in the factory's map, which is all that this association looks at.
TEST_F(UnusualInventory, SkippedProcessorHasNoCapabilities) {
  inventory().processor("cpu0").status(15).processor("cpu1");
  Corvcim::AssociationFilter filter;
  filter.assocClass = capabilities;
  for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                   OperationKind::References, OperationKind::ReferenceNames}) {
    EXPECT_EQ(associate(capabilities, kind, processorPath("cpu0"), filter), withoutDone(answeredNothing()));
    EXPECT_EQ(associate(capabilities, kind, capabilitiesPath("cpu0"), filter), withoutDone(answeredNothing()));
    const Support::ProviderFunctions& provider = Support::providerOf(capabilities);
    // The failed navigation of the first ends without an exit mark, the empty one of the second with it.
    const std::string operation(Corvcim::operationName(kind));
    EXPECT_EQ(Support::takeEventsOf(provider).size(), 2U + 4U) << operation;
  }
}

TEST_F(UnusualInventory, CachesWithoutCores) {
  inventory().processor("cpu0").cache("cache0").cache("cache1");
  EXPECT_EQ(pairs(processorCaches), 2U);
  EXPECT_EQ(farEnds(coreCaches, cachePath("cache0")), Paths());
  EXPECT_EQ(pairs(coreCaches), 0U);
  EXPECT_EQ(farEnds(components, processorPath("cpu0")), Paths());
  EXPECT_EQ(pairs(components), 0U);
}

TEST_F(UnusualInventory, CoresWithoutCaches) {
  inventory().processor("cpu0").core("core0").core("core1");
  EXPECT_EQ(pairs(processorCaches), 0U);
  EXPECT_EQ(farEnds(processorCaches, processorPath("cpu0")), Paths());
  EXPECT_EQ(farEnds(coreCaches, corePath("core0")), Paths());
  EXPECT_EQ(pairs(coreCaches), 0U);
  EXPECT_EQ(pairs(components), 2U);
}

TEST_F(UnusualInventory, OneProcessorWithPartsAndOneWithout) {
  inventory().processor("cpu0").processor("cpu1").core("core0").cache("cache0");
  EXPECT_EQ(farEnds(processorCaches, processorPath("cpu0")), Paths());
  EXPECT_EQ(pairs(processorCaches), 1U);
  EXPECT_EQ(pairs(components), 1U);
  EXPECT_EQ(pairs(coreCaches), 1U);
}

// A core without caches does not stop the walk over the others.
TEST_F(UnusualInventory, CoreWithoutCachesBetweenOthers) {
  inventory().processor("cpu0").core("core0").cache("cache0").processor("cpu1").core("core1");
  inventory().processor("cpu2").core("core2").cache("cache2");
  EXPECT_EQ(
      enumerateInstanceNames(coreCaches),
      answered(Paths{
          Support::associationPath(coreCaches, "Antecedent", cachePath("cache0"), "Dependent", corePath("core0")),
          Support::associationPath(coreCaches, "Antecedent", cachePath("cache2"), "Dependent", corePath("core2"))}));
}

TEST_F(UnusualInventory, ProcessorWithoutAnythingElse) {
  inventory().processor("cpu0");
  EXPECT_EQ(pairs(capabilities), 1U);
  EXPECT_EQ(pairs(components), 0U);
  EXPECT_EQ(farEnds(components, processorPath("cpu0")), Paths());
}

// No inventory names two processors alike; the map can hold them.
TEST_F(UnusualInventory, TwoProcessorsWithOneInstanceIdShareTheirCapabilities) {
  afterwards([&] {
    inventory().processor("cpu0");
    enumerateInstances("HALDA_CPUProcessor");
  });
  for (const std::string name : {"twin2", "twin10"}) {
    Processor twin;
    twin.setProcessorDeviceID(name);
    twin.setInstanceId("NERITH:twin");
    CPUObjFactory::_processorMap[name] = twin;
  }

  const Paths twins{processorPath("twin10"), processorPath("twin2")};
  EXPECT_EQ(farEnds(capabilities, capabilitiesPath("twin")), twins);
  // Each twin leads to an instance of capabilities for each twin.
  EXPECT_EQ(farEnds(capabilities, processorPath("twin2")), (Paths{capabilitiesPath("twin"), capabilitiesPath("twin")}));
  EXPECT_EQ(pairs(capabilities), 1U + 2U * 2U);
  EXPECT_EQ(associate(capabilities, OperationKind::ReferenceNames, capabilitiesPath("twin")).paths.size(), 2U);
}

TEST_F(UnusualInventory, RecordThatTheInventoryDoesNotKnowHasNoParts) {
  afterwards([&] {
    inventory().processor("cpu0").core("core0").cache("cache0");
    enumerateInstances("HALDA_CPUConcreteComponent");
    enumerateInstances(coreCaches);
  });
  Processor ghost;
  ghost.setProcessorDeviceID("ghost");
  ghost.setInstanceId("NERITH:ghost");
  CPUObjFactory::_processorMap["ghost"] = ghost;
  EXPECT_EQ(pairs(components), 1U);
  EXPECT_EQ(pairs(capabilities), 2U);
  EXPECT_EQ(farEnds(components, processorPath("ghost")), Paths());
}

TEST_F(UnusualInventory, SourceWithBlanksAroundItsIdentifierIsUnknown) {
  inventory().processor("cpu0").core("core0").cache("cache0");
  EXPECT_EQ(farEnds(processorCaches, cachePath(" cache0 ")), Paths());
  EXPECT_EQ(farEnds(components, corePath("core0 ")), Paths());
}

TEST_F(UnusualInventory, QueryThatBreaksIsAnEmptyAnswer) {
  inventory().processor("cpu0").core("core0").cache("cache0");
  afterwards([&] { enumerateInstances(processorCaches); });
  inventory().failNth(Scripted::Operation::ConvertStringToPath, 1);
  EXPECT_EQ(farEnds(processorCaches, processorPath("cpu0")), Paths());
  inventory().failNth(Scripted::Operation::ConvertStringToPath, 1);
  EXPECT_EQ(farEnds(processorCaches, cachePath("cache0")), Paths());
  EXPECT_EQ(farEnds(processorCaches, cachePath("cache0")), Paths{processorPath("cpu0")});
}

}  // namespace
