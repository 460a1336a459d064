#include <optional>
#include <ostream>

#include "tests/factory/FactoryTest.h"

using namespace FactoryTests;

// The instance of one key.

namespace {

struct Lookup {
  std::string function;
  unsigned short (CPUObjFactory::*run)(const CMPIBroker*, const CMPIObjectPath*, CMPIString*, const char**,
                                       std::vector<CMPIInstance*>&, CMPIStatus*);
  std::optional<std::string> keyTracedAs;
  std::string prefix;                  // of the identifiers
  std::optional<std::string> failure;  // for a key that is not there
};

void PrintTo(const Lookup& lookup, std::ostream* stream) {
  *stream << lookup.function;
}

const Lookup lookups[] = {
    {"getOneCPUProcCMPIInstance", &CPUObjFactory::getOneCPUProcCMPIInstance, std::nullopt, "",
     "Processor map is empty"},
    {"getOneCPUProcCoreCMPIInstance", &CPUObjFactory::getOneCPUProcCoreCMPIInstance, "instanceID", "",
     "CPU Processor Core Map is empty"},
    {"getOneCPUMemoryCMPIInstance", &CPUObjFactory::getOneCPUMemoryCMPIInstance, std::nullopt, "",
     "CPU Memory map is empty"},
    {"getOneCPUProcCapCMPIInstance", &CPUObjFactory::getOneCPUProcCapCMPIInstance, "instanceID",
     "NERITH:", std::nullopt},
};

class LookupOfOne : public FactoryTest, public ::testing::WithParamInterface<Lookup> {
 protected:
  static void placeSome() {
    for (const char* identifier : {"a", "b", "c"}) {
      place(fullProcessor(identifier));
      place(fullCore(identifier));
      place(fullCache(identifier));
    }
  }

  unsigned short find(const std::string& text, const char** properties = nullptr) {
    key_ = key(text);
    return (factory().*GetParam().run)(broker_, ref_, key_, properties, instances_, &rc_);
  }

  /// The function's own events for the key asked for last.
  Lines framed(const std::string& text, const std::optional<std::string>& failure) const {
    const std::string parameters =
        requestParameters(broker_, ref_,
                          " key=" + Scripted::address(key_) + " properties=" + Scripted::address(nullptr) +
                              " instances=" + Scripted::address(&instances_) + " rc=" + Scripted::address(&rc_));
    Lines lines = {events.entering(detail, GetParam().function, parameters)};
    if (GetParam().keyTracedAs) {
      lines.push_back(events.variable(detail, GetParam().function, *GetParam().keyTracedAs, text));
    }
    if (failure) {
      lines.push_back(events.message(error, GetParam().function, *failure));
    }
    lines.push_back(events.exiting(detail, GetParam().function, parameters));
    return lines;
  }

  CMPIString* key_ = nullptr;
  std::vector<CMPIInstance*> instances_;
};

}  // namespace

TEST_P(LookupOfOne, FindsTheInstanceOfTheKey) {
  placeSome();
  const std::string text = GetParam().prefix + "b";

  EXPECT_EQ(find(text), 0);

  EXPECT_EQ(identifiersOf(instances_), Lines{text});
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), framed(text, std::nullopt));
}

TEST_P(LookupOfOne, GivesAFullInstanceWithAFilter) {
  placeSome();

  find(GetParam().prefix + "b", names({"Caption"}));

  EXPECT_EQ(hostBroker_.services().count("setPropertyFilter"), 1U);
  EXPECT_TRUE(recording_.takeProperties().back().starts_with("Caption chars "));
}

TEST_P(LookupOfOne, AppendsToWhatIsThere) {
  placeSome();
  instances_ = {nullptr};

  find(GetParam().prefix + "b");

  EXPECT_EQ(identifiersOf(instances_), (Lines{"NULL", GetParam().prefix + "b"}));
}

TEST_P(LookupOfOne, AKeyThatIsNotThereFailsButForCapabilities) {
  placeSome();
  for (const char* name : {"d", "B", " b", "b ", "", "b\t"}) {
    const std::string text = GetParam().prefix + name;
    forgetTraces();

    EXPECT_EQ(find(text), GetParam().failure ? 1 : 0) << text;

    EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), framed(text, GetParam().failure)) << text;
  }
  EXPECT_TRUE(instances_.empty());
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
}

TEST_P(LookupOfOne, WithoutRecordsItIsTheSame) {
  EXPECT_EQ(find("a"), GetParam().failure ? 1 : 0);

  EXPECT_TRUE(instances_.empty());
  EXPECT_EQ(shown(rc_), "CMPI_RC_OK");
  EXPECT_EQ(Scripted::takeEventsOf(GetParam().function), framed("a", GetParam().failure));
}

TEST_P(LookupOfOne, AppendsTheNullOfABuilder) {
  placeSome();
  hostBroker_.services().failNth("newInstance", 1);

  EXPECT_EQ(find(GetParam().prefix + "b"), 0);

  EXPECT_EQ(identifiersOf(instances_), Lines{"NULL"});
}

TEST_P(LookupOfOne, TheTextOfTheKeyIsReadIntoTheStatus) {
  placeSome();
  hostBroker_.services().failNth("getCharPtr", 1,
                                 {Corvcim::FailureResult::StatusOnly, CMPI_RC_ERR_ACCESS_DENIED, "the broker says no"});

  find("nothing");

  EXPECT_EQ(shown(rc_), "CMPI_RC_ERR_ACCESS_DENIED |the broker says no|");
}

INSTANTIATE_TEST_SUITE_P(All, LookupOfOne, ::testing::ValuesIn(lookups),
                         [](const auto& tested) { return tested.param.function; });

namespace {

using LookupOfCapabilities = FactoryTest;

}  // namespace

TEST_F(LookupOfCapabilities, GivesOneInstanceForEachProcessorWithTheInstanceIdInTheOrderOfKeys) {
  Processor twin = fullProcessor("z");
  twin.setInstanceId("NERITH:a");
  twin.setNumberOfProcessorCores(8);
  place(twin);
  place(fullProcessor("b"));
  place(fullProcessor("a"));
  std::vector<CMPIInstance*> instances;

  EXPECT_EQ(factory().getOneCPUProcCapCMPIInstance(broker_, ref_, key("NERITH:a"), nullptr, instances, &rc_), 0);

  ASSERT_EQ(instances.size(), 2U);
  EXPECT_EQ(Corvcim::valueOf(instances[0]).property("NumberOfProcessorCores")->asUnsigned(), 16U);
  EXPECT_EQ(Corvcim::valueOf(instances[1]).property("NumberOfProcessorCores")->asUnsigned(), 8U);
}

TEST_F(LookupOfCapabilities, ComparesInstanceIdsWithoutTheirBlanks) {
  Processor processor = fullProcessor("a");
  processor.setInstanceId(" NERITH:a ");
  place(processor);
  std::vector<CMPIInstance*> instances;

  factory().getOneCPUProcCapCMPIInstance(broker_, ref_, key("NERITH:a"), nullptr, instances, &rc_);
  factory().getOneCPUProcCapCMPIInstance(broker_, ref_, key(" NERITH:a "), nullptr, instances, &rc_);

  EXPECT_EQ(identifiersOf(instances), Lines{"NERITH:a"});
}
