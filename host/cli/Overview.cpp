#include "host/cli/Overview.h"

#include <algorithm>
#include <array>
#include <functional>
#include <optional>
#include <string_view>
#include <utility>

#include "host/cli/InventoryText.h"
#include "host/cli/NodeFields.h"
#include "host/cli/Operations.h"
#include "host/cli/ProcessorState.h"
#include "host/cli/Quantities.h"
#include "host/cli/Text.h"
#include "host/cli/results/ValueNames.h"
#include "platform/instrumentation/ProcessTree.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::Tree;
using Tarn::Inventory::Unread;
namespace Lexicon = Tarn::NodeLexicon;

std::string nameOf(std::string_view property, std::optional<std::uint64_t> code) {
  if (!code) {
    return "not known";
  }
  const std::string_view name = valueName(property, *code);
  return name.empty() ? std::to_string(*code) : std::string(name);
}

/// The texts that say something, with ", " between them.
std::string listed(std::initializer_list<std::string> texts) {
  std::string line;
  for (const std::string& text : texts) {
    if (!text.empty()) {
      line += (line.empty() ? "" : ", ") + text;
    }
  }
  return line;
}

/// A processor with its state and its node, which is nullptr where the inventory does not have it.
struct Shown {
  const OverviewProcessor* overview;
  ProcessorState state;
  const Node* node;
};

std::vector<Shown> worstFirst(const OverviewData& data, const Tree& tree) {
  std::vector<Shown> shown;
  for (const OverviewProcessor& overview : data.processors) {
    ProcessorState state = stateOf(overview.processor, overview.capabilities, tree);
    const Node* node = processorNode(tree, state.path);
    shown.push_back({&overview, std::move(state), node});
  }
  std::ranges::stable_sort(shown, std::greater(), [](const Shown& each) { return each.state.severity; });
  return shown;
}

std::string clockText(const Instance& processor, std::string_view property, std::string_view what) {
  const std::uint64_t clock = propertyNumber(processor, property).value_or(0);
  return clock == 0 ? std::string() : formatMegahertz(clock) + ' ' + std::string(what);
}

/// What the library answers, and what it keeps to itself on a virtual machine.
std::string withKernels(const std::string& answered, const std::string& kernels) {
  const bool isWithheld = answered == "Unknown" && !kernels.empty() && kernels != answered;
  return isWithheld ? "Unknown to clients; the kernel reports " + kernels : answered;
}

std::string kernelModel(const Shown& shown, const Tree& tree) {
  const std::string* model = shown.node == nullptr ? nullptr : tree.text(*shown.node, Lexicon::PropProcessorName);
  return model == nullptr ? "" : toPrintable(*model);
}

std::string modelText(const Shown& shown, const Tree& tree) {
  return withKernels(propertyText(shown.overview->processor, "Name"), kernelModel(shown, tree));
}

std::string familyText(const Shown& shown, const Tree& tree) {
  const Instance& processor = shown.overview->processor;
  const std::string stepping = propertyText(processor, "Stepping");
  const unsigned int* kernels = shown.node == nullptr ? nullptr : tree.number(*shown.node, Lexicon::PropFamily);
  return listed({withKernels(nameOf("Family", propertyNumber(processor, "Family")),
                             kernels == nullptr ? "" : nameOf("Family", *kernels)),
                 stepping.empty() ? "" : "stepping " + stepping});
}

/// Data and address width. The library reports the data width for both where the platform tells one.
std::string widthText(const Instance& processor) {
  const std::uint64_t data = propertyNumber(processor, "DataWidth").value_or(0);
  const std::uint64_t address = propertyNumber(processor, "AddressWidth").value_or(0);
  return listed({data == 0 ? "" : std::to_string(data) + " data bits",
                 address == 0 ? "" : std::to_string(address) + " address bits"});
}

struct CacheKind {
  std::string name;    ///< "L1d"; "cache" where the level is not known
  std::uint64_t size;  ///< bytes; 0 where it is not known
  std::size_t count;

  std::string label() const { return size == 0 ? name : name + ' ' + formatBytes(size); }
};

std::string cacheName(const Instance& association) {
  constexpr std::uint64_t firstLevelCode = 3;
  constexpr std::uint64_t lastLevelCode = 5;
  constexpr std::uint64_t instruction = 2;
  constexpr std::uint64_t data = 3;
  const std::uint64_t level = propertyNumber(association, "Level").value_or(0);
  const std::uint64_t type = propertyNumber(association, "CacheType").value_or(0);
  if (level < firstLevelCode || level > lastLevelCode) {
    return "cache";
  }
  return "L" + std::to_string(level - firstLevelCode + 1) + (type == instruction ? "i" : type == data ? "d" : "");
}

std::vector<CacheKind> cacheKinds(const std::vector<OverviewCache>& caches) {
  std::vector<CacheKind> kinds;
  for (const auto& [cache, association] : caches) {
    const CacheKind kind = {
        cacheName(association),
        propertyNumber(cache, "BlockSize").value_or(0) * propertyNumber(cache, "NumberOfBlocks").value_or(0), 1};
    const auto same = std::ranges::find(kinds, kind.label(), &CacheKind::label);
    if (same == kinds.end()) {
      kinds.push_back(kind);
    } else {
      ++same->count;
    }
  }
  std::ranges::sort(kinds, {}, &CacheKind::label);
  return kinds;
}

std::string cacheText(const std::vector<OverviewCache>& caches) {
  std::string text;
  for (const CacheKind& kind : cacheKinds(caches)) {
    text += text.empty() ? "" : ", ";
    text += (kind.count == 1 ? "" : std::to_string(kind.count) + " × ") + kind.label();
  }
  return text;
}

/// Everything about a processor but its identity.
std::string traitsOf(const Shown& shown, const Tree& tree) {
  const Instance& processor = shown.overview->processor;
  const std::pair<std::string_view, std::string> rows[] = {
      {"Model", modelText(shown, tree)},
      {"Family", familyText(shown, tree)},
      {"State", listed({nameOf("EnabledState", propertyNumber(processor, "EnabledState")),
                        "health " + nameOf("HealthState", propertyNumber(processor, "HealthState"))})},
      {"Cores", coreText(shown.state.counts)},
      {"Clocks",
       listed({clockText(processor, "CurrentClockSpeed", "now"), clockText(processor, "MaxClockSpeed", "at most")})},
      {"Caches", cacheText(shown.overview->caches)},
      {"Widths", widthText(processor)}};
  std::string text;
  for (const auto& [label, value] : rows) {
    text += "  " + padRight(std::string(label), 6) + "  " + (value.empty() ? "not known" : value) + '\n';
  }
  return text;
}

struct Paragraph {
  std::vector<std::string> identities;
  std::string note;
  std::string traits;
};

std::string noteOf(const ProcessorState& state) {
  return state.status == 0 ? "" : stateNote(state.status);
}

std::vector<Paragraph> paragraphsOf(const std::vector<Shown>& processors, const Tree& tree) {
  std::vector<Paragraph> paragraphs;
  for (const Shown& shown : processors) {
    Paragraph own = {{shown.state.path}, noteOf(shown.state), traitsOf(shown, tree)};
    const auto same = std::ranges::find_if(
        paragraphs, [&](const Paragraph& other) { return other.note == own.note && other.traits == own.traits; });
    if (same == paragraphs.end()) {
      paragraphs.push_back(std::move(own));
    } else {
      same->identities.push_back(shown.state.path);
    }
  }
  return paragraphs;
}

std::string joined(const std::vector<std::string>& texts) {
  std::string line;
  for (const std::string& text : texts) {
    line += (line.empty() ? "" : ", ") + text;
  }
  return line;
}

std::string headingOf(const Paragraph& paragraph) {
  const std::size_t count = paragraph.identities.size();
  return (count == 1 ? "Processor " : std::to_string(count) + " equal processors: ") + joined(paragraph.identities) +
         (paragraph.note.empty() ? "" : " (" + paragraph.note + ')') + '\n';
}

/// How many processors are in which state, the worst state first: "1 failed", "2 in use", "1 empty socket".
std::vector<std::pair<std::string, std::size_t>> countStates(const std::vector<Shown>& processors,
                                                             std::span<const Node* const> unreported) {
  std::vector<unsigned int> states;
  for (const Shown& shown : processors) {
    states.push_back(shown.state.status);
  }
  for (const Node* node : unreported) {
    states.push_back(node->status);
  }
  const auto rank = [](unsigned int status) { return std::pair(-static_cast<int>(severityOf(status)), status); };
  std::ranges::sort(states, {}, rank);
  std::vector<std::pair<std::string, std::size_t>> counts;
  for (const unsigned int status : states) {
    const std::string note = status == Tarn::Inventory::Status::inUse ? "in use" : stateNote(status);
    if (counts.empty() || counts.back().first != note) {
      counts.emplace_back(note, 0);
    }
    ++counts.back().second;
  }
  return counts;
}

std::vector<ProcessorState> statesOf(const std::vector<Shown>& processors) {
  std::vector<ProcessorState> states;
  for (const Shown& shown : processors) {
    states.push_back(shown.state);
  }
  return states;
}

/// "4 sockets (1 failed, 2 in use, 1 empty socket): 24 cores, 16 enabled, 48 threads"; empty for a lone processor.
std::string totalLine(const std::vector<Shown>& processors, std::span<const Node* const> unreported) {
  const std::size_t count = processors.size() + unreported.size();
  if (count < 2) {
    return "";
  }
  std::vector<std::string> states;
  const auto counts = countStates(processors, unreported);
  for (const auto& [note, number] : counts) {
    states.push_back(std::to_string(number) + ' ' + note);
  }
  const std::string cores = coreText(totalOf(statesOf(processors)));
  return std::to_string(count) +
         (counts.size() == 1 ? std::string(" processors") : " sockets (" + joined(states) + ')') +
         (cores.empty() ? "" : ": " + cores) + '\n';
}

std::string unreportedLine(std::span<const Node* const> unreported) {
  std::vector<std::string> parts;
  for (const Node* node : unreported) {
    parts.push_back(std::string(node->path()) + " (" + stateNote(node->status) + ')');
  }
  return parts.empty() ? "" : "\nNot reported to clients: " + joined(parts) + '\n';
}

std::string systemLine(const Instance& system) {
  const std::string name = propertyText(system, "Name");
  const std::string maker = propertyText(system, "Manufacturer");
  const std::string model = propertyText(system, "Model");
  const std::string make = maker.empty() || model.starts_with(maker) ? model : maker + ' ' + model;
  return (name.empty() ? "This machine" : name) + (make.empty() ? "" : ": " + make) + '\n';
}

bool isVirtual(const OverviewData& data) {
  return propertyText(data.system, "Model").find("Virtual") != std::string::npos;
}

/// What a virtual machine may lack, by the ends of the files' names.
constexpr std::array<std::pair<std::string_view, std::string_view>, 3> virtualLacks = {
    {{"/smbios_entry_point", "firmware tables"},
     {"/product_name", "product name"},
     {"/cpuinfo_max_freq", "maximum clock"}}};

std::string lackOf(const Unread& entry) {
  const auto* const known =
      std::ranges::find_if(virtualLacks, [&](const auto& lack) { return entry.file.ends_with(lack.first); });
  return known == virtualLacks.end() ? toPrintable(entry.file) : std::string(known->second);
}

/// What could not be read. Files that a virtual machine does not have are one line: nothing can be done about them.
std::string unreadText(const Tree& tree, bool isOnVirtual) {
  std::vector<std::string> lacks;
  std::vector<Unread> entries;
  for (const Unread& entry : tree.unread()) {
    if (isOnVirtual && entry.reason == "no such file or directory") {
      lacks.push_back(lackOf(entry));
    } else {
      entries.push_back(entry);
    }
  }
  const std::string others = writeUnread(entries);
  return (lacks.empty() ? "" : "\nThis virtual machine does not provide: " + joined(lacks) + '\n') +
         (others.empty() ? "" : '\n' + others);
}

OrderedJson countOrNull(std::optional<std::uint64_t> count) {
  return count ? OrderedJson(*count) : OrderedJson();
}

OrderedJson numberOrNull(const Instance& instance, std::string_view property) {
  return countOrNull(propertyNumber(instance, property));
}

OrderedJson cachesAsJson(const std::vector<OverviewCache>& caches) {
  OrderedJson list = OrderedJson::array();
  for (const CacheKind& kind : cacheKinds(caches)) {
    list.push_back({{"name", kind.name},
                    {"size", kind.size == 0 ? OrderedJson() : OrderedJson(kind.size)},
                    {"count", kind.count}});
  }
  return list;
}

void addCounts(OrderedJson& json, const CoreCounts& counts) {
  json["cores"] = countOrNull(counts.cores);
  json["enabledCores"] = countOrNull(counts.enabled);
  json["threads"] = countOrNull(counts.threads);
}

OrderedJson processorAsJson(const Shown& shown, const Tree& tree) {
  const Instance& processor = shown.overview->processor;
  OrderedJson json = {{"path", shown.state.path},
                      {"severity", severityName(shown.state.severity)},
                      {"reasons", shown.state.reasons},
                      {"model", textOrNull(propertyText(processor, "Name"))},
                      {"inventoryModel", textOrNull(kernelModel(shown, tree))},
                      {"stepping", textOrNull(propertyText(processor, "Stepping"))}};
  constexpr std::string_view numbers[] = {"Family",        "CPUStatus", "EnabledState",      "HealthState",
                                          "MaxClockSpeed", "DataWidth", "CurrentClockSpeed", "AddressWidth"};
  for (const std::string_view property : numbers) {
    json[std::string(property)] = numberOrNull(processor, property);
  }
  addCounts(json, shown.state.counts);
  json["caches"] = cachesAsJson(shown.overview->caches);
  return json;
}

}  // namespace

std::string writeOverview(const OverviewData& data, const Tree& tree) {
  std::vector<Shown> processors = worstFirst(data, tree);
  const std::vector<const Node*> others = unreported(statesOf(processors), tree);
  std::string text = systemLine(data.system) + totalLine(processors, others);
  if (processors.empty()) {
    text += "\nNo processors found.\n";
  }
  for (const Paragraph& paragraph : paragraphsOf(processors, tree)) {
    text += '\n' + headingOf(paragraph) + paragraph.traits;
  }
  return text + unreportedLine(others) + unreadText(tree, isVirtual(data));
}

std::string writeOverviewAsJson(const OverviewData& data, const Tree& tree) {
  const std::vector<Shown> processors = worstFirst(data, tree);
  const std::vector<ProcessorState> states = statesOf(processors);
  OrderedJson json = {{"system",
                       {{"name", textOrNull(propertyText(data.system, "Name"))},
                        {"manufacturer", textOrNull(propertyText(data.system, "Manufacturer"))},
                        {"model", textOrNull(propertyText(data.system, "Model"))},
                        {"virtual", isVirtual(data)}}}};
  addCounts(json, totalOf(states));
  json["processors"] = OrderedJson::array();
  for (const Shown& shown : processors) {
    json["processors"].push_back(processorAsJson(shown, tree));
  }
  json["notReported"] = OrderedJson::array();
  for (const Node* node : unreported(states, tree)) {
    json["notReported"].push_back({{"path", node->path()}, {"status", node->status}});
  }
  json["unread"] = unreadAsJson(tree.unread());
  return jsonDocument(json);
}

Outcome showOverview(Dispatcher& dispatcher, const std::string& nameSpace, Format format) {
  const OverviewData data = gatherOverview(dispatcher, nameSpace);
  Outcome outcome;
  outcome.errors = data.failures;
  if (data.processors.empty()) {
    if (const std::optional<std::string> error = inventoryError()) {
      return {"", {*error}};
    }
  }
  if (!data.processorsAreKnown) {
    return outcome;
  }
  const auto tree = Tarn::Inventory::processTree();
  outcome.output = format == Format::Json ? writeOverviewAsJson(data, *tree) : writeOverview(data, *tree);
  return outcome;
}

}  // namespace Corvcim
