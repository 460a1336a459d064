#include <CPUClassNames.h>

#include <string>

#include "tests/factory/FactoryTest.h"

using namespace FactoryTests;
using Corvcim::Failure;
using Corvcim::FailureResult;

// The class at the far end of an association, by the class at the near end.

namespace {

struct TargetCase {
  const char* source;
  const char* association;
  const char* message;
  const char* target;
};

constexpr TargetCase targets[] = {
    {"HALDA_CPUMemory", "HALDA_CPUAssociatedCacheMemory", "Target Class is cpuProcessorClass", "HALDA_CPUProcessor"},
    {"HALDA_CPUProcessor", "HALDA_CPUAssociatedCacheMemory", "Target Class is cpuMemoryClass", "HALDA_CPUMemory"},
    {"HALDA_CPUMemory", "HALDA_CPUCoreAssociatedCacheMemory", "Target Class is cpuProcessorCoreClass",
     "HALDA_CPUProcessorCore"},
    {"HALDA_CPUProcessorCore", "HALDA_CPUCoreAssociatedCacheMemory", "Target Class is cpuMemoryClass",
     "HALDA_CPUMemory"},
    {"HALDA_ComputerSystem", "HALDA_CPUSystemDevice", "Target Class is cpuProcessorClass", "HALDA_CPUProcessor"},
    {"HALDA_CPUProcessor", "HALDA_CPUSystemDevice", "Target Class is ComputerSystemClass", "HALDA_ComputerSystem"},
    {"HALDA_CPUProcessorCapabilities", "HALDA_CPUElementCapabilities", "Target Class is cpuProcessorClass",
     "HALDA_CPUProcessor"},
    {"HALDA_CPUProcessor", "HALDA_CPUElementCapabilities", "Target Class is cpuProcessorCapClass",
     "HALDA_CPUProcessorCapabilities"},
    {"HALDA_CPUProcessorCore", "HALDA_CPUConcreteComponent", "Target Class is cpuProcessorClass", "HALDA_CPUProcessor"},
    {"HALDA_CPUProcessor", "HALDA_CPUConcreteComponent", "Target Class is cpuProcessorCoreClass",
     "HALDA_CPUProcessorCore"},
};

constexpr const char* nameFunction = "get_assoc_targetClass_Name";
constexpr const char* pathFunction = "get_assoc_targetClass_ObjectPath";

class TargetClass : public FactoryTest {
 protected:
  std::string nameOf(const std::string& source, const char* association, const char* resultClass = nullptr) {
    return factory().get_assoc_targetClass_Name(broker_, path(source), association, resultClass, &rc_);
  }

  CMPIObjectPath* pathOf(const CMPIObjectPath* source, const char* association, const char* resultClass = nullptr) {
    return factory().get_assoc_targetClass_ObjectPath(broker_, source, association, resultClass, &rc_);
  }

  std::string parameters(const CMPIObjectPath* source, const std::string& association,
                         const std::string& resultClass) const {
    return " _broker=" + Scripted::address(broker_) + " ref=" + Scripted::address(source) +
           " _RefLeftClass=" + association + " _RefRightClass=" + resultClass + " rc=" + Scripted::address(&rc_);
  }
};

std::string upperCase(std::string text) {
  for (char& letter : text) {
    letter = letter >= 'a' && letter <= 'z' ? static_cast<char>(letter - 'a' + 'A') : letter;
  }
  return text;
}

}  // namespace

TEST_F(TargetClass, ClassesHaveTheirNames) {
  EXPECT_STREQ(Tarn::CPUProvider::cpuProcessorClass, "HALDA_CPUProcessor");
  EXPECT_STREQ(Tarn::CPUProvider::cpuProcessorCoreClass, "HALDA_CPUProcessorCore");
  EXPECT_STREQ(Tarn::CPUProvider::cpuMemoryClass, "HALDA_CPUMemory");
  EXPECT_STREQ(Tarn::CPUProvider::cpuProcessorCapClass, "HALDA_CPUProcessorCapabilities");
  EXPECT_STREQ(Tarn::CPUProvider::computerSystemClass, "HALDA_ComputerSystem");
  EXPECT_STREQ(Tarn::CPUProvider::cpuAssociatedCacheMemoryClass, "HALDA_CPUAssociatedCacheMemory");
  EXPECT_STREQ(Tarn::CPUProvider::cpuCoreAssociatedCacheMemoryClass, "HALDA_CPUCoreAssociatedCacheMemory");
  EXPECT_STREQ(Tarn::CPUProvider::cpuSystemDeviceClass, "HALDA_CPUSystemDevice");
  EXPECT_STREQ(Tarn::CPUProvider::cpuElementCapClass, "HALDA_CPUElementCapabilities");
  EXPECT_STREQ(Tarn::CPUProvider::cpuConcreteComponentClass, "HALDA_CPUConcreteComponent");
}

TEST_F(TargetClass, IsTheOtherEndOfTheAssociation) {
  for (const TargetCase& target : targets) {
    EXPECT_EQ(nameOf(target.source, target.association), target.target) << target.source << ' ' << target.association;
  }
}

TEST_F(TargetClass, IsReported) {
  for (const TargetCase& target : targets) {
    forgetTraces();
    const CMPIObjectPath* source = path(target.source);
    factory().get_assoc_targetClass_Name(broker_, source, target.association, "Wanted", &rc_);
    const std::string list = parameters(source, target.association, "Wanted");
    const Lines expected = {events.entering(detail, nameFunction, list),
                            events.message(info, nameFunction, target.message),
                            events.exiting(detail, nameFunction, list)};
    EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
  }
}

TEST_F(TargetClass, IsEmptyForEveryOtherPair) {
  const char* const classes[] = {"HALDA_CPUProcessor",
                                 "HALDA_CPUProcessorCore",
                                 "HALDA_CPUMemory",
                                 "HALDA_ComputerSystem",
                                 "HALDA_CPUProcessorCapabilities",
                                 "CIM_Processor",
                                 ""};
  const char* const associations[] = {"HALDA_CPUAssociatedCacheMemory",
                                      "HALDA_CPUCoreAssociatedCacheMemory",
                                      "HALDA_CPUSystemDevice",
                                      "HALDA_CPUElementCapabilities",
                                      "HALDA_CPUConcreteComponent",
                                      "CIM_SystemDevice",
                                      ""};
  unsigned int found = 0;
  for (const std::string source : classes) {
    for (const std::string association : associations) {
      std::string expected;
      for (const TargetCase& target : targets) {
        if (source == target.source && association == target.association) {
          expected = target.target;
          ++found;
        }
      }
      EXPECT_EQ(nameOf(source, association.c_str()), expected) << source << ' ' << association;
    }
  }
  EXPECT_EQ(found, 10U);
}

TEST_F(TargetClass, NamesCompareExactly) {
  for (const TargetCase& target : targets) {
    EXPECT_EQ(nameOf(upperCase(target.source), target.association), "");
    EXPECT_EQ(nameOf(target.source, upperCase(target.association).c_str()), "");
    EXPECT_EQ(nameOf(std::string(target.source) + " ", target.association), "");
    EXPECT_EQ(nameOf(target.source, (std::string(target.association) + "s").c_str()), "");
  }
}

TEST_F(TargetClass, WithoutAnAssociationThereIsNone) {
  for (const TargetCase& target : targets) {
    EXPECT_EQ(nameOf(target.source, nullptr), "");
    EXPECT_EQ(nameOf(target.source, ""), "");
    EXPECT_EQ(pathOf(path(target.source), nullptr), nullptr);
  }
}

TEST_F(TargetClass, AMissingOneIsReported) {
  const CMPIObjectPath* source = path("HALDA_CPUProcessor");

  EXPECT_EQ(pathOf(source, nullptr), nullptr);

  const std::string list = parameters(source, "", "");
  const Lines expected = {events.entering(detail, pathFunction, list),
                          events.entering(detail, nameFunction, list),
                          events.message(info, nameFunction, "Target Class is empty"),
                          events.exiting(detail, nameFunction, list),
                          events.variable(detail, pathFunction, "targetName", ""),
                          events.exiting(detail, pathFunction, list)};
  EXPECT_EQ(Scripted::takeEventsWithoutLines(), expected);
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
  EXPECT_EQ(hostBroker_.services().count("newObjectPath"), 0U);
}

TEST_F(TargetClass, TheResultClassPlaysNoPart) {
  EXPECT_EQ(nameOf("HALDA_CPUProcessor", "HALDA_CPUSystemDevice", "HALDA_CPUMemory"), "HALDA_ComputerSystem");
  EXPECT_EQ(nameOf("HALDA_CPUProcessor", "NoSuchClass", "HALDA_CPUMemory"), "");
}

TEST_F(TargetClass, ASourceWithoutClassNameHasNone) {
  hostBroker_.services().failNth("getClassName", 1);
  EXPECT_EQ(nameOf("HALDA_CPUProcessor", "HALDA_CPUSystemDevice"), "");
}

TEST_F(TargetClass, ThePathHasNamespaceAndHostAndNoKeys) {
  const CMPIObjectPath* source = path("HALDA_CPUProcessor", "interop/deep");

  CMPIObjectPath* made = pathOf(source, "HALDA_CPUAssociatedCacheMemory");

  Corvcim::ObjectPath expected;
  expected.host = "scripted-host";
  expected.nameSpace = "interop/deep";
  expected.className = "HALDA_CPUMemory";
  EXPECT_EQ(Corvcim::valueOf(made), expected);
  EXPECT_EQ(hostBroker_.services().count("setNameSpace"), 1U);
  EXPECT_EQ(hostBroker_.services().count("setHostname"), 1U);
}

TEST_F(TargetClass, ThePathIsReported) {
  const CMPIObjectPath* source = path("HALDA_CPUProcessor");

  pathOf(source, "HALDA_CPUSystemDevice", "Wanted");

  const std::string list = parameters(source, "HALDA_CPUSystemDevice", "Wanted");
  const Lines expected = {events.entering(detail, pathFunction, list),
                          events.variable(detail, pathFunction, "targetName", "HALDA_ComputerSystem"),
                          events.exiting(detail, pathFunction, list)};
  EXPECT_EQ(Scripted::takeEventsOf(pathFunction), expected);
}

TEST_F(TargetClass, AFailedPathIsHandedBackWithTheStatusOfTheBroker) {
  const CMPIObjectPath* source = path("HALDA_CPUProcessor");

  hostBroker_.services().failNth("newObjectPath", 1, Failure{FailureResult::Null, CMPI_RC_ERR_ACCESS_DENIED, "no"});
  EXPECT_EQ(pathOf(source, "HALDA_CPUSystemDevice"), nullptr);
  EXPECT_EQ(shown(rc_), "CMPI_RC_ERR_ACCESS_DENIED |no|");

  hostBroker_.services().failNth("newObjectPath", 1,
                                 Failure{FailureResult::HandleLess, CMPI_RC_ERR_ACCESS_DENIED, "no"});
  CMPIObjectPath* handleLess = pathOf(source, "HALDA_CPUSystemDevice");
  ASSERT_NE(handleLess, nullptr);
  EXPECT_EQ(handleLess->hdl, nullptr);
}
