#include "platform/inventory/sources/live/Reconciliation.h"

#include <gtest/gtest.h>

#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;

Facts::Explain by(const char* source) {
  return [source] { return Origin{source, "raw", "rule"}; };
}

struct Reconciled {
  Facts facts;
  std::vector<Disagreement> disagreements;
};

Reconciled reconciled(const Facts::Fact& kernel, const Facts::Fact& firmware) {
  Facts known;
  known.add(kernel);
  Facts told;
  told.add(firmware);
  Reconciled result;
  result.facts = reconcile(known, told, "P0", result.disagreements);
  return result;
}

TEST(Reconciliation, WhatOnlyOneSourceKnowsComesFromIt) {
  const Reconciled both =
      reconciled({PropHardwareThreads, 16U, by("kernel")}, {PropUpgradeMethod, 58U, by("firmware")});

  ASSERT_EQ(both.facts.all().size(), 2U);
  EXPECT_EQ(*both.facts.number(PropHardwareThreads), 16U);
  EXPECT_EQ(*both.facts.number(PropUpgradeMethod), 58U);
  EXPECT_EQ(both.facts.find(PropUpgradeMethod)->explain().source, "firmware");
  EXPECT_TRUE(both.disagreements.empty());
}

TEST(Reconciliation, WhereBothKnowTheKernelCountsAndADifferenceIsToldOf) {
  const Reconciled both = reconciled({PropProcessorCores, 8U, by("kernel")}, {PropProcessorCores, 16U, by("firmware")});

  ASSERT_EQ(both.facts.all().size(), 1U);
  EXPECT_EQ(*both.facts.number(PropProcessorCores), 8U);
  EXPECT_EQ(both.disagreements, (std::vector<Disagreement>{{"P0", "ProcessorCores", "8", "kernel", "16", "firmware"}}));
}

struct ComparisonRow {
  const char* what;
  Properties id;
  Facts::Value kernel;
  Facts::Value firmware;
  bool differ;
};

class Compared : public testing::TestWithParam<ComparisonRow> {};

TEST_P(Compared, ByWhatTheValuesMean) {
  const ComparisonRow& row = GetParam();
  const Reconciled both = reconciled({row.id, row.kernel, by("kernel")}, {row.id, row.firmware, by("firmware")});

  EXPECT_EQ(both.disagreements.size(), row.differ ? 1U : 0U) << row.what;
  EXPECT_EQ(both.facts.find(row.id)->value, row.kernel) << row.what;
}

INSTANTIATE_TEST_SUITE_P(
    All, Compared,
    testing::Values(ComparisonRow{"equal numbers", PropMaxClockSpeed, 3700U, 3700U, false},
                    ComparisonRow{"other numbers", PropMaxClockSpeed, 3700U, 4000U, true},
                    ComparisonRow{"widths", PropDataWidth, 64U, 32U, true},
                    ComparisonRow{"threads", PropHardwareThreads, 16U, 8U, true},
                    ComparisonRow{"the clock of the moment", PropCurrentClockSpeed, 800U, 3600U, false},
                    ComparisonRow{"cores that can be taken offline", PropEnabledCores, 7U, 8U, false},
                    ComparisonRow{"two spellings of a name", PropProcessorName, "Intel(R) Xeon(R) CPU",
                                  "INTEL XEON  CPU ", false},
                    ComparisonRow{"two names", PropProcessorName, "Intel(R) Xeon(R) CPU", "Intel Core", true},
                    ComparisonRow{"feature bits behind the signature", PropProcessorId, "A6 06 06 00",
                                  "A6 06 06 00 FF FB EB BF", false},
                    ComparisonRow{"two signatures", PropProcessorId, "A6 06 06 00", "A7 06 06 00 FF FB EB BF", true},
                    ComparisonRow{"two families", PropFamily, 179U, 198U, true},
                    ComparisonRow{"the family other", PropFamily, 179U, 1U, false},
                    ComparisonRow{"two models", PropSystemModel, "Box 1", "Box 2", true},
                    ComparisonRow{"two makers", PropSystemManufacturer, "Boxes", "Bags", true}));

TEST(Reconciliation, AFamilyThatTheKernelsTableDoesNotKnowComesFromTheFirmware) {
  const Reconciled both = reconciled({PropFamily, 2U, by("kernel")}, {PropFamily, 198U, by("firmware")});

  EXPECT_EQ(*both.facts.number(PropFamily), 198U);
  EXPECT_TRUE(both.disagreements.empty());
}

TEST(Reconciliation, AnUnknownFamilyStaysWhereTheFirmwareTellsNone) {
  const Reconciled both = reconciled({PropFamily, 2U, by("kernel")}, {PropUpgradeMethod, 1U, by("firmware")});

  EXPECT_EQ(*both.facts.number(PropFamily), 2U);
}

}  // namespace
}  // namespace Tarn::Inventory
