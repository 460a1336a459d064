#ifndef TESTS_PROVIDERS_ASSOCIATIONROWS_H
#define TESTS_PROVIDERS_ASSOCIATIONROWS_H

#include <gtest/gtest.h>

#include <span>
#include <string>
#include <utility>
#include <vector>

#include "tests/support/ProviderTest.h"

/// How the five association providers differ, and the machine that they are asked about. The tests
/// walk this table for each behaviour.
namespace Associations {

// The classes that several tests name.
inline const std::string processorCaches = "HALDA_CPUAssociatedCacheMemory";
inline const std::string coreCaches = "HALDA_CPUCoreAssociatedCacheMemory";
inline const std::string systemDevice = "HALDA_CPUSystemDevice";
inline const std::string systemClass = "HALDA_ComputerSystem";

using Corvcim::ObjectPath;
using Paths = std::vector<ObjectPath>;
using Pair = std::pair<ObjectPath, ObjectPath>;

/// A source, and the elements associated with it in the order of answers.
struct FarEnds {
  ObjectPath source;
  Paths elements;
};

/// What an operation does when source and association class lead nowhere.
enum class AbsentTarget {
  Fails,     ///< logs its text and fails with it
  LogsOnly,  ///< logs its text
  Succeeds   ///< marks its exit
};

struct Row {
  const char* className;
  const char* firstEnd;
  const char* secondEnd;
  const char* builder;     ///< the function that makes all instances
  const char* filterKeys;  ///< that property lists are filtered with, in an enumeration

  // References of one source.
  bool referencesAreFiltered;
  bool referencesDescribeTheCache;

  bool enumerationsDescribeTheCache;
  bool exitBeforeDone;   ///< known where the order of the exit mark and CMReturnDone is
  bool comparesWithLog;  ///< which comparison function GetInstance calls
  bool tracesRefClasses;
  bool tracesTargetClass;

  AbsentTarget absentAssociators;
  AbsentTarget absentReferences;
  const char* absentAssociatorsText;

  std::vector<Pair> (*pairs)();       ///< all, in the order of enumerations
  std::vector<FarEnds> (*farEnds)();  ///< of one source of each class
};

std::span<const Row> rows();

/// Two processors; the first in the inventory is the last by name, and likewise their parts:
/// cpu1 with core2 and cache2, cpu0 with core1, core0, cache1 and cache0.
void scriptMachine();

/// Of the caches of that machine: level, write policy, read policy, type and associativity.
std::vector<Corvcim::NamedValue> cacheProperties(const ObjectPath& cache);

class Association : public Support::ProviderTest, public ::testing::WithParamInterface<Row> {
 protected:
  /// Scripts the machine and two computer systems, sysB and sysA.
  Association();

  const Row& row() const { return GetParam(); }
  const Support::ProviderFunctions& provider() const { return Support::providerOf(row().className); }
  CMPIInstanceMI* mi() { return instanceMI(row().className); }

  Corvcim::Response ask(Corvcim::OperationKind kind, const ObjectPath& source,
                        const Corvcim::AssociationFilter& filter = {}, const Corvcim::PropertyList& properties = {});
  /// The same with this row's association class, which only associators look at.
  Corvcim::Response askOwn(Corvcim::OperationKind kind, const ObjectPath& source,
                           const Corvcim::PropertyList& properties = {});

  /// The association of two elements as the library names it.
  ObjectPath pathOf(const Pair& pair) const;
  Paths allPaths() const;
  /// The instance of an association: its ends, and what it says of its cache if it does.
  Corvcim::Instance instanceOf(const Pair& pair, bool describesTheCache) const;
  /// The ends in order, whichever of them the source is.
  Pair pairOf(const ObjectPath& source, const ObjectPath& element) const;

  Support::EventList events(const std::string& operation) const { return {provider(), operation}; }
  /// EnumInstances or GetInstance up to its builder's entry, and from its builder's end.
  Support::EventList enteringBuilder(const std::string& operation) const;
  Support::EventList leavingBuilder(Support::EventList list, const std::string& operation) const;
  /// An association operation up to where it looks for its far ends.
  Support::EventList enteringAssociation(Corvcim::OperationKind kind, const Corvcim::AssociationFilter& filter) const;
  void expectEvents(const Support::EventList& expected) const { Support::expectEvents(provider(), expected); }

  /// Runs `request` once and tells which call of the service, counted from 1, was the n-th whose
  /// detail is this one.
  template <class Request>
  unsigned int ordinalOf(const std::string& service, const std::string& detail, unsigned int n, Request request) {
    broker.services().record(true);
    afterwardsTaking(request);
    return ordinalOf(service, detail, n);
  }

 private:
  template <class Request>
  void afterwardsTaking(Request request) {
    forgetTraces();
    request();
    record_ = broker.services().takeRecord();
    broker.services().record(false);
    forgetTraces();
  }
  unsigned int ordinalOf(const std::string& service, const std::string& detail, unsigned int n) const;

  std::vector<Corvcim::ServiceCall> record_;
};

std::string className(const ::testing::TestParamInfo<Row>& tested);

inline constexpr Corvcim::OperationKind associationOperations[] = {
    Corvcim::OperationKind::Associators, Corvcim::OperationKind::AssociatorNames, Corvcim::OperationKind::References,
    Corvcim::OperationKind::ReferenceNames};

/// Associators and AssociatorNames, which look at the association class of the request.
bool isAssociators(Corvcim::OperationKind kind);

}  // namespace Associations

#endif
