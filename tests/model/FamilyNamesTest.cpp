#include <CPU.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <string>

using Tarn::CPUProvider::cpufamily;

namespace {

const std::string expectedFamilies[] = {
    "Unknown",    "Intel8086",  "Intel286",   "Intel386",   "Intel486",     "Intel8087",  "Intel287",     "Intel387",
    "Intel487",   "Pentium",    "PentiumPro", "Pentium2",   "Pentium2Xeon", "Pentium3",   "Pentium3Xeon", "Pentium4",
    "Xeon",       "Celeron",    "Itanium",    "Itanium2",   "AMDDuron",     "AMDK5",      "AMDK6",        "Athlon",
    "Athlon64",   "AthlonXP",   "AthlonMP",   "Opteron",    "PowerPC",      "PowerPC601", "PowerPC603",   "PowerPC603p",
    "PowerPC604", "PowerPC620", "PowerPC704", "PowerPC750", "AS400",        "Cell",       "S390",         "Invalid",
};

}  // namespace

TEST(FamilyNames, AreTheseFortyInThisOrder) {
  ASSERT_EQ(std::size(cpufamily), 40U);
  ASSERT_EQ(std::size(expectedFamilies), 40U);
  EXPECT_TRUE(std::equal(std::begin(cpufamily), std::end(cpufamily), std::begin(expectedFamilies)));
}
