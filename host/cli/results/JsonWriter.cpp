#include "host/cli/results/JsonWriter.h"

#include <algorithm>
#include <vector>

#include "host/ClassTable.h"
#include "host/broker/Names.h"
#include "host/cli/results/JsonBuilder.h"
#include "host/cli/results/LocalPaths.h"

namespace Corvcim {
namespace {

void writeInstance(JsonBuilder& json, const Instance& instance, const PropertyList& selection);

void writeValues(JsonBuilder& json, const std::vector<NamedValue>& values) {
  for (const NamedValue& each : values) {
    json.key(each.name);
    writeValue(json, each.value);
  }
}

bool isSelected(const PropertyList& selection, const PropertyDefinition& property) {
  return !selection || property.key ||
         std::ranges::any_of(*selection, [&](const std::string& name) { return sameName(name, property.name); });
}

void writeUnknownProperties(JsonBuilder& json, const Instance& instance, const PropertyList& selection) {
  const ClassDefinition* definition = findClass(instance.path.className);
  if (definition == nullptr) {
    return;
  }
  for (const PropertyDefinition& property : definition->properties) {
    if (instance.property(property.name) == nullptr && isSelected(selection, property)) {
      json.key(property.name);
      json.null();
    }
  }
}

void writeNames(JsonBuilder& json, const ObjectPath& path) {
  json.member("class", path.className);
  json.member("namespace", path.nameSpace);
  json.member("path", withoutHosts(path).text());
}

void writeInstance(JsonBuilder& json, const Instance& instance, const PropertyList& selection) {
  json.beginObject();
  writeNames(json, instance.path);
  json.key("properties");
  json.beginObject();
  writeValues(json, instance.properties);
  writeUnknownProperties(json, instance, selection);
  json.endObject();
  json.endObject();
}

}  // namespace

void writeValue(JsonBuilder& json, const Value& value) {
  if (value.isNull()) {
    json.null();
    return;
  }
  if (value.isArray()) {
    json.beginArray();
    for (const Value& element : value.elements()) {
      writeValue(json, element);
    }
    json.endArray();
    return;
  }
  switch (value.type()) {
    case CMPI_boolean:
      json.boolean(value.asBoolean());
      return;
    case CMPI_real32:
    case CMPI_real64:
      json.number(value.asReal());
      return;
    case CMPI_ref:
      json.text(withoutHosts(value.asReference()).text());
      return;
    case CMPI_instance:
      writeInstance(json, value.asInstance(), std::nullopt);
      return;
    case CMPI_string:
    case CMPI_dateTime:
      json.text(value.asString());
      return;
    case CMPI_sint8:
    case CMPI_sint16:
    case CMPI_sint32:
    case CMPI_sint64:
      json.number(value.asSigned());
      return;
    default:
      json.number(value.asUnsigned());
  }
}

std::string instancesAsJson(std::span<const Instance> instances, const PropertyList& selection) {
  JsonBuilder json;
  json.beginArray();
  for (const Instance& instance : instances) {
    writeInstance(json, instance, selection);
  }
  json.endArray();
  return json.take();
}

std::string instanceAsJson(const Instance& instance, const PropertyList& selection) {
  JsonBuilder json;
  writeInstance(json, instance, selection);
  return json.take();
}

std::string pathsAsJson(std::span<const ObjectPath> paths) {
  JsonBuilder json;
  json.beginArray();
  for (const ObjectPath& path : paths) {
    json.beginObject();
    writeNames(json, path);
    json.key("keys");
    json.beginObject();
    writeValues(json, path.keys);
    json.endObject();
    json.endObject();
  }
  json.endArray();
  return json.take();
}

}  // namespace Corvcim
