#include "host/corvcim/overview/OverviewData.h"

#include <map>
#include <optional>
#include <string_view>
#include <utility>

#include "host/corvcim/operations/Operations.h"

namespace Corvcim {
namespace {

constexpr std::string_view systemClass = "HALDA_ComputerSystem";
constexpr std::string_view processorClass = "HALDA_CPUProcessor";
constexpr std::string_view capabilitiesClass = "HALDA_CPUProcessorCapabilities";
constexpr std::string_view capabilitiesAssociation = "HALDA_CPUElementCapabilities";
constexpr std::string_view cacheClass = "HALDA_CPUMemory";
constexpr std::string_view cacheAssociation = "HALDA_CPUAssociatedCacheMemory";

class Gathering {
 public:
  Gathering(Dispatcher& dispatcher, const std::string& nameSpace) : dispatcher_(dispatcher), nameSpace_(nameSpace) {}

  /// Nothing where the class could not be asked; then there is a failure that says so.
  std::optional<std::vector<Instance>> ask(std::string_view className) {
    Answer answer = dispatcher_.enumerateInstances({{}, nameSpace_, std::string(className), {}});
    if (!answer.response.ok()) {
      failures_.push_back(std::string(className) + ": " + describeStatus(answer.response.rc, answer.response.message));
      return std::nullopt;
    }
    return std::move(answer.response.instances);
  }

  std::vector<Instance> instancesOf(std::string_view className) {
    return ask(className).value_or(std::vector<Instance>());
  }

  std::vector<std::string> takeFailures() { return std::move(failures_); }

 private:
  Dispatcher& dispatcher_;
  const std::string& nameSpace_;
  std::vector<std::string> failures_;
};

bool refersTo(const Instance& association, std::string_view role, const Instance& instance) {
  const Value* reference = association.property(role);
  return reference != nullptr && !reference->isNull() && reference->type() == CMPI_ref &&
         namesSameInstance(reference->asReference(), instance.path);
}

/// Instances by one of their keys.
class Index {
 public:
  Index(const std::vector<Instance>& instances, std::string_view key) : key_(key) {
    for (const Instance& instance : instances) {
      const std::string* text = keyText(instance.path);
      if (text != nullptr) {
        byKey_.emplace(*text, &instance);
      }
    }
  }

  /// What the association refers to in that role; nullptr where it is not among the instances.
  const Instance* farEnd(const Instance& association, std::string_view role) const {
    const Value* reference = association.property(role);
    if (reference == nullptr || reference->isNull() || reference->type() != CMPI_ref) {
      return nullptr;
    }
    const std::string* text = keyText(reference->asReference());
    const auto found = text == nullptr ? byKey_.end() : byKey_.find(*text);
    return found == byKey_.end() ? nullptr : found->second;
  }

 private:
  const std::string* keyText(const ObjectPath& path) const {
    const Value* value = path.key(key_);
    return value == nullptr || value->isNull() || value->type() != CMPI_string ? nullptr : &value->asString();
  }

  std::string_view key_;
  std::map<std::string_view, const Instance*> byKey_;
};

void addCapabilities(OverviewProcessor& processor, const std::vector<Instance>& associations, const Index& index) {
  for (const Instance& association : associations) {
    if (!refersTo(association, "ManagedElement", processor.processor)) {
      continue;
    }
    if (const Instance* capabilities = index.farEnd(association, "Capabilities")) {
      processor.capabilities = *capabilities;
      return;
    }
  }
}

void addCaches(OverviewProcessor& processor, const std::vector<Instance>& associations, const Index& index) {
  for (const Instance& association : associations) {
    if (!refersTo(association, "Dependent", processor.processor)) {
      continue;
    }
    if (const Instance* cache = index.farEnd(association, "Antecedent")) {
      processor.caches.push_back({*cache, association});
    }
  }
}

}  // namespace

OverviewData gatherOverview(Dispatcher& dispatcher, const std::string& nameSpace) {
  Gathering gathering(dispatcher, nameSpace);
  OverviewData data;
  std::vector<Instance> systems = gathering.instancesOf(systemClass);
  if (!systems.empty()) {
    data.system = std::move(systems.front());
  }
  const std::optional<std::vector<Instance>> processors = gathering.ask(processorClass);
  data.processorsAreKnown = processors.has_value();
  if (processors && !processors->empty()) {
    const std::vector<Instance> capabilityLinks = gathering.instancesOf(capabilitiesAssociation);
    const std::vector<Instance> capabilities = gathering.instancesOf(capabilitiesClass);
    const Index capabilityIndex(capabilities, "InstanceID");
    const std::vector<Instance> cacheLinks = gathering.instancesOf(cacheAssociation);
    const std::vector<Instance> caches = gathering.instancesOf(cacheClass);
    const Index cacheIndex(caches, "DeviceID");
    for (const Instance& instance : *processors) {
      OverviewProcessor processor;
      processor.processor = instance;
      addCapabilities(processor, capabilityLinks, capabilityIndex);
      addCaches(processor, cacheLinks, cacheIndex);
      data.processors.push_back(std::move(processor));
    }
  }
  data.failures = gathering.takeFailures();
  return data;
}

}  // namespace Corvcim
