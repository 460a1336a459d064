#include <ostream>

#include "tests/factory/FactoryTest.h"

using namespace FactoryTests;

// All instances of a class.

namespace {

struct Enumeration {
  std::string function;
  std::string builder;
  unsigned short (*run)(CPUObjFactory&, const CMPIBroker*, const CMPIObjectPath*, const char**, bool,
                        std::vector<CMPIInstance*>&, CMPIStatus*);
  void (*place)(const std::string& identifier);
  std::string prefix;  // of the identifiers that the instances show
  bool emptyIsFailure;
};

void PrintTo(const Enumeration& enumeration, std::ostream* stream) {
  *stream << enumeration.function;
}

template <auto Function>
unsigned short enumerate(CPUObjFactory& factory, const CMPIBroker* broker, const CMPIObjectPath* ref,
                         const char** properties, bool isObjPath, std::vector<CMPIInstance*>& instances,
                         CMPIStatus* rc) {
  return (factory.*Function)(broker, ref, properties, isObjPath, instances, rc);
}

const Enumeration enumerations[] = {
    {"getAllCPUProcCMPIInstances", "makeCPUProcInstance", enumerate<&CPUObjFactory::getAllCPUProcCMPIInstances>,
     placeProcessor, "", true},
    {"getAllCPUProcCapCMPIInstances", "makeCPUProcCapInstance",
     enumerate<&CPUObjFactory::getAllCPUProcCapCMPIInstances>, placeProcessor, "NERITH:", true},
    {"getAllCPUProcCoreCMPIInstances", "makeCPUProcCoreInstance",
     enumerate<&CPUObjFactory::getAllCPUProcCoreCMPIInstances>, placeCore, "", true},
    {"getAllCPUMemoryCMPIInstances", "makeCPUMemoryInstance", enumerate<&CPUObjFactory::getAllCPUMemoryCMPIInstances>,
     placeCache, "", false},
};

class EnumerationOfInstances : public FactoryTest, public ::testing::WithParamInterface<Enumeration> {
 protected:
  unsigned short run(const char** properties = nullptr, bool isObjPath = false) {
    return GetParam().run(factory(), broker_, ref_, properties, isObjPath, instances_, &rc_);
  }

  void placeSome() {
    for (const char* identifier : {"b2", "b10", "A"}) {
      GetParam().place(identifier);
    }
  }

  Lines identifiers(const Lines& names) const {
    Lines lines;
    for (const std::string& name : names) {
      lines.push_back(GetParam().prefix + name);
    }
    return lines;
  }

  std::string parameters(const char** properties, bool isObjPath) const {
    return requestParameters(broker_, ref_,
                             " properties=" + Scripted::address(properties) + " isObjPath=" + (isObjPath ? "1" : "0") +
                                 " instances=" + Scripted::address(&instances_) + " rc=" + Scripted::address(&rc_));
  }

  std::vector<CMPIInstance*> instances_;
};

}  // namespace

TEST_P(EnumerationOfInstances, GivesAllInTheOrderOfTheirKeys) {
  placeSome();

  EXPECT_EQ(run(), 0);

  EXPECT_EQ(identifiersOf(instances_), identifiers({"A", "b10", "b2"}));
}

TEST_P(EnumerationOfInstances, AppendsToWhatIsThere) {
  placeSome();
  instances_ = {nullptr};

  EXPECT_EQ(run(), 0);

  ASSERT_EQ(instances_.size(), 4U);
  EXPECT_EQ(instances_[0], nullptr);
  EXPECT_NE(instances_[1], nullptr);
}

TEST_P(EnumerationOfInstances, HandsPropertiesAndFlagToTheBuilder) {
  GetParam().place("a");

  run(names({"Caption"}), false);
  const Lines withCaption = recording_.takeProperties();
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), 1U);
  run(nullptr, true);
  const Lines keysOnly = recording_.takeProperties();
  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), 1U);

  EXPECT_EQ(withCaption.size(), keysOnly.size() + 1);
  EXPECT_TRUE(withCaption.back().starts_with("Caption chars "));
}

TEST_P(EnumerationOfInstances, WithoutRecordsFailsButForCaches) {
  EXPECT_EQ(run(), GetParam().emptyIsFailure ? 1 : 0);

  EXPECT_TRUE(instances_.empty());
  EXPECT_EQ(rc_.rc, CMPI_RC_OK);
  Lines expected = {events.entering(detail, GetParam().function, parameters(nullptr, false))};
  if (GetParam().emptyIsFailure) {
    expected.push_back(events.message(error, GetParam().function, "***No Instance found***"));
  }
  expected.push_back(events.exiting(detail, GetParam().function, parameters(nullptr, false)));
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), expected);
}

TEST_P(EnumerationOfInstances, ReportsItsFrame) {
  placeSome();

  run(nullptr, true);

  const Lines expected = {events.entering(detail, GetParam().function, parameters(nullptr, true)),
                          events.exiting(detail, GetParam().function, parameters(nullptr, true))};
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), expected);
}

TEST_P(EnumerationOfInstances, AppendsTheNullOfABuilderAndGoesOn) {
  placeSome();
  hostBroker_.services().failNth("newInstance", 2);

  EXPECT_EQ(run(), 0);

  EXPECT_EQ(identifiersOf(instances_)[0], identifiers({"A"})[0]);
  EXPECT_EQ(instances_.at(1), nullptr);
  EXPECT_EQ(identifiersOf(instances_)[2], identifiers({"b2"})[0]);
}

TEST_P(EnumerationOfInstances, IsDoneByItsBuilder) {
  placeSome();

  run();

  Lines entries = Scripted::takeEventsOf(GetParam().builder);
  std::erase_if(entries, [](const std::string& line) { return line.find("|ENTERING: ") == std::string::npos; });
  EXPECT_EQ(entries.size(), 3U);
}

INSTANTIATE_TEST_SUITE_P(All, EnumerationOfInstances, ::testing::ValuesIn(enumerations),
                         [](const auto& tested) { return tested.param.function; });
