#ifndef TESTS_FACTORY_BUILDERCASES_H
#define TESTS_FACTORY_BUILDERCASES_H

#include <iosfwd>
#include <string>
#include <vector>

#include "tests/factory/FactoryTest.h"

namespace FactoryTests {

/// One property: the name that selects it, and how it is set from a full record.
struct PropertyRow {
  std::string selection;
  std::string setting;
};

/// What a builder says when the broker makes no array, and where.
struct ArrayFailureCase {
  std::string property;
  std::string text;
  int level;
  bool setsStatus;
};

/// One of the four builders, with the instance that it makes of a full record named "part0".
struct BuilderCase {
  std::string function;
  std::string className;
  std::string recordLabel;  // in the parameter list
  CMPIInstance* (*make)(CPUObjFactory&, const CMPIBroker*, const CMPIObjectPath*, const char**, bool, CMPIStatus*);
  Lines keySettings;
  std::string keyNames;  // as the property filter gets them
  std::vector<PropertyRow> properties;
  ArrayFailureCase arrayFailure;
  bool marksExitOfFailure;

  /// All settings of an instance with the properties that `names` select, in order.
  Lines settings(const Lines& names) const;
  Lines allSettings() const;
};

void PrintTo(const BuilderCase& builder, std::ostream* stream);

const std::vector<BuilderCase>& builderCases();

/// A test for each of the four.
class BuilderTest : public FactoryTest, public ::testing::WithParamInterface<BuilderCase> {
 protected:
  CMPIInstance* make(const char** properties, bool isObjPath) {
    return GetParam().make(factory(), broker_, ref_, properties, isObjPath, &rc_);
  }

  /// The builder's own events, with the record's address replaced by "#".
  Lines takeBuilderEvents();
  std::string parameters(const char** properties, bool isObjPath) const;

  /// What was recorded of these services only.
  std::vector<Corvcim::ServiceCall> takeCallsOf(const Lines& services);
};

inline std::string builderName(const ::testing::TestParamInfo<BuilderCase>& tested) {
  return tested.param.function;
}

}  // namespace FactoryTests

#endif
