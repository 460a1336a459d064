#include "host/corvcim/overview/Overview.h"

#include <algorithm>
#include <array>
#include <optional>
#include <string_view>
#include <utility>

#include "host/corvcim/operations/Operations.h"
#include "host/corvcim/overview/OverviewParts.h"
#include "host/corvcim/results/TableWriter.h"
#include "host/corvcim/results/ValueNames.h"
#include "host/corvcim/text/InventoryText.h"
#include "host/corvcim/text/Quantities.h"
#include "host/corvcim/text/Text.h"
#include "platform/inventory/ProcessTree.h"

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

std::string clockText(const Instance& processor, std::string_view property, std::string_view what) {
  const std::uint64_t clock = propertyNumber(processor, property).value_or(0);
  return clock == 0 ? std::string() : formatMegahertz(clock) + ' ' + std::string(what);
}

/// What the library answers, and what it keeps to itself on a virtual machine.
std::string withKernels(const std::string& answered, const std::string& kernels) {
  const bool isWithheld = answered == "Unknown" && !kernels.empty() && kernels != answered;
  return isWithheld ? "Unknown to clients; the kernel reports " + kernels : answered;
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

void checkColumns(const std::vector<Instance>& rows, const ColumnList& columns) {
  for (const std::string& name : columns.value_or(std::vector<std::string>())) {
    if (!rows.empty() && rows.front().property(name) == nullptr) {
      std::vector<std::string> known;
      for (const NamedValue& property : rows.front().properties) {
        known.push_back(property.name);
      }
      throw UsageError("the overview has no column '" + name + "': there are " + joined(known));
    }
  }
}

std::string write(const OverviewData& data, const Tree& tree, const Options& options) {
  if (hasColumns(options.format)) {
    const std::vector<Instance> rows = overviewRows(data, tree);
    checkColumns(rows, columnsAskedFor(options));
    return rowsAs(options.format, rows, columnsAskedFor(options));
  }
  return options.format == Format::Json ? writeOverviewAsJson(data, tree) : writeOverview(data, tree);
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

Outcome showOverview(Dispatcher& dispatcher, const Options& options) {
  const OverviewData data = gatherOverview(dispatcher, options.nameSpace);
  Outcome outcome;
  outcome.errors = data.failures;
  if (data.processors.empty()) {
    if (const std::optional<std::string> error = inventoryError()) {
      return {"", {*error}};
    }
  }
  if (data.processorsAreKnown) {
    outcome.output = write(data, *Tarn::Inventory::processTree(), options);
  }
  return outcome;
}

}  // namespace Corvcim
