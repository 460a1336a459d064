#include "host/corvcim/overview/ProcessorState.h"

#include <algorithm>
#include <string_view>

#include "host/corvcim/results/TextWriter.h"
#include "host/corvcim/results/ValueNames.h"
#include "host/corvcim/text/Text.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::CpuSet;
using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::noNode;
using Tarn::Inventory::Tree;
namespace Lexicon = Tarn::NodeLexicon;

NodeIndex findProcessor(const Tree& tree, std::string_view path) {
  const NodeIndex index = tree.find('/' + std::string(path));
  return index != noNode && tree.node(index).type == Lexicon::NodeProcessor ? index : noNode;
}

/// Calls `use` with each core and cache of the processor.
template <class Use>
void forEachPart(const Tree& tree, NodeIndex processor, Use use) {
  for (NodeIndex i = processor + 1; processor != noNode && i < tree.node(processor).end; ++i) {
    use(tree.node(i));
  }
}

std::optional<std::uint64_t> numberIn(const Tree& tree, NodeIndex node, Lexicon::Properties id) {
  const unsigned int* number = node == noNode ? nullptr : tree.number(tree.node(node), id);
  return number == nullptr ? std::nullopt : std::optional<std::uint64_t>(*number);
}

bool isInUse(const Node& node) {
  return severityOf(node.status) == Severity::Fine;
}

CoreCounts countCores(const Instance& processor, const Instance& capabilities, const Tree& tree, NodeIndex node) {
  CoreCounts counts;
  counts.cores = propertyNumber(capabilities, "NumberOfProcessorCores");
  counts.threads = propertyNumber(capabilities, "NumberOfHardwareThreads");
  counts.cores = counts.cores ? counts.cores : numberIn(tree, node, Lexicon::PropProcessorCores);
  counts.threads = counts.threads ? counts.threads : numberIn(tree, node, Lexicon::PropHardwareThreads);
  counts.enabled = propertyNumber(processor, "NumberOfEnabledCores");
  std::uint64_t known = 0;
  std::uint64_t inUse = 0;
  CpuSet placed;
  forEachPart(tree, node, [&](const Node& part) {
    if (part.type == Lexicon::NodeProcessorCore) {
      ++known;
      inUse += isInUse(part) ? 1 : 0;
      placed.add(part.cpus);
    }
  });
  if (known != 0) {
    counts.enabled = counts.enabled.value_or(0) == 0 ? inUse : std::min(*counts.enabled, inUse);
    CpuSet cpus = tree.node(node).cpus;
    cpus.remove(placed);
    counts.withoutCore = placed.empty() ? 0 : cpus.count();
  } else if (counts.enabled == 0U) {
    counts.enabled.reset();  // the library's answer where the inventory has no number
  }
  return counts;
}

/// By the codes of HealthState.
Severity severityOfHealth(std::optional<std::uint64_t> health) {
  constexpr std::uint64_t ok = 5;
  constexpr std::uint64_t degraded = 10;
  constexpr std::uint64_t firstFailure = 15;
  if (!health || (*health != ok && *health < degraded)) {
    return Severity::Unknown;
  }
  return *health == ok ? Severity::Fine : *health >= firstFailure ? Severity::Failed : Severity::Degraded;
}

class Judgement {
 public:
  explicit Judgement(ProcessorState& state) : state_(state) { state_.severity = Severity::Fine; }

  void add(Severity severity, std::string reason) {
    if (severity != Severity::Fine) {
      state_.severity = std::max(state_.severity, severity);
      state_.reasons.push_back(std::move(reason));
    }
  }

 private:
  ProcessorState& state_;
};

/// Failed and degraded parts. One that is off is counted among the cores, or is a cache that somebody switched off.
void judgeParts(Judgement& judgement, const Tree& tree, NodeIndex processor) {
  forEachPart(tree, processor, [&](const Node& part) {
    constexpr unsigned int predictiveFailure = 20;
    constexpr unsigned int degraded = 21;
    if (part.status == Tarn::Inventory::Status::failed || part.status == predictiveFailure || part.status == degraded) {
      judgement.add(Severity::Degraded, std::string(Tarn::Inventory::nodeTypeName(part.type)) + ' ' +
                                            std::string(part.path()) + ": " + stateNote(part.status));
    }
  });
}

std::string healthReason(std::optional<std::uint64_t> health) {
  const std::string_view name = health ? valueName("HealthState", *health) : "not known";
  return "health " + (name.empty() ? std::to_string(*health) : std::string(name));
}

void addTo(std::optional<std::uint64_t>& total, std::optional<std::uint64_t> number) {
  total = total && number ? std::optional(*total + *number) : std::nullopt;
}

}  // namespace

std::string propertyText(const Instance& instance, std::string_view property) {
  const Value* value = instance.property(property);
  return value == nullptr || value->isNull() || value->type() != CMPI_string ? std::string()
                                                                             : toPrintable(value->asString());
}

std::optional<std::uint64_t> propertyNumber(const Instance& instance, std::string_view property) {
  const Value* value = instance.property(property);
  return value != nullptr && isUnsignedNumber(*value) ? std::optional(value->asUnsigned()) : std::nullopt;
}

const Node* processorNode(const Tree& tree, std::string_view path) {
  const NodeIndex index = findProcessor(tree, path);
  return index == noNode ? nullptr : &tree.node(index);
}

ProcessorState stateOf(const Instance& processor, const Instance& capabilities, const Tree& tree) {
  ProcessorState state;
  state.path = propertyText(processor, "DeviceID");
  const NodeIndex node = findProcessor(tree, state.path);
  const std::optional<std::uint64_t> status = propertyNumber(processor, "CPUStatus");
  const std::optional<std::uint64_t> health = propertyNumber(processor, "HealthState");
  state.status = static_cast<unsigned int>(status.value_or(0));
  state.counts = countCores(processor, capabilities, tree, node);
  const Severity ofStatus = severityOf(state.status);
  if (state.counts.cores && ofStatus != Severity::Fine && status) {
    state.counts.enabled = 0;
  }
  Judgement judgement(state);
  judgement.add(ofStatus, status ? stateNote(state.status) : "state not known");
  judgement.add(severityOfHealth(health), healthReason(health));
  const bool isPartial = state.counts.cores && state.counts.enabled && *state.counts.enabled < *state.counts.cores;
  judgement.add(isPartial ? Severity::Degraded : Severity::Fine, coreText(state.counts));
  judgeParts(judgement, tree, node);
  return state;
}

std::string coreText(const CoreCounts& counts) {
  std::string text;
  const auto add = [&text](const std::string& part) { text += (text.empty() ? "" : ", ") + part; };
  if (counts.cores) {
    add(counted(*counts.cores, "core"));
  }
  if (counts.enabled) {
    const bool isAll = counts.cores == counts.enabled && *counts.enabled > 1 && counts.withoutCore == 0;
    add(isAll ? "all enabled" : *counts.enabled == 0 ? "none enabled" : std::to_string(*counts.enabled) + " enabled");
  }
  if (counts.threads) {
    add(counted(*counts.threads, "thread"));
  }
  if (counts.withoutCore != 0) {
    add(std::to_string(counts.withoutCore) + " of them on no known core");
  }
  return text;
}

CoreCounts totalOf(std::span<const ProcessorState> states) {
  CoreCounts total = {0, 0, 0, 0};
  for (const ProcessorState& state : states) {
    addTo(total.cores, state.counts.cores);
    addTo(total.enabled, state.counts.enabled);
    addTo(total.threads, state.counts.threads);
    total.withoutCore += state.counts.withoutCore;
  }
  return total;
}

std::vector<const Node*> unreported(std::span<const ProcessorState> states, const Tree& tree) {
  std::vector<const Node*> nodes;
  for (const NodeIndex index : tree.ofType(Lexicon::NodeProcessor)) {
    const Node& node = tree.node(index);
    if (std::ranges::find(states, node.path(), &ProcessorState::path) == states.end()) {
      nodes.push_back(&node);
    }
  }
  return nodes;
}

}  // namespace Corvcim
