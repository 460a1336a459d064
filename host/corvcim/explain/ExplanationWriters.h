#ifndef HOST_CORVCIM_EXPLAIN_EXPLANATIONWRITERS_H
#define HOST_CORVCIM_EXPLAIN_EXPLANATIONWRITERS_H

#include <span>
#include <string>
#include <string_view>

#include "host/corvcim/explain/Explanation.h"

namespace Corvcim {

/// Everything about every property, for people.
std::string writeExplanations(const Tarn::Inventory::Tree& tree, std::span<const ExplainedInstance> instances);

/// One line for each property that comes from the inventory: its value, and the datum's source.
std::string writeShortExplanations(const Tarn::Inventory::Tree& tree, std::span<const ExplainedInstance> instances);

/// The same as the first, for programs. `source` is the inventory's.
std::string writeExplanationsAsJson(const Tarn::Inventory::Tree& tree, std::span<const ExplainedInstance> instances,
                                    std::string_view source);

}  // namespace Corvcim

#endif
