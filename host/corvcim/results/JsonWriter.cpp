#include "host/corvcim/results/JsonWriter.h"

#include <algorithm>
#include <vector>

#include "host/corvcim/results/LocalPaths.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

OrderedJson valuesAsJson(const std::vector<NamedValue>& values) {
  OrderedJson json = OrderedJson::object();
  for (const NamedValue& each : values) {
    json[each.name] = valueAsJson(each.value);
  }
  return json;
}

bool isSelected(const PropertyList& selection, const PropertyDefinition& property) {
  return !selection || property.key ||
         std::ranges::any_of(*selection, [&](const std::string& name) { return sameName(name, property.name); });
}

void addUnknownProperties(OrderedJson& json, const Instance& instance, const PropertyList& selection) {
  const ClassDefinition* definition = findClass(instance.path.className);
  if (definition == nullptr) {
    return;
  }
  for (const PropertyDefinition& property : definition->properties) {
    if (instance.property(property.name) == nullptr && isSelected(selection, property)) {
      json[std::string(property.name)] = nullptr;
    }
  }
}

OrderedJson namesOf(const ObjectPath& path) {
  return {{"class", path.className}, {"namespace", path.nameSpace}, {"path", withoutHosts(path).text()}};
}

OrderedJson jsonOf(const Instance& instance, const PropertyList& selection) {
  OrderedJson json = namesOf(instance.path);
  json["properties"] = valuesAsJson(instance.properties);
  addUnknownProperties(json["properties"], instance, selection);
  return json;
}

OrderedJson listAsJson(const std::vector<Value>& elements) {
  OrderedJson json = OrderedJson::array();
  for (const Value& element : elements) {
    json.push_back(valueAsJson(element));
  }
  return json;
}

}  // namespace

OrderedJson valueAsJson(const Value& value) {
  if (value.isNull()) {
    return nullptr;
  }
  if (value.isArray()) {
    return listAsJson(value.elements());
  }
  switch (value.type()) {
    case CMPI_boolean:
      return value.asBoolean();
    case CMPI_real32:
    case CMPI_real64:
      return value.asReal();
    case CMPI_ref:
      return withoutHosts(value.asReference()).text();
    case CMPI_instance:
      return jsonOf(value.asInstance(), std::nullopt);
    case CMPI_string:
    case CMPI_dateTime:
      return value.asString();
    case CMPI_sint8:
    case CMPI_sint16:
    case CMPI_sint32:
    case CMPI_sint64:
      return value.asSigned();
    default:
      return value.asUnsigned();
  }
}

std::string instancesAsJson(std::span<const Instance> instances, const PropertyList& selection) {
  return jsonListDocument(instances, [&](const Instance& instance) { return jsonOf(instance, selection); });
}

std::string instanceAsJson(const Instance& instance, const PropertyList& selection) {
  return jsonDocument(jsonOf(instance, selection));
}

std::string pathsAsJson(std::span<const ObjectPath> paths) {
  return jsonListDocument(paths, [](const ObjectPath& path) {
    OrderedJson json = namesOf(path);
    json["keys"] = valuesAsJson(path.keys);
    return json;
  });
}

}  // namespace Corvcim
