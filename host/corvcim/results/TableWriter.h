#ifndef HOST_CORVCIM_RESULTS_TABLEWRITER_H
#define HOST_CORVCIM_RESULTS_TABLEWRITER_H

#include <optional>
#include <span>
#include <string>
#include <vector>

#include "host/broker/Instance.h"
#include "host/corvcim/options/Options.h"

namespace Corvcim {

/// The columns that were asked for, by the names of properties; nothing for all.
using ColumnList = std::optional<std::vector<std::string>>;

/// What the options say of columns.
ColumnList columnsAskedFor(const Options& options);

/// Paths as instances that have nothing but their keys.
std::vector<Instance> keysOf(std::span<const ObjectPath> paths);

// One row for each instance, under a row with the names of the columns. An empty list of columns means the keys.
// Without a list, the columns are all properties of the classes, after the column Class if there are several.

/// Aligned columns; values as instancesAsText shows them, "-" for unknown values.
std::string rowsAsTable(std::span<const Instance> rows, const ColumnList& columns);

/// Rows as RFC 4180 defines them: fields with commas, quotes or line ends are quoted, lines end with CRLF. Codes and
/// numbers are written as numbers, references as paths, lists as JSON. An unknown value is an empty field, an empty
/// text is "".
std::string rowsAsCsv(std::span<const Instance> rows, const ColumnList& columns);

/// As one of them: the format is Table or Csv.
std::string rowsAs(Format format, std::span<const Instance> rows, const ColumnList& columns);

}  // namespace Corvcim

#endif
