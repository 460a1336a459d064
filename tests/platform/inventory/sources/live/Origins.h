#ifndef CORVANE_TESTS_PLATFORM_INVENTORY_SOURCES_LIVE_ORIGINS_H
#define CORVANE_TESTS_PLATFORM_INVENTORY_SOURCES_LIVE_ORIGINS_H

#include <string>
#include <vector>

#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// One value of a tree, with where it comes from.
struct ExplainedValue {
  std::string name;      ///< "P0 status", "P0.L2.0 CacheLevel"
  const Origin* origin;  ///< nullptr where the tree does not tell
};

/// Every status, description and property of the tree, in its order. A node without a description has
/// nothing to explain there.
std::vector<ExplainedValue> explainedValues(const Tree& tree);

/// The names of the values whose origin is missing, names no source or no rule, or shows no raw datum
/// although its source is a file or a structure.
std::vector<std::string> unexplainedValues(const Tree& tree);

/// Every value on a line of its own: "P0 status: SOURCE: RAW: RULE".
std::string originsOf(const Tree& tree);

}  // namespace Tarn::Inventory

#endif
