// What the providers do when the factory fails, also in ways in which the real one does not.

#include "tests/providers/ScriptedFactoryTest.h"

namespace {

using Corvcim::ObjectPath;
using Corvcim::OperationKind;
using Corvcim::Response;
using ScriptedFactory::script;
using Support::cachePath;
using Support::capabilitiesPath;
using Support::classPath;
using Support::corePath;
using Support::EventList;
using Support::outcome;
using Support::processorPath;

/// The text of a failing lookup: which operation calls what, and what it then says.
struct Lookup {
  const char* className;
  OperationKind kind;
  bool withKey;  ///< of GetInstance: whether the reference has the key that names an instance
  const char* function;
  const char* text;  ///< NULL: nothing
};

constexpr Lookup lookups[] = {
    {"HALDA_CPUProcessor", OperationKind::EnumerateInstances, false, "getAllCPUProcCMPIInstances",
     "Failed To get CMPIInstances"},
    {"HALDA_CPUProcessorCore", OperationKind::EnumerateInstances, false, "getAllCPUProcCoreCMPIInstances",
     "getAllCPUProcCoreCMPIInstances Failed"},
    {"HALDA_CPUMemory", OperationKind::EnumerateInstances, false, "getAllCPUMemoryCMPIInstances",
     "***Can't get Instances.            Exiting EnumerateInstanceNames***"},
    {"HALDA_CPUProcessorCapabilities", OperationKind::EnumerateInstances, false, "getAllCPUProcCapCMPIInstances",
     "getAllCPUProcCapCMPIInstances Failed "},
    {"HALDA_CPUProcessor", OperationKind::GetInstance, false, "getAllCPUProcCMPIInstances",
     "getAllCPUProcCMPIInstances Failed"},
    {"HALDA_CPUProcessorCore", OperationKind::GetInstance, false, "getAllCPUProcCoreCMPIInstances",
     "getAllCPUProcCoreCMPIInstances Failed"},
    {"HALDA_CPUMemory", OperationKind::GetInstance, false, "getAllCPUMemoryCMPIInstances", nullptr},
    {"HALDA_CPUProcessorCapabilities", OperationKind::GetInstance, false, "getAllCPUProcCapCMPIInstances",
     "getAllCPUProcCapCMPIInstances Failed"},
    {"HALDA_CPUProcessor", OperationKind::GetInstance, true, "getOneCPUProcCMPIInstance",
     "getOneCPUProcCMPIInstance Failed"},
    {"HALDA_CPUProcessorCore", OperationKind::GetInstance, true, "getOneCPUProcCoreCMPIInstance",
     "getOneCPUProcCoreCMPIInstance Failed"},
    {"HALDA_CPUMemory", OperationKind::GetInstance, true, "getOneCPUMemoryCMPIInstance",
     "***Can't get Instance.                                Exiting GetInstance***"},
    {"HALDA_CPUProcessorCapabilities", OperationKind::GetInstance, true, "getOneCPUProcCapCMPIInstance",
     "getOneCPUProcCapCMPIInstance Failed"},
};

class FactoryFailure : public ScriptedFactory::ScriptedFactoryTest {
 protected:
  static std::vector<std::string> errorsOf(const std::string& className) {
    std::vector<std::string> errors;
    for (const Scripted::Event& event : Support::takeEventsOf(Support::providerOf(className))) {
      if (event.level == 6000) {
        errors.push_back(event.text.substr(event.text.find("]: ") + 3));
      }
      EXPECT_NE(event.function, "markProviderExit");
    }
    return errors;
  }
};

TEST_F(FactoryFailure, OfALookupIsLoggedAndPassesItsStatusBack) {
  script().failureStatus = CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED;
  for (const Lookup& each : lookups) {
    script().results = {{each.function, 2}};
    ObjectPath path = classPath(each.className);
    path.keys = {Support::textKey("Other", "x")};
    if (each.withKey) {
      path.keys = {Support::textKey("DeviceID", "x"), Support::textKey("InstanceID", "x")};
    }
    const Response response = perform(each.className, {each.kind, path, {}, {}});
    EXPECT_EQ(outcome(response), "CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED no message not done") << each.function;
    const std::vector<std::string> errors =
        each.text != nullptr ? std::vector<std::string>{each.text} : std::vector<std::string>();
    EXPECT_EQ(errorsOf(each.className), errors) << each.function;
  }
}

/// The text of an association operation whose navigation fails.
struct FailingNavigation {
  const char* className;
  ObjectPath source;
  const char* targetClass;
  const char* function;
  /// Of Associators, AssociatorNames, References and ReferenceNames; NULL: nothing.
  const char* texts[4];
};

class NavigationFailure : public FactoryFailure {
 protected:
  static std::vector<FailingNavigation> navigations() {
    constexpr const char* ofCore = "getProcessorRefByProcCoreHandle Failed for InstanceID";
    constexpr const char* ofProcessor = "getProcessorRefByProcCoreHandle Failed for DeviceID";
    return {
        {"HALDA_CPUAssociatedCacheMemory",
         cachePath("x"),
         "HALDA_CPUProcessor",
         "getProcessorRefByMemoryHandle",
         {"***Can't get Processor instances related to Memory.                 Exiting Associators***",
          "***Can't get processor ObjPaths related to Processor.                 Exiting AssociatorNames***",
          "***Can't get Processor instances                 Exiting References***",
          "***Can't get Processor ObjPaths.                 Exiting ReferenceNames***"}},
        {"HALDA_CPUAssociatedCacheMemory",
         processorPath("x"),
         "HALDA_CPUMemory",
         "getCPUMemoryRefByProcessorHandle",
         {"***Can't get Memory instances related to Processor.                 Exiting Associators***",
          "***Can't get Memory ObjectPaths related to Processor.                 Exiting AssociatorNames***",
          "***Can't get Memory instances.                 Exiting References***",
          "***Can't get Memory ObjPaths.                 Exiting ReferenceNames***"}},
        {"HALDA_CPUCoreAssociatedCacheMemory",
         cachePath("x"),
         "HALDA_CPUProcessorCore",
         "getProcessorCoreRefByMemoryHandle",
         {"***Can't get ProcessorCore instances related to Memory.                 Exiting Associators***",
          "***Can't get processorcore ObjPaths related to Memory.                 Exiting AssociatorNames***",
          "***Can't get ProcessorCore instances                 Exiting References***",
          "***Can't get ProcessorCore ObjPaths.                 Exiting ReferenceNames***"}},
        {"HALDA_CPUCoreAssociatedCacheMemory",
         corePath("x"),
         "HALDA_CPUMemory",
         "getCPUMemoryRefByProcessorCoreHandle",
         {"***Can't get Memory instances related to ProcessorCore.                 Exiting Associators***",
          "***Can't get Memory ObjectPaths related to ProcessorCore.                 Exiting AssociatorNames***",
          "***Can't get Memory instances.                 Exiting References***",
          "***Can't get Memory ObjPaths.                 Exiting ReferenceNames***"}},
        {"HALDA_CPUElementCapabilities",
         processorPath("x"),
         "HALDA_CPUProcessorCapabilities",
         "getProcessorCapRefByProcHandle",
         {nullptr, nullptr, nullptr, nullptr}},
        {"HALDA_CPUElementCapabilities",
         capabilitiesPath("x"),
         "HALDA_CPUProcessor",
         "getProcessorRefByProcCapHandle",
         {nullptr, nullptr, nullptr, nullptr}},
        {"HALDA_CPUConcreteComponent",
         corePath("x"),
         "HALDA_CPUProcessor",
         "getProcessorRefByProcCoreHandle",
         {ofCore, ofCore, ofCore, ofCore}},
        {"HALDA_CPUConcreteComponent",
         processorPath("x"),
         "HALDA_CPUProcessorCore",
         "getProcessorCoreRefByProcHandle",
         {ofProcessor, ofProcessor, ofProcessor, ofProcessor}},
    };
  }
};

TEST_F(NavigationFailure, IsLoggedAndPassesItsStatusBack) {
  constexpr OperationKind kinds[] = {OperationKind::Associators, OperationKind::AssociatorNames,
                                     OperationKind::References, OperationKind::ReferenceNames};
  script().failureStatus = CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED;
  for (const FailingNavigation& each : navigations()) {
    script().results = {{each.function, 1}};
    script().targetClass = each.targetClass;
    for (std::size_t i = 0; i < std::size(kinds); ++i) {
      const Response response = associate(each.className, kinds[i], each.source);
      EXPECT_EQ(outcome(response), "CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED no message not done");
      EXPECT_EQ(response.instances.size() + response.paths.size(), 0U);
      const char* text = each.texts[i];
      EXPECT_EQ(errorsOf(each.className),
                text != nullptr ? std::vector<std::string>{text} : std::vector<std::string>());
    }
  }
}

/// The walk of an enumeration that cannot go on.
struct Walk {
  const char* className;
  const char* builder;
  ObjectPath near;
  const char* navigation;  ///< NULL: the far ends need none
  const char* navigationText;
  const char* navigationTextOfNames;
  const char* nullNearEnd;
  const char* nullNearEndStatusOfNames;
};

class WalkFailure : public FactoryFailure {
 protected:
  static std::vector<Walk> walks() {
    return {
        {"HALDA_CPUAssociatedCacheMemory", "CPUAssociatedCacheMemoryCMPIInstances", cachePath("x"),
         "getProcessorRefByMemoryHandle",
         "***Can't get Processor ObjectPaths based on passed in Mem                 DeviceID. Exiting EnumerateInstanceNames***",
         "***Can't get Processor ObjectPaths based on passed in Mem                 DeviceID. Exiting EnumerateInstanceNames***",
         "CMPIObjectPath is NULL for CPUMemory", "CMPIObjectPath is NULL for CPUMemory"},
        {"HALDA_CPUCoreAssociatedCacheMemory", "CPUCoreAssociatedCacheMemoryCMPIInstances", corePath("x"),
         "getCPUMemoryRefByProcessorCoreHandle",
         "***Can't get CPUMemory ObjectPaths based on passed in ProcessorCore                 InstanceID. Exiting EnumerateInstanceNames***",
         "***Can't get Memory ObjectPaths based on passed in ProcessorCore                InstanceID. Exiting EnumerateInstanceNames***",
         "CMPIObjectPath is NULL for CPUProcessorCore", "CMPIObjectPath is NULL for CPUProcessorCore"},
        {"HALDA_CPUSystemDevice", "CPUSystemDeviceCMPIInstances", processorPath("x"), nullptr, nullptr, nullptr,
         "CMPIObjectPath is NULL for CPUProcessor", "CMPIObjectPath is NULL for CPUProcessor"},
        {"HALDA_CPUElementCapabilities", "ElementCapabilitiesCMPIInstances", processorPath("x"),
         "getProcessorCapRefByProcHandle",
         "***Can't get ObjectPaths for EnabledLogicalElementCap.                 Exiting EnumerateInstanceNames***",
         "getProcessorCapRefByProcHandle Failed for DeviceId", "CMPIObjectPath is NULL for Processor",
         "CMPIObjectPath is                 NULL for Processor"},
        {"HALDA_CPUConcreteComponent", "ConcreteComponentCMPIInstances", processorPath("x"),
         "getProcessorCoreRefByProcHandle",
         "***Can't get ObjectPaths for Processor Cores.             Exiting EnumerateInstanceNames***",
         "Can't get ObjectPaths for Processor Core", "CMPIObjectPath is NULL for Processor",
         "CMPIObjectPath is                 NULL for Processor"},
    };
  }

  void expectBuilderGivesUp(const Walk& walk, const std::string& text) {
    const Support::ProviderFunctions& provider = Support::providerOf(walk.className);
    const Response response =
        perform(walk.className, {OperationKind::EnumerateInstances, classPath(walk.className), {}, {}});
    EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
    EXPECT_EQ(response.instances.size(), 0U);
    Support::expectEvents(provider, EventList(provider, "EnumInstances")
                                        .entering()
                                        .in(walk.builder)
                                        .entering()
                                        .error(text)
                                        .exiting()
                                        .in(provider.prefix + "_EnumInstances")
                                        .exiting());
  }

  Response expectNamesGiveUp(const Walk& walk, const std::string& text) {
    const Support::ProviderFunctions& provider = Support::providerOf(walk.className);
    const Response response =
        perform(walk.className, {OperationKind::EnumerateInstanceNames, classPath(walk.className), {}, {}});
    EXPECT_EQ(response.paths.size(), 0U);
    EXPECT_EQ(response.doneCalls, 1U);
    Support::expectEvents(provider, EventList(provider, "EnumInstanceNames").entering().error(text).exiting());
    return response;
  }
};

TEST_F(WalkFailure, OfANavigationIsLogged) {
  script().failureStatus = CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED;
  for (const Walk& each : walks()) {
    if (each.navigation == nullptr) {
      continue;
    }
    script().paths = {path(each.near)};
    script().results = {{each.navigation, 1}};
    expectBuilderGivesUp(each, each.navigationText);
    const Response names = expectNamesGiveUp(each, each.navigationTextOfNames);
    EXPECT_EQ(names.rc, CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED);
  }
}

TEST_F(WalkFailure, AtANearEndThatIsNullIsLogged) {
  for (const Walk& each : walks()) {
    for (CMPIObjectPath* nothing : {static_cast<CMPIObjectPath*>(nullptr), handleLessPath()}) {
      script().paths = {nothing};
      expectBuilderGivesUp(each, each.nullNearEnd);
      const Response names = expectNamesGiveUp(each, each.nullNearEnd);
      EXPECT_EQ(outcome(names), "CMPI_RC_ERR_FAILED |" + std::string(each.nullNearEndStatusOfNames) + "| done");
    }
  }
}

TEST_F(WalkFailure, ReadsNoKeyOfANearEndWithoutOne) {
  for (const Walk& each : walks()) {
    if (each.navigation == nullptr) {
      continue;
    }
    ObjectPath keyless = each.near;
    keyless.keys.clear();
    script().paths = {path(keyless)};
    script().instances.clear();
    const Response response =
        perform(each.className, {OperationKind::EnumerateInstanceNames, classPath(each.className), {}, {}});
    EXPECT_EQ(outcome(response), "CMPI_RC_OK no message done");
    EXPECT_NE(takeCalls().back().find("key NULL"), std::string::npos);
  }
}

// The library catches nothing at its entries.
TEST_F(FactoryFailure, ExceptionsLeaveEveryOperation) {
  script().throwing = "getFactoryInstance";
  for (const Support::ProviderFunctions& provider : Support::providerFunctions()) {
    ObjectPath path = classPath(provider.className);
    EXPECT_THROW(perform(provider.className, {OperationKind::EnumerateInstances, path, {}, {}}), std::runtime_error);
    EXPECT_THROW(perform(provider.className, {OperationKind::EnumerateInstanceNames, path, {}, {}}),
                 std::runtime_error);
    path.keys = {Support::textKey("Other", "x")};
    EXPECT_THROW(perform(provider.className, {OperationKind::GetInstance, path, {}, {}}), std::runtime_error);
    if (provider.createAssociationMI == nullptr) {
      continue;
    }
    for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                     OperationKind::References, OperationKind::ReferenceNames}) {
      EXPECT_THROW(associate(provider.className, kind, processorPath("x")), std::runtime_error);
    }
  }
}

}  // namespace
