#ifndef TESTS_PROVIDERS_INSTANCEPROVIDERROWS_H
#define TESTS_PROVIDERS_INSTANCEPROVIDERROWS_H

#include <gtest/gtest.h>

#include <array>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/ProviderTest.h"

/// How the four providers of plain classes differ. The tests walk this table for each behaviour.
namespace InstanceProviders {

struct Text {
  const char* text;
  std::optional<int> line;
};

struct Row {
  const char* className;
  unsigned int nodeType;  ///< of the inventory, that is collected
  Corvcim::ObjectPath (*pathOf)(const std::string& identifier);
  std::array<std::string_view, 2> identifiers;  ///< of the two elements in twoProcessors(), in the order of answers

  const char* key;
  bool failsWithoutKeys;
  bool tracesKey;
  Text noKeys;
  std::optional<Text> oneFailed;  ///< none: an unknown key succeeds with nothing
  std::optional<Text> allFailed;  ///< none: an empty inventory succeeds with nothing
  std::optional<int> exitLine;    ///< of the exit mark of GetInstance

  std::optional<const char*> instancesVariable;
  std::optional<Text> instancesFailed;

  std::optional<Text> namesVariable;
  Text namesFailed;
};

std::span<const Row> rows();

/// A machine of two processors with one core and one cache each.
void twoProcessors();

class InstanceProvider : public Support::ProviderTest, public ::testing::WithParamInterface<Row> {
 protected:
  const Row& row() const { return GetParam(); }
  const Support::ProviderFunctions& provider() const { return Support::providerOf(row().className); }
  CMPIInstanceMI* mi() { return instanceMI(row().className); }

  Support::EventList events(const std::string& operation) const { return {provider(), operation}; }
  void expectEvents(const Support::EventList& expected) const { Support::expectEvents(provider(), expected); }

  Corvcim::ObjectPath path(std::string_view identifier) const { return row().pathOf(std::string(identifier)); }
  std::vector<Corvcim::ObjectPath> allPaths() const;
  /// The path of an instance of the row's class that has only keys which do not name it.
  Corvcim::ObjectPath pathWithOtherKey() const;
  /// The same with the key that names it, of this value.
  Corvcim::ObjectPath pathWithKey(const Corvcim::Value& value) const;

  /// How often nodes of the row's kind were collected, and of the other kinds.
  unsigned int collections() const;
  unsigned int otherCollections() const;
};

std::string className(const ::testing::TestParamInfo<Row>& tested);

}  // namespace InstanceProviders

#endif
