#include "tests/factory/BuilderCases.h"

using namespace FactoryTests;

// What only instances made from processors have: conditions on values, traced variables, odd names.

namespace {

class ProcessorInstance : public FactoryTest {
 protected:
  Lines settingsOf(const Processor& processor, const char** properties) {
    factory().makeCPUProcInstance(broker_, ref_, processor, properties, false, &rc_);
    return recording_.takeProperties();
  }

  Lines capabilitiesOf(const Processor& processor, const char** properties) {
    factory().makeCPUProcCapInstance(broker_, ref_, processor, properties, false, &rc_);
    return recording_.takeProperties();
  }

  /// A copy of `lines` without those about one property.
  static Lines without(Lines lines, const std::string& property) {
    std::erase_if(lines, [&](const std::string& line) { return line.starts_with(property + " "); });
    return lines;
  }

  const Lines all_ = builderCases()[0].allSettings();
  const Lines keys_ = builderCases()[0].keySettings;
};

}  // namespace

TEST_F(ProcessorInstance, WidthsAndEnabledCoresOfZeroAreLeftOut) {
  Processor processor = fullProcessor("part0");
  processor.setDataWidth(0);
  EXPECT_EQ(settingsOf(processor, nullptr), without(all_, "DataWidth"));

  processor.setAddressWidth(0);
  EXPECT_EQ(settingsOf(processor, nullptr), without(without(all_, "DataWidth"), "AddressWidth"));

  processor = fullProcessor("part0");
  processor.setNumberOfEnabledCores(65536);
  EXPECT_EQ(settingsOf(processor, nullptr), without(all_, "NumberOfEnabledCores"));
}

TEST_F(ProcessorInstance, WidthsAndEnabledCoresOfZeroAreLeftOutAlsoWhenAskedFor) {
  EXPECT_EQ(settingsOf(Processor(), names({"DataWidth", "AddressWidth", "NumberOfEnabledCores"})).size(), keys_.size());
}

TEST_F(ProcessorInstance, OtherZeroAndEmptyValuesAreSet) {
  const Lines expected = {"CreationClassName chars |HALDA_CPUProcessor|",
                          "DeviceID chars ||",
                          "SystemCreationClassName chars |HALDA_ComputerSystem|",
                          "SystemName chars |scripted-host|",
                          "Caption chars |en:MSGID_CPU_PROCESSOR_CAPTION|",
                          "Description chars |en:MSGID_CPU_PROCESSOR_DESCRIPTION|",
                          "ElementName chars ||",
                          "Name chars ||",
                          "Family uint16 0",
                          "OtherFamilyDescription chars |Other|",
                          "EnabledState uint16 0",
                          "RequestedState uint16 0",
                          "CurrentClockSpeed uint32 0",
                          "MaxClockSpeed uint32 0",
                          "ExternalBusClockSpeed uint32 3600",
                          "CPUStatus uint16 0",
                          "Status chars |Unknown|",
                          "HealthState uint16 0",
                          "OperationalStatus uint16[] {0}",
                          "Stepping chars ||",
                          "UniqueId chars ||",
                          "UpgradeMethod uint16 0"};
  EXPECT_EQ(settingsOf(Processor(), nullptr), expected);
}

TEST_F(ProcessorInstance, TheUniqueIdIsSelectedByOneSpellingAndSetUnderTheOther) {
  const Processor processor = fullProcessor("part0");

  Lines expected = keys_;
  expected.push_back("UniqueId chars |0FA9|");
  EXPECT_EQ(settingsOf(processor, names({"UniqueID"})), expected);
  EXPECT_EQ(settingsOf(processor, names({"UniqueId"})), keys_);
}

TEST_F(ProcessorInstance, TheNameIsTracedWhenItIsSet) {
  const std::string name = events.variable(detail, "makeCPUProcInstance", "name", " Model 9000");
  const Processor processor = fullProcessor("part0");

  settingsOf(processor, nullptr);
  Lines reported = Scripted::takeEventsOf("makeCPUProcInstance");
  ASSERT_EQ(reported.size(), 3U);
  EXPECT_EQ(reported[1], name);

  settingsOf(processor, names({"Name"}));
  reported = Scripted::takeEventsOf("makeCPUProcInstance");
  ASSERT_EQ(reported.size(), 3U);
  EXPECT_EQ(reported[1], name);

  settingsOf(processor, names({"Family"}));
  EXPECT_EQ(Scripted::takeEventsOf("makeCPUProcInstance").size(), 2U);
}

TEST_F(ProcessorInstance, TheNumberOfCoresOfCapabilitiesIsTracedWhenItIsSet) {
  const std::string number = events.variable(detail, "makeCPUProcCapInstance", "numProcCores", "16");
  const Processor processor = fullProcessor("part0");

  capabilitiesOf(processor, nullptr);
  Lines reported = Scripted::takeEventsOf("makeCPUProcCapInstance");
  ASSERT_EQ(reported.size(), 3U);
  EXPECT_EQ(reported[1], number);

  capabilitiesOf(processor, names({"NumberOfHardwareThreads"}));
  EXPECT_EQ(Scripted::takeEventsOf("makeCPUProcCapInstance").size(), 2U);
}

TEST_F(ProcessorInstance, CapabilitiesOfNothingAreSetAllTheSame) {
  const Lines expected = {"InstanceID chars ||",
                          "Caption chars |en:MSGID_CPU_PROC_CAPABILITIES_CAPTION|",
                          "Description chars |en:MSGID_CPU_PROC_CAPABILITIES_DESCRIPTION|",
                          "NumberOfProcessorCores uint16 0",
                          "NumberOfHardwareThreads uint16 0",
                          "RequestedStatesSupported uint16[] {}",
                          "ElementNameEditSupported boolean 0"};
  EXPECT_EQ(capabilitiesOf(Processor(), nullptr), expected);
}

TEST_F(ProcessorInstance, ArraysAreOfExactlyTheirElements) {
  Processor processor;
  processor.setRequestedStatesSupported(std::vector<unsigned int>(300, 1));

  capabilitiesOf(processor, names({"RequestedStatesSupported"}));

  EXPECT_EQ(hostBroker_.services().count("newArray"), 1U);
  EXPECT_EQ(hostBroker_.services().count("setElementAt"), 300U);
}

TEST_F(ProcessorInstance, ACacheAndAProcessorOfOneIdentifierDifferByTheirClass) {
  CMPIInstance* processor = factory().makeCPUProcInstance(broker_, ref_, fullProcessor("part0"), nullptr, true, &rc_);
  CMPIInstance* cache = factory().makeCPUMemoryInstance(broker_, ref_, fullCache("part0"), nullptr, true, &rc_);

  const Corvcim::ObjectPath processorPath = Corvcim::valueOf(processor).path;
  const Corvcim::ObjectPath cachePath = Corvcim::valueOf(cache).path;
  EXPECT_EQ(processorPath.key("CreationClassName")->asString(), "HALDA_CPUProcessor");
  EXPECT_EQ(cachePath.key("CreationClassName")->asString(), "HALDA_CPUMemory");
  for (const char* name : {"DeviceID", "SystemCreationClassName", "SystemName"}) {
    EXPECT_EQ(processorPath.key(name)->asString(), cachePath.key(name)->asString()) << name;
  }
}
