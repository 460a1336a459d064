#include <ostream>

#include "tests/factory/FactoryTest.h"
#include "tests/factory/FactoryTexts.h"

using namespace FactoryTests;
using Corvcim::Failure;
using Corvcim::FailureResult;

// All object paths of a class.

namespace {

struct Listing {
  std::string function;
  std::string className;
  unsigned short (CPUObjFactory::*run)(const CMPIBroker*, const CMPIObjectPath*, std::vector<CMPIObjectPath*>&,
                                       CMPIStatus*);
  void (*place)(const std::string& identifier);
  Lines keys;          // of the record "a"
  std::string prefix;  // of the identifiers that the paths show
  std::string failure;
};

void PrintTo(const Listing& listing, std::ostream* stream) {
  *stream << listing.function;
}

const Listing listings[] = {
    {"getAllCPUProcCMPIObjPaths",
     "HALDA_CPUProcessor",
     &CPUObjFactory::getAllCPUProcCMPIObjPaths,
     placeProcessor,
     {"CreationClassName chars |HALDA_CPUProcessor|", "DeviceID chars |a|",
      "SystemCreationClassName chars |HALDA_ComputerSystem|", "SystemName chars |scripted-host|"},
     "",
     processorPathFailed},
    {"getAllCPUProcCoreCMPIObjPaths",
     "HALDA_CPUProcessorCore",
     &CPUObjFactory::getAllCPUProcCoreCMPIObjPaths,
     placeCore,
     {"InstanceID chars |a|"},
     "",
     corePathFailed},
    {"getAllCPUMemoryCMPIObjPaths",
     "HALDA_CPUMemory",
     &CPUObjFactory::getAllCPUMemoryCMPIObjPaths,
     placeCache,
     {"CreationClassName chars |HALDA_CPUMemory|", "DeviceID chars |a|",
      "SystemCreationClassName chars |HALDA_ComputerSystem|", "SystemName chars |scripted-host|"},
     "",
     cachePathFailed},
    {"getAllCPUProcCapCMPIObjPaths",
     "HALDA_CPUProcessorCapabilities",
     &CPUObjFactory::getAllCPUProcCapCMPIObjPaths,
     placeProcessor,
     {"InstanceID chars |NERITH:a|"},
     "NERITH:",
     capabilitiesPathFailed},
};

class ObjectPaths : public FactoryTest, public ::testing::WithParamInterface<Listing> {
 protected:
  unsigned short run() { return (factory().*GetParam().run)(broker_, ref_, paths_, &rc_); }

  std::string parameters() const {
    return requestParameters(broker_, ref_,
                             " objPaths=" + Scripted::address(&paths_) + " status=" + Scripted::address(&rc_));
  }

  std::vector<CMPIObjectPath*> paths_;
};

}  // namespace

TEST_P(ObjectPaths, HaveTheKeysOfTheirClassInOrder) {
  GetParam().place("a");

  EXPECT_EQ(run(), 0);

  EXPECT_EQ(recording_.takeKeys(), GetParam().keys);
}

TEST_P(ObjectPaths, StandInTheNamespaceOfTheReferenceAndOnThisHost) {
  GetParam().place("a");
  ref_ = path("HALDA_Whatever", "interop/deep");

  run();

  ASSERT_EQ(paths_.size(), 1U);
  const Corvcim::ObjectPath made = Corvcim::valueOf(paths_[0]);
  EXPECT_EQ(made.className, GetParam().className);
  EXPECT_EQ(made.nameSpace, "interop/deep");
  EXPECT_EQ(made.host, "scripted-host");
}

TEST_P(ObjectPaths, AreMadeWithoutInstances) {
  GetParam().place("a");

  run();

  EXPECT_EQ(hostBroker_.services().count("newInstance"), 0U);
}

TEST_P(ObjectPaths, ComeInTheOrderOfTheirKeysBehindWhatIsThere) {
  for (const char* identifier : {"b2", "b10", "A"}) {
    GetParam().place(identifier);
  }
  paths_ = {nullptr};

  EXPECT_EQ(run(), 0);

  const std::string& prefix = GetParam().prefix;
  EXPECT_EQ(identifiersOf(paths_), (Lines{"NULL", prefix + "A", prefix + "b10", prefix + "b2"}));
}

TEST_P(ObjectPaths, ReportTheirFrame) {
  GetParam().place("a");

  run();

  const Lines expected = {events.entering(detail, GetParam().function, parameters()),
                          events.exiting(detail, GetParam().function, parameters())};
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), expected);
}

TEST_P(ObjectPaths, WithoutRecordsFail) {
  EXPECT_EQ(run(), 1);

  EXPECT_TRUE(paths_.empty());
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
  const Lines expected = {events.entering(detail, GetParam().function, parameters()),
                          events.message(error, GetParam().function, "***No ObjPaths found***"),
                          events.exiting(detail, GetParam().function, parameters())};
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), expected);
}

TEST_P(ObjectPaths, AFailedCreationEndsTheListAndKeepsThePathsBefore) {
  for (const FailureResult result : {FailureResult::Null, FailureResult::HandleLess}) {
    for (const char* identifier : {"a", "b", "c"}) {
      GetParam().place(identifier);
    }
    paths_.clear();
    forgetTraces();
    hostBroker_.services().failNth("newObjectPath", 2, Failure{result, CMPI_RC_ERR_ACCESS_DENIED, "no"});

    EXPECT_EQ(run(), 2);

    EXPECT_EQ(identifiersOf(paths_), Lines{GetParam().prefix + "a"});
    EXPECT_EQ(hostBroker_.services().count("newObjectPath"), 2U);
    EXPECT_EQ(shown(rc_), "CMPI_RC_ERR_FAILED |" + pathFailed + "|");
    const Lines reported = Scripted::takeEventsOf(GetParam().function);
    ASSERT_GE(reported.size(), 2U);
    EXPECT_EQ(reported[1], events.message(error, GetParam().function, GetParam().failure));
  }
}

TEST_P(ObjectPaths, AFailedCreationNeedsNoStatus) {
  GetParam().place("a");
  hostBroker_.services().failNth("newObjectPath", 1);

  EXPECT_EQ((factory().*GetParam().run)(broker_, ref_, paths_, nullptr), 2);

  EXPECT_EQ(hostBroker_.services().count("newString"), 0U);
}

TEST_P(ObjectPaths, AReferenceWithoutNamespaceReadsAsEmpty) {
  GetParam().place("a");
  hostBroker_.services().failNth("getNameSpace", 1, {}, 0);

  EXPECT_EQ(run(), 0);

  ASSERT_EQ(paths_.size(), 1U);
  EXPECT_EQ(Corvcim::valueOf(paths_[0]).nameSpace, "");
}

INSTANTIATE_TEST_SUITE_P(All, ObjectPaths, ::testing::ValuesIn(listings),
                         [](const auto& tested) { return tested.param.function; });
