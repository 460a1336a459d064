#include <ostream>

#include "tests/factory/FactoryTest.h"

using namespace FactoryTests;
using Scripted::inventory;
using Scripted::Operation;

// From one element to the elements related to it: six functions of one kind.

namespace {

struct Navigation {
  std::string function;
  unsigned short (CPUObjFactory::*run)(const CMPIBroker*, const CMPIObjectPath*, CMPIString*, const char**, bool,
                                       std::vector<CMPIInstance*>&, CMPIStatus*);
  std::string source;  // in the usual tree
  std::string handleTracedAs;
  std::string query;
  std::string builder;
  std::string failure;
  bool failureIsVariable;
  Lines found;  // from the source
};

void PrintTo(const Navigation& navigation, std::ostream* stream) {
  *stream << navigation.function;
}

const Navigation navigations[] = {
    {"getProcessorCoreRefByProcHandle",
     &CPUObjFactory::getProcessorCoreRefByProcHandle,
     "cpu1",
     "deviceID",
     "getCPUProcCoresFromCPUProcessor",
     "makeCPUProcCoreInstance",
     "***getCPUProcCoresFromCPUProcessor failed***",
     true,
     {"core1", "core1b"}},
    {"getCPUMemoryRefByProcessorCoreHandle",
     &CPUObjFactory::getCPUMemoryRefByProcessorCoreHandle,
     "core1",
     "instanceId",
     "getCPUMemoriesFromCPUProcessorCore",
     "makeCPUMemoryInstance",
     "***getCPUMemoriesFromCPUProcessorCore failed***",
     false,
     {"cache1", "cache1b"}},
    {"getProcessorCoreRefByMemoryHandle",
     &CPUObjFactory::getProcessorCoreRefByMemoryHandle,
     "cache1",
     "deviceID",
     "getCPUProcessorCoresFromCPUMemory",
     "makeCPUProcCoreInstance",
     "***getCPUProcessorCoresFromCPUMemory failed***",
     false,
     {"core1", "core1b"}},
    {"getCPUMemoryRefByProcessorHandle",
     &CPUObjFactory::getCPUMemoryRefByProcessorHandle,
     "cpu1",
     "deviceId",
     "getCPUMemoriesFromCPUProcessor",
     "makeCPUMemoryInstance",
     "***getCPUMemoriesFromCPUProcessor failed***",
     false,
     {"cache1", "cache1b"}},
    {"getProcessorRefByMemoryHandle",
     &CPUObjFactory::getProcessorRefByMemoryHandle,
     "cache1",
     "deviceID",
     "getCPUProcessorsFromCPUMemory",
     "makeCPUProcInstance",
     "***getCPUProcessorsFromCPUMemory failed***",
     false,
     {"cpu1"}},
    {"getProcessorRefByProcCoreHandle",
     &CPUObjFactory::getProcessorRefByProcCoreHandle,
     "core1",
     "instanceID",
     "getCPUProcessorsFromCPUProcCore",
     "makeCPUProcInstance",
     "***getCPUProcessorsFromCPUProcCore failed***",
     false,
     {"cpu1"}},
};

class NavigationByHandle : public FactoryTest, public ::testing::WithParamInterface<Navigation> {
 protected:
  NavigationByHandle() {
    inventory().system("Model").processor("cpu0").core("core0").cache("cache0");
    inventory().fullProcessor("cpu1").core("core1").cache("cache1").core("core1b").cache("cache1b");
  }

  unsigned short follow(const std::string& handle, const char** properties = nullptr, bool isObjPath = true) {
    key_ = key(handle);
    return (factory().*GetParam().run)(broker_, ref_, key_, properties, isObjPath, instances_, &rc_);
  }

  Lines framed(const std::string& handle, const Lines& more) const {
    const std::string parameters = requestParameters(
        broker_, ref_,
        " key=" + Scripted::address(key_) + " properties=" + Scripted::address(nullptr) +
            " isObjPath=1 instances=" + Scripted::address(&instances_) + " rc=" + Scripted::address(&rc_));
    Lines lines = {events.entering(detail, GetParam().function, parameters),
                   events.variable(detail, GetParam().function, GetParam().handleTracedAs, handle)};
    lines.insert(lines.end(), more.begin(), more.end());
    lines.push_back(events.exiting(detail, GetParam().function, parameters));
    return lines;
  }

  std::string failure() const {
    const std::string& text = GetParam().failure;
    return GetParam().failureIsVariable ? events.variable(error, GetParam().function, "\"" + text + "\"", text)
                                        : events.message(error, GetParam().function, text);
  }

  CMPIString* key_ = nullptr;
  std::vector<CMPIInstance*> instances_;
};

}  // namespace

TEST_P(NavigationByHandle, FindsTheRelatedElementsInTheOrderOfTheTree) {
  EXPECT_EQ(follow(GetParam().source), 0);

  EXPECT_EQ(identifiersOf(instances_), GetParam().found);
}

TEST_P(NavigationByHandle, ReportsItsFrameAndTheHandle) {
  follow(GetParam().source);

  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), framed(GetParam().source, {}));
}

TEST_P(NavigationByHandle, AsksItsQueryAndItsBuilder) {
  follow(GetParam().source);

  unsigned int queries = 0;
  unsigned int builders = 0;
  for (const Scripted::Event& event : Scripted::takeEvents()) {
    if (event.text.starts_with("ENTERING: ")) {
      queries += event.function == GetParam().query ? 1 : 0;
      builders += event.function == GetParam().builder ? 1 : 0;
    }
  }
  EXPECT_EQ(queries, 1U);
  EXPECT_EQ(builders, GetParam().found.size());
}

TEST_P(NavigationByHandle, HandsPropertiesAndFlagToTheBuilder) {
  follow(GetParam().source, names({"Caption"}), false);
  const auto filters = static_cast<unsigned int>(GetParam().found.size());
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), filters);
  EXPECT_TRUE(recording_.takeProperties().back().starts_with("Caption chars "));

  follow(GetParam().source, nullptr, true);
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), filters);
}

TEST_P(NavigationByHandle, TheResultsStandInTheNamespaceOfTheReference) {
  ref_ = path("HALDA_Target", "interop");

  follow(GetParam().source);

  ASSERT_FALSE(instances_.empty());
  EXPECT_EQ(Corvcim::valueOf(instances_[0]).path.nameSpace, "interop");
}

TEST_P(NavigationByHandle, AppendsToWhatIsThere) {
  instances_ = {nullptr};

  follow(GetParam().source);

  EXPECT_EQ(instances_.size(), GetParam().found.size() + 1);
  EXPECT_EQ(instances_[0], nullptr);
}

TEST_P(NavigationByHandle, AppendsTheNullOfABuilderAndGoesOn) {
  hostBroker_.services().failNth("newInstance", 1);

  EXPECT_EQ(follow(GetParam().source), 0);

  ASSERT_EQ(instances_.size(), GetParam().found.size());
  EXPECT_EQ(instances_[0], nullptr);
}

TEST_P(NavigationByHandle, NeedsNoFilledMaps) {
  ASSERT_TRUE(CPUObjFactory::_processorMap.empty());

  EXPECT_EQ(follow(GetParam().source), 0);

  EXPECT_FALSE(instances_.empty());
  EXPECT_TRUE(CPUObjFactory::_processorMap.empty());
}

TEST_P(NavigationByHandle, AFailedQueryIsLoggedAndSwallowed) {
  inventory().failNth(Operation::SelectType, 1);
  testing::internal::CaptureStderr();

  EXPECT_EQ(follow(GetParam().source), 0);

  testing::internal::GetCapturedStderr();
  EXPECT_TRUE(instances_.empty());
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), framed(GetParam().source, {failure()}));
}

TEST_P(NavigationByHandle, AnUnknownHandleFindsNothing) {
  const bool fromProcessor = GetParam().source == "cpu1";
  for (const char* handle : {"nothing", "", " cpu1", "CORE1"}) {
    forgetTraces();

    EXPECT_EQ(follow(handle), 0) << handle;

    EXPECT_TRUE(instances_.empty()) << handle;
    // Downward the queries call that a success, upward a failure.
    EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), framed(handle, fromProcessor ? Lines{} : Lines{failure()}));
  }
}

TEST_P(NavigationByHandle, TheHandleIsReadIntoTheStatus) {
  hostBroker_.services().failNth("getCharPtr", 1,
                                 {Corvcim::FailureResult::StatusOnly, CMPI_RC_ERR_ACCESS_DENIED, "the broker says no"});

  follow("nothing");

  EXPECT_EQ(shown(rc_), "CMPI_RC_ERR_ACCESS_DENIED |the broker says no|");
}

INSTANTIATE_TEST_SUITE_P(All, NavigationByHandle, ::testing::ValuesIn(navigations),
                         [](const auto& tested) { return tested.param.function; });

namespace {

using NavigationWithoutRelations = FactoryTest;

}  // namespace

TEST_F(NavigationWithoutRelations, AProcessorWithoutCoresOrCachesFindsNothingAndIsNoFailure) {
  inventory().system("Model").processor("cpu0").processor("cpu1").core("core1").cache("cache1");
  std::vector<CMPIInstance*> instances;

  EXPECT_EQ(factory().getProcessorCoreRefByProcHandle(broker_, ref_, key("cpu0"), nullptr, true, instances, &rc_), 0);
  EXPECT_EQ(factory().getCPUMemoryRefByProcessorHandle(broker_, ref_, key("cpu0"), nullptr, true, instances, &rc_), 0);

  EXPECT_TRUE(instances.empty());
  for (const Scripted::Event& event : Scripted::takeEvents()) {
    EXPECT_LT(event.level, 6000) << event;
  }
}
