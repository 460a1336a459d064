// One whole instance of each plain class, from the inventory to the client.

#include "tests/support/ProviderTest.h"

namespace {

using Corvcim::Instance;
using Corvcim::NamedValue;
using Corvcim::ObjectPath;
using Corvcim::Value;
using Scripted::inventory;
using Support::answered;

class InstanceContents : public Support::ProviderTest {
 protected:
  InstanceContents() { inventory().fullProcessor("cpu0").core("core0").fullCache("cache0"); }
};

/// The instance with this path: its keys, then these properties.
std::vector<Instance> oneInstance(const ObjectPath& path, const std::vector<NamedValue>& properties) {
  Instance instance{path, path.keys};
  instance.properties.insert(instance.properties.end(), properties.begin(), properties.end());
  return {instance};
}

NamedValue text(const std::string& name, const std::string& value) {
  return {name, Value::string(value)};
}

NamedValue number(const std::string& name, std::uint16_t value) {
  return {name, Value::uint16(value)};
}

TEST_F(InstanceContents, OfAProcessor) {
  EXPECT_EQ(
      enumerateInstances("HALDA_CPUProcessor"),
      answered(oneInstance(Support::processorPath("cpu0"), {text("Caption", "en:MSGID_CPU_PROCESSOR_CAPTION"),
                                                            text("Description", "en:MSGID_CPU_PROCESSOR_DESCRIPTION"),
                                                            text("ElementName", "Element cpu0"),
                                                            text("Name", "Model 9000"),
                                                            number("Family", 198),
                                                            text("OtherFamilyDescription", "Other"),
                                                            number("EnabledState", 2),
                                                            number("RequestedState", 12),
                                                            {"CurrentClockSpeed", Value::uint32(2100)},
                                                            {"MaxClockSpeed", Value::uint32(3700)},
                                                            {"ExternalBusClockSpeed", Value::uint32(100)},
                                                            number("CPUStatus", 1),
                                                            text("Status", "OK"),
                                                            number("HealthState", 5),
                                                            {"OperationalStatus", Value::uint16Array({2})},
                                                            number("DataWidth", 64),
                                                            number("AddressWidth", 48),
                                                            text("Stepping", "7"),
                                                            text("UniqueId", "0FA9"),
                                                            number("UpgradeMethod", 54),
                                                            number("NumberOfEnabledCores", 12)})));
}

TEST_F(InstanceContents, OfACore) {
  EXPECT_EQ(enumerateInstances("HALDA_CPUProcessorCore"),
            answered(oneInstance(Support::corePath("core0"), {text("Caption", "en:MSGID_CPU_PROC_CORE_CAPTION"),
                                                              text("Description", "en:MSGID_CPU_PROC_CORE_DESCRIPTION"),
                                                              text("ElementName", "Element core0"),
                                                              number("CoreEnabledState", 2),
                                                              number("EnabledState", 2),
                                                              number("RequestedState", 12),
                                                              number("HealthState", 5),
                                                              {"OperationalStatus", Value::uint16Array({2})}})));
}

TEST_F(InstanceContents, OfACache) {
  EXPECT_EQ(enumerateInstances("HALDA_CPUMemory"),
            answered(oneInstance(Support::cachePath("cache0"), {text("Caption", "en:MSGID_CPU_MEMORY_CAPTION"),
                                                                text("Description", "en:MSGID_CPU_MEMORY_DESCRIPTION"),
                                                                text("ElementName", "Element cache0"),
                                                                text("Name", "L1 Data Cache"),
                                                                {"BlockSize", Value::uint64(64)},
                                                                {"NumberOfBlocks", Value::uint64(512)},
                                                                {"ConsumableBlocks", Value::uint64(500)},
                                                                number("EnabledState", 2),
                                                                number("HealthState", 5),
                                                                number("RequestedState", 12),
                                                                {"OperationalStatus", Value::uint16Array({2})}})));
}

TEST_F(InstanceContents, OfCapabilities) {
  EXPECT_EQ(enumerateInstances("HALDA_CPUProcessorCapabilities"),
            answered(oneInstance(Support::capabilitiesPath("cpu0"),
                                 {text("Caption", "en:MSGID_CPU_PROC_CAPABILITIES_CAPTION"),
                                  text("Description", "en:MSGID_CPU_PROC_CAPABILITIES_DESCRIPTION"),
                                  number("NumberOfProcessorCores", 16),
                                  number("NumberOfHardwareThreads", 24),
                                  {"RequestedStatesSupported", Value::uint16Array({2, 2})},
                                  {"ElementNameEditSupported", Value::boolean(false)}})));
}

// What a builder reports of a property reaches the client with the instances.
TEST_F(InstanceContents, StatusOfAnArrayThatTheBrokerCannotMake) {
  const auto outcomeOf = [&](const std::string& className) {
    broker.failNth("newArray", 1, {.rc = CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED, .message = "no array"});
    const auto response = enumerateInstances(className);
    EXPECT_EQ(response.instances.size(), 1U);
    EXPECT_EQ(response.instances.at(0).property("OperationalStatus"), nullptr);
    EXPECT_EQ(response.instances.at(0).property("RequestedStatesSupported"), nullptr);
    return Support::outcome(response);
  };
  EXPECT_EQ(outcomeOf("HALDA_CPUProcessor"),
            "CMPI_RC_ERR_FAILED |Create Array for Property                         OperationalStatus failed.| done");
  EXPECT_EQ(outcomeOf("HALDA_CPUProcessorCore"),
            "CMPI_RC_ERR_FAILED |Create Array for Property OperationalStatus failed.| done");
}

}  // namespace
