#include "host/cli/explain/ExplanationWriters.h"
#include "host/cli/results/JsonBuilder.h"
#include "host/cli/results/JsonWriter.h"
#include "host/cli/results/LocalPaths.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Disagreement;
using Tarn::Inventory::Tree;

void writeDisagreements(JsonBuilder& json, std::span<const Disagreement> entries) {
  json.key("disagreements");
  json.beginArray();
  for (const Disagreement& entry : entries) {
    json.beginObject();
    json.member("path", entry.path);
    json.member("property", entry.property);
    json.member("chosen", entry.chosen);
    json.member("chosenSource", entry.chosenSource);
    json.member("other", entry.other);
    json.member("otherSource", entry.otherSource);
    json.endObject();
  }
  json.endArray();
}

void writeOrigin(JsonBuilder& json, const Tarn::Inventory::Origin* origin) {
  json.key("origin");
  if (origin == nullptr) {
    json.null();
    return;
  }
  json.beginObject();
  json.member("source", origin->source);
  json.member("raw", origin->raw);
  json.member("rule", origin->rule);
  json.endObject();
}

void writeProperty(JsonBuilder& json, const ExplainedProperty& property) {
  json.beginObject();
  json.member("name", property.source->property);
  json.key("value");
  writeValue(json, property.value.value_or(Value()));
  json.key("field");
  if (property.source->field.empty()) {
    json.null();
  } else {
    json.text(property.source->field);
  }
  json.key("datum");
  writeFieldValue(json, property.datum.value);
  writeOrigin(json, property.origin);
  json.member("library", property.step);
  writeDisagreements(json, property.disagreements);
  writeUnreadMember(json, "unread", property.unread);
  json.endObject();
}

void writeInstance(JsonBuilder& json, const Tree& tree, const ExplainedInstance& instance) {
  json.beginObject();
  json.member("class", instance.className);
  json.member("part", tree.node(instance.node).path());
  json.key("path");
  if (instance.path) {
    json.text(withoutHosts(*instance.path).text());
  } else {
    json.null();
  }
  json.key("notReported");
  if (instance.notReported.empty()) {
    json.null();
  } else {
    json.text(instance.notReported);
  }
  json.key("properties");
  json.beginArray();
  for (const ExplainedProperty& property : instance.properties) {
    writeProperty(json, property);
  }
  json.endArray();
  json.endObject();
}

}  // namespace

std::string writeExplanationsAsJson(const Tree& tree, std::span<const ExplainedInstance> instances,
                                    std::string_view source) {
  JsonBuilder json;
  json.beginObject();
  json.member("inventory", source);
  json.key("instances");
  json.beginArray();
  for (const ExplainedInstance& instance : instances) {
    writeInstance(json, tree, instance);
  }
  json.endArray();
  writeDisagreements(json, tree.disagreements());
  writeUnreadMember(json, "unread", tree.unread());
  json.endObject();
  return json.take();
}

}  // namespace Corvcim
