#ifndef HOST_CORVCIM_OVERVIEW_PROCESSORSTATE_H
#define HOST_CORVCIM_OVERVIEW_PROCESSORSTATE_H

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <vector>

#include "host/broker/Instance.h"
#include "host/corvcim/text/StateNote.h"
#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// Cores and threads of a processor; nothing where the number is not known.
struct CoreCounts {
  std::optional<std::uint64_t> cores;
  std::optional<std::uint64_t> enabled;  ///< 0 for a processor that is not in use
  std::optional<std::uint64_t> threads;
  std::uint64_t withoutCore = 0;  ///< logical CPUs of the processor that belong to none of the cores that are known
};

/// A processor as it is: by what the library answers, and by the states of its parts in the inventory.
struct ProcessorState {
  std::string path;
  unsigned int status = 0;  ///< CPUStatus; 0 where there is none
  Severity severity = Severity::Unknown;
  std::vector<std::string> reasons;  ///< "failed", "8 cores, 6 enabled"; what the severity rests on
  CoreCounts counts;
};

/// `capabilities` may be without properties; its numbers are taken before those of the inventory.
ProcessorState stateOf(const Instance& processor, const Instance& capabilities, const Tarn::Inventory::Tree& tree);

/// "8 cores, 6 enabled, 16 threads"; empty where nothing is known.
std::string coreText(const CoreCounts& counts);

/// The sum. A number that is not known of one processor is not known of all.
CoreCounts totalOf(std::span<const ProcessorState> states);

/// The processors of the inventory that the library does not report, empty sockets for example.
std::vector<const Tarn::Inventory::Node*> unreported(std::span<const ProcessorState> states,
                                                     const Tarn::Inventory::Tree& tree);

/// The node of the processor, or nullptr.
const Tarn::Inventory::Node* processorNode(const Tarn::Inventory::Tree& tree, std::string_view path);

// Properties of instances; nothing, or an empty text, for one that is not there.
std::string propertyText(const Instance& instance, std::string_view property);
std::optional<std::uint64_t> propertyNumber(const Instance& instance, std::string_view property);

}  // namespace Corvcim

#endif
