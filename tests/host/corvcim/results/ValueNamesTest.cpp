#include "host/corvcim/results/ValueNames.h"

#include <gtest/gtest.h>

#include <string>

namespace Corvcim {
namespace {

/// All codes of a property that have a name, as "code name" lines.
std::string namesOf(std::string_view property, std::uint64_t last) {
  std::string names;
  for (std::uint64_t code = 0; code <= last; ++code) {
    if (const std::string_view name = valueName(property, code); !name.empty()) {
      names += std::to_string(code) + ' ' + std::string(name) + '\n';
    }
  }
  return names;
}

TEST(ValueNames, EveryCodeOfAStateHasItsName) {
  EXPECT_EQ(namesOf("EnabledState", 100),
            "0 Unknown\n1 Other\n2 Enabled\n3 Disabled\n4 Shutting Down\n5 Not Applicable\n6 Enabled but Offline\n"
            "7 In Test\n8 Deferred\n9 Quiesce\n10 Starting\n");
  EXPECT_EQ(namesOf("RequestedState", 100),
            "0 Unknown\n2 Enabled\n3 Disabled\n4 Shut Down\n5 No Change\n6 Offline\n7 Test\n8 Deferred\n9 Quiesce\n"
            "10 Reboot\n11 Reset\n12 Not Applicable\n");
  EXPECT_EQ(namesOf("HealthState", 100),
            "0 Unknown\n5 OK\n10 Degraded\n15 Minor Failure\n20 Major Failure\n25 Critical Failure\n"
            "30 Non-recoverable Error\n");
  EXPECT_EQ(namesOf("CoreEnabledState", 100),
            "0 Unknown\n2 Core Enabled\n3 Core Disabled\n4 Core Disabled by User\n5 Core Disabled by POST Error\n");
}

TEST(ValueNames, EveryOperationalStatusThatTheLibraryDeliversHasAName) {
  for (const std::uint64_t code : {0, 2, 5, 8, 9, 10, 12, 13, 15}) {
    EXPECT_NE(valueName("OperationalStatus", code), "") << code;
  }
}

TEST(ValueNames, EveryCodeOfACacheHasItsName) {
  EXPECT_EQ(namesOf("Level", 100), "0 Unknown\n1 Other\n2 Not Applicable\n3 Primary\n4 Secondary\n5 Tertiary\n");
  EXPECT_EQ(namesOf("CacheType", 100), "0 Unknown\n1 Other\n2 Instruction\n3 Data\n4 Unified\n");
  EXPECT_EQ(namesOf("WritePolicy", 100),
            "0 Unknown\n1 Other\n2 Write Back\n3 Write Through\n4 Varies with Address\n5 Determination per I/O\n");
  EXPECT_EQ(namesOf("Associativity", 100),
            "0 Unknown\n1 Other\n2 Direct Mapped\n3 2-way Set-Associative\n4 4-way Set-Associative\n"
            "5 Fully Associative\n6 8-way Set-Associative\n7 16-way Set-Associative\n");
}

TEST(ValueNames, FamiliesHaveTheirNames) {
  EXPECT_EQ(valueName("Family", 2), "Unknown");
  EXPECT_EQ(valueName("Family", 107), "Zen");
  EXPECT_EQ(valueName("Family", 179), "Xeon");
  EXPECT_EQ(valueName("Family", 198), "Core i7");
  EXPECT_EQ(valueName("Family", 257), "ARMv8");
  EXPECT_EQ(valueName("Family", 0), "");
  EXPECT_EQ(valueName("Family", 65535), "");
}

TEST(ValueNames, NamesOfPropertiesHaveNoCase) {
  EXPECT_EQ(valueName("enabledSTATE", 2), "Enabled");
  EXPECT_EQ(unitName("MAXCLOCKSPEED"), "MHz");
}

TEST(ValueNames, PropertiesWithoutCodesHaveNone) {
  EXPECT_EQ(valueName("MaxClockSpeed", 2), "");
  EXPECT_EQ(unitName("BlockSize"), "bytes");
  EXPECT_EQ(unitName("NumberOfBlocks"), "");
}

}  // namespace
}  // namespace Corvcim
