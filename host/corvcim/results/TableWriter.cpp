#include "host/corvcim/results/TableWriter.h"

#include <algorithm>
#include <functional>
#include <string_view>

#include "host/corvcim/results/JsonWriter.h"
#include "host/corvcim/results/TextWriter.h"
#include "host/corvcim/text/Text.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

using Cells = std::vector<std::string>;

constexpr std::string_view classColumn = "Class";

void addOnce(std::vector<std::string>& names, std::string_view name) {
  if (std::ranges::none_of(names, [&](const std::string& known) { return sameName(known, name); })) {
    names.emplace_back(name);
  }
}

std::vector<std::string> classesOf(std::span<const Instance> rows) {
  std::vector<std::string> classes;
  for (const Instance& row : rows) {
    addOnce(classes, row.path.className);
  }
  return classes;
}

/// The name as the classes spell it.
std::string spelled(const std::string& name, const std::vector<std::string>& classes) {
  for (const std::string& className : classes) {
    const ClassDefinition* definition = findClass(className);
    const PropertyDefinition* property = definition == nullptr ? nullptr : findProperty(*definition, name);
    if (property != nullptr) {
      return std::string(property->name);
    }
  }
  return name;
}

bool isKey(const Instance& row, std::string_view name) {
  return row.path.key(name) != nullptr;
}

std::vector<std::string> columnsOf(std::span<const Instance> rows, const ColumnList& asked) {
  const std::vector<std::string> classes = classesOf(rows);
  std::vector<std::string> columns;
  if (asked && !asked->empty()) {
    for (const std::string& name : *asked) {
      columns.push_back(spelled(name, classes));
    }
    return columns;
  }
  if (classes.size() > 1) {
    columns.emplace_back(classColumn);
  }
  for (const Instance& row : rows) {
    for (const NamedValue& property : row.properties) {
      if (!asked || isKey(row, property.name)) {
        addOnce(columns, property.name);
      }
    }
  }
  return columns;
}

/// The names of the columns, then one line for each row.
std::vector<Cells> cellsOf(std::span<const Instance> rows, const ColumnList& asked,
                           const std::function<std::string(std::string_view, const Value*)>& write) {
  const std::vector<std::string> columns = columnsOf(rows, asked);
  std::vector<Cells> lines = {columns};
  for (const Instance& row : rows) {
    Cells cells;
    for (const std::string& column : columns) {
      const Value* value = row.property(column);
      cells.push_back(value == nullptr && column == classColumn ? row.path.className : write(column, value));
    }
    lines.push_back(std::move(cells));
  }
  return lines;
}

std::string quotedField(std::string_view text) {
  if (!text.empty() && text.find_first_of(",\"\r\n") == std::string_view::npos) {
    return std::string(text);
  }
  std::string field = "\"";
  for (const char c : text) {
    field.append(c == '"' ? 2 : 1, c);
  }
  return field + '"';
}

std::string fieldOf(const Value* value) {
  if (value == nullptr || value->isNull()) {
    return "";
  }
  const OrderedJson json = valueAsJson(*value);
  return quotedField(json.is_string() ? toValidUtf8(json.get<std::string>()) : jsonLine(json));
}

}  // namespace

ColumnList columnsAskedFor(const Options& options) {
  return options.hasPropertyList ? ColumnList(options.properties) : std::nullopt;
}

std::vector<Instance> keysOf(std::span<const ObjectPath> paths) {
  std::vector<Instance> rows;
  for (const ObjectPath& path : paths) {
    rows.push_back({path, path.keys});
  }
  return rows;
}

std::string rowsAsTable(std::span<const Instance> rows, const ColumnList& columns) {
  const std::vector<Cells> lines = cellsOf(rows, columns, [](std::string_view column, const Value* value) {
    return value == nullptr ? std::string("-") : valueAsText(column, *value);
  });
  std::vector<std::size_t> widths(lines.front().size());
  for (const Cells& cells : lines) {
    for (std::size_t i = 0; i < cells.size(); ++i) {
      widths[i] = std::max(widths[i], Corvcim::columns(cells[i]));
    }
  }
  std::string text;
  for (const Cells& cells : lines) {
    for (std::size_t i = 0; i < cells.size(); ++i) {
      text += i + 1 == cells.size() ? cells[i] + '\n' : padRight(cells[i], widths[i] + 2);
    }
  }
  return text;
}

std::string rowsAsCsv(std::span<const Instance> rows, const ColumnList& columns) {
  std::string text;
  for (const Cells& cells :
       cellsOf(rows, columns, [](std::string_view, const Value* value) { return fieldOf(value); })) {
    for (const std::string& cell : cells) {
      text += cell + (&cell == &cells.back() ? "\r\n" : ",");
    }
  }
  return text;
}

std::string rowsAs(Format format, std::span<const Instance> rows, const ColumnList& columns) {
  return format == Format::Csv ? rowsAsCsv(rows, columns) : rowsAsTable(rows, columns);
}

}  // namespace Corvcim
