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

std::string declarationOf(const PropertyDefinition& property) {
  std::string type = property.referenceClass.empty() ? typeName(property.type) : std::string(property.referenceClass);
  std::string name(property.name);
  if (!property.referenceClass.empty()) {
    type += " REF";
  } else if (type.ends_with("[]")) {
    type.resize(type.size() - 2);  // MOF has them after the name
    name += "[]";
  }
  return "  " + std::string(property.key ? "[Key] " : "") + type + ' ' + name + ";\n";
}

std::string classesAsMof() {
  std::string mof;
  for (const ClassDefinition& definition : classDefinitions()) {
    mof.append(mof.empty() ? "" : "\n").append(definition.association ? "[Association]\n" : "");
    mof.append("class ").append(definition.name).append(" : ").append(definition.parent).append(" {\n");
    for (const PropertyDefinition& property : definition.properties) {
      mof += declarationOf(property);
    }
    mof += "};\n";
  }
  return mof;
}

}  // namespace

std::string writeClassList(Format format) {
  switch (format) {
    case Format::Mof:
      return classesAsMof();
    case Format::Json:
      return classesAsJson();
    default:
      return classesAsText();
  }
}

}  // namespace Corvcim
