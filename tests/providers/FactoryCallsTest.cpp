// What the providers ask the factory for, and with which arguments.

#include "tests/providers/ScriptedFactoryTest.h"

namespace {

using Corvcim::Operation;
using Corvcim::OperationKind;
using ScriptedFactory::script;
using Support::cachePath;
using Support::capabilitiesPath;
using Support::classPath;
using Support::corePath;
using Support::processorPath;

using Calls = std::vector<std::string>;

constexpr OperationKind operations[] = {OperationKind::Associators, OperationKind::AssociatorNames,
                                        OperationKind::References, OperationKind::ReferenceNames};

class FactoryCalls : public ScriptedFactory::ScriptedFactoryTest {
 protected:
  Calls enumerating(const std::string& className, OperationKind kind) {
    perform(className, {kind, classPath(className), std::vector<std::string>{"Caption", "Level"}, {}});
    return takeCalls();
  }

  Calls navigating(const std::string& className, OperationKind kind, const Corvcim::ObjectPath& source) {
    associate(className, kind, source, std::vector<std::string>{"Caption", "Level"});
    return takeCalls();
  }
};

TEST_F(FactoryCalls, OfInstanceProviders) {
  const struct {
    const char* className;
    Calls instances;
    Calls names;
  } expectations[] = {
      {"HALDA_CPUProcessor",
       {"getFactoryInstance(1, 0, 0)", "getNumberOfProcInstances()",
        "getAllCPUProcCMPIInstances(HALDA_CPUProcessor, properties Caption Level, isObjPath 0)"},
       {"getFactoryInstance(1, 0, 0)", "getNumberOfProcInstances()", "getAllCPUProcCMPIObjPaths(HALDA_CPUProcessor)"}},
      {"HALDA_CPUProcessorCore",
       {"getFactoryInstance(0, 0, 1)", "getNumberOfProcInstances()",
        "getAllCPUProcCoreCMPIInstances(HALDA_CPUProcessorCore, properties Caption Level, isObjPath 0)"},
       {"getFactoryInstance(0, 0, 1)", "getNumberOfProcInstances()",
        "getAllCPUProcCoreCMPIObjPaths(HALDA_CPUProcessorCore)"}},
      {"HALDA_CPUMemory",
       {"getFactoryInstance(0, 1, 0)",
        "getAllCPUMemoryCMPIInstances(HALDA_CPUMemory, properties Caption Level, isObjPath 0)"},
       {"getFactoryInstance(0, 1, 0)", "getNumberOfMemInstances()", "getAllCPUMemoryCMPIObjPaths(HALDA_CPUMemory)"}},
      {"HALDA_CPUProcessorCapabilities",
       {"getFactoryInstance(1, 0, 0)", "getNumberOfProcInstances()",
        "getAllCPUProcCapCMPIInstances(HALDA_CPUProcessorCapabilities, properties Caption Level, isObjPath 0)"},
       {"getFactoryInstance(1, 0, 0)", "getNumberOfProcInstances()",
        "getAllCPUProcCapCMPIObjPaths(HALDA_CPUProcessorCapabilities)"}},
  };
  for (const auto& each : expectations) {
    EXPECT_EQ(enumerating(each.className, OperationKind::EnumerateInstances), each.instances);
    EXPECT_EQ(enumerating(each.className, OperationKind::EnumerateInstanceNames), each.names);
  }
}

TEST_F(FactoryCalls, OfGetInstance) {
  const auto calls = [&](const Corvcim::ObjectPath& path) {
    perform(path.className, {OperationKind::GetInstance, path, std::vector<std::string>{"Caption"}, {}});
    return takeCalls();
  };
  EXPECT_EQ(calls(processorPath("x")),
            (Calls{"getFactoryInstance(1, 0, 0)",
                   "getOneCPUProcCMPIInstance(HALDA_CPUProcessor, key x, properties Caption)"}));
  EXPECT_EQ(calls(corePath("x")),
            (Calls{"getFactoryInstance(0, 0, 1)",
                   "getOneCPUProcCoreCMPIInstance(HALDA_CPUProcessorCore, key x, properties Caption)"}));
  EXPECT_EQ(calls(cachePath("x")), (Calls{"getFactoryInstance(0, 1, 0)",
                                          "getOneCPUMemoryCMPIInstance(HALDA_CPUMemory, key x, properties Caption)"}));
  EXPECT_EQ(calls(capabilitiesPath("x")), (Calls{"getFactoryInstance(1, 0, 0)",
                                                 "getOneCPUProcCapCMPIInstance(HALDA_CPUProcessorCapabilities, key "
                                                 "NERITH:x, properties Caption)"}));
}

/// The calls of the operations that go from one source to a target class: all start alike.
struct Navigation {
  const char* className;
  Corvcim::ObjectPath source;
  const char* targetClass;
  std::vector<std::string> start;  ///< before the target is looked up
  Calls instances;                 ///< for whole far ends
  Calls names;                     ///< for their paths
};

class NavigationCalls : public FactoryCalls {
 protected:
  void expectCalls(const Navigation& expected, OperationKind kind, const Calls& search) {
    script().targetClass = expected.targetClass;
    const bool associators = kind == OperationKind::Associators || kind == OperationKind::AssociatorNames;
    resultClass = expected.targetClass;
    Calls calls = expected.start;
    calls.push_back("get_assoc_targetClass_ObjectPath(" + expected.source.className + ", " + expected.className +
                    (associators ? ", " + std::string(expected.targetClass) : ", NULL") + ")");
    calls.insert(calls.end(), search.begin(), search.end());
    Calls actual = navigating(expected.className, kind, expected.source);
    std::erase_if(actual, isReserve);
    EXPECT_EQ(actual, calls) << Corvcim::operationName(kind);
  }

  // How much room is made is not seen by anyone.
  static bool isReserve(const std::string& call) {
    return call == "getNumberOfProcInstances()" || call == "getNumberOfMemInstances()";
  }
};

TEST_F(NavigationCalls, OfTheCacheAssociations) {
  // The guard counts cores first; elsewhere their number makes room only.
  const Calls guarded = {"getFactoryInstance(1, 1, 0)", "getNumberOfProcCoreInstances()"};
  const Navigation navigations[] = {
      {"HALDA_CPUAssociatedCacheMemory",
       cachePath("x"),
       "HALDA_CPUProcessor",
       guarded,
       {"getProcessorRefByMemoryHandle(HALDA_CPUProcessor, key x, properties Caption Level, isObjPath 0)"},
       {"getProcessorRefByMemoryHandle(HALDA_CPUProcessor, key x, properties NULL, isObjPath 1)"}},
      {"HALDA_CPUAssociatedCacheMemory",
       processorPath("x"),
       "HALDA_CPUMemory",
       guarded,
       {"getCPUMemoryRefByProcessorHandle(HALDA_CPUMemory, key x, properties Caption Level, isObjPath 0)"},
       {"getCPUMemoryRefByProcessorHandle(HALDA_CPUMemory, key x, properties NULL, isObjPath 1)"}},
      {"HALDA_CPUCoreAssociatedCacheMemory",
       cachePath("x"),
       "HALDA_CPUProcessorCore",
       {"getFactoryInstance(0, 1, 1)"},
       {"getNumberOfProcCoreInstances()",
        "getProcessorCoreRefByMemoryHandle(HALDA_CPUProcessorCore, key x, properties Caption Level, isObjPath 0)"},
       {"getNumberOfProcCoreInstances()",
        "getProcessorCoreRefByMemoryHandle(HALDA_CPUProcessorCore, key x, properties NULL, isObjPath 1)"}},
      {"HALDA_CPUCoreAssociatedCacheMemory",
       corePath("x"),
       "HALDA_CPUMemory",
       {"getFactoryInstance(0, 1, 1)"},
       {"getCPUMemoryRefByProcessorCoreHandle(HALDA_CPUMemory, key x, properties Caption Level, isObjPath 0)"},
       {"getCPUMemoryRefByProcessorCoreHandle(HALDA_CPUMemory, key x, properties NULL, isObjPath 1)"}},
  };
  for (const Navigation& each : navigations) {
    expectCalls(each, OperationKind::Associators, each.instances);
    expectCalls(each, OperationKind::AssociatorNames, each.names);
    expectCalls(each, OperationKind::References, each.instances);
    expectCalls(each, OperationKind::ReferenceNames, each.names);
  }
}

// The reference operations look their far ends up without the property list.
TEST_F(NavigationCalls, OfElementCapabilities) {
  const Navigation navigations[] = {
      {"HALDA_CPUElementCapabilities",
       processorPath("x"),
       "HALDA_CPUProcessorCapabilities",
       {"getFactoryInstance(1, 0, 0)"},
       {"getProcessorCapRefByProcHandle(HALDA_CPUProcessorCapabilities, key x, properties Caption Level)"},
       {"getProcessorCapRefByProcHandle(HALDA_CPUProcessorCapabilities, key x, properties NULL)"}},
      {"HALDA_CPUElementCapabilities",
       capabilitiesPath("x"),
       "HALDA_CPUProcessor",
       {"getFactoryInstance(1, 0, 0)"},
       {"getProcessorRefByProcCapHandle(HALDA_CPUProcessor, key NERITH:x, properties Caption Level)"},
       {"getProcessorRefByProcCapHandle(HALDA_CPUProcessor, key NERITH:x, properties NULL)"}},
  };
  for (const Navigation& each : navigations) {
    expectCalls(each, OperationKind::Associators, each.instances);
    expectCalls(each, OperationKind::AssociatorNames, each.names);
    expectCalls(each, OperationKind::References, each.names);
    expectCalls(each, OperationKind::ReferenceNames, each.names);
  }
}

TEST_F(NavigationCalls, OfConcreteComponentForInstances) {
  const Navigation fromCore = {
      "HALDA_CPUConcreteComponent",
      corePath("x"),
      "HALDA_CPUProcessor",
      {"getFactoryInstance(1, 0, 1)"},
      {"getProcessorRefByProcCoreHandle(HALDA_CPUProcessor, key x, properties Caption Level, isObjPath 0)"},
      {}};
  const Navigation fromProcessor = {
      "HALDA_CPUConcreteComponent",
      processorPath("x"),
      "HALDA_CPUProcessorCore",
      {"getFactoryInstance(1, 0, 1)"},
      {"getNumberOfProcCoreInstances()",
       "getProcessorCoreRefByProcHandle(HALDA_CPUProcessorCore, key x, properties Caption Level, isObjPath 0)"},
      {}};
  expectCalls(fromCore, OperationKind::Associators, fromCore.instances);
  expectCalls(fromProcessor, OperationKind::Associators, fromProcessor.instances);
}

// The factory is taken once, also where the broker is asked for the other end.
TEST_F(NavigationCalls, OfSystemDevice) {
  const Navigation fromSystem = {
      "HALDA_CPUSystemDevice",
      Support::systemPath("x"),
      "HALDA_CPUProcessor",
      {"getFactoryInstance(1, 0, 0)"},
      {"getAllCPUProcCMPIInstances(HALDA_CPUProcessor, properties Caption Level, isObjPath 0)"},
      {"getAllCPUProcCMPIObjPaths(HALDA_CPUProcessor)"}};
  const Navigation fromProcessor = {
      "HALDA_CPUSystemDevice", processorPath("x"), "HALDA_ComputerSystem", {"getFactoryInstance(1, 0, 0)"}, {}, {}};
  for (const OperationKind kind : operations) {
    expectCalls(fromSystem, kind, kind == OperationKind::Associators ? fromSystem.instances : fromSystem.names);
    expectCalls(fromProcessor, kind, {});
  }
}

// Another processor's target is not this provider's: nothing is looked up.
TEST_F(NavigationCalls, StopAtATargetOfAnotherClass) {
  script().targetClass = "HALDA_Unrelated";
  for (const char* className :
       {"HALDA_CPUAssociatedCacheMemory", "HALDA_CPUCoreAssociatedCacheMemory", "HALDA_CPUSystemDevice",
        "HALDA_CPUElementCapabilities", "HALDA_CPUConcreteComponent"}) {
    for (const OperationKind kind : operations) {
      const auto response = associate(className, kind, processorPath("x"));
      EXPECT_EQ(response, Corvcim::Response()) << className;
      for (const std::string& call : takeCalls()) {
        EXPECT_EQ(call.find("RefBy"), std::string::npos) << call;
        EXPECT_EQ(call.find("getAll"), std::string::npos) << call;
      }
    }
  }
}

/// The walks of enumerations: two near ends, each with the far ends that the script finds.
class WalkCalls : public FactoryCalls {
 protected:
  void findTwo(const Corvcim::ObjectPath& first, const Corvcim::ObjectPath& second, const Corvcim::ObjectPath& far) {
    script().paths = {path(first), path(second)};
    script().instances = {element(far)};
  }
  /// Without the counts, which make room.
  Calls walking(const std::string& className, OperationKind kind) {
    Calls calls = enumerating(className, kind);
    std::erase_if(calls, [](const std::string& call) { return call.starts_with("getNumberOf"); });
    return calls;
  }
};

TEST_F(WalkCalls, OfProcessorsCaches) {
  findTwo(cachePath("a"), cachePath("b"), processorPath("cpu"));
  const std::string all = "getAllCPUMemoryCMPIObjPaths(HALDA_CPUAssociatedCacheMemory)";
  const auto navigation = [](const std::string& key) {
    return "getProcessorRefByMemoryHandle(HALDA_CPUAssociatedCacheMemory, key " + key +
           ", properties NULL, isObjPath 1)";
  };
  EXPECT_EQ(walking("HALDA_CPUAssociatedCacheMemory", OperationKind::EnumerateInstances),
            (Calls{"getFactoryInstance(1, 1, 0)", all, navigation("a"), "getAssocCacheData(key a)", navigation("b"),
                   "getAssocCacheData(key b)"}));
  EXPECT_EQ(walking("HALDA_CPUAssociatedCacheMemory", OperationKind::EnumerateInstanceNames),
            (Calls{"getFactoryInstance(1, 1, 0)", all, navigation("a"), navigation("b")}));
}

TEST_F(WalkCalls, OfCoresCaches) {
  findTwo(corePath("a"), corePath("b"), cachePath("cache"));
  const std::string all = "getAllCPUProcCoreCMPIObjPaths(HALDA_CPUCoreAssociatedCacheMemory)";
  const auto navigation = [](const std::string& key) {
    return "getCPUMemoryRefByProcessorCoreHandle(HALDA_CPUCoreAssociatedCacheMemory, key " + key +
           ", properties NULL, isObjPath 1)";
  };
  EXPECT_EQ(walking("HALDA_CPUCoreAssociatedCacheMemory", OperationKind::EnumerateInstances),
            (Calls{"getFactoryInstance(0, 1, 1)", all, navigation("a"), "getAssocCacheData(key cache)", navigation("b"),
                   "getAssocCacheData(key cache)"}));
  EXPECT_EQ(walking("HALDA_CPUCoreAssociatedCacheMemory", OperationKind::EnumerateInstanceNames),
            (Calls{"getFactoryInstance(0, 1, 1)", all, navigation("a"), navigation("b")}));
}

TEST_F(WalkCalls, OfElementCapabilities) {
  findTwo(processorPath("a"), processorPath("b"), capabilitiesPath("a"));
  const auto calls = [](const std::string& properties) {
    const auto navigation = [&](const std::string& key) {
      return "getProcessorCapRefByProcHandle(HALDA_CPUElementCapabilities, key " + key + ", " + properties + ")";
    };
    return Calls{"getFactoryInstance(1, 0, 0)", "getAllCPUProcCMPIObjPaths(HALDA_CPUElementCapabilities)",
                 navigation("a"), navigation("b")};
  };
  EXPECT_EQ(walking("HALDA_CPUElementCapabilities", OperationKind::EnumerateInstances),
            calls("properties Caption Level"));
  EXPECT_EQ(walking("HALDA_CPUElementCapabilities", OperationKind::EnumerateInstanceNames), calls("properties NULL"));
}

// Also for the cores of each processor room is made.
TEST_F(WalkCalls, OfConcreteComponent) {
  findTwo(processorPath("a"), processorPath("b"), corePath("core"));
  const auto navigation = [](const std::string& key) {
    return "getProcessorCoreRefByProcHandle(HALDA_CPUConcreteComponent, key " + key + ", properties NULL, isObjPath 1)";
  };
  const Calls calls = {"getFactoryInstance(1, 0, 1)",
                       "getNumberOfProcInstances()",
                       "getAllCPUProcCMPIObjPaths(HALDA_CPUConcreteComponent)",
                       "getNumberOfProcCoreInstances()",
                       navigation("a"),
                       "getNumberOfProcCoreInstances()",
                       navigation("b")};
  EXPECT_EQ(enumerating("HALDA_CPUConcreteComponent", OperationKind::EnumerateInstances), calls);
  EXPECT_EQ(enumerating("HALDA_CPUConcreteComponent", OperationKind::EnumerateInstanceNames), calls);
}

TEST_F(WalkCalls, OfSystemDevice) {
  script().paths = {path(processorPath("a"))};
  const Calls calls = {"getFactoryInstance(1, 0, 0)", "getAllCPUProcCMPIObjPaths(HALDA_CPUSystemDevice)"};
  EXPECT_EQ(walking("HALDA_CPUSystemDevice", OperationKind::EnumerateInstances), calls);
  EXPECT_EQ(walking("HALDA_CPUSystemDevice", OperationKind::EnumerateInstanceNames), calls);
}

}  // namespace
