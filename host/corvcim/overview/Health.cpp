#include "host/corvcim/overview/Health.h"

#include <algorithm>
#include <array>
#include <functional>

#include "host/broker/Dispatcher.h"
#include "host/corvcim/operations/Libraries.h"
#include "host/corvcim/operations/Operations.h"
#include "host/corvcim/options/SourceArgument.h"
#include "host/corvcim/overview/OverviewData.h"
#include "host/corvcim/text/Text.h"
#include "platform/inventory/ProcessTree.h"

namespace Corvcim {
namespace {

std::string lineOf(const ProcessorState& state) {
  std::string text;
  for (const std::string& reason : state.reasons) {
    text += (text.empty() ? "" : "; ") + reason;
  }
  if (text.empty()) {
    text = coreText(state.counts);
  }
  return std::string(severityName(state.severity)).append(" ").append(state.path) + (text.empty() ? "" : ": ") + text +
         '\n';
}

int healthStatus(Severity worst) {
  constexpr std::array<int, 4> statuses = {0, 1, 3, 2};
  return statuses[static_cast<std::size_t>(worst)];
}

}  // namespace

Outcome unknownHealth(const std::string& reason) {
  Outcome outcome;
  outcome.output = std::string(severityName(Severity::Unknown)) + ": " + toPrintable(withGivenNames(reason)) + '\n';
  outcome.status = healthStatus(Severity::Unknown);
  return outcome;
}

Outcome checkHealth(const Options& options) {
  Dispatcher dispatcher(libraryFiles(options));
  const Answer answer = dispatcher.enumerateInstances({{}, options.nameSpace, "HALDA_CPUProcessor", {}});
  const Response& response = answer.response;
  if (!response.ok() || response.instances.empty()) {
    const std::optional<std::string> error = inventoryError();
    return unknownHealth(error           ? *error
                         : response.ok() ? "no processors"
                                         : "HALDA_CPUProcessor: " + describeStatus(response.rc, response.message));
  }
  const auto tree = Tarn::Inventory::processTree();
  std::vector<ProcessorState> states;
  for (const Instance& processor : response.instances) {
    states.push_back(stateOf(processor, {}, *tree));
  }
  const auto others = unreported(states, *tree);
  return writeHealth(std::move(states), others);
}

Outcome writeHealth(std::vector<ProcessorState> states, std::span<const Tarn::Inventory::Node* const> unreported) {
  for (const Tarn::Inventory::Node* node : unreported) {
    if (node->status != Tarn::Inventory::Status::emptySocket) {
      states.push_back({std::string(node->path()),
                        node->status,
                        Severity::Unknown,
                        {"not reported to clients", stateNote(node->status)},
                        {}});
    }
  }
  if (states.empty()) {
    return unknownHealth("no processors");
  }
  std::ranges::stable_sort(states, std::greater(), &ProcessorState::severity);
  Outcome outcome;
  for (const ProcessorState& state : states) {
    outcome.output += lineOf(state);
  }
  outcome.status = healthStatus(states.front().severity);
  return outcome;
}

}  // namespace Corvcim
