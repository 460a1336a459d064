#include <CPU.h>
#include <gtest/gtest.h>

#include <string>
#include <type_traits>
#include <vector>

using Tarn::CPUProvider::Processor;

namespace {

template <auto get>
std::string readText(Processor& processor) {
  return (processor.*get)();
}

template <auto get>
unsigned int readNumber(Processor& processor) {
  return (processor.*get)();
}

// Plain numbers: what goes in comes out, cut to 16 bits where the field has 16.

struct NumberCase {
  const char* name;
  bool (Processor::*set)(unsigned int);
  unsigned int (*get)(Processor&);
  bool is16Bit;
};

const NumberCase numbers[] = {
    {"MaxClockSpeed", &Processor::setMaxClockSpeed, readNumber<&Processor::getMaxClockSpeed>, false},
    {"CurrentClockSpeed", &Processor::setCurrentClockSpeed, readNumber<&Processor::getCurrentClockSpeed>, false},
    {"ExternalClockSpeed", &Processor::setExternalClockSpeed, readNumber<&Processor::getExternalClockSpeed>, false},
    {"CPUStatus", &Processor::setCPUStatus, readNumber<&Processor::getCPUStatus>, true},
    {"DataWidth", &Processor::setDataWidth, readNumber<&Processor::getDataWidth>, true},
    {"AddressWidth", &Processor::setAddressWidth, readNumber<&Processor::getAddressWidth>, true},
    {"UpgradeMethod", &Processor::setUpgradeMethod, readNumber<&Processor::getUpgradeMethod>, true},
    {"NumberOfProcessorCores", &Processor::setNumberOfProcessorCores, readNumber<&Processor::getNumberOfProcessorCores>,
     true},
    {"NumberOfEnabledCores", &Processor::setNumberOfEnabledCores, readNumber<&Processor::getNumberOfEnabledCores>,
     true},
    {"NumberOfHardwareThreads", &Processor::setNumberOfHardwareThreads,
     readNumber<&Processor::getNumberOfHardwareThreads>, true},
    {"Family", &Processor::setFamily, readNumber<&Processor::getFamily>, true},
};

struct TextCase {
  const char* name;
  bool (Processor::*set)(std::string);
  std::string (*get)(Processor&);
  bool isStripped;  // by the getter
  bool mayBeEmpty;  // without the setter saying so
};

const TextCase textCases[] = {
    {"ProcessorDeviceID", &Processor::setProcessorDeviceID, readText<&Processor::getProcessorDeviceID>, true, false},
    {"InstanceId", &Processor::setInstanceId, readText<&Processor::getInstanceId>, true, false},
    {"ElementName", &Processor::setElementName, readText<&Processor::getElementName>, true, false},
    {"Name", &Processor::setName, readText<&Processor::getName>, false, true},
    {"UniqueId", &Processor::setUniqueId, readText<&Processor::getUniqueId>, false, false},
    {"Stepping", &Processor::setStepping, readText<&Processor::getStepping>, false, false},
    {"OtherFamilyDescription", &Processor::setOtherFamilyDescription, readText<&Processor::getOtherFamilyDescription>,
     false, false},
};

}  // namespace

TEST(Processor, IsAPlainValue) {
  EXPECT_FALSE(std::is_polymorphic_v<Processor>);
  EXPECT_TRUE(std::is_copy_constructible_v<Processor>);
  EXPECT_TRUE(std::is_copy_assignable_v<Processor>);
}

TEST(Processor, StartsWithItsDefaults) {
  Processor processor;

  EXPECT_EQ(processor.getProcessorDeviceID(), "");
  EXPECT_EQ(processor.getInstanceId(), "");
  EXPECT_EQ(processor.getElementName(), "");
  EXPECT_EQ(processor.getName(), "");
  EXPECT_EQ(processor.getUniqueId(), "");
  EXPECT_EQ(processor.getStepping(), "");
  EXPECT_EQ(processor.getStatusString(), "Unknown");
  EXPECT_EQ(processor.getOtherFamilyDescription(), "Other");
  EXPECT_EQ(processor.getOperationalStatus(), std::vector<unsigned short>{0});
  EXPECT_EQ(processor.getRequestedStatesSupported(), std::vector<unsigned short>{});
  EXPECT_EQ(processor.getDataWidth(), 0);
  EXPECT_EQ(processor.getAddressWidth(), 0);
  EXPECT_EQ(processor.getFamily(), 0);
  EXPECT_EQ(processor.getMaxClockSpeed(), 0U);
  EXPECT_EQ(processor.getCurrentClockSpeed(), 0U);
  EXPECT_EQ(processor.getCPUStatus(), 0);
  EXPECT_EQ(processor.getEnabledState(), 0);
  EXPECT_EQ(processor.getRequestedState(), 0);
  EXPECT_EQ(processor.getHealthState(), 0);
  EXPECT_EQ(processor.getUpgradeMethod(), 0);
  EXPECT_EQ(processor.getNumberOfProcessorCores(), 0);
  EXPECT_EQ(processor.getNumberOfEnabledCores(), 0);
  EXPECT_EQ(processor.getNumberOfHardwareThreads(), 0);
}

TEST(Processor, PlainNumbersComeBackAsTheyWereSet) {
  for (const NumberCase& number : numbers) {
    Processor processor;
    for (const unsigned int value : {1U, 2U, 3600U, 65535U}) {
      EXPECT_TRUE((processor.*number.set)(value)) << number.name;
      EXPECT_EQ(number.get(processor), value) << number.name;
    }
  }
}

TEST(Processor, NumbersAbove16BitsLoseTheirHighHalfWhereTheFieldHas16) {
  for (const NumberCase& number : numbers) {
    for (const unsigned int value : {65537U, 0xFFFF0007U, 0xFFFFFFFFU}) {
      Processor processor;
      EXPECT_TRUE((processor.*number.set)(value)) << number.name;
      EXPECT_EQ(number.get(processor), number.is16Bit ? value & 0xFFFF : value) << number.name;
    }
  }
}

TEST(Processor, A16BitFieldMayBeCutToZero) {
  Processor processor;
  EXPECT_TRUE(processor.setDataWidth(65536));
  EXPECT_EQ(processor.getDataWidth(), 0);
}

TEST(Processor, ZeroIsAPlainNumberButForTheExternalClock) {
  for (const NumberCase& number : numbers) {
    Processor processor;
    (processor.*number.set)(5);
    EXPECT_TRUE((processor.*number.set)(0)) << number.name;
    EXPECT_EQ(number.get(processor), std::string(number.name) == "ExternalClockSpeed" ? 3600U : 0U) << number.name;
  }
}

TEST(Processor, AnUnknownExternalClockReads3600FromTheFirstGetOn) {
  Processor processor;
  EXPECT_TRUE(processor.setExternalClockSpeed(0));
  const Processor copyBefore = processor;

  EXPECT_EQ(processor.getExternalClockSpeed(), 3600U);

  Processor copyAfter = processor;
  EXPECT_EQ(copyAfter.getExternalClockSpeed(), 3600U);
  EXPECT_EQ(Processor(copyBefore).getExternalClockSpeed(), 3600U);
  EXPECT_EQ(processor.getExternalClockSpeed(), 3600U);
}

TEST(Processor, TextsComeBackAsTheyWereSetOrWithoutBlanksAtTheEnds) {
  for (const TextCase& text : textCases) {
    Processor processor;
    EXPECT_TRUE((processor.*text.set)("  a b\t ")) << text.name;
    EXPECT_EQ(text.get(processor), text.isStripped ? "a b\t" : "  a b\t ") << text.name;
  }
}

TEST(Processor, AnEmptyTextIsStoredAndReportedButForTheName) {
  for (const TextCase& text : textCases) {
    Processor processor;
    (processor.*text.set)("something");
    EXPECT_EQ((processor.*text.set)(""), text.mayBeEmpty) << text.name;
    EXPECT_EQ(text.get(processor), "") << text.name;
  }
}

TEST(Processor, ATextOfBlanksIsNotEmpty) {
  for (const TextCase& text : textCases) {
    Processor processor;
    EXPECT_TRUE((processor.*text.set)("  ")) << text.name;
    EXPECT_EQ(text.get(processor), text.isStripped ? "" : "  ") << text.name;
  }
}

TEST(Processor, FamilyOtherBringsItsDescription) {
  for (const unsigned int code : {1U, 65537U, 0xFFFF0001U}) {
    Processor processor;
    EXPECT_TRUE(processor.setFamily(code));
    EXPECT_EQ(processor.getFamily(), 1);
    EXPECT_EQ(processor.getOtherFamilyDescription(), "Cell Blade Family");
  }
}

TEST(Processor, AnyOtherFamilyLeavesTheDescription) {
  for (const unsigned int code : {0U, 2U, 11U, 198U, 65535U, 65536U, 65538U}) {
    Processor processor;
    EXPECT_TRUE(processor.setFamily(code));
    EXPECT_EQ(processor.getOtherFamilyDescription(), "Other") << code;
  }
  Processor processor;
  processor.setFamily(1);
  processor.setFamily(2);
  EXPECT_EQ(processor.getOtherFamilyDescription(), "Cell Blade Family");
}

TEST(Processor, EachOneAmongTheSupportedStatesAppendsEnabled) {
  Processor processor;

  EXPECT_TRUE(processor.setRequestedStatesSupported({1, 3, 1}));
  EXPECT_EQ(processor.getRequestedStatesSupported(), (std::vector<unsigned short>{2, 2}));

  EXPECT_TRUE(processor.setRequestedStatesSupported({}));
  EXPECT_TRUE(processor.setRequestedStatesSupported({0, 2, 65537, 0xFFFFFFFF}));
  EXPECT_EQ(processor.getRequestedStatesSupported(), (std::vector<unsigned short>{2, 2}));

  EXPECT_TRUE(processor.setRequestedStatesSupported({1}));
  EXPECT_EQ(processor.getRequestedStatesSupported(), (std::vector<unsigned short>{2, 2, 2}));
}

TEST(Processor, ElementNameCanNeverBeEdited) {
  EXPECT_FALSE(Processor().isElementNameEditSupported());
}

TEST(Processor, ACopyHasEveryField) {
  Processor original;
  for (const TextCase& text : textCases) {
    (original.*text.set)(std::string("the ") + text.name);
  }
  unsigned int value = 100;
  for (const NumberCase& number : numbers) {
    (original.*number.set)(++value);
  }
  original.setEnabledState(16);
  original.setRequestedState(0);
  original.setHealthState(21);
  original.setOperationalStatus(20);
  original.setRequestedStatesSupported({1});

  Processor copy(original);

  for (const TextCase& text : textCases) {
    EXPECT_EQ(text.get(copy), std::string("the ") + text.name);
  }
  value = 100;
  for (const NumberCase& number : numbers) {
    EXPECT_EQ(number.get(copy), ++value) << number.name;
  }
  EXPECT_EQ(copy.getEnabledState(), 3);
  EXPECT_EQ(copy.getRequestedState(), 12);
  EXPECT_EQ(copy.getHealthState(), 10);
  EXPECT_EQ(copy.getStatusString(), "Degraded");
  EXPECT_EQ(copy.getOperationalStatus(), std::vector<unsigned short>{5});
  EXPECT_EQ(copy.getRequestedStatesSupported(), std::vector<unsigned short>{2});
}
