// Results are counted in 16 bits: of more, the remainder modulo 65536 is delivered.

#include "tests/providers/ScriptedFactoryTest.h"

namespace {

using Corvcim::ObjectPath;
using Corvcim::OperationKind;
using ScriptedFactory::script;
using Support::classPath;
using Support::processorPath;

constexpr std::size_t oneTooMany = 65536 + 1;

class ResultCount : public ScriptedFactory::ScriptedFactoryTest {
 protected:
  /// The number of results when the factory finds this many instances and paths.
  std::size_t resultsOf(const std::string& className, OperationKind kind, const ObjectPath& path, std::size_t found) {
    const ObjectPath object = processorPath("x");
    script().instances.assign(found, element(object));
    script().paths.assign(found, this->path(object));
    const auto response = Corvcim::isAssociationOperation(kind) ? associate(className, kind, path)
                                                                : perform(className, {kind, path, {}, {}});
    return response.instances.size() + response.paths.size();
  }
};

TEST_F(ResultCount, OfInstanceProviders) {
  for (const char* className :
       {"HALDA_CPUProcessor", "HALDA_CPUProcessorCore", "HALDA_CPUMemory", "HALDA_CPUProcessorCapabilities"}) {
    ObjectPath path = classPath(className);
    path.keys = {Support::textKey("Other", "x")};
    for (const OperationKind kind :
         {OperationKind::EnumerateInstances, OperationKind::EnumerateInstanceNames, OperationKind::GetInstance}) {
      EXPECT_EQ(resultsOf(className, kind, path, oneTooMany), 1U);
      EXPECT_EQ(resultsOf(className, kind, path, oneTooMany - 1), 0U);
    }
  }
}

TEST_F(ResultCount, OfAssociationOperations) {
  const struct {
    const char* className;
    const char* targetClass;
  } associations[] = {{"HALDA_CPUAssociatedCacheMemory", "HALDA_CPUProcessor"},
                      {"HALDA_CPUCoreAssociatedCacheMemory", "HALDA_CPUProcessorCore"},
                      {"HALDA_CPUSystemDevice", "HALDA_CPUProcessor"},
                      {"HALDA_CPUElementCapabilities", "HALDA_CPUProcessor"},
                      {"HALDA_CPUConcreteComponent", "HALDA_CPUProcessor"}};
  for (const auto& each : associations) {
    script().targetClass = each.targetClass;
    for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                     OperationKind::References, OperationKind::ReferenceNames}) {
      EXPECT_EQ(resultsOf(each.className, kind, Support::cachePath("x"), oneTooMany), 1U)
          << each.className << ' ' << Corvcim::operationName(kind);
    }
  }
}

TEST_F(ResultCount, OfWalks) {
  for (const char* className :
       {"HALDA_CPUAssociatedCacheMemory", "HALDA_CPUCoreAssociatedCacheMemory", "HALDA_CPUSystemDevice",
        "HALDA_CPUElementCapabilities", "HALDA_CPUConcreteComponent"}) {
    // One near end, and for it one far end.
    EXPECT_EQ(resultsOf(className, OperationKind::EnumerateInstanceNames, classPath(className), oneTooMany), 1U)
        << className;
    EXPECT_EQ(resultsOf(className, OperationKind::EnumerateInstances, classPath(className), oneTooMany), 1U)
        << className;
  }
}

}  // namespace
