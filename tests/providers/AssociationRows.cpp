#include "tests/providers/AssociationRows.h"

#include <stdexcept>

namespace Associations {

using Corvcim::AssociationFilter;
using Corvcim::Instance;
using Corvcim::NamedValue;
using Corvcim::OperationKind;
using Corvcim::Response;
using Corvcim::Value;
using Scripted::inventory;
using Support::cachePath;
using Support::capabilitiesPath;
using Support::corePath;
using Support::EventList;
using Support::processorPath;
using Support::systemPath;

namespace {

std::vector<Pair> processorCachePairs() {
  return {{cachePath("cache0"), processorPath("cpu0")},
          {cachePath("cache1"), processorPath("cpu0")},
          {cachePath("cache2"), processorPath("cpu1")}};
}
std::vector<FarEnds> processorCacheEnds() {
  return {{cachePath("cache1"), {processorPath("cpu0")}},
          {processorPath("cpu0"), {cachePath("cache1"), cachePath("cache0")}}};
}

std::vector<Pair> coreCachePairs() {
  return {{cachePath("cache1"), corePath("core0")},
          {cachePath("cache0"), corePath("core0")},
          {cachePath("cache1"), corePath("core1")},
          {cachePath("cache0"), corePath("core1")},
          {cachePath("cache2"), corePath("core2")}};
}
std::vector<FarEnds> coreCacheEnds() {
  return {{cachePath("cache0"), {corePath("core1"), corePath("core0")}},
          {corePath("core0"), {cachePath("cache1"), cachePath("cache0")}}};
}

std::vector<Pair> systemDevicePairs() {
  return {{systemPath("sysB"), processorPath("cpu0")},
          {systemPath("sysB"), processorPath("cpu1")},
          {systemPath("sysA"), processorPath("cpu0")},
          {systemPath("sysA"), processorPath("cpu1")}};
}
std::vector<FarEnds> systemDeviceEnds() {
  return {{systemPath("sysA"), {processorPath("cpu0"), processorPath("cpu1")}},
          {processorPath("cpu1"), {systemPath("sysB"), systemPath("sysA")}}};
}

std::vector<Pair> capabilitiesPairs() {
  return {{processorPath("cpu0"), capabilitiesPath("cpu0")}, {processorPath("cpu1"), capabilitiesPath("cpu1")}};
}
std::vector<FarEnds> capabilitiesEnds() {
  return {{processorPath("cpu1"), {capabilitiesPath("cpu1")}}, {capabilitiesPath("cpu0"), {processorPath("cpu0")}}};
}

std::vector<Pair> componentPairs() {
  return {{processorPath("cpu0"), corePath("core1")},
          {processorPath("cpu0"), corePath("core0")},
          {processorPath("cpu1"), corePath("core2")}};
}
std::vector<FarEnds> componentEnds() {
  return {{processorPath("cpu0"), {corePath("core1"), corePath("core0")}},
          {corePath("core2"), {processorPath("cpu1")}}};
}

constexpr Row table[] = {
    {.className = "HALDA_CPUAssociatedCacheMemory",
     .firstEnd = "Antecedent",
     .secondEnd = "Dependent",
     .builder = "CPUAssociatedCacheMemoryCMPIInstances",
     .filterKeys = "{Antecedent,Dependent}",
     .referencesAreFiltered = true,
     .referencesDescribeTheCache = false,
     .enumerationsDescribeTheCache = true,
     .exitBeforeDone = false,
     .comparesWithLog = true,
     .tracesRefClasses = false,
     .tracesTargetClass = false,
     .absentAssociators = AbsentTarget::Fails,
     .absentReferences = AbsentTarget::Fails,
     .absentAssociatorsText = "Object Path is NULL in Associators.",
     .pairs = processorCachePairs,
     .farEnds = processorCacheEnds},
    {.className = "HALDA_CPUCoreAssociatedCacheMemory",
     .firstEnd = "Antecedent",
     .secondEnd = "Dependent",
     .builder = "CPUCoreAssociatedCacheMemoryCMPIInstances",
     .filterKeys = "{Antecedent,Dependent}",
     .referencesAreFiltered = true,
     .referencesDescribeTheCache = true,
     .enumerationsDescribeTheCache = true,
     .exitBeforeDone = false,
     .comparesWithLog = true,
     .tracesRefClasses = true,
     .tracesTargetClass = false,
     .absentAssociators = AbsentTarget::Fails,
     .absentReferences = AbsentTarget::Fails,
     .absentAssociatorsText = "Object Path is NULL in Associators.",
     .pairs = coreCachePairs,
     .farEnds = coreCacheEnds},
    {.className = "HALDA_CPUSystemDevice",
     .firstEnd = "GroupComponent",
     .secondEnd = "PartComponent",
     .builder = "CPUSystemDeviceCMPIInstances",
     .filterKeys = "{GroupComponent,PartComponent}",
     .referencesAreFiltered = false,
     .referencesDescribeTheCache = false,
     .enumerationsDescribeTheCache = false,
     .exitBeforeDone = false,
     .comparesWithLog = false,
     .tracesRefClasses = false,
     .tracesTargetClass = true,
     .absentAssociators = AbsentTarget::Succeeds,
     .absentReferences = AbsentTarget::Fails,
     .absentAssociatorsText = nullptr,
     .pairs = systemDevicePairs,
     .farEnds = systemDeviceEnds},
    {.className = "HALDA_CPUElementCapabilities",
     .firstEnd = "ManagedElement",
     .secondEnd = "Capabilities",
     .builder = "ElementCapabilitiesCMPIInstances",
     .filterKeys = "{Antecedent,Dependent}",
     .referencesAreFiltered = false,
     .referencesDescribeTheCache = false,
     .enumerationsDescribeTheCache = false,
     .exitBeforeDone = true,
     .comparesWithLog = false,
     .tracesRefClasses = false,
     .tracesTargetClass = false,
     .absentAssociators = AbsentTarget::LogsOnly,
     .absentReferences = AbsentTarget::LogsOnly,
     .absentAssociatorsText = "Object Path is NULL in Associations.",
     .pairs = capabilitiesPairs,
     .farEnds = capabilitiesEnds},
    {.className = "HALDA_CPUConcreteComponent",
     .firstEnd = "GroupComponent",
     .secondEnd = "PartComponent",
     .builder = "ConcreteComponentCMPIInstances",
     .filterKeys = "{GroupComponent,PartComponent}",
     .referencesAreFiltered = true,
     .referencesDescribeTheCache = false,
     .enumerationsDescribeTheCache = false,
     .exitBeforeDone = true,
     .comparesWithLog = false,
     .tracesRefClasses = false,
     .tracesTargetClass = false,
     .absentAssociators = AbsentTarget::LogsOnly,
     .absentReferences = AbsentTarget::LogsOnly,
     .absentAssociatorsText = "Object Path is NULL in Associations.",
     .pairs = componentPairs,
     .farEnds = componentEnds},
};

std::string shown(const std::optional<std::string>& text) {
  return text.value_or("(null)");
}

}  // namespace

std::span<const Row> rows() {
  return table;
}

void scriptMachine() {
  using namespace Tarn::NodeLexicon;
  inventory().processor("cpu1").core("core2").cache("cache2");
  inventory()
      .has(PropCacheLevel, 5U)
      .has(PropCacheWritePolicy, 2U)
      .has(PropCacheType, 3U)
      .has(PropCacheAssociativity, 6U);
  inventory().processor("cpu0").core("core1").core("core0").fullCache("cache1").fullCache("cache0");
}

std::vector<NamedValue> cacheProperties(const ObjectPath& cache) {
  const bool last = cache.key("DeviceID")->asString() == "cache2";
  const auto property = [](const std::string& name, std::uint16_t value) {
    return NamedValue{name, Value::uint16(value)};
  };
  return {property("Level", last ? 5 : 3), property("WritePolicy", last ? 3 : 2), property("ReadPolicy", 0),
          property("CacheType", last ? 4 : 3), property("Associativity", last ? 7 : 6)};
}

Association::Association() {
  scriptMachine();
  broker.serveInstances("HALDA_ComputerSystem", {Support::systemInstance("sysB"), Support::systemInstance("sysA")});
}

Response Association::ask(OperationKind kind, const ObjectPath& source, const AssociationFilter& filter,
                          const Corvcim::PropertyList& properties) {
  return associate(row().className, kind, source, filter, properties);
}

Response Association::askOwn(OperationKind kind, const ObjectPath& source, const Corvcim::PropertyList& properties) {
  AssociationFilter filter;
  if (isAssociators(kind)) {
    filter.assocClass = row().className;
  }
  return ask(kind, source, filter, properties);
}

ObjectPath Association::pathOf(const Pair& pair) const {
  return Support::associationPath(row().className, row().firstEnd, pair.first, row().secondEnd, pair.second);
}

Paths Association::allPaths() const {
  Paths paths;
  for (const Pair& pair : row().pairs()) {
    paths.push_back(pathOf(pair));
  }
  return paths;
}

Instance Association::instanceOf(const Pair& pair, bool describesTheCache) const {
  Instance instance{pathOf(pair), pathOf(pair).keys};
  if (describesTheCache) {
    for (NamedValue& property : cacheProperties(pair.first)) {
      instance.properties.push_back(std::move(property));
    }
  }
  return instance;
}

Pair Association::pairOf(const ObjectPath& source, const ObjectPath& element) const {
  const bool sourceIsFirst = source.className == row().pairs().front().first.className;
  return sourceIsFirst ? Pair{source, element} : Pair{element, source};
}

EventList Association::enteringBuilder(const std::string& operation) const {
  return events(operation).entering().in(row().builder).entering();
}

EventList Association::leavingBuilder(EventList list, const std::string& operation) const {
  return list.in(row().builder).exiting().in(provider().prefix + "_" + operation).exiting();
}

EventList Association::enteringAssociation(OperationKind kind, const AssociationFilter& filter) const {
  EventList list = events(std::string(Corvcim::operationName(kind))).entering();
  if (row().tracesRefClasses && isAssociators(kind)) {
    list.variable("_RefLeftClass = ", shown(filter.assocClass))
        .variable("_RefRightClass = ", shown(filter.resultClass));
  }
  if (row().tracesRefClasses && kind == OperationKind::References) {
    list.variable("resultClass = ", shown(filter.resultClass));
  }
  return list;
}

unsigned int Association::ordinalOf(const std::string& service, const std::string& detail, unsigned int n) const {
  const std::vector<std::string> details = Support::detailsOf(record_, service);
  for (std::size_t i = 0; i < details.size(); ++i) {
    if (details[i] == detail && --n == 0) {
      return static_cast<unsigned int>(i) + 1;
    }
  }
  throw std::logic_error("the request makes no such call: " + service + " of " + detail);
}

std::string className(const ::testing::TestParamInfo<Row>& tested) {
  return tested.param.className;
}

bool isAssociators(OperationKind kind) {
  return kind == OperationKind::Associators || kind == OperationKind::AssociatorNames;
}

}  // namespace Associations
