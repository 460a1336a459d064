#include "host/corvcim/results/TextWriter.h"

#include <algorithm>
#include <iterator>

#include "host/corvcim/results/LocalPaths.h"
#include "host/corvcim/results/ValueNames.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

std::string numberAsText(std::string_view property, const Value& value) {
  const std::uint64_t number = value.asUnsigned();
  std::string text = std::to_string(number);
  if (const std::string_view name = valueName(property, number); !name.empty()) {
    return text.append(" (").append(name).append(")");
  }
  if (const std::string_view unit = unitName(property); !unit.empty()) {
    return text.append(" ").append(unit);
  }
  return text;
}

std::string listAsText(std::string_view property, const std::vector<Value>& elements) {
  std::string text;
  for (const Value& element : elements) {
    text += (text.empty() ? "" : ", ") + valueAsText(property, element);
  }
  return text.empty() ? "(none)" : text;
}

}  // namespace

bool isUnsignedNumber(const Value& value) {
  constexpr CMPIType types[] = {CMPI_uint8, CMPI_uint16, CMPI_uint32, CMPI_uint64};
  return !value.isNull() && std::ranges::find(types, value.type()) != std::end(types);
}

std::string valueAsText(std::string_view property, const Value& value) {
  if (value.isNull()) {
    return "-";
  }
  if (value.isArray()) {
    return listAsText(property, value.elements());
  }
  if (isUnsignedNumber(value)) {
    return numberAsText(property, value);
  }
  if (value.type() == CMPI_string || value.type() == CMPI_dateTime) {
    return value.asString().empty() ? "\"\"" : toPrintable(value.asString());
  }
  if (value.type() == CMPI_boolean) {
    return value.asBoolean() ? "true" : "false";
  }
  if (value.type() == CMPI_ref) {
    return toPrintable(withoutHosts(value.asReference()).text());
  }
  return toPrintable(value.text());
}

std::string instancesAsText(std::span<const Instance> instances) {
  std::string text;
  for (const Instance& instance : instances) {
    text += (text.empty() ? "" : "\n") + toPrintable(withoutHosts(instance.path).text()) + '\n';
    std::size_t width = 0;
    for (const NamedValue& property : instance.properties) {
      width = std::max(width, columns(property.name));
    }
    for (const NamedValue& property : instance.properties) {
      text += "  " + padRight(property.name, width) + "  " + valueAsText(property.name, property.value) + '\n';
    }
  }
  return text;
}

std::string pathsAsText(std::span<const ObjectPath> paths) {
  std::string text;
  for (const ObjectPath& path : paths) {
    text += toPrintable(withoutHosts(path).text()) + '\n';
  }
  return text;
}

}  // namespace Corvcim
