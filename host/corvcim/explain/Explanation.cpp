#include "host/corvcim/explain/Explanation.h"

#include <algorithm>
#include <array>
#include <utility>

#include "host/corvcim/operations/Operations.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Disagreement;
using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::Origin;
using Tarn::Inventory::Tree;
using Tarn::Inventory::Unread;
namespace Status = Tarn::Inventory::Status;
using namespace Tarn::NodeLexicon;

constexpr std::string_view capabilitiesClass = "HALDA_CPUProcessorCapabilities";
constexpr std::string_view cacheLinkClass = "HALDA_CPUAssociatedCacheMemory";

/// Which files tell a field: a part of their names, as the account of what could not be read has them.
struct FieldFile {
  std::string_view field;
  std::string_view file;
};
constexpr std::array fieldFiles = {
    FieldFile{"AddressWidth", "/proc/cpuinfo"},      FieldFile{"CacheAssociativity", "/cache"},
    FieldFile{"CacheBlockSize", "/cache"},           FieldFile{"CacheConsumableBlocks", "/cache"},
    FieldFile{"CacheNumberOfBlocks", "/cache"},      FieldFile{"CacheType", "/cache"},
    FieldFile{"CacheWritePolicy", "/cache"},         FieldFile{"CurrentClockSpeed", "/cpufreq"},
    FieldFile{"CurrentClockSpeed", "/proc/cpuinfo"}, FieldFile{"DataWidth", "/proc/cpuinfo"},
    FieldFile{"EnabledCores", "/topology"},          FieldFile{"ExternalClockSpeed", "/firmware/dmi"},
    FieldFile{"MaxClockSpeed", "/cpufreq"},          FieldFile{"MaxClockSpeed", "/firmware/dmi"},
    FieldFile{"ProcessorCores", "/topology"},        FieldFile{"ProcessorId", "/proc/cpuinfo"},
    FieldFile{"ProcessorName", "/proc/cpuinfo"},     FieldFile{"Stepping", "/proc/cpuinfo"},
    FieldFile{"SystemManufacturer", "/class/dmi"},   FieldFile{"SystemModel", "/class/dmi"},
    FieldFile{"SystemModel", "/device-tree"},        FieldFile{"UpgradeMethod", "/firmware/dmi"},
};

std::vector<Unread> unreadOf(const Tree& tree, std::string_view field) {
  std::vector<Unread> entries;
  for (const Unread& entry : tree.unread()) {
    const bool tells = std::ranges::any_of(fieldFiles, [&](const FieldFile& each) {
      return each.field == field && entry.file.find(each.file) != std::string::npos;
    });
    if (tells) {
      entries.push_back(entry);
    }
  }
  return entries;
}

const Origin* originOf(const Tree& tree, NodeIndex node, std::string_view field) {
  if (field == "status") {
    return tree.statusOrigin(node);
  }
  if (field == "description") {
    return tree.descriptionOrigin(node);
  }
  const Tarn::Inventory::PropertyEntry* entry = Tarn::Inventory::findProperty(field);
  return entry == nullptr ? nullptr : tree.origin(node, entry->id);
}

bool isVirtual(const Tree& tree) {
  const auto systems = tree.ofType(NodeSystem);
  const std::string* model = systems.empty() ? nullptr : tree.text(tree.node(systems.front()), PropSystemModel);
  return model != nullptr && model->find("Virtual") != std::string::npos;
}

bool isProperty(std::string_view className, std::string_view name) {
  return std::ranges::any_of(propertySources(), [&](const PropertySource& source) {
    return source.className == className && sameName(source.property, name);
  });
}

/// "Status" is a property before it is a field.
bool isSelected(const PropertySource& source, const std::vector<std::string>& selection) {
  return selection.empty() || std::ranges::any_of(selection, [&](const std::string& name) {
           return isProperty(source.className, name) ? sameName(name, source.property)
                                                     : !source.field.empty() && sameName(name, source.field);
         });
}

/// The text of a value that a copy or a code can be compared with; an array's single element.
std::string plainText(const Value& value) {
  if (value.isNull()) {
    return "";
  }
  if (value.isArray()) {
    return value.elements().size() == 1 ? plainText(value.elements().front()) : value.text();
  }
  return value.type() == CMPI_string ? value.asString() : value.text();
}

const std::string* textKey(const ObjectPath& path, std::string_view name) {
  const Value* key = path.key(name);
  return key == nullptr || key->isNull() || key->type() != CMPI_string ? nullptr : &key->asString();
}

bool isAbout(const Instance& instance, std::string_view className, std::string_view path) {
  if (className == cacheLinkClass) {
    const Value* cache = instance.path.key("Antecedent");
    const std::string* key = cache == nullptr || cache->isNull() || cache->type() != CMPI_ref
                                 ? nullptr
                                 : textKey(cache->asReference(), "DeviceID");
    return key != nullptr && *key == path;
  }
  if (className == capabilitiesClass) {
    const std::string* key = textKey(instance.path, "InstanceID");
    return key != nullptr && *key == "NERITH:" + std::string(path);
  }
  const std::string* key = textKey(instance.path, "DeviceID");
  key = key == nullptr ? textKey(instance.path, "InstanceID") : key;
  return key == nullptr || *key == path;
}

std::string whyLeftOut(const Node& node) {
  if (node.status == Status::emptySocket) {
    return "the library leaves out empty sockets";
  }
  if (node.status == 0) {
    return "the library leaves out parts without a status";
  }
  return "the library does not report it";
}

}  // namespace

Explainer::Explainer(const Tree& tree, Dispatcher& dispatcher, std::string nameSpace)
    : tree_(tree), dispatcher_(dispatcher), nameSpace_(std::move(nameSpace)), isVirtual_(isVirtual(tree)) {}

ExplainedInstance Explainer::explain(const ExplanationTarget& target, const std::vector<std::string>& selection) {
  ExplainedInstance explained{target.className, target.node, {}, {}, {}};
  const Instance* instance = instanceOf(target, explained.notReported);
  if (instance != nullptr) {
    explained.path = instance->path;
  }
  for (const PropertySource& source : propertySources()) {
    if (source.className == target.className && isSelected(source, selection)) {
      explained.properties.push_back(explainProperty(target, source, instance));
    }
  }
  return explained;
}

std::vector<std::string> Explainer::failures() const {
  std::vector<std::string> lines;
  for (const auto& [className, failure] : failures_) {
    if (!failure.empty()) {
      lines.push_back("explain: " + std::string(className) + ": " + failure);
    }
  }
  return lines;
}

const Instance* Explainer::instanceOf(const ExplanationTarget& target, std::string& failure) {
  const Node& node = tree_.node(target.node);
  const std::vector<Instance>& all = instancesOf(target.className, failure);
  const auto found =
      std::ranges::find_if(all, [&](const Instance& each) { return isAbout(each, target.className, node.path()); });
  if (found != all.end()) {
    return &*found;
  }
  if (failure.empty()) {
    failure = whyLeftOut(node);
  }
  return nullptr;
}

const std::vector<Instance>& Explainer::instancesOf(std::string_view className, std::string& failure) {
  const auto [entry, isNew] = instances_.try_emplace(className);
  if (isNew) {
    Answer answer = dispatcher_.enumerateInstances({"", nameSpace_, std::string(className), {}});
    if (answer.response.ok()) {
      entry->second = std::move(answer.response.instances);
    } else {
      failures_[className] = describeStatus(answer.response.rc, answer.response.message);
    }
  }
  failure = failures_[className];
  return entry->second;
}

ExplainedProperty Explainer::explainProperty(const ExplanationTarget& target, const PropertySource& source,
                                             const Instance* instance) const {
  const Node& node = tree_.node(target.node);
  ExplainedProperty explained;
  explained.source = &source;
  if (const Value* value = instance == nullptr ? nullptr : instance->property(source.property)) {
    explained.value = *value;
  }
  explained.datum.isVirtual = isVirtual_;
  if (source.field == "path") {
    explained.datum.value = std::string(node.path());
  } else if (!source.field.empty()) {
    explained.datum.value = readField(tree_, node, source.field);
    explained.origin = originOf(tree_, target.node, source.field);
  }
  if (!source.field.empty() && !explained.datum.value) {
    explained.unread = unreadOf(tree_, source.field);
  }
  std::ranges::copy_if(tree_.disagreements(), std::back_inserter(explained.disagreements),
                       [&](const Disagreement& entry) {
                         return entry.path == node.path() && entry.property == source.field && !source.field.empty();
                       });
  if (instance == nullptr) {
    return explained;
  }
  explained.step = describeStep(source, explained.datum);
  const std::optional<std::string> expected = expectedValue(source, explained.datum);
  if (explained.value && expected && plainText(*explained.value) != *expected) {
    explained.step += "; the library has read another value, at its own moment";
  }
  return explained;
}

}  // namespace Corvcim
