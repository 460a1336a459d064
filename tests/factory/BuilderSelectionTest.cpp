#include <algorithm>
#include <cctype>

#include "tests/factory/BuilderCases.h"

using namespace FactoryTests;

// Which properties a request gets, in which order, of which types.

namespace {

using BuilderSelection = BuilderTest;

std::string lowerCase(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(), [](unsigned char c) { return std::tolower(c); });
  return text;
}

}  // namespace

TEST_P(BuilderSelection, WithoutAListEveryPropertyIsSetInOrder) {
  make(nullptr, false);

  EXPECT_EQ(recording_.takeProperties(), GetParam().allSettings());
}

TEST_P(BuilderSelection, AnEmptyListSelectsTheKeysOnly) {
  make(names({}), false);

  EXPECT_EQ(recording_.takeProperties(), GetParam().keySettings);
}

TEST_P(BuilderSelection, EachNameSelectsItsProperty) {
  for (const PropertyRow& row : GetParam().properties) {
    make(names({row.selection}), false);
    EXPECT_EQ(recording_.takeProperties(), GetParam().settings({row.selection})) << row.selection;
  }
}

TEST_P(BuilderSelection, NamesInAnotherCaseSelectNothing) {
  for (const PropertyRow& row : GetParam().properties) {
    make(names({lowerCase(row.selection)}), false);
    EXPECT_EQ(recording_.takeProperties(), GetParam().keySettings) << row.selection;
  }
}

TEST_P(BuilderSelection, TheOrderOfTheListAndRepetitionsDoNotMatter) {
  Lines list;
  for (const PropertyRow& row : GetParam().properties) {
    list.insert(list.begin(), row.selection);
  }
  list.push_back(list.front());

  make(names(list), false);

  EXPECT_EQ(recording_.takeProperties(), GetParam().allSettings());
}

TEST_P(BuilderSelection, UnknownNamesKeyNamesAndPartsOfNamesSelectNothing) {
  make(names({"NoSuchProperty", "", "DeviceID", "InstanceID", "CreationClassName", "SystemName", "Capt", "Captions"}),
       false);

  EXPECT_EQ(recording_.takeProperties(), GetParam().keySettings);
}

TEST_P(BuilderSelection, TheBrokerTakesEveryPropertyAsItsClassDefinesIt) {
  CMPIInstance* instance = make(nullptr, false);

  ASSERT_NE(instance, nullptr);
  EXPECT_EQ(Corvcim::valueOf(instance).properties.size(), GetParam().allSettings().size());
}

INSTANTIATE_TEST_SUITE_P(All, BuilderSelection, ::testing::ValuesIn(builderCases()), builderName);
