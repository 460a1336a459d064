#include "host/corvcim/ClassList.h"

#include <algorithm>
#include <array>
#include <stdexcept>
#include <vector>

#include "host/broker/Dispatcher.h"
#include "host/broker/Value.h"
#include "host/corvcim/results/ValueNames.h"
#include "host/corvcim/text/Json.h"
#include "host/corvcim/text/Text.h"
#include "schema/ClassTable.h"

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

OrderedJson propertyAsJson(const PropertyDefinition& property) {
  OrderedJson json = {{"name", property.name}, {"type", typeName(property.type)}, {"key", property.key}};
  if (!property.referenceClass.empty()) {
    json["referenceClass"] = property.referenceClass;
  }
  if (const std::string_view unit = unitName(property.name); !unit.empty()) {
    json["unit"] = unit;
  }
  for (const CodeName& value : codesOf(property.name)) {
    json["values"][std::to_string(value.code)] = value.name;
  }
  return json;
}

OrderedJson classAsJson(const ClassDefinition& definition) {
  OrderedJson properties = OrderedJson::array();
  for (const PropertyDefinition& property : definition.properties) {
    properties.push_back(propertyAsJson(property));
  }
  return {{"class", definition.name},
          {"parent", definition.parent},
          {"association", definition.association},
          {"properties", std::move(properties)}};
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

std::string classAsMof(const ClassDefinition& definition) {
  std::string mof(definition.association ? "[Association]\n" : "");
  mof.append("class ").append(definition.name).append(" : ").append(definition.parent).append(" {\n");
  for (const PropertyDefinition& property : definition.properties) {
    mof += declarationOf(property);
  }
  return mof + "};\n";
}

/// "2 Enabled, 3 Disabled" on lines of at most 80 columns.
std::string codeLines(std::span<const CodeName> codes) {
  constexpr std::size_t longestLine = 80;
  std::string text;
  std::string line;
  for (const CodeName& code : codes) {
    std::string entry = std::to_string(code.code).append(" ").append(code.name);
    entry += &code == &codes.back() ? "" : ",";
    if (!line.empty() && line.size() + 1 + entry.size() > longestLine) {
      text += line + '\n';
      line.clear();
    }
    line += (line.empty() ? "      " : " ") + entry;
  }
  return line.empty() ? text : text + line + '\n';
}

std::string classAsText(const ClassDefinition& definition) {
  using Row = std::array<std::string, 3>;
  std::vector<Row> rows;
  std::array<std::size_t, 2> widths = {};
  for (const PropertyDefinition& property : definition.properties) {
    std::string remark(property.key ? "key" : unitName(property.name));
    if (!property.referenceClass.empty()) {
      remark.append(", refers to ").append(property.referenceClass);
    }
    rows.push_back({std::string(property.name), typeName(property.type), remark});
    for (std::size_t i = 0; i < widths.size(); ++i) {
      widths[i] = std::max(widths[i], rows.back()[i].size());
    }
  }
  std::string text = std::string(definition.name).append(": ").append(definition.parent);
  text += definition.association ? ", an association\n" : "\n";
  for (const auto& [name, type, remark] : rows) {
    text += "  " + padRight(name, widths[0]) + "  " +
            (remark.empty() ? type : padRight(type, widths[1]) + "  " + remark) + '\n' + codeLines(codesOf(name));
  }
  return text;
}

using Classes = std::vector<const ClassDefinition*>;

/// What each class has in the format, with an empty line in between.
std::string joined(const Classes& classes, std::string (*write)(const ClassDefinition& definition)) {
  std::string text;
  for (const ClassDefinition* definition : classes) {
    text += (text.empty() ? "" : "\n") + write(*definition);
  }
  return text;
}

std::string classesAsJson(const Classes& classes) {
  return jsonListDocument(classes, [](const ClassDefinition* definition) { return classAsJson(*definition); });
}

}  // namespace

std::string writeClassList(Format format) {
  Classes all;
  for (const ClassDefinition& definition : classDefinitions()) {
    all.push_back(&definition);
  }
  return format == Format::Mof    ? joined(all, classAsMof)
         : format == Format::Json ? classesAsJson(all)
                                  : classesAsText();
}

std::string writeClass(Format format, std::string_view name) {
  const Classes classes = classesServing(name);
  if (classes.empty()) {
    throw std::runtime_error("classes: no class " + quotedText(name) + " is served here; " + suggestClasses(name));
  }
  if (format == Format::Json) {
    return classes.size() == 1 ? jsonDocument(classAsJson(*classes.front())) : classesAsJson(classes);
  }
  return joined(classes, format == Format::Mof ? classAsMof : classAsText);
}

}  // namespace Corvcim
