#include "host/broker/Dispatcher.h"

#include <gtest/gtest.h>

#include <string>

namespace Corvcim {
namespace {

const LibraryFiles allLibraries = {{"corvcpuprofileprovider", TEST_PROVIDER},
                                   {"corvcomputersystemprovider", TEST_PROVIDER}};

ObjectPath classPath(std::string_view nameSpace, std::string_view className) {
  return {{}, std::string(nameSpace), std::string(className), {}};
}

ObjectPath instanceOf(std::string_view nameSpace, std::string_view className) {
  return {{}, std::string(nameSpace), std::string(className), {{"DeviceID", Value::string("x")}}};
}

// Class and DeviceID of each instance, which in these tests says what the provider was asked.
std::vector<std::string> told(const Answer& answer) {
  std::vector<std::string> result;
  for (const Instance& each : answer.response.instances) {
    const Value* id = each.property("DeviceID");
    result.push_back(each.path.className + ": " + (id != nullptr ? id->asString() : "-"));
  }
  return result;
}

std::string outcome(const Answer& answer) {
  return statusName(answer.response.rc) + " " + answer.response.message.value_or("-");
}

using Told = std::vector<std::string>;

class DispatcherTest : public testing::Test {
 protected:
  Dispatcher dispatcher_{allLibraries};
};

}  // namespace

TEST_F(DispatcherTest, AsksTheProviderOfTheClass) {
  const Answer answer = dispatcher_.enumerateInstances(classPath("plain", "halda_CPUMEMORY"));

  EXPECT_EQ(told(answer), (Told{"HALDA_CPUMemory: enumerateInstances"}));
  EXPECT_TRUE(answer.failures.empty());
}

TEST_F(DispatcherTest, GivesProvidersTheExactNameOfTheirClass) {
  const Answer answer = dispatcher_.enumerateInstanceNames(classPath("plain", "halda_CPUMEMORY"));

  EXPECT_EQ(answer.response.paths, (std::vector<ObjectPath>{classPath("plain", "HALDA_CPUMemory")}));
}

TEST_F(DispatcherTest, AsksEveryClassDerivedFromTheOneNamed) {
  EXPECT_EQ(told(dispatcher_.enumerateInstances(classPath("plain", "CIM_LogicalDevice"))),
            (Told{"HALDA_CPUProcessor: enumerateInstances", "HALDA_CPUMemory: enumerateInstances"}));
}

TEST_F(DispatcherTest, SaysWhichClassesThereAreIfTheClassIsUnknown) {
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("plain", "CIM_Fan"))),
            "CMPI_RC_ERR_INVALID_CLASS no class \"CIM_Fan\" is served here; there are HALDA_ComputerSystem, "
            "HALDA_CPUProcessor, HALDA_CPUProcessorCore, HALDA_CPUMemory, HALDA_CPUProcessorCapabilities, "
            "HALDA_CPUSystemDevice, HALDA_CPUConcreteComponent, HALDA_CPUAssociatedCacheMemory, "
            "HALDA_CPUCoreAssociatedCacheMemory, HALDA_CPUElementCapabilities");
  EXPECT_EQ(dispatcher_.associators(instanceOf("plain", "CIM_Fan")).response.rc, CMPI_RC_ERR_INVALID_CLASS);
}

TEST_F(DispatcherTest, SuggestsTheClassThatIsNearest) {
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("plain", "HALDA_CPUMemry"))),
            "CMPI_RC_ERR_INVALID_CLASS no class \"HALDA_CPUMemry\" is served here; did you mean HALDA_CPUMemory?");
  EXPECT_EQ(suggestClasses("CIM_LogicalDevise"), "did you mean CIM_LogicalDevice?");
  EXPECT_EQ(suggestClasses("HALDA_CPUMemry", true).substr(0, 32), "there are HALDA_CPUSystemDevice,");
}

TEST_F(DispatcherTest, SendsRequestsAsTheyAre) {
  const auto sent = [&](OperationKind kind, const ObjectPath& path, const AssociationFilter& filter = {}) {
    return told(dispatcher_.performAsIs({kind, path, std::nullopt, filter}));
  };
  const ObjectPath memory = instanceOf("plain", "HALDA_cpumemory");

  EXPECT_EQ(sent(OperationKind::Associators, memory, {"halda_cpuassociatedcachememory", "x", "y", ""}),
            (Told{"HALDA_CPUAssociatedCacheMemory: associators halda_cpuassociatedcachememory x y "}));
  EXPECT_EQ(sent(OperationKind::References, memory, {{}, "CIM_ElementCapabilities", "y", {}}),
            (Told{"HALDA_CPUElementCapabilities: references CIM_ElementCapabilities y"}));
  EXPECT_EQ(sent(OperationKind::Associators, instanceOf("plain", "CIM_Fan"), {"CIM_Fans", {}, {}, {}}),
            (Told{"HALDA_CPUSystemDevice: associators CIM_Fans NULL NULL NULL",
                  "HALDA_CPUConcreteComponent: associators CIM_Fans NULL NULL NULL",
                  "HALDA_CPUAssociatedCacheMemory: associators CIM_Fans NULL NULL NULL",
                  "HALDA_CPUCoreAssociatedCacheMemory: associators CIM_Fans NULL NULL NULL",
                  "HALDA_CPUElementCapabilities: associators CIM_Fans NULL NULL NULL"}));
  EXPECT_EQ(dispatcher_.performAsIs({OperationKind::EnumerateInstanceNames, classPath("plain", "cim_MEMORY"), {}, {}})
                .response.paths,
            (std::vector<ObjectPath>{classPath("plain", "cim_MEMORY")}));
}

TEST_F(DispatcherTest, AddsNothingToTheAnswersOfRequestsThatAreSentAsTheyAre) {
  const auto get = [&](std::string_view nameSpace, std::string_view className) {
    return dispatcher_.performAsIs({OperationKind::GetInstance, instanceOf(nameSpace, className), {}, {}});
  };

  EXPECT_EQ(get("two", "HALDA_CPUProcessorCore").response.instances.size(), 2U);
  EXPECT_EQ(get("none", "HALDA_CPUProcessorCore").response, Response{});
  EXPECT_EQ(get("plain", "CIM_Fan").response.rc, CMPI_RC_ERR_INVALID_CLASS);
}

TEST_F(DispatcherTest, GetsExactlyOneInstance) {
  EXPECT_EQ(told(dispatcher_.getInstance(instanceOf("plain", "HALDA_CPUMemory"))),
            (Told{"HALDA_CPUMemory: getInstance"}));
  EXPECT_EQ(outcome(dispatcher_.getInstance(instanceOf("none", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_NOT_FOUND there is no instance none:HALDA_CPUMemory.DeviceID=\"x\"");
  EXPECT_EQ(outcome(dispatcher_.getInstance(instanceOf("two", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_INVALID_PARAMETER the path two:HALDA_CPUMemory.DeviceID=\"x\" names 2 instances; give every "
            "key that tells them apart");
  EXPECT_EQ(outcome(dispatcher_.getInstance(instanceOf("fail", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_ACCESS_DENIED denied");
}

TEST_F(DispatcherTest, RefusesKeysThatTheClassDoesNotHave) {
  EXPECT_EQ(outcome(dispatcher_.getInstance(instanceOf("plain", "HALDA_CPUProcessorCore"))),
            "CMPI_RC_ERR_INVALID_PARAMETER class HALDA_CPUProcessorCore has no key DeviceID; its keys are InstanceID");
}

TEST_F(DispatcherTest, AsksEveryAssociationThatTheSourceTakesPartIn) {
  EXPECT_EQ(
      told(dispatcher_.associators(instanceOf("plain", "HALDA_cpumemory"))),
      (Told{"HALDA_CPUAssociatedCacheMemory: associators HALDA_CPUAssociatedCacheMemory NULL NULL NULL",
            "HALDA_CPUCoreAssociatedCacheMemory: associators HALDA_CPUCoreAssociatedCacheMemory NULL NULL NULL"}));
  EXPECT_EQ(told(dispatcher_.references(instanceOf("plain", "HALDA_CPUMemory"))),
            (Told{"HALDA_CPUAssociatedCacheMemory: references NULL NULL",
                  "HALDA_CPUCoreAssociatedCacheMemory: references NULL NULL"}));
}

TEST_F(DispatcherTest, GivesSourcesTheExactNameOfTheirClass) {
  const Answer answer = dispatcher_.referenceNames(instanceOf("plain", "halda_computersystem"));

  EXPECT_EQ(answer.response.paths, (std::vector<ObjectPath>{instanceOf("plain", "HALDA_ComputerSystem")}));
  EXPECT_EQ(dispatcher_.associatorNames(instanceOf("plain", "HALDA_ComputerSystem")).response, answer.response);
}

TEST_F(DispatcherTest, AsksTheAssociationNamedOrDerivedFromTheOneNamed) {
  const ObjectPath source = instanceOf("plain", "HALDA_CPUMemory");

  EXPECT_EQ(told(dispatcher_.associators(source, {"halda_cpuassociatedcachememory", {}, {}, {}})),
            (Told{"HALDA_CPUAssociatedCacheMemory: associators HALDA_CPUAssociatedCacheMemory NULL NULL NULL"}));
  EXPECT_EQ(dispatcher_.associators(source, {"CIM_AssociatedCacheMemory", {}, {}, {}}).response.instances.size(), 2U);
  EXPECT_EQ(told(dispatcher_.references(source, {{}, "halda_cpuassociatedcachememory", {}, {}})),
            (Told{"HALDA_CPUAssociatedCacheMemory: references HALDA_CPUAssociatedCacheMemory NULL"}));
}

TEST_F(DispatcherTest, AnswersWithNothingForAnAssociationOfOtherClasses) {
  EXPECT_EQ(
      dispatcher_.associators(instanceOf("plain", "HALDA_CPUMemory"), {"HALDA_CPUSystemDevice", {}, {}, {}}).response,
      Response{});
}

TEST_F(DispatcherTest, SaysWhichAssociationsThereAreIfTheClassIsNone) {
  EXPECT_EQ(outcome(dispatcher_.associators(instanceOf("plain", "HALDA_CPUMemory"), {"HALDA_CPUMemory", {}, {}, {}})),
            "CMPI_RC_ERR_INVALID_PARAMETER no association class \"HALDA_CPUMemory\" is served here; there are "
            "HALDA_CPUSystemDevice, HALDA_CPUConcreteComponent, HALDA_CPUAssociatedCacheMemory, "
            "HALDA_CPUCoreAssociatedCacheMemory, HALDA_CPUElementCapabilities");
}

TEST_F(DispatcherTest, TestsRolesAndResultClassesByTheClassTable) {
  const ObjectPath source = instanceOf("plain", "HALDA_CPUProcessor");
  const auto classesFor = [&](const AssociationFilter& filter) {
    Told result;
    for (const Instance& each : dispatcher_.associators(source, filter).response.instances) {
      result.push_back(each.path.className);
    }
    return result;
  };

  EXPECT_EQ(classesFor({{}, "CIM_System", {}, {}}), (Told{"HALDA_CPUSystemDevice"}));
  EXPECT_EQ(classesFor({{}, {}, "groupcomponent", {}}), (Told{"HALDA_CPUConcreteComponent"}));
  EXPECT_EQ(classesFor({{}, {}, {}, "GroupComponent"}), (Told{"HALDA_CPUSystemDevice"}));
  EXPECT_EQ(classesFor({{}, "CIM_Fan", {}, {}}), Told{});
  EXPECT_EQ(classesFor({{}, {}, "NoRole", {}}), Told{});
  EXPECT_EQ(told(dispatcher_.references(source, {{}, {}, "dependent", {}})),
            (Told{"HALDA_CPUAssociatedCacheMemory: references NULL dependent"}));
}

TEST_F(DispatcherTest, ReportsWhoFailedWithoutHidingWhatSucceeded) {
  const Answer answer = dispatcher_.associators(instanceOf("fail HALDA_CPUAssociatedCacheMemory", "HALDA_CPUMemory"));

  EXPECT_TRUE(answer.response.ok());
  EXPECT_EQ(told(answer).size(), 1U);
  EXPECT_EQ(answer.failures,
            (std::vector<ClassFailure>{{"HALDA_CPUAssociatedCacheMemory", CMPI_RC_ERR_ACCESS_DENIED, "denied"}}));
}

TEST_F(DispatcherTest, FailsIfNobodySucceeded) {
  const Answer answer = dispatcher_.associators(instanceOf("fail", "HALDA_CPUMemory"));

  EXPECT_EQ(outcome(answer), "CMPI_RC_ERR_ACCESS_DENIED denied");
  EXPECT_EQ(answer.failures.size(), 2U);
}

TEST_F(DispatcherTest, KeepsEachGroupInAProcessOfItsOwn) {
  dispatcher_.enumerateInstances(classPath("plain", "HALDA_CPUProcessor"));
  dispatcher_.enumerateInstances(classPath("plain", "HALDA_CPUMemory"));

  EXPECT_EQ(told(dispatcher_.enumerateInstances(classPath("count", "HALDA_CPUProcessorCore"))),
            (Told{"HALDA_CPUProcessorCore: 3"}));
  EXPECT_EQ(told(dispatcher_.enumerateInstances(classPath("count", "HALDA_CPUMemory"))), (Told{"HALDA_CPUMemory: 4"}));
  const Answer cacheAssociation = dispatcher_.enumerateInstances(classPath("count", "HALDA_CPUAssociatedCacheMemory"));
  EXPECT_EQ(told(cacheAssociation), (Told{"HALDA_CPUAssociatedCacheMemory: 1"}));
}

TEST_F(DispatcherTest, CrashIsOneErrorAndTheNextRequestStartsAnew) {
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("crash", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_FAILED the provider process of group cpu (" TEST_PROVIDER
            ") was ended by signal 9 (Killed) during EnumerateInstances of HALDA_CPUMemory; the next request starts it "
            "anew");
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("exit", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_FAILED the provider process of group cpu (" TEST_PROVIDER
            ") exited with status 3 during EnumerateInstances of HALDA_CPUMemory; the next request starts it anew");
  EXPECT_EQ(told(dispatcher_.enumerateInstances(classPath("count", "HALDA_CPUMemory"))), (Told{"HALDA_CPUMemory: 1"}));
}

TEST_F(DispatcherTest, ExceptionOfAProviderIsAnError) {
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("throw", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_FAILED the provider of HALDA_CPUMemory threw an exception: thrown");
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("throw-number", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_FAILED the provider of HALDA_CPUMemory threw something that is no exception");
  EXPECT_EQ(told(dispatcher_.enumerateInstances(classPath("count", "HALDA_CPUMemory"))), (Told{"HALDA_CPUMemory: 3"}));
}

TEST_F(DispatcherTest, UpcallReachesTheProviderOfAnotherGroup) {
  EXPECT_EQ(told(dispatcher_.enumerateInstances(classPath("upcall", "HALDA_CPUMemory"))),
            (Told{"HALDA_ComputerSystem: enumerateInstances"}));
}

TEST_F(DispatcherTest, UpcallMayGoBackIntoTheSameProcess) {
  EXPECT_EQ(told(dispatcher_.enumerateInstances(classPath("upcall-own", "HALDA_CPUMemory"))),
            (Told{"HALDA_CPUMemory: enumerateInstances"}));
}

TEST_F(DispatcherTest, UpcallToAClassThatNobodyServesIsEmptyAndOk) {
  EXPECT_EQ(dispatcher_.enumerateInstances(classPath("upcall-unserved", "HALDA_CPUMemory")).response, Response{});
}

TEST_F(DispatcherTest, UpcallsWithoutEndAreStopped) {
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("loop", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_FAILED up-calls of providers are nested more than 16 deep; one calls itself without end");
  EXPECT_TRUE(dispatcher_.enumerateInstances(classPath("plain", "HALDA_CPUMemory")).response.ok());
}

TEST_F(DispatcherTest, CrashDuringAnUpcallEndsBothOperations) {
  const Answer answer = dispatcher_.enumerateInstances(classPath("upcall-crash", "HALDA_CPUMemory"));

  EXPECT_EQ(answer.response.rc, CMPI_RC_ERR_FAILED);
  EXPECT_TRUE(dispatcher_.enumerateInstances(classPath("plain", "HALDA_CPUMemory")).response.ok());
}

TEST_F(DispatcherTest, MissingFactoryIsAnError) {
  EXPECT_EQ(outcome(dispatcher_.enumerateInstances(classPath("plain", "HALDA_CPUProcessorCapabilities"))),
            "CMPI_RC_ERR_FAILED provider library " TEST_PROVIDER
            " exports no CPUProcessorCapProvider_Create_InstanceMI: it does not serve this class");
}

TEST(DispatcherLibraries, MissingFileIsAnError) {
  Dispatcher dispatcher(LibraryFiles{{"corvcpuprofileprovider", "/nowhere/lib.so"}});

  EXPECT_EQ(outcome(dispatcher.enumerateInstances(classPath("plain", "HALDA_CPUMemory"))),
            "CMPI_RC_ERR_FAILED cannot load provider library: /nowhere/lib.so: cannot open shared object file: No such "
            "file or directory");
}

TEST(DispatcherLibraries, ClassOfALibraryThatIsNotThereIsAnErrorButNotForUpcalls) {
  Dispatcher dispatcher(LibraryFiles{{"corvcpuprofileprovider", TEST_PROVIDER}});

  EXPECT_EQ(outcome(dispatcher.enumerateInstances(classPath("plain", "HALDA_ComputerSystem"))),
            "CMPI_RC_ERR_FAILED no file is known for provider library corvcomputersystemprovider, which serves "
            "HALDA_ComputerSystem");
  EXPECT_EQ(dispatcher.enumerateInstances(classPath("upcall", "HALDA_CPUMemory")).response, Response{});
}

}  // namespace Corvcim
