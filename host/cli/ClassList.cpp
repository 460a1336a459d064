#include "host/cli/ClassList.h"

#include <algorithm>
#include <string_view>

#include "host/ClassTable.h"
#include "host/broker/Value.h"
#include "host/cli/Text.h"
#include "host/cli/results/JsonBuilder.h"

namespace Corvcim {
namespace {

std::string keysOf(const ClassDefinition& definition) {
  std::string keys;
  for (const PropertyDefinition& property : definition.properties) {
    if (property.key) {
      keys.append(keys.empty() ? "" : ", ").append(property.name);
    }
  }
  return keys;
}

std::string classesAsText() {
  std::size_t nameWidth = 0;
  std::size_t parentWidth = 0;
  for (const ClassDefinition& definition : classDefinitions()) {
    nameWidth = std::max(nameWidth, definition.name.size());
    parentWidth = std::max(parentWidth, definition.parent.size());
  }
  const auto row = [&](std::string_view name, std::string_view parent, std::string_view keys) {
    return padRight(std::string(name), nameWidth) + "  " + padRight(std::string(parent), parentWidth) + "  " +
           std::string(keys) + '\n';
  };
  std::string text = row("CLASS", "DERIVED FROM", "KEYS");
  for (const ClassDefinition& definition : classDefinitions()) {
    text += row(definition.name, definition.parent, keysOf(definition));
  }
  return text;
}

void writeProperty(JsonBuilder& json, const PropertyDefinition& property) {
  json.beginObject();
  json.member("name", property.name);
  json.member("type", typeName(property.type));
  json.key("key");
  json.boolean(property.key);
  if (!property.referenceClass.empty()) {
    json.member("referenceClass", property.referenceClass);
  }
  json.endObject();
}

std::string classesAsJson() {
  JsonBuilder json;
  json.beginArray();
  for (const ClassDefinition& definition : classDefinitions()) {
    json.beginObject();
    json.member("class", definition.name);
    json.member("parent", definition.parent);
    json.key("association");
    json.boolean(definition.association);
    json.key("properties");
    json.beginArray();
    for (const PropertyDefinition& property : definition.properties) {
      writeProperty(json, property);
    }
    json.endArray();
    json.endObject();
  }
  json.endArray();
  return json.take();
}

}  // namespace

std::string writeClassList(Format format) {
  return format == Format::Json ? classesAsJson() : classesAsText();
}

}  // namespace Corvcim
