#include "host/corvcim/explain/ExplanationWriters.h"
#include "host/corvcim/results/JsonWriter.h"
#include "host/corvcim/results/LocalPaths.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Disagreement;
using Tarn::Inventory::Tree;

OrderedJson disagreementsAsJson(std::span<const Disagreement> entries) {
  OrderedJson list = OrderedJson::array();
  for (const Disagreement& entry : entries) {
    list.push_back({{"path", entry.path},
                    {"property", entry.property},
                    {"chosen", entry.chosen},
                    {"chosenSource", entry.chosenSource},
                    {"other", entry.other},
                    {"otherSource", entry.otherSource}});
  }
  return list;
}

OrderedJson originAsJson(const Tarn::Inventory::Origin* origin) {
  return origin == nullptr ? OrderedJson()
                           : OrderedJson({{"source", origin->source}, {"raw", origin->raw}, {"rule", origin->rule}});
}

OrderedJson propertyAsJson(const ExplainedProperty& property) {
  return {{"name", property.source->property},
          {"value", valueAsJson(property.value.value_or(Value()))},
          {"field", textOrNull(property.source->field)},
          {"datum", fieldAsJson(property.datum.value)},
          {"origin", originAsJson(property.origin)},
          {"library", property.step},
          {"disagreements", disagreementsAsJson(property.disagreements)},
          {"unread", unreadAsJson(property.unread)}};
}

OrderedJson instanceAsJson(const Tree& tree, const ExplainedInstance& instance) {
  OrderedJson properties = OrderedJson::array();
  for (const ExplainedProperty& property : instance.properties) {
    properties.push_back(propertyAsJson(property));
  }
  return {{"class", instance.className},
          {"part", tree.node(instance.node).path()},
          {"path", instance.path ? OrderedJson(withoutHosts(*instance.path).text()) : OrderedJson()},
          {"notReported", textOrNull(instance.notReported)},
          {"properties", std::move(properties)}};
}

}  // namespace

std::string writeExplanationsAsJson(const Tree& tree, std::span<const ExplainedInstance> instances,
                                    std::string_view source) {
  OrderedJson list = OrderedJson::array();
  for (const ExplainedInstance& instance : instances) {
    list.push_back(instanceAsJson(tree, instance));
  }
  return jsonDocument({{"inventory", source},
                       {"instances", std::move(list)},
                       {"disagreements", disagreementsAsJson(tree.disagreements())},
                       {"unread", unreadAsJson(tree.unread())}});
}

}  // namespace Corvcim
